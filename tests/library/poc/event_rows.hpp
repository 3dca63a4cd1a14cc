// SPDX-License-Identifier: Apache-2.0
// The push-to-talk notifications: what the service sends and what the application gets.
#pragma once

#include "tests/support/event_row.hpp"

namespace test {

inline constexpr EventModule kPocEvents{.unit = "ims_poc.cpp",
                                        .interface = "org.kelvo.ims.Poc",
                                        .decoder = "on_poc_signal_emit_handler"};

// At least one of each notification, with everything in it that it can hold.
std::span<const EventRow> poc_event_rows();

} // namespace test
