// SPDX-License-Identifier: Apache-2.0
// Registration with the network, and logins.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module registration_module();

// Its tables, one a file.
std::span<const Verb> registration_verbs();
std::span<const Verb> login_verbs();
std::span<const EventRow> registration_events();
std::span<const EventRow> login_events();

} // namespace imsctl
