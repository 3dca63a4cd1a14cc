// SPDX-License-Identifier: Apache-2.0
#include "tests/contract/contract.hpp"

#include "tests/support/files.hpp"
#include "tests/support/glib_ref.hpp"

#include <gio/gio.h>

#include <filesystem>
#include <memory>
#include <stdexcept>

namespace test {
namespace {

struct NodeUnref {
    void operator()(GDBusNodeInfo *node) const { g_dbus_node_info_unref(node); }
};
using Node = std::unique_ptr<GDBusNodeInfo, NodeUnref>;

[[noreturn]] void fail(const std::filesystem::path &file, const std::string &why) {
    throw std::runtime_error(file.string() + ": " + why);
}

Node parsed(const std::filesystem::path &path) {
    GError *error = nullptr;
    Node node{g_dbus_node_info_new_for_xml(content_of(path).c_str(), &error)};
    if (!node)
        throw_error(path.string(), error);
    return node;
}

std::string type_of(const std::filesystem::path &file, GDBusArgInfo **arguments) {
    std::string type = "(";
    for (GDBusArgInfo **each = arguments; each != nullptr && *each != nullptr; ++each) {
        if ((*each)->name == nullptr)
            fail(file, "an argument has no name");
        type += (*each)->signature;
    }
    return type + ")";
}

void add(Contract &contract, const std::filesystem::path &file) {
    const Node node = parsed(file);
    if (node->interfaces == nullptr || node->interfaces[0] == nullptr ||
        node->interfaces[1] != nullptr || node->interfaces[0]->name != file.stem())
        fail(file, "not exactly one interface that is named like the file");
    const GDBusInterfaceInfo &interface = *node->interfaces[0];
    for (GDBusMethodInfo **each = interface.methods; each != nullptr && *each != nullptr; ++each)
        contract.methods.insert(method_line(interface.name, (*each)->name,
                                            type_of(file, (*each)->in_args),
                                            type_of(file, (*each)->out_args)));
    for (GDBusSignalInfo **each = interface.signals; each != nullptr && *each != nullptr; ++each)
        contract.signals.insert(
            signal_line(interface.name, (*each)->name, type_of(file, (*each)->args)));
}

} // namespace

std::string method_line(const std::string &interface, const std::string &member,
                        const std::string &in, const std::string &out) {
    return interface + "." + member + " " + in + " -> " + out;
}

std::string signal_line(const std::string &interface, const std::string &member,
                        const std::string &type) {
    return interface + ":" + member + " " + type;
}

Contract contract_of_files() {
    Contract contract;
    for (const auto &entry : std::filesystem::directory_iterator{IMS_TEST_INTERFACES_DIR})
        add(contract, entry.path());
    return contract;
}

std::string missing(const std::set<std::string> &from, const std::set<std::string> &expected) {
    std::string text;
    for (const std::string &line : expected)
        if (!from.contains(line))
            text += "\n  " + line;
    return text;
}

} // namespace test
