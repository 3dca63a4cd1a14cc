// SPDX-License-Identifier: Apache-2.0
// The bus policy, as a dbus-daemon applies it. The service and its clients are this very user, so
// the names in the policy are replaced; everything else is the file's.
#include "tests/support/expectations.hpp"
#include "tests/support/files.hpp"
#include "tests/support/with_peer.hpp"

#include <gmock/gmock.h>

#include <algorithm>

#include <grp.h>
#include <pwd.h>
#include <unistd.h>

namespace test {
namespace {

// As on a system bus: nobody owns a name or calls anybody but the bus, unless a policy says so.
constexpr const char *kSystemRules = "<deny own=\"*\"/>\n"
                                     "<deny send_type=\"method_call\"/>\n"
                                     "<allow send_destination=\"org.freedesktop.DBus\"/>\n";

// Another service, which anybody may call: this user owns its name, whatever group it is in.
constexpr const char *kNeighbour = "org.example.neighbour";
constexpr const char *kNeighboursPolicy = "<policy context=\"default\">\n"
                                          "<allow own=\"org.example.neighbour\"/>\n"
                                          "<allow send_destination=\"org.example.neighbour\"/>\n"
                                          "</policy>\n";

std::string this_user() {
    return getpwuid(geteuid())->pw_name;
}

std::string other_user() {
    return geteuid() == 0 ? "daemon" : "root";
}

std::string group_of_this_user() {
    return getgrgid(getegid())->gr_name;
}

// One that this user is not in.
std::string other_group() {
    std::vector<gid_t> own(static_cast<std::size_t>(getgroups(0, nullptr)));
    own.resize(static_cast<std::size_t>(getgroups(static_cast<int>(own.size()), own.data())));
    own.push_back(getegid());
    setgrent();
    const group *found = getgrent();
    while (found != nullptr && std::find(own.begin(), own.end(), found->gr_gid) != own.end())
        found = getgrent();
    const std::string name = found != nullptr ? found->gr_name : "";
    endgrent();
    if (name.empty())
        throw std::runtime_error("this user is in every group");
    return name;
}

void replace_once(std::string &text, const std::string &from, const std::string &to) {
    const auto at = text.find(from);
    if (at == std::string::npos || text.find(from, at + 1) != std::string::npos)
        throw std::runtime_error(from + " does not stand in the policy exactly once");
    text.replace(at, from.size(), to);
}

// The policy in a file of its own.
class Policy {
  public:
    void write(const std::string &service_user, const std::string &client_group) const {
        std::string text = content_of(IMS_TEST_POLICY);
        replace_once(text, "<policy user=\"root\">", "<policy user=\"" + service_user + "\">");
        replace_once(text, "<policy group=\"kelvo-ims\">",
                     "<policy group=\"" + client_group + "\">");
        put_content(path(), text);
    }
    std::string path() const { return directory_.file("org.kelvo.ims.conf"); }
    std::string element() const { return "<include>" + path() + "</include>\n"; }

  private:
    TemporaryDirectory directory_;
};

class BusPolicy : public WithPeer {
  protected:
    BusPolicy() {
        policy_.write(this_user(), group_of_this_user());
        policy_rules_ = kSystemRules;
        bus_elements_ = policy_.element() + kNeighboursPolicy;
    }

    void SetUp() override {
        WithPeer::SetUp();
        peer().on("org.kelvo.ims.Call.CallListInfo", reply("(iuaa{sv})", "(0, 0, [])"));
        peer().on("org.kelvo.ims.Call.HoldCall", reply("(i)", "(0,)"));
    }

    int query() {
        ims_call_list_info_s list{};
        return ims_call_get_call_list_info(handle_, &list);
    }

