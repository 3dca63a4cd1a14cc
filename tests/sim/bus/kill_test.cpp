// SPDX-License-Identifier: Apache-2.0
#include "sim/group/json.hpp"
#include "sim/settings/json.hpp"
#include "tests/sim/bus/kill_rounds.hpp"

#include <csignal>

namespace sim::test {
namespace {

template <typename T>
std::string problem_of(const Answer<T> &content) {
    return content ? "" : content.refusal().reason;
}

TEST_F(KillTest, NoAcknowledgedChangeOfSettingsIsLost) {
    kill_while_keeping(
        {.interface = "org.kelvo.ims.Settings",
         .method = "UpdateGlobalSettings",
         .arguments =
             [](int number) {
                 return fmt::format("({{'name': <'default'>, 'session_expire': <{}>, "
                                    "'self_port': <'{}'>}},)",
                                    number, number);
             },
         .query = "GetGlobalSettings",
         .query_arguments = "('default',)",
         .read =
             [](GVariant *set) {
                 gint32 number = -1;
                 const char *text = "";
                 EXPECT_TRUE(g_variant_lookup(set, "session_expire", "i", &number));
                 EXPECT_TRUE(g_variant_lookup(set, "self_port", "&s", &text));
                 EXPECT_EQ(std::to_string(number), text);
                 return number;
             },
         .file = "sub0.json",
         .problem = [](const std::string &text) { return problem_of(from_json(text)); }},
        50);
}

TEST_F(KillTest, NoAcknowledgedChangeOfGroupsIsLost) {
    {
        const auto program = start();
        ASSERT_EQ(client_->call(0, kXdm, "XdmCreateGroup", "({'group_uri': <'sip:g@x'>},)").body,
                  "(0,)");
        program->send_signal(SIGKILL);
        program->wait();
        client_->wait_until_gone(kServiceName);
    }
    kill_while_keeping(
        {.interface = kXdm,
         .method = "XdmModifyGroupSessionActivePolicy",
         .arguments =
             [](int number) {
                 return fmt::format("('sip:g@x', {{'min_participants': <int64 {}>, "
                                    "'max_duration': <int64 {}>}})",
                                    number, number);
             },
         .query = "XdmFetchSharedGroup",
         .query_arguments = "('sip:g@x', '')",
         .read =
             [](GVariant *group) {
                 const auto lookup = [](GVariant *in, const char *key) {
                     return Variant::adopt(g_variant_lookup_value(in, key, G_VARIANT_TYPE_VARDICT));
                 };
                 const auto properties = lookup(group, "group_properties");
                 const auto policy = lookup(properties.get(), "group_session_active_policy");
                 gint64 least = -1;
                 gint64 longest = -2;
                 EXPECT_TRUE(g_variant_lookup(policy.get(), "min_participants", "x", &least));
                 EXPECT_TRUE(g_variant_lookup(policy.get(), "max_duration", "x", &longest));
                 EXPECT_EQ(least, longest);
                 return static_cast<int>(least);
             },
         .file = "groups.json",
         .problem = [](const std::string &text) { return problem_of(groups_from_json(text)); }},
        20);
}

} // namespace
} // namespace sim::test
