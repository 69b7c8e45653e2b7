# shellcheck shell=bash disable=SC2154
# The libraries for Windows, from Debian's sources. Sourced by scripts/windows.sh. All are linked into the programs but libpq,
# which a program loads when a job wants it.

build_png() {
    windows_cmake '' -DPNG_SHARED=OFF -DPNG_TESTS=OFF
}

build_expat() {
    source=$source/expat
    # Debian's changes ask for the value that the other of its builds gives it.
    sed -i 's/^#cmakedefine XML_DTD$/#cmakedefine XML_DTD 1/' "$source/expat_config.h.cmake"
    windows_cmake '' -DEXPAT_SHARED_LIBS=OFF -DEXPAT_BUILD_TESTS=OFF -DEXPAT_BUILD_EXAMPLES=OFF -DEXPAT_BUILD_TOOLS=OFF \
        -DEXPAT_BUILD_DOCS=OFF
}

build_freetype() {
    windows_cmake png -DFT_REQUIRE_ZLIB=ON -DFT_REQUIRE_PNG=ON -DFT_DISABLE_HARFBUZZ=ON -DFT_DISABLE_BROTLI=ON \
        -DFT_DISABLE_BZIP2=ON
}

build_fontconfig() {
    local folders=/usr/$windows_triple/lib/pkgconfig name
    for name in expat freetype png; do
        folders=$folders:${windows_prefix[$name]}/lib/pkgconfig
    done
    cat > cross.ini << INI
[binaries]
c = '$windows_triple-gcc-posix'
ar = '$windows_triple-ar'
strip = '$windows_triple-strip'
windres = '$windows_triple-windres'
pkgconfig = 'pkg-config'

[host_machine]
system = 'windows'
cpu_family = 'x86_64'
cpu = 'x86_64'
endian = 'little'
INI
    # The cache of what was found is a file: the programs keep theirs in memory.
    PKG_CONFIG_LIBDIR=$folders meson setup --cross-file cross.ini --wrap-mode=nodownload --default-library=static \
        --buildtype=release --prefix="$prefix" --libdir=lib -Ddoc=disabled -Dtests=disabled -Dtools=disabled \
        -Dnls=disabled -Dcache-build=disabled -Dadditional-fonts-dirs=no . "$source"
    ninja -j "$windows_jobs" install
}

build_hpdf() {
    # The version that a PDF names as its producer: Debian's own build of these sources says so.
    sed -i 's/"2\.3\.0RC[0-9]*"/"2.3.0"/' "$source/include/hpdf_version.h"
    grep -q '"2\.3\.0"' "$source/include/hpdf_version.h"
    windows_cmake png -DLIBHPDF_SHARED=OFF -DLIBHPDF_STATIC=ON -DLIBHPDF_EXAMPLES=OFF
    mv "$prefix/lib/libhpdfs.a" "$prefix/lib/libhpdf.a"
    rm -f "$prefix/lib/libpng.a" "$prefix/lib/libz.a" # copies of what it was built with
}

build_sqlite() {
    # One source file is made of all, by tools that run here.
    "$source/configure" --disable-tcl --disable-shared --disable-readline
    make -j "$windows_jobs" sqlite3.c sqlite3.h
    "$windows_triple-gcc-posix" -O2 -D_WIN32_WINNT=0x0A00 -DSQLITE_SECURE_DELETE -DSQLITE_ENABLE_COLUMN_METADATA \
        -DSQLITE_ENABLE_RTREE -DSQLITE_ENABLE_FTS3 -DSQLITE_ENABLE_FTS4 -DSQLITE_ENABLE_FTS5 \
        -DSQLITE_ENABLE_MATH_FUNCTIONS -DSQLITE_OMIT_LOAD_EXTENSION -c sqlite3.c -o sqlite3.o
    mkdir -p "$prefix/lib" "$prefix/include"
    "$windows_triple-ar" rcs "$prefix/lib/libsqlite3.a" sqlite3.o
    cp sqlite3.h "$prefix/include"
}

build_xlsxwriter() {
    windows_cmake '' -DBUILD_SHARED_LIBS=OFF
}

build_pq() {
    "$source/configure" --host="$windows_triple" --prefix="$prefix" --without-readline --without-zlib --without-icu \
        CC="$windows_triple-gcc-posix" CFLAGS='-O2 -D_WIN32_WINNT=0x0A00'
    make -C src/backend generated-headers
    make -j "$windows_jobs" -C src/interfaces/libpq install
    make -C src/include install
    "$windows_triple-strip" "$prefix"/lib/libpq.dll "$prefix"/bin/libpq.dll 2> /dev/null || true
}

build_json() {
    windows_cmake '' -DJSON_BuildTests=OFF
}

build_cli11() {
    windows_cmake '' -DCLI11_BUILD_TESTS=OFF -DCLI11_BUILD_EXAMPLES=OFF -DCLI11_BUILD_DOCS=OFF -DCLI11_SINGLE_FILE=OFF
}

build_gtest() {
    windows_cmake '' -DBUILD_GMOCK=ON
}

# All of them, in the order in which they need each other.
windows_libraries() {
    windows_library png libpng1.6
    windows_library expat expat
    windows_library freetype freetype png
    windows_library fontconfig fontconfig expat freetype png
    windows_library hpdf libharu png
    windows_library sqlite sqlite3
    windows_library xlsxwriter libxlsxwriter
    windows_library pq postgresql-15
    windows_library json nlohmann-json3
    windows_library cli11 cli11
    windows_library gtest googletest
    windows_library qt qt6-base
}
