// SPDX-License-Identifier: Apache-2.0
#include "sim/introspection.hpp"

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

// One element for each complete type of the body.
std::string arguments(std::string_view signature, std::string_view direction) {
    std::string xml;
    const std::string text(signature);
    const GVariantType *type = g_variant_type_first(G_VARIANT_TYPE(text.c_str()));
    for (; type; type = g_variant_type_next(type)) {
        const std::string_view letters(g_variant_type_peek_string(type),
                                       g_variant_type_get_string_length(type));
        xml += direction.empty()
                   ? fmt::format("<arg type=\"{}\"/>", letters)
                   : fmt::format("<arg type=\"{}\" direction=\"{}\"/>", letters, direction);
    }
    return xml;
}

} // namespace

std::string of_object(std::span<const Interface> interfaces) {
    std::string xml;
    for (const auto &interface : interfaces) {
        xml += fmt::format("  <interface name=\"{}\">\n", interface.name);
        for (const auto &method : interface.methods)
            xml += fmt::format("    <method name=\"{}\">{}{}</method>\n", method.member,
                               arguments(method.in, "in"), arguments(method.out, "out"));
        for (const auto &signal : interface.signals)
            xml += fmt::format("    <signal name=\"{}\">{}</signal>\n", signal.member,
                               arguments(signal.signature, ""));
        xml += "  </interface>\n";
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
