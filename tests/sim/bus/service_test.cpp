// SPDX-License-Identifier: Apache-2.0
// Objects, interfaces and errors; who may ask.
#include "tests/sim/bus/bus_client.hpp"

#include "sim/base/result.hpp"

#include <gio/gio.h>
#include <set>

namespace sim::test {
namespace {

using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;

class BusService : public Served {
  protected:
    Reply peer(const std::string &path, const char *interface, const char *method,
               GVariant *body = nullptr) {
        return client_->call(path, interface, method, Variant(body));
    }
};

TEST_F(BusService, OwnsItsName) {
    EXPECT_EQ(client_->call(slot_path(0), "org.freedesktop.DBus.Peer", "Ping", Variant()).body,
              "()");
}

TEST_F(BusService, AnUnknownObjectIsSaidToBeUnknown) {
    for (const auto *path : {"/org/kelvo/ims/sub2", "/org/kelvo/ims/sub00", "/elsewhere",
                             "/org/kel", "/org/kelvo/ims/sub0/x"}) {
        const auto reply = peer(path, kCall, "SwapCall", g_variant_new("(i)", 1));
        EXPECT_EQ(reply.error, "org.freedesktop.DBus.Error.UnknownObject") << path;
        EXPECT_THAT(reply.text, HasSubstr("/org/kelvo/ims/sub0 to /org/kelvo/ims/sub1"));
    }
}

TEST_F(BusService, AnUnknownInterfaceIsSaidToBeUnknown) {
    const auto reply = client_->call(0, "org.kelvo.ims.Nothing", "SwapCall", "(1,)");
    EXPECT_EQ(reply.error, "org.freedesktop.DBus.Error.UnknownInterface");
    EXPECT_THAT(reply.text, HasSubstr("org.kelvo.ims.Nothing"));
    EXPECT_EQ(peer("/org/kelvo/ims", kCall, "SwapCall", g_variant_new("(i)", 1)).error,
              "org.freedesktop.DBus.Error.UnknownInterface");
    EXPECT_EQ(client_->call(0, "org.freedesktop.DBus.Nothing", "Get").error,
              "org.freedesktop.DBus.Error.UnknownInterface");
}

TEST_F(BusService, AnUnknownMethodIsSaidToBeUnknown) {
    const auto reply = client_->call(0, kCall, "CallMother", "(1,)");
    EXPECT_EQ(reply.error, "org.freedesktop.DBus.Error.UnknownMethod");
    EXPECT_THAT(reply.text, AllOf(HasSubstr(kCall), HasSubstr("CallMother")));
    EXPECT_EQ(client_->call(0, "org.freedesktop.DBus.Peer", "Pong").error,
              "org.freedesktop.DBus.Error.UnknownMethod");
}

TEST_F(BusService, AnotherSignatureIsRefusedAndBothAreNamed) {
    auto reply = client_->call(0, kCall, "MakeCall", "(1, '+15550101')");
    EXPECT_EQ(reply.error, "org.freedesktop.DBus.Error.InvalidArgs");
    EXPECT_THAT(reply.text, AllOf(HasSubstr("\"(isissss)\""), HasSubstr("\"(is)\"")));
    reply = client_->call(0, kRegistration, "RegisterApplication", "('x',)");
    EXPECT_EQ(reply.error, "org.freedesktop.DBus.Error.InvalidArgs");
    EXPECT_THAT(reply.text, HasSubstr("\"(is)\" or \"()\""));
    EXPECT_THAT(program_->read_errors("malformed"), HasSubstr("malformed"));
}

TEST_F(BusService, ACallMayLeaveItsInterfaceOut) {
    EXPECT_EQ(client_->call(0, nullptr, "RegisterApplication", "(0, 'x')").body, "(0, 1)");
    EXPECT_EQ(client_->call(0, nullptr, "SwapCall", "(1,)").body, "(13,)");
    EXPECT_EQ(client_->call(0, nullptr, "CallMother").error,
              "org.freedesktop.DBus.Error.UnknownMethod");
}

TEST_F(BusService, EveryNodeDescribesItself) {
    const auto describe = [&](const std::string &path) {
        const auto reply = peer(path, "org.freedesktop.DBus.Introspectable", "Introspect");
        const char *xml = "";
        g_variant_get(reply.value.get(), "(&s)", &xml);
        ErrorSlot error;
        GDBusNodeInfo *info = g_dbus_node_info_new_for_xml(xml, &error.raw);
        EXPECT_NE(info, nullptr) << error.message() << "\n" << xml;
        return std::unique_ptr<GDBusNodeInfo, FreeWith<g_dbus_node_info_unref>>(info);
    };
    const auto children = [&](const std::string &path) {
        std::vector<std::string> names;
        const auto info = describe(path);
        for (GDBusNodeInfo **child = info->nodes; child && *child; ++child)
            names.emplace_back((*child)->path);
        return names;
    };
    EXPECT_THAT(children("/"), ElementsAre("org"));
    EXPECT_THAT(children("/org"), ElementsAre("kelvo"));
    EXPECT_THAT(children("/org/kelvo"), ElementsAre("ims"));
    EXPECT_THAT(children("/org/kelvo/ims"), ElementsAre("sub0", "sub1"));

    const auto slot = describe(slot_path(1));
    struct Size {
        const char *interface;
        int methods;
        int signals;
    };
    for (const Size &size :
         {Size{kCall, 42, 20}, Size{kRegistration, 4, 2}, Size{kLogin, 3, 1}, Size{kSms, 2, 3},
          Size{kSs, 6, 0}, Size{kPoc, 27, 22}, Size{kVt, 28, 0}}) {
        const auto *info = g_dbus_node_info_lookup_interface(slot.get(), size.interface);
        ASSERT_NE(info, nullptr) << size.interface;
        int methods = 0;
        for (GDBusMethodInfo **method = info->methods; method && *method; ++method)
            ++methods;
        int signals = 0;
        for (GDBusSignalInfo **signal = info->signals; signal && *signal; ++signal)
            ++signals;
        EXPECT_EQ(methods, size.methods) << size.interface;
        EXPECT_EQ(signals, size.signals) << size.interface;
    }
    const GDBusInterfaceInfo *registration =
        g_dbus_node_info_lookup_interface(slot.get(), kRegistration);
    ASSERT_NE(registration, nullptr);
    EXPECT_STREQ(registration->methods[0]->name, "RegisterApplication");
    EXPECT_STREQ(registration->methods[1]->name, "RegisterApplication");
}

TEST_F(BusService, TheStandardInterfacesAnswerSensibly) {
    const auto id = peer("/", "org.freedesktop.DBus.Peer", "GetMachineId");
    EXPECT_TRUE(id.type == "(s)" || id.error == "org.freedesktop.DBus.Error.FileNotFound");
    const char *properties = "org.freedesktop.DBus.Properties";
    EXPECT_EQ(client_->call(0, properties, "GetAll", "('org.kelvo.ims.Call',)").body, "({},)");
    EXPECT_EQ(client_->call(0, properties, "Get", "('org.kelvo.ims.Call', 'Volume')").error,
              "org.freedesktop.DBus.Error.UnknownProperty");
    EXPECT_EQ(client_->call(0, properties, "Set", "('org.kelvo.ims.Call', 'Volume', <1>)").error,
              "org.freedesktop.DBus.Error.UnknownProperty");
    EXPECT_EQ(client_->call(0, properties, "GetAll", "('org.kelvo.ims.Nothing',)").error,
              "org.freedesktop.DBus.Error.UnknownInterface");
    EXPECT_EQ(client_->call(0, properties, "Get", "('x',)").error,
              "org.freedesktop.DBus.Error.InvalidArgs");
    EXPECT_EQ(client_->call(0, properties, "List").error,
              "org.freedesktop.DBus.Error.UnknownMethod");
}

TEST_F(BusService, RegistersAnApplicationForEachRequest) {
    EXPECT_EQ(client_->call(0, kRegistration, "RegisterApplication", "(0, 'a')").body, "(0, 1)");
    EXPECT_EQ(client_->call(0, kRegistration, "RegisterApplication", "(0, 'a')").body, "(0, 2)");
    EXPECT_EQ(client_->call(1, kRegistration, "RegisterApplication", "(1, 'a')").body, "(0, 3)");
    // The slot must be that of the object.
    EXPECT_EQ(client_->call(1, kRegistration, "RegisterApplication", "(0, 'a')").body, "(10, 0)");
}

TEST_F(BusService, RegisteringWithoutParametersKeepsTheConnectionsId) {
    EXPECT_EQ(client_->call(0, kRegistration, "RegisterApplication").body, "(0, 1)");
    EXPECT_EQ(client_->call(0, kRegistration, "RegisterApplication").body, "(0, 1)");
    EXPECT_EQ(client_->call(1, kRegistration, "RegisterApplication").body, "(0, 2)");
    EXPECT_EQ(another()->call(0, kRegistration, "RegisterApplication").body, "(0, 3)");
    EXPECT_EQ(client_->register_application(0), 4);
    EXPECT_EQ(client_->call(0, kRegistration, "RegisterApplication").body, "(0, 4)");
}

TEST_F(BusService, AnApplicationThatNobodyRegisteredIsRefused) {
    const int id = client_->register_application(1);
    EXPECT_EQ(client_->call(0, kCall, "SwapCall", fmt::format("({},)", id)).body, "(11,)");
    EXPECT_EQ(client_->call(1, kCall, "SwapCall", fmt::format("({},)", id + 1)).body, "(11,)");
    EXPECT_EQ(client_->call(1, kCall, "SwapCall", fmt::format("({},)", id)).body, "(13,)");
    EXPECT_THAT(program_->read_errors("refused"),
                HasSubstr("there is no application 1 on slot 0: call RegisterApplication first"));
}

TEST_F(BusService, AConnectionThatLeavesTakesItsApplicationsButNotTheCalls) {
    const int kept = client_->register_application(0);
    auto other = another();
    const int lost = other->register_application(0);
    EXPECT_EQ(
        other->call(0, kCall, "MakeCall", fmt::format("({}, '+15550207', 0, '', '', '', '')", lost))
            .body,
        "(0, 1)");
    client_->wait_for(0, "CallAlerting");
    const auto name = other->unique_name();
    other->close();
    client_->wait_until_gone(name);
    EXPECT_EQ(client_->call(0, kCall, "SwapCall", fmt::format("({},)", lost)).body, "(11,)");
    EXPECT_EQ(client_->call(0, kCall, "EndCall", fmt::format("({}, 1, 0, 0)", kept)).body, "(0,)");
}

TEST_F(BusService, ACallThatExpectsNoReplyGetsNone) {
    client_->register_application(0);
    const GObjectPtr<GDBusMessage> message(
        g_dbus_message_new_method_call(kServiceName, slot_path(0).c_str(), kCall, "MakeCall"));
    g_dbus_message_set_flags(message.get(), G_DBUS_MESSAGE_FLAGS_NO_REPLY_EXPECTED);
    g_dbus_message_set_body(message.get(),
                            g_variant_new("(isissss)", 1, "+15559999", 0, "", "", "", ""));
    struct Seen {
        std::vector<std::string> kinds;
        std::mutex mutex;
    } seen;
    const guint filter = g_dbus_connection_add_filter(
        client_->connection(),
        [](GDBusConnection *, GDBusMessage *arrived, gboolean incoming, gpointer data) {
            auto &record = *static_cast<Seen *>(data);
            const std::lock_guard lock(record.mutex);
            const auto type = g_dbus_message_get_message_type(arrived);
            if (incoming && type != G_DBUS_MESSAGE_TYPE_SIGNAL)
                record.kinds.emplace_back("answer");
            return arrived;
        },
        &seen, nullptr);
    g_dbus_connection_send_message(client_->connection(), message.get(),
                                   G_DBUS_SEND_MESSAGE_FLAGS_NONE, nullptr, nullptr);
    // The call has been made all the same.
    client_->wait_for(0, "CallEstablished");
    g_dbus_connection_remove_filter(client_->connection(), filter);
    const std::lock_guard lock(seen.mutex);
    EXPECT_TRUE(seen.kinds.empty());
}

TEST_F(BusService, TheAnswerComesBeforeTheEventsItCauses) {
    client_->register_application(0);
    client_->call(0, kCall, "MakeCall", "(1, '+15559999', 0, '', '', '', '')");
    client_->wait_for(0, "CallEstablished");
    struct Seen {
        std::vector<std::string> order;
        std::mutex mutex;
    } seen;
    const guint filter = g_dbus_connection_add_filter(
        client_->connection(),
        [](GDBusConnection *, GDBusMessage *arrived, gboolean incoming, gpointer data) {
            auto &record = *static_cast<Seen *>(data);
            const std::lock_guard lock(record.mutex);
            if (incoming)
                record.order.emplace_back(g_dbus_message_get_member(arrived)
                                              ? g_dbus_message_get_member(arrived)
                                              : "answer");
            return arrived;
        },
        &seen, nullptr);
    client_->call(0, kCall, "HoldCall", "(1, 1)");
    client_->wait_for(0, "CallHeld");
    g_dbus_connection_remove_filter(client_->connection(), filter);
    const std::lock_guard lock(seen.mutex);
    EXPECT_THAT(seen.order, ElementsAre("answer", "CallHeld"));
}

} // namespace
} // namespace sim::test
