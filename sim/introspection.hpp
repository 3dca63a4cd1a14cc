// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/service.hpp"

#include <span>
#include <string>
#include <vector>

// What objects say about themselves, in the XML of D-Bus.
namespace sim::introspection {

std::string of_object(std::span<const Interface> interfaces);
std::string of_node(const std::vector<std::string> &children);

} // namespace sim::introspection
