// SPDX-License-Identifier: Apache-2.0
// What the fields of the events come to, in words.
#pragma once

#include "imsctl/output/fields.hpp"

namespace imsctl {

std::string summarise_registration(const Fields &fields);
std::string summarise_emergency_registration(const Fields &fields);
std::string summarise_login(const Fields &fields);

} // namespace imsctl
