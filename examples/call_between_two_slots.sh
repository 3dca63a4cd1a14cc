#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: call_between_two_slots.sh DIRECTORY
# Runs answer_call on slot 1 and, once that is ready, place_call from slot 0 to it, both from
# DIRECTORY, and shows what the two of them say as one timeline.
set -euo pipefail
programs=$1
number_of_slot_1=+15550101

coproc callee { exec "$programs/answer_call" 1; }
# shellcheck disable=SC2154 # coproc sets it
callee_process=$callee_PID
exec {callee_output}<&"${callee[0]}"
while IFS= read -r line <&"$callee_output"; do
    printf '%s\n' "$line"
    [[ $line == *ready ]] && break
done
cat <&"$callee_output" &

status=0
"$programs/place_call" 0 "$number_of_slot_1" || status=$?
# A caller that failed leaves the callee waiting.
[[ $status == 0 ]] || kill "$callee_process" 2>/dev/null || true
wait "$callee_process" || status=1
wait
exit "$status"
