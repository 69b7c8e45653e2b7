# shellcheck shell=bash disable=SC2154
# Qt for Windows, from Debian's sources and with the tools of Debian's Qt. Sourced by scripts/windows.sh.

# The Wintab header, which pen tablets need, is not free and not among Debian's sources. A window of Qt has one function less
# without it: what is built against Qt must be built against this one.
build_qt() {
    windows_cmake '' -DQT_HOST_PATH=/usr -DQT_HOST_PATH_CMAKE_DIR=/usr/lib/x86_64-linux-gnu/cmake \
        -DQT_BUILD_EXAMPLES=OFF -DQT_BUILD_TESTS=OFF \
        -DFEATURE_sql=OFF -DFEATURE_dbus=OFF -DFEATURE_network=OFF -DFEATURE_zstd=OFF -DINPUT_opengl=no \
        -DFEATURE_tabletevent=OFF -DFEATURE_direct2d=OFF -DFEATURE_direct2d1_1=OFF \
        -DFEATURE_system_zlib=OFF -DFEATURE_system_png=OFF -DFEATURE_system_freetype=OFF
}
