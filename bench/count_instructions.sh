#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: count_instructions.sh [BUILD-DIRECTORY]
# Instructions per round trip, through the library and with GDBus alone: in the caller's thread, and
# in the whole process. Each is a slope between a short and a long run, so that what a program does
# once does not count, and the median of several such slopes. REPETITIONS: how many (default 5).
set -euo pipefail

build=${1:-$(dirname "$0")/../build/release}
trips=$build/bin/frame_trips
repetitions=${REPETITIONS:-5}
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT

# Prints the instructions of the first thread, and of all threads, for a number of trips. Threads
# take turns fairly, as they would on two processors.
count() {
    local profile=$scratch/profile
    rm -f "$profile"*
    if ! valgrind --quiet --tool=callgrind --separate-threads=yes --fair-sched=yes \
        --callgrind-out-file="$profile" "$trips" "$@" >"$scratch/log" 2>&1; then
        cat "$scratch/log" >&2
        return 1
    fi
    awk '/^totals:/ { all += $2; if (FILENAME ~ /-01$/) first = $2 } END { print first, all }' \
        "$profile"-*
}

# slope KIND SIDE SHORT LONG OPERATIONS-PER-TRIP
slope() {
    local short long
    short=$(count "$1" "$2" "$3")
    long=$(count "$1" "$2" "$4")
    awk -v short="$short" -v long="$long" -v operations=$((($4 - $3) * $5)) 'BEGIN {
        split(short, a); split(long, b)
        printf "%d %d\n", (b[1] - a[1]) / operations, (b[2] - a[2]) / operations
    }'
}

median() {
    sort -n | awk '{ value[NR] = $1 } END { print value[int((NR + 1) / 2)] }'
}

# compare KIND SHORT LONG OPERATIONS-PER-TRIP
compare() {
    local side
    for ((repetition = 0; repetition < repetitions; ++repetition)); do
        for side in library bare; do
            slope "$1" "$side" "$2" "$3" "$4" >>"$scratch/$1.$side"
        done
    done
    for side in library bare; do
        cut -d' ' -f1 "$scratch/$1.$side" | median
        cut -d' ' -f2 "$scratch/$1.$side" | median
    done | paste -sd' ' | awk -v kind="$1" '{
        printf "%-9s%9d%9d%8.3f %9d%9d%8.3f\n", kind, $1, $3, $1 / $3, $2, $4, $2 / $4
    }'
}

printf '%-9s%26s %26s\n' '' "caller's thread" 'whole process'
printf '%-9s%9s%9s%8s %9s%9s%8s\n' '' library bare ratio library bare ratio
compare request 200 1200 1
compare query 200 1200 1
# A trip is a burst of 500 signals.
compare signal 2 6 500
