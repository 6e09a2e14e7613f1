# Sourced by the commands beside this folder: installs what they need and moves to the project.
# shellcheck shell=bash disable=SC2034 # they use the names

set -euo pipefail

project_dir=$(cd "$(dirname "${BASH_SOURCE[0]}")/../.." && pwd)
cd "$project_dir"

say() {
    printf '== %s\n' "$*"
}

fail() {
    printf '%s: %s\n' "$(basename "$0")" "$*" >&2
    exit 1
}

is_installed() {
    [ "$(dpkg-query -W -f='${db:Status-Status}' "$1" 2>/dev/null)" = installed ]
}

# The command in front of apt-get: nothing for root, sudo where it asks no password.
apt_prefix() {
    if [ "$(id -u)" -eq 0 ]; then
        printf 'env'
    elif command -v sudo >/dev/null && sudo -n true 2>/dev/null; then
        printf 'sudo'
    else
        return 1
    fi
}

# Installs the Debian packages named, those that are missing.
require_packages() {
    if ! command -v dpkg-query >/dev/null || ! command -v apt-get >/dev/null; then
        say "Not a Debian system: going on with what is installed. Needed are what Debian calls: $*"
        return
    fi
    local missing=() package prefix
    for package in "$@"; do
        is_installed "$package" || missing+=("$package")
    done
    if [ ${#missing[@]} -eq 0 ]; then
        return
    fi
    prefix=$(apt_prefix) || fail "these packages are missing and may not be installed by this user:
    ${missing[*]}
Install them as root, then run this again:
    apt-get update && apt-get install --no-install-recommends ${missing[*]}"
    say "Installing ${missing[*]}"
    $prefix apt-get update -q
    $prefix env DEBIAN_FRONTEND=noninteractive \
        apt-get install -q -y --no-install-recommends "${missing[@]}"
}

# Runs a command on a display of its own, which goes with it.
run_under_xvfb() {
    xvfb-run --auto-servernum --server-args='-screen 0 1920x1080x24' "$@"
}

# What every build needs.
build_packages=(cmake ninja-build g++ ccache qtbase5-dev)

# What the view layer for Qt Quick needs, to be built and to be imported; its tools check QML files.
quick_packages=(qtdeclarative5-dev qtdeclarative5-dev-tools qml-module-qtqml-models2
    qml-module-qtquick2 qml-module-qtquick-shapes qml-module-qtquick-window2)

# What the tool for interruption rules needs.
rules_packages=(nlohmann-json3-dev libcli11-dev)

# What its tests need beside that; groff and man check the man page, a browser the page of a matrix.
rules_test_packages=(python3-jsonschema groff-base man-db chromium chromium-driver python3-selenium)

# What feeding the tool with random input needs beside Clang, and so the preset "clang".
fuzz_packages=(libclang-rt-14-dev)

# The fonts of the head unit's screens.
scene_packages=(fonts-inter fonts-material-design-icons-iconfont)

# A display that nobody sees.
xvfb_packages=(xvfb xauth)

# What the benchmarks need beside that, and so the preset "release". Qt SCXML's CMake files ask for
# Qt Qml, which its own package does not bring.
benchmark_packages=(libqt5scxml5-dev qtdeclarative5-dev valgrind)

# What the reference of the classes needs, and so the preset "dev": Doxygen, graphviz for its drawings,
# Qt's tag files for links to Qt's own reference.
docs_packages=(doxygen graphviz python3 qtbase5-doc-dev qtdeclarative5-doc-dev)

# What compares the binary interface with the committed one, and so the preset "dev".
interface_packages=(abigail-tools python3)

# What draws the diagrams of the documents.
diagram_packages=(graphviz)

# What counts the lines and branches that tests run.
coverage_packages=(gcovr)

# What making Debian packages needs beside that, and looking into them.
debian_packages=(dpkg-dev file lintian)

# What using the installed library by pkg-config and qmake needs beside that.
package_test_packages=(pkg-config make "${debian_packages[@]}")

# What looks at the code without running it: scripts/check, and so the preset "clang".
check_packages=(clang-tidy clazy codespell cppcheck pyflakes3 python3 shellcheck)

# What the preset "tsan" needs beside the compiler.
tsan_packages=(libtsan2)
