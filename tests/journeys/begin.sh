# shellcheck shell=bash
# Sourced by the journeys that take pictures of the watch: sentences, a finger and a place to work.
# usage: . begin.sh CLOCK_SIM PICTURE_DIRECTORY
# shellcheck disable=SC2034 # variables of the journeys
journeys=$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd) || exit 1
. "$journeys/check.sh"
. "$journeys/../../scripts/watch.sh"
simulator=$1 pictures=$2
check_environment
export TZ=Europe/Berlin
trap 'watch_end; rm -rf "$work"' EXIT
rm -rf "$pictures" && mkdir -p "$pictures" || exit 1
