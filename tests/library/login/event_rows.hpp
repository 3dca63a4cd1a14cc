// SPDX-License-Identifier: Apache-2.0
// The login notification: what the service sends and what the application gets.
#pragma once

#include "tests/support/event_row.hpp"

namespace test {

inline constexpr EventModule kLoginEvents{"ims_login.cpp", "org.kelvo.ims.Login",
                                          "on_login_signal_emit_handler"};

std::span<const EventRow> login_event_rows();

} // namespace test
