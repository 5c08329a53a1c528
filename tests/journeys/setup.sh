#!/usr/bin/env bash
# usage: setup.sh SOURCE_DIRECTORY
# What ./run and ./test do about missing packages, with stand-ins for the system's programs.
set -u
here=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd) || exit 1
. "$here/check.sh"
root=$1
check_environment
trap 'rm -rf "$work"' EXIT
mkdir "$work/bin"

# stand_in NAME BODY: a program that is found before the system's.
stand_in() {
    printf '#!/bin/bash\n%s\n' "$2" >"$work/bin/$1"
    chmod +x "$work/bin/$1"
}
system() { printf 'ID=%s\nVERSION_ID="%s"\nPRETTY_NAME="%s %s"\n' "$1" "$2" "$1" "$2" >"$work/os-release"; }
missing() { printf '%s\n' "$@" >"$work/missing"; }
# sets_up STATUS: runs the set-up; what it prints is in $out, what it installed in $installed.
sets_up() {
    local status
    rm -f "$work/apt"
    PATH=$work/bin:$PATH CLOCK_OS_RELEASE=$work/os-release WORK=$work \
        bash -uc '. "$1/scripts/setup.sh"; setup "$1"' - "$root" </dev/null >"$work/out" 2>&1
    status=$?
    out=$(cat "$work/out") installed=$(cat "$work/apt" 2>/dev/null)
    is "$status" "$1"
}
root_is() { stand_in id "echo $1"; }
sudo_works() { stand_in sudo '[ "$1" = -n ] && exit 0; exec "$@"'; }
sudo_asks() { stand_in sudo 'exit 1'; }

stand_in dpkg-query 'for name; do :; done; grep -qx "$name" "$WORK/missing" && exit 1; echo "ii "'
stand_in apt-get 'echo "$@" >>"$WORK/apt"; [ ! -e "$WORK/no-network" ]'
sudo_asks

system debian 12 && root_is 0
: >"$work/missing"
check "With every package there the set-up succeeds" sets_up 0
check "With every package there nothing is fetched" is "$installed" ""

missing xvfb gettext
check "Root installs missing packages" sets_up 0
check "The lists are fetched first" contains "$installed" "update"
check "All that is missing is installed at once" contains "$installed" "--no-install-recommends gettext xvfb"
check "Nothing else is installed" is "$(wc -l <"$work/apt")" 2

root_is 1000
check "Without root and without sudo the set-up stops" sets_up 1
check "The missing packages are named" contains "$out" "xvfb"
check "The packages that are there are not named" is "$(grep -c ninja-build "$work/out")" 0
check "Nothing was fetched" is "$installed" ""
sudo_works
check "A user for whom sudo works installs missing packages" sets_up 0
check "sudo installs" contains "$installed" "gettext xvfb"

root_is 0
: >"$work/no-network"
check "A failing installation stops the set-up" sets_up 1
check "The packages that could not be installed are named" contains "$out" "gettext"
rm "$work/no-network"

system debian 13
check "Nothing is installed on another release" sets_up 1
check "The other release is named" contains "$out" "debian 13"
check "What is missing there is named" contains "$out" "xvfb"
check "Nothing was installed there" is "$installed" ""
: >"$work/missing"
check "Another release of the family that has everything is accepted" sets_up 0
check "It is told about" contains "$out" "not Debian 12"

system fedora 40
stand_in dpkg-query 'exit 127'
check "A system without these packages is refused" sets_up 1
check "All needed packages are named" contains "$out" "libefl-all-dev"

# usage of ./test
for arguments in --fast "--asan --asan" "--asan more" dev; do
    # shellcheck disable=SC2086
    "$root/test" $arguments >"$work/out" 2>"$work/err"
    check "./test $arguments is refused" is $? 2
    check "./test $arguments prints the usage" grep -q 'usage: ./test' "$work/err"
done
check "./test --help prints the usage" grep -q 'usage: ./test' <("$root/test" --help)
check_end
