#!/usr/bin/env bash
# Builds and runs a program with what pkg-config says of the installed library.
#
#   pkg-config-test.sh COMPILER LIBRARY-FOLDER OUTPUT-FOLDER VERSION
set -euo pipefail
compiler=$1
libraries=$2
folder=$3
version=$4
source=$(dirname "$0")/main.cpp

export PKG_CONFIG_PATH=$libraries/pkgconfig
pkg-config --exact-version="$version" kareport
pkg-config --validate kareport
# shellcheck disable=SC2207 # one word each, as a makefile takes them
flags=($(pkg-config --cflags --libs kareport))
mkdir -p "$folder"
"$compiler" -std=c++20 -fPIC -Wl,-rpath,"$libraries" -o "$folder/by-pkg-config" "$source" "${flags[@]}"
"$folder/by-pkg-config" > /dev/null
