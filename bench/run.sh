#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: run.sh [BUILD-DIRECTORY]
# Measures what the library costs beside GDBus alone and says which goals are met. Without a
# directory it builds the release preset first. REPETITIONS (default 5): of how many runs each figure
# is the median. SECONDS_EACH (default 2): how long a timed run is.
set -euo pipefail
cd "$(dirname "$0")/.."

if (($#)); then
    build=$1
else
    build=build/release
    scripts/dependencies.sh check
    cmake --preset release -DIMS_BUILD_BENCH=ON
    cmake --build --preset release
fi
export REPETITIONS=${REPETITIONS:-5}
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

"$build/bin/frame_bench" --benchmark_repetitions="$REPETITIONS" \
    --benchmark_min_time="${SECONDS_EACH:-2}" --benchmark_enable_random_interleaving=true \
    --benchmark_out="$scratch/rates.csv" --benchmark_out_format=csv
"$build/bin/frame_memory" | tee "$scratch/memory"
bench/count_instructions.sh "$build" | tee "$scratch/instructions"

# line WHAT LIBRARY BARE FIGURE RELATION GOAL
line() {
    awk -v what="$1" -v library="$2" -v bare="$3" -v figure="$4" -v relation="$5" -v goal="$6" '
    BEGIN {
        is_met = relation == "<=" ? figure <= goal : figure >= goal
        printf "%-40s%9d%9d%8s  %s %-5s %s\n", what, library, bare, figure, relation, goal,
            is_met ? "met" : "MISSED"
    }'
}

ratio() {
    awk -v library="$1" -v bare="$2" 'BEGIN { printf "%.3f", library / bare }'
}

# The median of the CSV's named column for a benchmark.
timed() {
    awk -F, -v name="\"$1/process_time/real_time_median\"" -v column="$2" '
    $1 == "name" { for (i = 1; i <= NF; ++i) if ($i == column) at = i }
    $1 == name { printf "%.3f", $at }' "$scratch/rates.csv"
}

rate() {
    local library bare
    library=$(timed "$1/library" items_per_second)
    bare=$(timed "$1/bare" items_per_second)
    line "$2" "$library" "$bare" "$(ratio "$library" "$bare")" '>=' 0.97
}

cpu() {
    local library bare
    library=$(timed "$1/library" cpu_time)
    bare=$(timed "$1/bare" cpu_time)
    printf '%-40s%9.1f%9.1f%8s\n' "$2" "$library" "$bare" "$(ratio "$library" "$bare")"
}

instructions() {
    local library bare
    read -r _ library bare _ < <(grep "^$1 " "$scratch/instructions")
    line "$2" "$library" "$bare" "$(ratio "$library" "$bare")" '<=' 1.02
}

memory() {
    local library bare
    library=$(awk '$1 == "library" { print $2 }' "$scratch/memory")
    bare=$(awk '$1 == "bare" { print $2 }' "$scratch/memory")
    line 'heap bytes per pending request' "$library" "$bare" "+$((library - bare))" '<=' 64
}

printf '\n%-40s%9s%9s%8s  %s\n' "medians of $REPETITIONS" library bare '' goal
rate request_1 'requests/s, 1 outstanding'
rate request_64 'requests/s, 64 outstanding'
rate request_1000 'requests/s, 1000 outstanding'
rate query 'queries/s'
rate signal 'signals/s'
instructions request "instructions per request, caller's thread"
instructions query "instructions per query, caller's thread"
memory
cpu request_1 'process CPU us per request, 1'
cpu request_64 'process CPU us per request, 64'
cpu request_1000 'process CPU us per request, 1000'
cpu query 'process CPU us per query'
cpu signal 'process CPU us per signal'
