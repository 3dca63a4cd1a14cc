// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/bus/contract_signals.hpp"

#include "sim/bus/introspection.hpp"

#include <gtest/gtest.h>
#include <map>
#include <stdexcept>

namespace sim::test {

namespace {

using Types = std::map<std::string, std::string, std::less<>>;

void add(Types &types, const introspection::Description &description) {
    const auto xml = fmt::format("<node>{}</node>", description.xml);
    ErrorSlot error;
    const std::unique_ptr<GDBusNodeInfo, FreeWith<g_dbus_node_info_unref>> node(
        g_dbus_node_info_new_for_xml(xml.c_str(), &error.raw));
    if (!node)
        throw std::runtime_error(fmt::format("{}: {}", description.interface, error.message()));
    for (GDBusSignalInfo **each = node->interfaces[0]->signals; each && *each; ++each) {
        std::string &type = types[(*each)->name];
        for (GDBusArgInfo **argument = (*each)->args; argument && *argument; ++argument)
            type += (*argument)->signature;
        type = fmt::format("({})", type);
    }
}

Types read_types() {
    Types types;
    for (const auto &description : introspection::descriptions())
        add(types, description);
    return types;
}

} // namespace

void expect_as_in_contract(const Signal &signal) {
    static const Types types = read_types();
    const auto found = types.find(signal.member);
    ASSERT_NE(found, types.end()) << signal.member << " is not in the contract";
    EXPECT_EQ(g_variant_get_type_string(signal.body.get()), found->second)
        << signal.member << " is not what the contract says";
}

} // namespace sim::test
