# shellcheck shell=bash disable=SC2034
# Where the sources, the libraries and Qt for Windows are kept between builds. Sourced by the scripts beside it.
#
# Each library has a folder of its own, whose name ends with a key: a sum over the versions and checksums of its sources, the
# function that builds it, the compiler, and the keys of the libraries that it needs. When one of these changes, what depends
# on it is built again, and nothing else. Any folder of the cache can be deleted at any time.

windows_cache=${XDG_CACHE_HOME:-$HOME/.cache}/kareport-windows
windows_sources=$windows_cache/sources
windows_triple=x86_64-w64-mingw32
windows_jobs=${KAREPORT_JOBS:-$(nproc)}
windows_toolchain=$PWD/cmake/mingw-w64.cmake

declare -A windows_prefix=() # of each library that is there
declare -A windows_key=()
windows_prefixes=            # of all of them, as a list of CMake

# The compiler and its run-time libraries, which are linked into everything.
windows_compiler() {
    dpkg-query -W -f '${Package} ${Version}\n' g++-mingw-w64-x86-64-posix mingw-w64-x86-64-dev libz-mingw-w64-dev
}

# windows_library NAME SOURCE [LIBRARY...]
#
# Makes sure that a library is in the cache. The function build_NAME builds it from the unpacked sources ($source) in a folder
# of its own, which is the current one, and installs it into $prefix. The libraries after SOURCE are those that it needs.
windows_library() {
    local name=$1 package=$2 needed key prefix source started log status
    shift 2
    windows_fetch "$package"
    key=$({
        cat "$windows_sources/$package.files"
        grep -v '^#' "$windows_toolchain"
        declare -f "build_$name" windows_cmake windows_root
        windows_compiler
        for needed in "$@"; do echo "${windows_key[$needed]}"; done
    } | sha256sum | cut -c 1-16)
    prefix=$windows_cache/$name-$key
    windows_key[$name]=$key
    windows_prefix[$name]=$prefix
    windows_prefixes=${windows_prefixes:+$windows_prefixes;}$prefix
    [ -e "$prefix/complete" ] && return

    started=$SECONDS
    echo "Building $name ($(head -n 1 "$windows_sources/$package.files"))"
    source=$windows_cache/build/$name-source
    log=$windows_cache/build/$name.log
    # A build of the same that was broken off goes on where it was.
    if [ "$(cat "$windows_cache/build/$name.key" 2> /dev/null)" != "$key" ]; then
        rm -rf "$prefix" "$source" "$windows_cache/build/$name"
        mkdir -p "$prefix" "$windows_cache/build/$name"
        windows_unpack "$package" "$source"
        echo "$key" > "$windows_cache/build/$name.key"
    fi
    # Not in the condition itself, where a shell goes on after errors.
    set +e
    (set -e; cd "$windows_cache/build/$name"; "build_$name") > "$log" 2>&1
    status=$?
    set -e
    if [ $status -ne 0 ]; then
        tail -n 40 "$log" >&2
        echo "$name could not be built; all of what was said is in $log" >&2
        exit 1
    fi
    mkdir -p "$prefix/licence"
    cp "$windows_sources/$package.files" "$prefix/licence/sources.txt"
    if [ -f "$source/debian/copyright" ]; then
        cp "$source/debian/copyright" "$prefix/licence/copyright"
    fi
    windows_licence "$source" "$prefix/licence"
    rm -rf "$source" "$windows_cache/build/$name" "$windows_cache/build/$name.key"
    echo "$((SECONDS - started)) s" > "$prefix/complete"
    echo "  $((SECONDS - started)) s, $(du -sm "$prefix" | cut -f 1) MB"
}

# The texts that makers of a library put beside its sources.
windows_licence() { # folder of the sources, folder to copy them to
    local file
    for file in "$1"/COPYING* "$1"/LICEN[CS]E* "$1"/docs/FTL.TXT "$1"/Copyright.txt "$1"/COPYRIGHT; do
        if [ -f "$file" ]; then
            cp "$file" "$2"
        fi
    done
    if [ -d "$1/LICENSES" ]; then
        cp -r "$1/LICENSES" "$2"
    fi
}

# The folders in which CMake looks for the libraries that another one needs.
windows_root() { # names of libraries
    local name root=
    for name in "$@"; do root=${root:+$root;}${windows_prefix[$name]}; done
    echo "$root"
}

# windows_cmake LIBRARIES OPTION... : configures, builds and installs $source with CMake. LIBRARIES is a list, "a b".
windows_cmake() {
    local libraries=$1
    shift
    # shellcheck disable=SC2086 # a list of names
    cmake -S "$source" -B . -G Ninja -DCMAKE_TOOLCHAIN_FILE="$windows_toolchain" -DCMAKE_BUILD_TYPE=Release \
        -DKAREPORT_WINDOWS_PREFIX="$(windows_root $libraries)" -DCMAKE_INSTALL_PREFIX="$prefix" "$@"
    cmake --build . --parallel "$windows_jobs"
    cmake --install . --strip
}
