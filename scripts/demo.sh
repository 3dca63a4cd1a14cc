#!/usr/bin/env bash
# SPDX-License-Identifier: Apache-2.0
# Builds what it needs and shows the main job on a private bus: two applications on two slots of the
# stand-in service, a call and a short message between them, and what each asks for and hears.
set -euo pipefail
cd "$(dirname "$0")/.."

scripts/dependencies.sh build
cmake --preset debug >/dev/null
cmake --build --preset debug --target ims-sim imsctl place_call answer_call

programs=build/debug/bin
echo
echo "A call between two slots: requests (->), answers and events (<-)"
"$programs/ims-sim" run -- examples/call_between_two_slots.sh "$programs"
echo
echo "A short message between two slots"
"$programs/ims-sim" run -- examples/message_between_two_slots.sh "$programs"
