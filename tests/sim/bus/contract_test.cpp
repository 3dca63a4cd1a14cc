// SPDX-License-Identifier: Apache-2.0
// What the running stand-in says about itself is what the contract's files say, and every method
// that it names answers in the type that it names.
#include "tests/sim/bus/bus_client.hpp"
#include "tests/support/files.hpp"

#include <filesystem>

namespace sim::test {
namespace {

class BusContract : public Served {
  protected:
    std::string description() {
        const auto reply = client_->call(slot_path(0), "org.freedesktop.DBus.Introspectable",
                                         "Introspect", Variant(g_variant_new_tuple(nullptr, 0)));
        const char *xml = "";
        g_variant_get(reply.value.get(), "(&s)", &xml);
        return xml;
    }
};

// The interface as its file has it, with every comment.
std::string interface_of(const std::filesystem::path &path) {
    const std::string text = ::test::content_of(path);
    const std::string begin = "<node>\n";
    const auto from = text.find(begin) + begin.size();
    return text.substr(from, text.find("</node>") - from);
}

TEST_F(BusContract, IntrospectAnswersWithTheFiles) {
    const std::string xml = description();
    std::size_t served = 0;
    for (const auto &entry : std::filesystem::directory_iterator(IMS_TEST_INTERFACES_DIR)) {
        EXPECT_NE(xml.find(interface_of(entry.path())), std::string::npos)
            << "not as it stands in " << entry.path();
        ++served;
    }
    EXPECT_EQ(served, 9U);
}

// Zero, an empty text, an empty list; what a variant holds does not matter.
GVariant *empty_argument(const char *type) {
    if (std::string_view(type) == "v")
        return g_variant_new_variant(g_variant_new_strv(nullptr, 0));
    return g_variant_new_from_data(G_VARIANT_TYPE(type), nullptr, 0, FALSE, nullptr, nullptr);
}

Variant empty_arguments(const GDBusMethodInfo &method) {
    std::vector<GVariant *> members;
    for (GDBusArgInfo **each = method.in_args; each && *each; ++each)
        members.push_back(empty_argument((*each)->signature));
    return Variant(g_variant_new_tuple(members.data(), members.size()));
}

std::string out_type(const GDBusMethodInfo &method) {
    std::string type = "(";
    for (GDBusArgInfo **each = method.out_args; each && *each; ++each)
        type += (*each)->signature;
    return type + ")";
}

TEST_F(BusContract, EveryMethodAnswersInItsType) {
    ErrorSlot error;
    const std::unique_ptr<GDBusNodeInfo, FreeWith<g_dbus_node_info_unref>> node(
        g_dbus_node_info_new_for_xml(description().c_str(), &error.raw));
    ASSERT_NE(node, nullptr) << error.message();
    client_->register_application(0);
    std::size_t asked = 0;
    for (GDBusInterfaceInfo **interface = node->interfaces; *interface; ++interface) {
        if (!std::string_view((*interface)->name).starts_with("org.kelvo.ims."))
            continue;
        for (GDBusMethodInfo **each = (*interface)->methods; each && *each; ++each, ++asked) {
            const auto reply = client_->call(slot_path(0), (*interface)->name, (*each)->name,
                                             empty_arguments(**each));
            EXPECT_EQ(reply.type, out_type(**each)) << (*interface)->name << "." << (*each)->name
                                                    << ": " << reply.error << ": " << reply.text;
        }
    }
    EXPECT_EQ(asked, 146U);
}

} // namespace
} // namespace sim::test
