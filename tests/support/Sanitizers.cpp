// What the sanitizers need to know to tell our leaks from the toolkit's, however the tests are run.

#ifdef __SANITIZE_ADDRESS__

#define READ_BY_THE_RUNTIME extern "C" __attribute__((visibility("default")))

READ_BY_THE_RUNTIME const char* __asan_default_options();
READ_BY_THE_RUNTIME const char* __lsan_default_options();

// The toolkit has no frame pointers: the fast unwinder never gets to our callers.
const char* __asan_default_options() {
    return "fast_unwind_on_malloc=0:malloc_context_size=60";
}

const char* __lsan_default_options() {
    return "print_suppressions=0:suppressions=" CLOCK_SOURCE_DIR "/tests/support/lsan.supp";
}

#endif
