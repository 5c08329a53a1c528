# shellcheck shell=bash
# Sourced by the journeys: sentences that hold or do not.

check_failures=0

# Lines that the screens log as errors and that tell of none.
CHECK_USUAL_ERRORS='path: |Alarm Name is NULL !!|Focus is not set for entry !!'

# check SENTENCE COMMAND...: the sentence holds when the command succeeds.
check() {
    local sentence=$1
    shift
    if "$@"; then
        echo "ok: $sentence"
    else
        echo "FAILED: $sentence"
        check_failures=$((check_failures + 1))
    fi
}

# is ACTUAL EXPECTED
is() {
    [ "$1" = "$2" ] || {
        printf '  got      %q\n  expected %q\n' "$1" "$2"
        return 1
    }
}

# contains TEXT PART
contains() {
    case $1 in
    *"$2"*) ;;
    *)
        printf '  no %q in %q\n' "$2" "$1"
        return 1
        ;;
    esac
}

# check_end: the script's last command.
check_end() {
    [ $check_failures = 0 ] || {
        echo "$check_failures failed"
        exit 1
    }
    exit 0
}

# Gives the programs under test a home of their own and none of the desktop outside.
check_environment() {
    work=$(mktemp -d) || exit 1
    mkdir "$work/home" && mkdir -m 700 "$work/runtime" || exit 1
    export HOME=$work/home XDG_RUNTIME_DIR=$work/runtime EINA_LOG_LEVEL=1 EINA_LOG_BACKTRACE=-1
    # Nobody listens to a test.
    export CLOCK_AUDIO_SINK='fakesink sync=true'
    unset DISPLAY WAYLAND_DISPLAY DBUS_SESSION_BUS_ADDRESS ELM_ENGINE ELM_DISPLAY LANGUAGE LC_ALL LANG
    unset XDG_DATA_HOME XDG_CONFIG_HOME XDG_CACHE_HOME CLOCK_DATA_DIR CLOCK_RUNTIME_DIR CLOCK_RESOURCE_DIR CLOCK_TONE_DIR CLOCK_APPLICATION_DIR
}
