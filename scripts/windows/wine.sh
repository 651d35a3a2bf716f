# How Wine is used here. Sourced by run-program and session.

# Not the scripts of that name in the path: they insist on a Wine for 32 bits as well.
wine=/usr/lib/wine/wine64
wineserver=/usr/lib/wine/wineserver64

# Sets Wine up for the programs of a build folder: a machine of its own in that folder, with the
# build's libraries in its path.
use_wine() {
    local build
    build=$(readlink -f "$1")
    export WINEPREFIX="$build/wine"
    export WINEDEBUG=-all
    export WINEPATH="Z:${build//\//\\}\\bin"
    # Without .NET and a web browser, which nothing here uses and Wine would ask for; and without its
    # debugger, which turns a crash into exit code 0.
    export WINEDLLOVERRIDES='mscoree,mshtml,winedbg.exe='
}
