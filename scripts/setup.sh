# shellcheck shell=bash
# Sourced by run and test: installs the packages of scripts/packages.txt that are missing.

# Prints the packages that the project needs, one per line.
setup_packages() {
    sed -e 's/#.*//' -e '/^[[:space:]]*$/d' "$1/scripts/packages.txt"
}

# Prints those of the packages given on standard input that are not installed.
setup_missing() {
    local package
    while read -r package; do
        case $(dpkg-query -W -f '${db:Status-Abbrev}\n' "$package" 2>/dev/null) in
        ii*) ;;
        *) echo "$package" ;;
        esac
    done
}

# Succeeds on Debian 12, prints the name of any other system.
setup_is_debian_12() {
    (
        . "${CLOCK_OS_RELEASE:-/etc/os-release}" 2>/dev/null
        [ "${ID-}" = debian ] && [ "${VERSION_ID-}" = 12 ] && exit 0
        echo "${PRETTY_NAME:-an unknown system}"
        exit 1
    )
}

# Says why the set-up stops, and names the packages.
setup_refuse() {
    local reason=$1
    shift
    printf '%s\n' "$reason" "Needed packages, by their Debian 12 names:" >&2
    printf '    %s\n' "$@" >&2
    return 1
}

# Prints the command that makes apt-get root's, or fails when there is none.
setup_root_command() {
    if [ "$(id -u)" = 0 ]; then
        echo env
    elif command -v sudo >/dev/null && { sudo -n true 2>/dev/null || [ -t 0 ]; }; then
        echo sudo
    else
        return 1
    fi
}

setup_install() {
    local as_root
    if ! as_root=$(setup_root_command); then
        setup_refuse "Packages are missing and can only be installed by root: run this as root, or where sudo works, or install them yourself." "$@"
        return 1
    fi
    echo "Installing: $*"
    "$as_root" apt-get update -q >&2 &&
        "$as_root" env DEBIAN_FRONTEND=noninteractive \
            apt-get install -q -y --no-install-recommends "$@" >&2 && return 0
    setup_refuse "apt-get could not install the missing packages; its messages are above." "$@"
}

# setup ROOT: returns non-zero, with a message, when packages are missing and stay so.
setup() {
    local system packages missing
    mapfile -t packages < <(setup_packages "$1")
    if ! system=$(setup_is_debian_12); then
        command -v dpkg-query >/dev/null || {
            setup_refuse "This is $system; packages are installed on Debian 12 only." "${packages[@]}"
            return 1
        }
        mapfile -t missing < <(printf '%s\n' "${packages[@]}" | setup_missing)
        [ ${#missing[@]} = 0 ] || {
            setup_refuse "This is $system; packages are installed on Debian 12 only, and some are missing." "${missing[@]}"
            return 1
        }
        echo "This is $system, not Debian 12; all packages are there, so going on."
        return 0
    fi
    mapfile -t missing < <(printf '%s\n' "${packages[@]}" | setup_missing)
    [ ${#missing[@]} = 0 ] || setup_install "${missing[@]}"
}
