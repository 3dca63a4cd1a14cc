// SPDX-License-Identifier: Apache-2.0
// The call notifications: what the service sends and what the application gets.
#pragma once

#include "tests/support/event_row.hpp"

namespace test {

inline constexpr EventModule kCallEvents{.unit = "ims_call.cpp",
                                         .interface = "org.kelvo.ims.Call",
                                         .decoder = "on_call_signal_emit_handler"};

// At least one of each notification, more where there are booleans.
std::span<const EventRow> call_event_rows();

// The shapes that the decoder knows for ids that no signal has.
std::span<const EventRow> undelivered_event_rows();

} // namespace test
