#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: run.sh [BUILD-DIRECTORY]
# Measures what the library costs beside GDBus alone and prints the result as the two tables of
# docs/benchmarks.md, with the goals that are met. Without a directory it builds the release preset
# first. REPETITIONS (default 5): of how many runs each figure is the median. SECONDS_EACH (default
# 2): how long a timed run is.
set -euo pipefail
cd "$(dirname "$0")/.."

if (($#)); then
    build=$1
else
    build=build/release
    scripts/dependencies.sh bench
    cmake --preset release -DIMS_BUILD_BENCH=ON
    cmake --build --preset release --target bench_programs
fi
export REPETITIONS=${REPETITIONS:-5}
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

for program in frame_bench settings_bench; do
    "$build/bin/$program" --benchmark_repetitions="$REPETITIONS" \
        --benchmark_min_time="${SECONDS_EACH:-2}" --benchmark_enable_random_interleaving=true \
        --benchmark_out="$scratch/$program.csv" --benchmark_out_format=csv
done
cat "$scratch"/*.csv >"$scratch/rates"
"$build/bin/frame_memory" | tee "$scratch/memory"
bench/count_instructions.sh "$build" | tee "$scratch/instructions"

# row WHAT RELATION GOAL FORMAT FIGURES... prints one row. The last column is the first figure's
# ratio to the second; with the relation "+", what it is more.
row() {
    local what=$1 relation=$2 goal=$3 format=$4
    shift 4
    printf '| %-42s ' "$what"
    # shellcheck disable=SC2059 # the format is a caller's word, not data
    printf "| $format " "$@"
    awk -v first="$1" -v second="$2" -v relation="$relation" -v goal="$goal" 'BEGIN {
        if (relation == "+") {
            figure = sprintf("+%d", first - second)
            is_met = first - second <= goal
            relation = "<="
        } else {
            figure = sprintf("%.3f", first / second)
            is_met = relation == "<=" ? figure <= goal : figure >= goal
        }
        if (goal != "") verdict = sprintf("%s %s, %s", relation, goal, is_met ? "met" : "MISSED")
        printf "| %6s | %-16s |\n", figure, verdict
    }'
}

# heading COLUMNS...
heading() {
    printf '\n| %-42s ' "medians of $REPETITIONS"
    printf '| %9s ' "$@"
    printf '| %6s | %-16s |\n|%s' ratio goal "$(dashes 44)"
    for _ in "$@"; do printf '|%s:' "$(dashes 10)"; done
    printf '|%s:|%s|\n' "$(dashes 7)" "$(dashes 18)"
}

dashes() {
    printf '%*s' "$1" '' | tr ' ' -
}

# timed BENCHMARK COLUMN prints the medians of all sides.
timed() {
    local side
    for side in "${sides[@]}"; do
        awk -F, -v name="\"$1/$side/process_time/real_time_median\"" -v column="$2" '
        $1 == "name" { for (i = 1; i <= NF; ++i) if ($i == column) at = i }
        $1 == name { printf "%.1f\n", $at }' "$scratch/rates"
    done
}

# rate BENCHMARK WHAT RELATION GOAL
rate() {
    local figures
    mapfile -t figures < <(timed "$1" items_per_second)
    row "$2" "$3" "$4" %9.0f "${figures[@]}"
}

cpu() {
    local figures
    mapfile -t figures < <(timed "$1" cpu_time)
    row "$2" '' '' %9.1f "${figures[@]}"
}

# instructions KIND WHAT RELATION GOAL: in the caller's thread.
instructions() {
    local figures
    read -ra figures < <(grep "^$1 " "$scratch/instructions")
    row "$2" "$3" "$4" %9d "${figures[@]:1:${#sides[@]}}"
}

memory() {
    local figures
    mapfile -t figures < <(awk '{ print $2 }' "$scratch/memory")
    row 'heap bytes per pending request' + 64 %9d "${figures[@]}"
}

sides=(library bare)
heading "${sides[@]}"
instructions request "instructions per request, caller's thread" '<=' 1.02
instructions query "instructions per query, caller's thread" '<=' 1.02
memory
rate request_1 'requests/s, 1 outstanding' '>=' 0.97
rate request_64 'requests/s, 64 outstanding' '>=' 0.97
rate request_1000 'requests/s, 1000 outstanding' '>=' 0.97
rate query 'queries/s' '>=' 0.97
rate signal 'signals/s' '>=' 0.97
cpu request_1 'process CPU us per request, 1'
cpu request_64 'process CPU us per request, 64'
cpu request_1000 'process CPU us per request, 1000'
cpu query 'process CPU us per query'
cpu signal 'process CPU us per signal'

sides=(library naive floor)
heading "${sides[@]}"
instructions read 'instructions per record read' '<=' 0.25
instructions write 'instructions per record written' '<=' 0.75
instructions get "instructions per get, caller's thread" '' ''
instructions update "instructions per update, caller's thread" '' ''
rate read 'records read/s' '' ''
rate write 'records written/s' '' ''
rate get 'gets/s' '' ''
rate update 'updates/s' '>=' 1.2
