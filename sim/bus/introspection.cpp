// SPDX-License-Identifier: Apache-2.0
#include "sim/bus/introspection.hpp"

#include <algorithm>
#include <fmt/format.h>

namespace sim::introspection {

namespace {

constexpr std::string_view kStandard =
    R"(  <interface name="org.freedesktop.DBus.Introspectable">
    <method name="Introspect"><arg type="s" direction="out"/></method>
  </interface>
  <interface name="org.freedesktop.DBus.Peer">
    <method name="Ping"/>
    <method name="GetMachineId"><arg type="s" direction="out"/></method>
  </interface>
  <interface name="org.freedesktop.DBus.Properties">
    <method name="Get"><arg type="s" direction="in"/><arg type="s" direction="in"/><arg type="v" direction="out"/></method>
    <method name="GetAll"><arg type="s" direction="in"/><arg type="a{sv}" direction="out"/></method>
    <method name="Set"><arg type="s" direction="in"/><arg type="s" direction="in"/><arg type="v" direction="in"/></method>
  </interface>
)";

std::string node(const std::string &content) {
    return fmt::format("{}<node>\n{}{}</node>\n",
                       "<!DOCTYPE node PUBLIC \"-//freedesktop//DTD D-BUS Object Introspection "
                       "1.0//EN\"\n \"http://www.freedesktop.org/standards/dbus/1.0/"
                       "introspect.dtd\">\n",
                       kStandard, content);
}

} // namespace

std::string of_object(std::span<const Interface> interfaces) {
    std::string xml;
    for (const auto &interface : interfaces) {
        const auto found =
            std::ranges::find(descriptions(), interface.name, &Description::interface);
        if (found != descriptions().end())
            xml += found->xml;
    }
    return node(xml);
}

std::string of_node(const std::vector<std::string> &children) {
    std::string xml;
    for (const auto &child : children)
        xml += fmt::format("  <node name=\"{}\"/>\n", child);
    return node(xml);
}

} // namespace sim::introspection
