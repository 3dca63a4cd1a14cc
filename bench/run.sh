#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: run.sh [BUILD-DIRECTORY]
# Measures what the library costs beside GDBus alone and prints the result as the two tables of
# docs/benchmarks.md, with the goals that are met. Without a directory it builds the release preset
# first. Each figure is a median, and the ratio of two rates is the median of the ratios in which
# they stood each time that one ran right after the other: what else the machine does then comes
# and goes for both. RUNS (default 15): how many timed runs. SECONDS_EACH (default 0.5): how long a
# side takes in each. REPETITIONS (default 5): how often instructions are counted.
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
runs=${RUNS:-15}
export REPETITIONS=${REPETITIONS:-5}
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

for ((run = 1; run <= runs; ++run)); do
    for program in frame_bench settings_bench; do
        printf 'run %d of %d: %s\n' "$run" "$runs" "$program"
        if ! "$build/bin/$program" --benchmark_min_time="${SECONDS_EACH:-0.5}" \
            --benchmark_min_warmup_time=0.1 --benchmark_out="$scratch/$program.$run.csv" \
            --benchmark_out_format=csv >"$scratch/log" 2>&1; then
            cat "$scratch/log" >&2
            exit 1
        fi
    done
done
cat "$scratch"/*.csv >"$scratch/rates"
"$build/bin/frame_memory" | tee "$scratch/memory"
bench/count_instructions.sh "$build" | tee "$scratch/instructions"

# row WHAT RELATION GOAL FORMAT RATIO FIGURES... prints one row. Without a ratio it is the first
# figure's to the second; with the relation "+", what it is more.
row() {
    local what=$1 relation=$2 goal=$3 format=$4 ratio=$5
    shift 5
    printf '| %-42s ' "$what"
    # shellcheck disable=SC2059 # the format is a caller's word, not data
    printf "| $format " "$@"
    awk -v ratio="$ratio" -v first="$1" -v second="$2" -v relation="$relation" -v goal="$goal" \
        'BEGIN {
        if (relation == "+") {
            figure = sprintf("+%d", first - second)
            is_met = first - second <= goal
            relation = "<="
        } else {
            figure = sprintf("%.3f", ratio == "" ? first / second : ratio)
            is_met = relation == "<=" ? figure <= goal : figure >= goal
        }
        if (goal != "") verdict = sprintf("%s %s, %s", relation, goal, is_met ? "met" : "MISSED")
        printf "| %6s | %-16s |\n", figure, verdict
    }'
}

# heading COLUMNS...
heading() {
    printf '\n| %-42s ' medians
    printf '| %9s ' "$@"
    printf '| %6s | %-16s |\n|%s' ratio goal "$(dashes 44)"
    for _ in "$@"; do printf '|%s:' "$(dashes 10)"; done
    printf '|%s:|%s|\n' "$(dashes 7)" "$(dashes 18)"
}

dashes() {
    printf '%*s' "$1" '' | tr ' ' -
}

median() {
    sort -g | awk '{ value[NR] = $1 } END { print value[int((NR + 1) / 2)] }'
}

# timed BENCHMARK SIDE COLUMN prints what each run measured, in order.
timed() {
    awk -F, -v name="\"$1/$2/process_time/real_time\"" -v column="$3" '
    $1 == "name" { for (i = 1; i <= NF; ++i) if ($i == column) at = i }
    $1 == name { print $at }' "$scratch/rates"
}

# timed_row BENCHMARK COLUMN WHAT RELATION GOAL FORMAT
timed_row() {
    local side figures=() ratio
    for side in "${sides[@]}"; do
        figures+=("$(timed "$1" "$side" "$2" | median)")
    done
    ratio=$(paste <(timed "$1" "${sides[0]}" "$2") <(timed "$1" "${sides[1]}" "$2") |
        awk '{ print $1 / $2 }' | median)
    row "$3" "$4" "$5" "$6" "$ratio" "${figures[@]}"
}

# rate BENCHMARK WHAT RELATION GOAL
rate() {
    timed_row "$1" items_per_second "$2" "$3" "$4" %9.0f
}

cpu() {
    timed_row "$1" cpu_time "$2" '' '' %9.1f
}

# instructions KIND WHAT RELATION GOAL: in the caller's thread.
instructions() {
    local figures
    read -ra figures < <(grep "^$1 " "$scratch/instructions")
    row "$2" "$3" "$4" %9d '' "${figures[@]:1:${#sides[@]}}"
}

memory() {
    local figures
    mapfile -t figures < <(awk '{ print $2 }' "$scratch/memory")
    row 'heap bytes per pending request' + 64 %9d '' "${figures[@]}"
}

sides=(library bare)
heading "${sides[@]}"
instructions request "instructions per request, caller's thread" '<=' 1.02
instructions query "instructions per query, caller's thread" '<=' 1.02
instructions callback "instructions in a signal's callback" '' ''
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
cpu update 'process CPU us per update'
