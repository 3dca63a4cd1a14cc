#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: count_instructions.sh [BUILD-DIRECTORY [KIND...]]
# Instructions through the library and with GDBus alone: of a request, a query and a signal, of the
# callback that GDBus calls with the signal, and of a full settings record that is read and written
# in process, and got and updated over the bus. In the caller's thread, and in the whole process.
# Each is a slope between a short and a long run, so that what a program does once does not count,
# and the median of several such slopes. REPETITIONS: how many (default 5). Kinds, for those only:
# request, query, signal, callback, read, write, get, update.
set -euo pipefail

build=${1:-$(dirname "$0")/../build/release}
kinds=" ${*:2} "
repetitions=${REPETITIONS:-5}
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

# count PROGRAM KIND SIDE TRIPS [FUNCTION] prints the instructions of the first thread, and of all
# threads: of all that runs, or of this function and what it calls. Threads take turns fairly, as
# they would on two processors.
count() {
    local profile=$scratch/profile
    rm -f "$profile"*
    if ! valgrind --quiet --tool=callgrind --separate-threads=yes --fair-sched=yes \
        ${5:+"--toggle-collect=$5"} --callgrind-out-file="$profile" "$build/bin/$1" "${@:2:3}" \
        >"$scratch/log" 2>&1; then
        cat "$scratch/log" >&2
        return 1
    fi
    awk '/^totals:/ { all += $2; if (FILENAME ~ /-01$/) first = $2 }
        END { print first, all; exit all == 0 }' "$profile"-*
}

# slope PROGRAM KIND SIDE SHORT LONG OPERATIONS-PER-TRIP [FUNCTION]
slope() {
    local short long
    short=$(count "$1" "$2" "$3" "$4" "${7:-}")
    long=$(count "$1" "$2" "$3" "$5" "${7:-}")
    awk -v short="$short" -v long="$long" -v operations=$((($5 - $4) * $6)) 'BEGIN {
        split(short, a); split(long, b)
        printf "%d %d\n", (b[1] - a[1]) / operations, (b[2] - a[2]) / operations
    }'
}

median() {
    sort -n | awk '{ value[NR] = $1 } END { print value[int((NR + 1) / 2)] }'
}

# compare NAME PROGRAM KIND SHORT LONG OPERATIONS-PER-TRIP [FUNCTION...] prints the figures of all
# sides, the ratio being the library's to the next. Functions: each side's, to count in.
compare() {
    local name=$1 side functions=("${@:7}")
    [[ $kinds == *[a-z]* && $kinds != *" $name "* ]] && return
    for ((repetition = 0; repetition < repetitions; ++repetition)); do
        for ((side = 0; side < ${#sides[@]}; ++side)); do
            slope "$2" "$3" "${sides[side]}" "${@:4:3}" "${functions[side]:-}" \
                >>"$scratch/$name.${sides[side]}"
        done
    done
    printf '%-9s' "$name"
    for thread in 1 2; do
        for side in "${sides[@]}"; do
            cut -d' ' -f$thread "$scratch/$name.$side" | median
        done | paste -sd' ' | awk '{
            for (i = 1; i <= NF; ++i) printf "%9d", $i
            printf "%8.3f  ", $1 / $2
        }'
    done
    printf '\n'
}

heading() {
    local width=$((9 * ${#sides[@]} + 8))
    printf "%-9s%${width}s  %${width}s\n" '' "caller's thread" 'whole process'
    printf '%-9s' ''
    for _ in 1 2; do
        printf '%9s' "${sides[@]}"
        printf '%8s  ' ratio
    done
    printf '\n'
}

sides=(library bare)
heading
compare request frame_trips request 200 1200 1
compare query frame_trips query 200 1200 1
# A trip is a burst of 500 signals.
compare signal frame_trips signal 2 6 500
compare callback frame_trips signal 2 6 500 '*::on_signal_callback(*' '*::on_signal(*'

sides=(library naive floor)
printf '\n'
heading
compare read settings_trips read 20 120 1
compare write settings_trips write 20 120 1
compare get settings_trips get 20 120 1
compare update settings_trips update 20 120 1