    int request() {
        ResponseRecorder recorder;
        EXPECT_EQ(ims_call_hold_call(handle_, 7, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_NONE);
        pump_until([&] { return recorder.count() > 0; }, "the callback of a request");
        return recorder.last().result;
    }

    // From now on this user is outside of the group of the clients.
    void leave_group() {
        policy_.write(this_user(), other_group());
        peer().client().reload_bus_configuration();
    }

    Policy policy_;
};

TEST_F(BusPolicy, ServesAClientInTheGroup) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_IN_PROGRESS, recorder);
    EXPECT_EQ(query(), IMS_ERROR_NONE);
    EXPECT_EQ(request(), 0);
    emit("org.kelvo.ims.Call", "CallInProgress", parse("(i)", "(7,)"));
    fence();
    EXPECT_EQ(recorder.count(), 1U);
    EXPECT_EQ(peer().calls_to("org.kelvo.ims.Call.HoldCall").size(), 1U);
}

TEST_F(BusPolicy, RefusesTheQueriesOfAClientOutsideTheGroup) {
    leave_group();
    EXPECT_EQ(query(), IMS_ERROR_PERMISSION_DENIED);
    expect_one_line("ims_call.cpp", "ims_call_get_call_list_info", "Permission denied");
    EXPECT_TRUE(peer().calls_to("org.kelvo.ims.Call.CallListInfo").empty());
}

TEST_F(BusPolicy, RefusesTheRequestsOfAClientOutsideTheGroup) {
    leave_group();
    EXPECT_EQ(request(), IMS_RESPONSE_ACCESS_DENIED);
    expect_one_line("ims_call.cpp", "on_response_call_hold_call", "Permission denied");
    EXPECT_TRUE(peer().calls_to("org.kelvo.ims.Call.HoldCall").empty());
}

TEST_F(BusPolicy, RegistersNobodyOutsideTheGroup) {
    leave_group();
    ims_h handle = nullptr;
    EXPECT_EQ(ims_init(kSlot, &handle), IMS_ERROR_PERMISSION_DENIED);
    EXPECT_EQ(handle, nullptr);
    expect_one_line("ims.cpp", "ims_init", "Permission denied");
}

TEST_F(BusPolicy, LetsNobodyOutsideTheGroupListen) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_IN_PROGRESS, recorder);
    leave_group();
    emit("org.kelvo.ims.Call", "CallInProgress", parse("(i)", "(7,)"));
    fence();
    EXPECT_EQ(recorder.count(), 0U);
}

// GDBus answers a ping by itself, on a thread of its own.
TEST_F(BusPolicy, LetsTheServiceCallAPeerOutsideTheGroup) {
    leave_group();
    BusClient neighbour{bus().address()};
    ASSERT_TRUE(neighbour.own_name(kNeighbour));
    GError *error = nullptr;
    const Variant answer{g_dbus_connection_call_sync(
        peer().client().connection(), kNeighbour, "/", "org.freedesktop.DBus.Peer", "Ping", nullptr,
        G_VARIANT_TYPE_UNIT, G_DBUS_CALL_FLAGS_NONE, -1, nullptr, &error)};
    EXPECT_TRUE(answer) << error->message;
    g_clear_error(&error);
}

// Whether the bus's policies let this user own the name.
bool may_own(const PrivateBus &bus, const char *name) {
    BusClient client{bus.address()};
    try {
        return client.own_name(name);
    } catch (const std::runtime_error &refusal) {
        EXPECT_THAT(refusal.what(), ::testing::HasSubstr("is not allowed to own the service"));
        return false;
    }
}

TEST(BusPolicyOwner, IsTheServicesUserAlone) {
    const Policy policy;
    policy.write(other_user(), group_of_this_user());
    const PrivateBus refusing{kSystemRules, policy.element()};
    EXPECT_FALSE(may_own(refusing, kServiceName));

    policy.write(this_user(), group_of_this_user());
    const PrivateBus allowing{kSystemRules, policy.element()};
    EXPECT_TRUE(may_own(allowing, kServiceName));
    EXPECT_FALSE(may_own(allowing, "org.kelvo.ims.other"));
}

} // namespace
} // namespace test
