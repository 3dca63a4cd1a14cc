// SPDX-License-Identifier: Apache-2.0
// The short-message notifications: what the service sends and what the application gets.
#pragma once

#include "tests/support/event_row.hpp"

namespace test {

inline constexpr EventModule kSmsEvents{.unit = "ims_sms.cpp",
                                        .interface = "org.kelvo.ims.Sms",
                                        .decoder = "on_sms_signal_emit_handler"};

// At least one of each notification, more where the service's length is not the text's.
std::span<const EventRow> sms_event_rows();

} // namespace test
