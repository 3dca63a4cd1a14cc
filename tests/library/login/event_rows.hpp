// SPDX-License-Identifier: Apache-2.0
// The login notification: what the service sends and what the application gets.
#pragma once

#include "tests/support/event_row.hpp"

namespace test {

inline constexpr EventModule kLoginEvents{.unit = "ims_login.cpp",
                                          .interface = "org.kelvo.ims.Login",
                                          .decoder = "on_login_signal_emit_handler"};

std::span<const EventRow> login_event_rows();

} // namespace test
