#!/usr/bin/env bash
# usage: package.sh SOURCE_DIRECTORY BUILD_DIRECTORY CXX [COMPILER_FLAGS]
# Installs the library, and builds and starts the example against the installed files alone.
set -u
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd) || exit 1
. "$here/check.sh"
source=$1 build=$2 cxx=$3 flags=${4-}
check_environment
trap 'rm -rf "$work"' EXIT
prefix=$work/prefix

quietly() { "$@" >"$work/log" 2>&1 || {
    tail -n 30 "$work/log"
    return 1
}; }
# starts PROGRAM: the example opens its window in memory, and ends on request.
starts() {
    local status
    ELM_ENGINE=buffer CLOCK_DATA_DIR=$work/data timeout --signal=TERM --kill-after=20 5 "$1" >"$work/log" 2>&1
    status=$?
    # A program that ends well in time would not have waited for a person.
    is $status 124 && ! grep -aE 'missing|Critical' "$work/log" | grep -avE "$CHECK_USUAL_ERRORS"
}

readme_example() { sed -n '/^<!-- examples\/AlarmEditorExample.cpp -->$/,/^```$/p' "$source/README.md" | sed -e '1,2d' -e '$d'; }

check "The README shows this example" diff <(readme_example) "$source/examples/AlarmEditorExample.cpp"
check "The library can be installed" quietly cmake --install "$build" --prefix "$prefix"
check "No header of the library is missing" diff <(cd "$source/include" && ls) <(cd "$prefix/include/clock-ui" && ls -p | grep -v / | grep -vE 'device_(app|host|remote|settings).h')
check "The themes are installed" test -s "$prefix/share/clock-ui/edje/AlarmEditViewController.edj"
check "The texts are installed" test -s "$prefix/share/clock-ui/locale/en/LC_MESSAGES/clock.mo"

# The simulator, in the installed files alone.
sim=$prefix/bin/clock-sim
check "The simulator is installed" is "$("$sim" --version)" "clock-sim $(sed -n 's/^project(clock-ui VERSION \([0-9.]*\).*/\1/p' "$source/CMakeLists.txt")"
check "It loads no library of the build folder" is "$(ldd "$sim" | grep -c "$build")" 0
check "It starts" starts "$sim"
check "The city picker starts under its own name" starts "$(find "$prefix/libexec" -name '*.city-picker')"
check "The tone picker is installed beside it" test -x "$(find "$prefix/libexec" -name '*.sound-tone-list')"
desktop=$prefix/share/applications/clock-sim.desktop
check "The desktop knows how to start it" is "$(sed -n 's/^Exec=//p' "$desktop")" clock-sim
check "The desktop has its icon" test -s "$prefix/share/icons/hicolor/scalable/apps/$(sed -n 's/^Icon=//p' "$desktop").svg"

mkdir "$work/cmake" && cp "$source/examples/AlarmEditorExample.cpp" "$work/cmake"
cat >"$work/cmake/CMakeLists.txt" <<'TEXT'
cmake_minimum_required(VERSION 3.25)
project(example LANGUAGES CXX)
set(CMAKE_CXX_STANDARD 20)
find_package(clock-ui 0.1 REQUIRED)
if(NOT EXISTS "${CLOCK_UI_RESOURCE_DIR}/edje")
    message(FATAL_ERROR "No resources in '${CLOCK_UI_RESOURCE_DIR}'")
endif()
add_executable(example AlarmEditorExample.cpp)
target_link_libraries(example PRIVATE clock-ui::clock-ui clock-ui::device-host)
TEXT
check "CMake finds the package" quietly cmake -S "$work/cmake" -B "$work/cmake/build" -DCMAKE_PREFIX_PATH="$prefix" \
    -DCMAKE_CXX_COMPILER="$cxx" -DCMAKE_CXX_FLAGS="$flags"
check "The example is built with CMake" quietly cmake --build "$work/cmake/build"
check "The example that CMake built starts" starts "$work/cmake/build/example"

PKG_CONFIG_PATH=$(dirname "$(find "$prefix" -name clock-ui.pc)")
export PKG_CONFIG_PATH
# shellcheck disable=SC2046,SC2086
check "The example is built with pkg-config" quietly "$cxx" $flags "$source/examples/AlarmEditorExample.cpp" -o "$work/example" \
    $(pkg-config --cflags --libs clock-ui) -Wl,-rpath,"$(pkg-config --variable=libdir clock-ui)"
check "The example that pkg-config built starts" starts "$work/example"
check "pkg-config knows the resources" test -d "$(pkg-config --variable=resourcedir clock-ui)/edje"
check_end
