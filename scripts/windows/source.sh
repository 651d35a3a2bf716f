# Fetches source packages of the Debian release that is installed, with an apt of its own: neither
# root nor a change of the machine's own package lists is needed. Sourced by libraries.

# The machine's mirrors of the release, each as a line for source packages. The release proper keeps
# its packages for as long as it lives; its updates replace theirs from day to day.
source_lines() {
    local codename signed=/usr/share/keyrings/debian-archive-keyring.gpg
    codename=$(. /etc/os-release && printf '%s' "$VERSION_CODENAME")
    apt-get indextargets --format '$(ORIGIN) $(CODENAME) $(REPO_URI) $(RELEASE)' \
        'Created-By: Packages' 'Component: main' |
        sed -n "s|^Debian $codename \\(.*\\)|deb-src [signed-by=$signed] \\1 main|p" | sort -u
}

# fetch_source NAME FOLDER: unpacks the package, patched as Debian patches it, as FOLDER/NAME.
fetch_source() {
    local name=$1 folder=$2 apt="$2/apt"
    mkdir -p "$apt/lists/partial" "$apt/cache/archives/partial"
    source_lines >"$apt/sources.list"
    [[ -s $apt/sources.list ]] || fail 'apt knows no mirror of Debian. Run apt-get update and try again.'
    local options=(
        -q -o "Dir::Etc::SourceList=$apt/sources.list" -o Dir::Etc::SourceParts=/dev/null
        -o "Dir::State::Lists=$apt/lists" -o "Dir::Cache=$apt/cache" -o APT::Sandbox::User=
    )
    apt-get "${options[@]}" update
    (cd "$folder" && apt-get "${options[@]}" source "$name")
    mv "$folder/$name"-*/ "$folder/$name"
}
