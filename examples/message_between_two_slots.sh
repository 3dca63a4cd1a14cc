#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Usage: message_between_two_slots.sh DIRECTORY
# Sends a short message from slot 0 to slot 1 with the imsctl in DIRECTORY, and shows both sides.
set -euo pipefail
imsctl=$1/imsctl
number_of_slot_1=+15550101

# The service registers a slot some time after its start.
wait_for_registration() {
    local state
    coproc changes { exec "$imsctl" registration watch --for 10 2>&1; }
    # shellcheck disable=SC2154 # coproc sets it
    local watch_process=$changes_PID
    exec {changes_output}<&"${changes[0]}"
    IFS= read -r state <&"$changes_output" # it watches: from now on no change is missed
    state=$("$imsctl" registration show)
    while [[ $state != *registered=true* ]]; do
        IFS= read -r state <&"$changes_output" ||
            { echo "slot 0 does not register" >&2; return 1; }
    done
    kill "$watch_process" 2>/dev/null || true
    wait "$watch_process" || true
    exec {changes_output}<&-
}

wait_for_registration
"$imsctl" registration show
coproc receiver { exec "$imsctl" --slot 1 sms watch --count 1 2>&1; }
# shellcheck disable=SC2154 # coproc sets it
receiver_process=$receiver_PID
exec {receiver_output}<&"${receiver[0]}"
IFS= read -r line <&"$receiver_output"
echo "slot 1: $line"
echo "slot 0: imsctl sms send $number_of_slot_1 'Hello from slot 0'"
status=0
"$imsctl" sms send "$number_of_slot_1" "Hello from slot 0" || status=$?
# A sender that failed leaves the receiver waiting.
[[ $status == 0 ]] || kill "$receiver_process" 2>/dev/null || true
while IFS= read -r line <&"$receiver_output"; do
    echo "slot 1: $line"
    [[ $line == *'Hello from slot 0'* ]] && arrived=yes
done
wait "$receiver_process" || status=1
[[ ${arrived:-no} == yes ]] || status=1
exit "$status"
