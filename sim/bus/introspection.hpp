// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"

#include <span>
#include <string>
#include <string_view>
#include <vector>

// What objects say about themselves, in the XML of D-Bus.
namespace sim::introspection {

// One interface as its file in dbus/interfaces has it.
struct Description {
    std::string_view interface;
    std::string_view xml;
};
std::span<const Description> descriptions();

// The interfaces in this order. One without a file is left out.
std::string of_object(std::span<const Interface> interfaces);
std::string of_node(const std::vector<std::string> &children);

} // namespace sim::introspection
