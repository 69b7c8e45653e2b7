# shellcheck shell=bash disable=SC2154
# Source packages of Debian, for the libraries that are built for Windows. Sourced by the scripts beside it.
#
# apt checks the signature of the archive's list of files with Debian's keys, that list names the checksum of the list of
# sources, and this one those of each file. Every file is compared with its checksum again whenever it is used, and
# dpkg-source compares what it unpacks with the package's own description (.dsc). The lists are in the cache: those of the
# system, and what it is set to install from, stay as they are.

windows_apt() { # command of apt-get or apt-cache, and its arguments
    local command=$1
    shift
    "$command" -q -o Dir::Etc::SourceList="$windows_cache/apt/sources.list" -o Dir::Etc::SourceParts=/dev/null \
        -o Dir::State::Lists="$windows_cache/apt/lists" -o Dir::Cache="$windows_cache/apt/cache" \
        -o APT::Sandbox::User="$(id -un)" "$@"
}

# Brings the lists of the archive up to date. Without a network, those of the last time are taken.
windows_update_lists() {
    local keys=/usr/share/keyrings/debian-archive-keyring.gpg log=$windows_cache/apt/update.log
    mkdir -p "$windows_cache/apt/lists/partial" "$windows_cache/apt/cache/archives/partial" "$windows_sources"
    printf 'deb-src [signed-by=%s] http://deb.debian.org/%s main\n' \
        "$keys" 'debian bookworm' "$keys" 'debian-security bookworm-security' > "$windows_cache/apt/sources.list"
    if ! windows_apt apt-get update > "$log" 2>&1 || grep -q '^[WE]:' "$log"; then
        cat "$log" >&2
        ls "$windows_cache"/apt/lists/*_Sources* > /dev/null || exit 1
        echo "The lists of Debian's sources could not be updated; the earlier ones are used." >&2
    fi
}

# Whether all files of a list ("NAME SHA256" lines, after a first line) are there and as Debian has signed them.
windows_are_whole() {
    (cd "$windows_sources" && tail -n +2 "$1" | awk '{print $2 "  " $1}' | sha256sum --quiet --check --strict) > /dev/null 2>&1
}

# windows_fetch PACKAGE: fetches a source package. What it consists of is then in $windows_sources/PACKAGE.files: the package
# with its version, and a line "NAME SHA256" for each file.
#
# Of several versions the newest that the archive really has is taken. Of a package whose changes by Debian the archive lacks,
# the makers' own sources alone.
windows_fetch() {
    local package=$1 version list=$windows_sources/$1.files files newest=
    for version in $(windows_apt apt-cache showsrc --only-source "$package" | sed -n 's/^Version: //p' | sort -rV); do
        newest=${newest:-$version}
        windows_list "$package" "$version" > "$list.new"
        files=$(tail -n +2 "$list.new" | wc -l)
        if [ "$files" -gt 0 ] && { windows_are_whole "$list.new" || windows_download "$package" "$version" &&
            windows_are_whole "$list.new"; }; then
            mv "$list.new" "$list"
            return
        fi
    done
    if [ -n "$newest" ]; then
        windows_list "$package" "$newest" | grep -E "^$package |\.orig\.tar\.[a-z0-9]+ " > "$list.new"
        if [ "$(wc -l < "$list.new")" -gt 1 ] && windows_are_whole "$list.new"; then
            echo "Of $package $newest, the archive has the makers' sources alone."
            mv "$list.new" "$list"
            return
        fi
    fi
    rm -f "$list.new"
    echo "The sources of $package could not be fetched." >&2
    exit 1
}

windows_list() { # package, version
    echo "$1 $2"
    windows_apt apt-get source --print-uris --download-only "$1=$2" 2> /dev/null |
        sed -n "s/^'[^']*' \([^ ]*\) [0-9]* SHA256:\([0-9a-f]*\)\$/\1 \2/p" | sort
}

windows_download() { # package, version
    (cd "$windows_sources" && windows_apt apt-get source --download-only "$1=$2" > "$1.log" 2>&1)
}

# windows_unpack PACKAGE FOLDER: unpacks what was fetched, with Debian's changes.
windows_unpack() {
    local description original list=$windows_sources/$1.files
    description=$(sed -n 's/\.dsc .*/.dsc/p' "$list")
    if ! windows_are_whole "$list"; then
        echo "The sources of $1 are not what Debian has signed." >&2
        exit 1
    fi
    if [ -n "$description" ]; then
        dpkg-source --no-copy -x "$windows_sources/$description" "$2" > "$windows_cache/build/$1-unpack.log" 2>&1
        return
    fi
    original=$(sed -n 's/\(\.orig\.tar\.[a-z0-9]*\) .*/\1/p' "$list")
    mkdir -p "$2"
    tar -xf "$windows_sources/$original" -C "$2" --strip-components=1
}
