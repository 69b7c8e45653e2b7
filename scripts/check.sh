#!/usr/bin/env bash
# Checks that take too long to run with the tests: clang-tidy over every folder, coverage, a search of each fuzz target.
# shellcheck disable=SC2317 # the steps are called by their names
set -euo pipefail
cd "$(dirname "$0")/.."

usage() {
    cat << 'TEXT'
usage: scripts/check.sh [tidy | coverage | fuzz]... [--folder FOLDER]... [--seconds N] [--jobs N]

Runs what is named, or all three, and installs what they need. Exit status 1 when one of them has found something.

  tidy       clang-tidy over every source, tests included, folder by folder (build/tidy). Nothing is built, and what was
             clean and has not changed since is not read again
  coverage   the tests, instrumented (build/coverage): the lines reached in each folder, and a page for each file in
             out/coverage
  fuzz       a minute of each fuzz target under the sanitizers (build/fuzz). New inputs stay in build/fuzz/corpus; one that
             fails is named, and is to be kept in fuzz/corpus once it is fixed

  --folder FOLDER   tidy: only this folder, as page or apps/kareport; can be given several times
  --seconds N       fuzz: seconds for each target instead of 60
  --jobs N          processes at a time; all processors without it
TEXT
}

steps=()
folders=()
seconds=60
jobs=$(nproc)
while [ $# -gt 0 ]; do
    case "$1" in
    tidy | coverage | fuzz) steps+=("$1") ;;
    --folder | --seconds | --jobs)
        [ $# -gt 1 ] || { usage >&2; exit 1; }
        case "$1" in
        --folder) folders+=("${2%/}") ;;
        --seconds) seconds=$2 ;;
        --jobs) jobs=$2 ;;
        esac
        shift
        ;;
    --help | -h) usage; exit 0 ;;
    *) usage >&2; exit 1 ;;
    esac
    shift
done
[ ${#steps[@]} -gt 0 ] || steps=(tidy coverage fuzz)
[ ${#folders[@]} -gt 0 ] ||
    folders=(host templates groups page formats report print view ui sheets geometry sources rows exports jobs preview apps tools bench examples fuzz tests)

run_tidy() {
    scripts/packages.sh build test bench tidy || return 1
    cmake --preset tidy > build/tidy.log 2>&1 || { cat build/tidy.log >&2; return 1; }
    local batch
    # Only the files that include the tests are made: asked for them, ninja would build the libraries first.
    for batch in $(ninja -C build/tidy -t targets all | sed -nE 's/^(tests\/.*batch[0-9]+\.cpp): CUSTOM_COMMAND$/\1/p'); do
        sh -c "$(ninja -C build/tidy -t commands -s "$batch")" || return 1
    done
    scripts/tidy.py --jobs "$jobs" "${folders[@]}"
}

run_coverage() {
    scripts/packages.sh build test coverage && scripts/build.sh coverage || return 1
    local found=0
    ctest --preset coverage --output-on-failure --progress --parallel "$jobs" || found=1
    mkdir -p out/coverage
    gcovr --root . --object-directory build/coverage -j "$jobs" --exclude '(tests|build|fuzz|bench|tools)/' \
        --exclude-throw-branches --exclude-unreachable-branches \
        --json-summary out/coverage/summary.json --html-details out/coverage/index.html > build/coverage.log 2>&1 ||
        { cat build/coverage.log >&2; return 1; }
    python3 - << 'PYTHON'
import collections, json
lines = collections.Counter()
reached = collections.Counter()
for file in json.load(open("out/coverage/summary.json"))["files"]:
    folder = file["filename"].rsplit("/", 1)[0]
    for name in (folder, "all"):
        lines[name] += file["line_total"]
        reached[name] += file["line_covered"]
for folder in sorted(lines, key=lambda name: (name == "all", name)):
    print(f"coverage: {folder:24} {100 * reached[folder] / max(1, lines[folder]):5.1f} % of {lines[folder]} lines")
PYTHON
    echo "coverage: each file in out/coverage/index.html"
    return "$found"
}

run_fuzz() {
    scripts/packages.sh build test && scripts/build.sh fuzz || return 1
    local target name found=0
    for target in build/fuzz/fuzz/Fuzz*; do
        [ -f "$target" ] || continue
        name=$(basename "$target")
        mkdir -p "build/fuzz/corpus/$name"
        echo "fuzz: $name for $seconds seconds"
        if ! QT_QPA_PLATFORM=offscreen "$target" -max_total_time="$seconds" -timeout=20 -print_final_stats=1 \
            -artifact_prefix="build/fuzz/$name-" "build/fuzz/corpus/$name" "fuzz/corpus/$name" examples \
            > "build/fuzz/$name.log" 2>&1
        then
            tail -n 40 "build/fuzz/$name.log"
            echo "fuzz: $name has found something: build/fuzz/$name-*"
            found=1
        fi
        grep -E 'number_of_executed_units|new_units_added' "build/fuzz/$name.log" | sed "s/^stat::/    /" || true
    done
    return "$found"
}

mkdir -p build
status=0
for step in "${steps[@]}"; do
    "run_$step" || { echo "$step: something was found"; status=1; }
done
exit $status
