// SPDX-License-Identifier: Apache-2.0
// The registration notifications: what the service sends and what the application gets.
#pragma once

#include "tests/support/event_row.hpp"

namespace test {

inline constexpr EventModule kRegEvents{.unit = "ims_reg.cpp",
                                        .interface = "org.kelvo.ims.Registration",
                                        .decoder = "on_reg_signal_emit_handler"};

std::span<const EventRow> reg_event_rows();

} // namespace test
