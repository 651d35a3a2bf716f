# What the scripts share: the packages that the project needs, and how it is built.
# Sourced by run and test; expects $project, the checkout's folder.

# One line a package. Where several serve, they stand on one line with a bar between them; the last
# one is installed when none is there.
build_packages=(
    g++ cmake ninja-build ccache pkg-config
    libwxgtk3.2-dev libgsf-1-dev libcups2-dev libexpat1-dev
    libpoppler-glib-dev libcairo2-dev libpango1.0-dev libfontconfig-dev libglib2.0-dev libseccomp-dev
    libharfbuzz-dev libreoffice-dev libreofficekit-dev
    libcli11-dev nlohmann-json3-dev gettext
    libsqlite3-dev libtomlplusplus-dev libcpp-httplib-dev libpqxx-dev prometheus-cpp-dev
    libsystemd-dev
)
run_packages=(
    'libreoffice-writer|libreoffice-writer-nogui'
    'libreoffice-calc|libreoffice-calc-nogui'
    'libreoffice-impress|libreoffice-impress-nogui'
    'libreoffice-draw|libreoffice-draw-nogui'
    ghostscript
    fonts-liberation fonts-dejavu-core fonts-crosextra-carlito fonts-crosextra-caladea
)
test_packages=(
    libgtest-dev libgmock-dev poppler-utils xvfb xauth
    cups-daemon cups-client cups-core-drivers cups-filters-core-drivers cups-ipp-utils dbus-daemon
    postgresql-15
)
# The compiler and the zlib for Windows, Wine, and what builds the other libraries from source.
windows_packages=(
    g++-mingw-w64-x86-64-posix gcc-mingw-w64-x86-64-posix libz-mingw-w64 libz-mingw-w64-dev
    googletest wine64
    dpkg-dev autoconf automake libtool make patch tcl xz-utils
)
lint_packages=(clang-format clang-tidy libbenchmark-dev)
bench_packages=(libgtest-dev libgmock-dev libbenchmark-dev hyperfine python3)

fail() {
    printf '%s\n' "$*" >&2
    exit 2
}

# Locks an open file; says what it waits for when somebody else has it.
# lock DESCRIPTOR WHAT
lock() {
    flock -n "$1" && return
    printf 'Waiting for another %s to end.\n' "$2" >&2
    flock "$1"
}

# Installs those of the packages given that are not there. Says nothing when all are.
ensure_packages() {
    local wanted missing=() installed alternative
    installed=" $(dpkg-query -W -f '${db:Status-Abbrev}${Package} ' 2>/dev/null) "
    for wanted in "$@"; do
        for alternative in ${wanted//|/ }; do
            [[ $installed == *" ii $alternative "* || $installed == *" hi $alternative "* ]] && continue 2
        done
        missing+=("${wanted##*|}")
    done
    ((${#missing[@]})) || return 0

    local as_root=()
    if ((EUID != 0)); then
        command -v sudo >/dev/null || fail "These packages are missing: ${missing[*]}
Install them as root: apt-get install --no-install-recommends ${missing[*]}"
        as_root=(sudo)
    fi
    mkdir -p "$project/build"
    exec 7>"$project/build/.packages.lock"
    lock 7 'installation of packages'
    printf 'Installing %s\n' "${missing[*]}" >&2
    # Tests start database servers of their own; no other is to be made and started for good.
    local no_cluster=/etc/postgresql-common/createcluster.d/quillon-tests.conf
    "${as_root[@]}" mkdir -p "${no_cluster%/*}"
    echo 'create_main_cluster = false' | "${as_root[@]}" tee "$no_cluster" >/dev/null
    {
        "${as_root[@]}" apt-get -q update &&
            "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
                apt-get -qy -o DPkg::Lock::Timeout=-1 install --no-install-recommends "${missing[@]}"
    } >&2 7>&- || fail "The packages could not be installed. Install them by hand: ${missing[*]}"
    "${as_root[@]}" rm "$no_cluster"
    flock -u 7
}

# Builds a target of a preset, one builder at a time; quiet unless it fails. A folder is configured
# for the program alone, and again when a target wants more: QUILLON_TESTS or QUILLON_BENCHMARKS.
# build PRESET TARGET [OPTION]…
build() {
    local preset=$1 target=$2 folder="$project/build/$1" log
    shift 2
    log="$folder/build.log"
    mkdir -p "$folder" && [[ -w $folder ]] ||
        fail "$folder cannot be written to. It may belong to another user: remove it, or run as that user."
    exec 9>"$folder/.lock"
    lock 9 "build in $folder"
    if ! is_configured "$folder" "$@"; then
        printf 'Building in %s; the first time takes a few minutes.\n' "$folder" >&2
        configure "$preset" "$@" >"$log" 2>&1 || show_failure "$log"
    fi
    cmake --build "$folder" --target "$target" >"$log" 2>&1 || show_failure "$log"
    flock -u 9
}

# Whether a build folder is ready, with all of the options given.
is_configured() {
    local folder=$1 option
    shift
    [[ -f $folder/build.ninja ]] || return
    for option in "$@"; do
        grep -q "^$option:BOOL=ON$" "$folder/CMakeCache.txt" || return
    done
}

# What has been configured before stays: only a new folder begins with the program alone.
configure() (
    preset=$1 options=()
    shift
    [[ -f $project/build/$preset/build.ninja ]] ||
        options=(-DQUILLON_TESTS=OFF -DQUILLON_BENCHMARKS=OFF)
    for option in "$@"; do
        options+=("-D$option=ON")
    done
    cd "$project"
    cmake --preset "$preset" "${options[@]}"
)

# Where the libraries for Windows lie that Debian has no package of: outside the tree, since they
# take long and serve every checkout.
windows_libraries="${XDG_CACHE_HOME:-$HOME/.cache}/quillon/windows-x86_64"

# Builds those libraries where that has not been done.
build_windows_libraries() {
    local log="$project/build/windows-libraries.log"
    mkdir -p "$project/build" "${windows_libraries%/*}"
    exec 8>"${windows_libraries%/*}/.lock"
    lock 8 'build of the libraries for Windows'
    "$project/scripts/windows/libraries" "$windows_libraries" >"$log" 2>&1 || show_failure "$log"
    exec 8>&-
}

show_failure() {
    grep -E -A 12 'FAILED|rror:|CMake Error' "$1" | head -n 60 >&2
    fail "The build failed; all of its output is in $1."
}
