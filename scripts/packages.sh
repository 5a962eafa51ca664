# Installs the system packages that are missing; to be sourced. Say which group is needed:
#   need_packages play       to build and start the game
#   need_packages desktop    to run every check of the desktop game as well
#   need_packages page       to build the page, and to play in it
#   need_packages web        to check the page as well
#   need_packages installer  to build the game for Windows and pack it
#   need_packages windows    to check it as well
#   need_packages package    to build the Debian package
#   need_packages root       to make a fresh system to try things in

say() { printf '%s: %s\n' "${0##*/}" "$*"; }
fail() {
    say "$*" >&2
    exit 1
}

packages_of() {
    local shared="cmake ninja-build g++ libstb-dev librsvg2-bin libharfbuzz-bin libpng-dev fonts-liberation"
    # From Debian 13 and Ubuntu 24.04 on, Sans Narrow is a package of its own.
    case "$1" in
        debian-12) ;;
        debian-13 | ubuntu-24.04) shared+=" fonts-liberation-sans-narrow" ;;
        *) return 1 ;;
    esac
    local play="$shared pkg-config libsdl2-dev libx11-dev libxext-dev libsqlite3-dev xdg-utils"
    # Node and npm are taken from wherever they are.
    local page="$shared clang-19 lld-19 wasi-libc libc++-19-dev-wasm32 libc++abi-19-dev-wasm32 libclang-rt-19-dev-wasm32"
    page+=" zip xdg-utils$(command -v node >/dev/null || printf ' nodejs')$(command -v npm >/dev/null || printf ' npm')"
    local installer="$shared g++-mingw-w64-x86-64-posix icoutils nsis zip"
    case "$2" in
        play) printf '%s' "$play" ;;
        desktop) printf '%s' "$play libgtest-dev clang-19 libclang-rt-19-dev clang-format-19 clang-tidy-19 cppcheck valgrind" \
            " apngasm xvfb openbox icewm xdotool x11-xserver-utils libxtst-dev" ;;
        page) printf '%s' "$page" ;;
        web) printf '%s' "$page libgtest-dev chromium firefox-esr" ;;
        installer) printf '%s' "$installer" ;;
        windows) printf '%s' "$installer libgtest-dev pkg-config libx11-dev libxtst-dev wine wine64 xvfb openbox unzip" ;;
        package) printf '%s' "$play dpkg-dev lintian desktop-file-utils appstream man-db groff" ;;
        root) printf 'debootstrap' ;;
    esac
}

need_packages() {
    local system list missing="" package
    system=$(. /etc/os-release 2>/dev/null && printf '%s-%s' "${ID:-unknown}" "${VERSION_ID:-}")
    if ! list=$(packages_of "$system" "$1"); then
        fail "this system ($system) is not known; Debian 12, Debian 13 and Ubuntu 24.04 are. On Debian 12 these packages are needed: $(packages_of debian-12 "$1")"
    fi
    for package in $list; do
        dpkg-query -W -f '${db:Status-Status}\n' "$package" 2>/dev/null | grep -qx installed || missing+=" $package"
    done
    [ -n "$missing" ] || return 0
    local as_root=""
    if [ "$(id -u)" -ne 0 ]; then
        command -v sudo >/dev/null || fail "these packages are missing, and there is no sudo to install them with:$missing"
        as_root=sudo
    fi
    say "installing$missing"
    local log
    log=$(mktemp)
    # shellcheck disable=SC2086  # the lists are words
    if ! { $as_root apt-get update -qq && $as_root env DEBIAN_FRONTEND=noninteractive \
        apt-get install -y -qq --no-install-recommends $missing; } </dev/null >"$log" 2>&1; then
        tail -n 20 "$log" >&2
        rm -f "$log"
        fail "could not install$missing"
    fi
    rm -f "$log"
}

# Configures a preset when that was not done yet (ninja sees to later changes), and builds it. With
# QUABBLE_WARNINGS_AS_ERRORS=ON in the environment a warning ends the build.
build_preset() {
    local log
    log=$(mktemp)
    if { [ -f "build/$1/build.ninja" ] || cmake --preset "$1" ${QUABBLE_WARNINGS_AS_ERRORS:+"-DQUABBLE_WARNINGS_AS_ERRORS=$QUABBLE_WARNINGS_AS_ERRORS"}; } >"$log" 2>&1 &&
        cmake --build --preset "$1" >>"$log" 2>&1; then
        rm -f "$log"
    else
        tail -n 60 "$log" >&2
        rm -f "$log"
        fail "the $1 build failed"
    fi
}
