#!/usr/bin/env bash
# Installs the Debian packages that a task needs and that are not there yet.
#
#   scripts/packages.sh build|test|docs|package|office|bench|compare|windows|tidy|coverage|tables [...]
#
# Every package is listed once, with the reason for it. apt is not called when all are installed.
set -euo pipefail

packages_build=(
    g++ cmake ninja-build   # compiler and build
    ccache                  # a second build in seconds
    qt6-base-dev            # text, files, JSON, settings, fonts, printing
    qt6-l10n-tools          # translations
    libcli11-dev            # the command line
    libhpdf-dev             # PDF
    libexpat1-dev           # LandXML files
    nlohmann-json3-dev      # JSON files, object by object
    libpq-dev               # PostgreSQL databases
    libsqlite3-dev          # SQLite databases and GeoPackages
    libxlsxwriter-dev       # workbooks
    libfontconfig-dev       # where the faces of a PDF are
    libfreetype-dev         # what the glyphs of a PDF are composed of
    fonts-dejavu-core       # the fixed-pitch face that a page is measured with, and of a PDF
)
packages_test=(
    libgtest-dev            # tests
    libgmock-dev            # matchers
    clang-format            # the format check
    clang                   # second opinion on warnings, fuzz targets
    libclang-rt-14-dev      # run-time library of the fuzz targets
    python3                 # the check scripts
    poppler-utils           # PDFs read back as text, as pictures, their fonts
    qpdf                    # PDFs checked
    cups-daemon cups-client # a print queue
    cups-filters cups-filters-core-drivers cups-core-drivers # what a queue makes of a job
    postgresql              # a database server
    locales                 # a language with a decimal comma
    fonts-liberation2       # a second fixed-pitch face
    fonts-wqy-zenhei        # a face with CJK
    qt6-translations-l10n   # Qt's own texts in other languages
    parallel                # spreads a batch of jobs over processes and machines
    doxygen                 # says which member of a public header has no sentence
    zsh fish                # shells in which the command line is completed
    pkg-config              # a program outside that asks it for our flags
)
packages_docs=(
    doxygen                 # the pages of the public headers
)
packages_package=(
    dpkg-dev file           # Debian packages and what they depend on
    python3                 # the check of what the libraries offer
)
packages_office=(
    libreoffice-writer-nogui # rich text read by another program; the tests use it where it is installed
    libreoffice-calc-nogui  # workbooks, likewise
    python3-openpyxl        # workbooks, likewise
    chromium                # web pages opened in a browser, likewise
)
packages_bench=(
    libbenchmark-dev        # micro benchmarks
    libpugixml-dev libxml2-dev # template files compared against XML parsers
)
packages_compare=(
    python3                 # runs the programs and writes the page
    python3-matplotlib      # its pictures
    mawk gawk sqlite3 miller datamash # rows to text, and their groups
    python3-openpyxl        # rows to a workbook
    xsltproc                # points of a LandXML file to text
    postgresql              # rows from a database server
    valgrind                # instructions counted
    python3-reportlab enscript ghostscript # pages to PDF
    libreoffice-writer-nogui # pages to PDF, rich text
    pandoc unrtf            # rich text
    featherpad              # a text editor
    xvfb python3-xlib       # a screen that is watched
    parallel                # a batch over processes
)
packages_windows=(
    g++-mingw-w64-x86-64-posix # the compiler, with C++'s threads
    libz-mingw-w64-dev      # zlib, the one library that Debian has for Windows
    dpkg-dev                # unpacks and checks source packages
    qt6-base-dev            # the tools that Qt's build and ours run here
    qt6-base-dev-tools      # likewise
    meson ninja-build cmake # builds of the libraries
    pkg-config gperf python3 # what fontconfig's build runs
    make gcc tcl            # what SQLite's and PostgreSQL's builds run
    perl                    # likewise, and Qt's build runs it
    qt6-translations-l10n   # Qt's own texts in other languages
    fonts-dejavu-core       # the fixed-pitch face
    zip                     # what users unpack
    wine64                  # runs the programs
    xvfb xauth              # a screen for their windows
)
packages_tidy=(
    clang clang-tidy        # the sources read for mistakes that compile
    libclang-dev            # the plugin that keeps its checks out of the headers of the system
)
packages_coverage=(
    gcovr                   # which lines the tests reach
)

packages_tables=(
    python3-mpmath          # arbitrary precision, for the expected values of the geometry's tests
)

wanted=()
for group in "$@"; do
    declare -n list="packages_$group"
    wanted+=("${list[@]}")
done

missing=()
for package in $(printf '%s\n' "${wanted[@]}" | sort -u); do
    status=$(dpkg-query -W -f '${db:Status-Status}' "$package" 2>/dev/null || true)
    [ "$status" = installed ] || missing+=("$package")
done
[ ${#missing[@]} -eq 0 ] && exit 0

echo "Installing from Debian's packages: ${missing[*]}"
as_root=()
if [ "$(id -u)" -ne 0 ]; then
    if ! command -v sudo > /dev/null; then
        echo "These packages are missing and can only be installed as root: ${missing[*]}" >&2
        exit 1
    fi
    as_root=(sudo)
fi
export DEBIAN_FRONTEND=noninteractive
install=("${as_root[@]}" apt-get install -y -q --no-install-recommends)
log=$(mktemp)
trap 'rm -f "$log"' EXIT
# The package lists may be absent or too old on a fresh machine: fetch them and try again.
if ! "${install[@]}" "${missing[@]}" > "$log" 2>&1; then
    "${as_root[@]}" apt-get update -q > /dev/null
    if ! "${install[@]}" "${missing[@]}" > "$log" 2>&1; then
        cat "$log" >&2
        echo "The packages could not be installed." >&2
        exit 1
    fi
fi
