// SPDX-License-Identifier: Apache-2.0
// The call notifications: what the service sends and what the application gets.
#pragma once

#include "tests/support/event_row.hpp"

namespace test {

inline constexpr EventModule kCallEvents{"ims_call.cpp", "org.kelvo.ims.Call",
                                         "on_call_signal_emit_handler"};

// At least one of each notification, more where there are booleans.
std::span<const EventRow> call_event_rows();

// The shapes that the decoder knows for ids that no signal has.
std::span<const EventRow> undelivered_event_rows();

} // namespace test
