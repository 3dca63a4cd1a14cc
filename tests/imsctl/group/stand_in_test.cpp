// SPDX-License-Identifier: Apache-2.0
// Group documents from end to end, with the stand-in service.
#include "tests/imsctl/temporary_file.hpp"
#include "tests/imsctl/with_stand_in.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

constexpr const char *kCrew =
    R"({"group_uri":"sip:crew@example.org",)"
    R"("group_properties":{"display_name":"Crew","subject":"Night"},)"
    R"("group_member_list":{"contacts":[{"uri":"tel:+15550100","active":true},)"
    R"({"uri":"tel:+15550101","disp_name":"Bo"}]},)"
    R"("group_rule_set":[{"rule_id":"guests","rule_identity_type":1,)"
    R"("identity":{"contacts":[{"uri":"tel:+15550199"}]}}]})";

class Groups : public WithStandIn {
  protected:
    static Json shown(const std::string &slot) {
        return run("--slot " + slot + " group show sip:crew@example.org --json").json();
    }
};

TEST_F(Groups, AreFetchedEditedAndCreatedAgain) {
    const TemporaryFile file{kCrew};
    expect_ok("group create " + file.name());
    expect_refusal("group create " + file.name(), 20);

    const Json before = shown("1");
    EXPECT_EQ(before["group_properties"]["subject"], "Night");
    EXPECT_EQ(before["group_member_list"]["contacts"][1]["disp_name"], "Bo");
    EXPECT_EQ(before["group_rule_set"][0]["identity"]["contacts"][0]["uri"], "tel:+15550199");

    Json edited = before;
    edited["group_properties"]["subject"] = "Day";
    const TemporaryFile again{edited.dump()};
    expect_ok("group delete sip:crew@example.org");
    expect_refusal("group show sip:crew@example.org", 19);
    expect_ok("group create " + again.name());
    EXPECT_EQ(shown("0")["group_properties"], edited["group_properties"]);
    EXPECT_EQ(shown("0")["group_member_list"], edited["group_member_list"]);
}

// What is not set does not come back as something that is set and empty.
TEST_F(Groups, KeepWhatIsNotSetWhenTheyAreCreatedAgain) {
    struct {
        const char *document;
        std::vector<const char *> unset;
    } const rows[] = {
        {R"({"group_uri":"sip:crew@example.org"})", {"/group_properties", "/group_member_list"}},
        {R"({"group_uri":"sip:crew@example.org","group_properties":{},"group_rule_set":)"
         R"([{"rule_id":"all"}]})",
         {"/group_properties/group_active_policy", "/group_rule_set/0/identity",
          "/group_rule_set/0/media_list"}},
        {R"({"group_uri":"sip:crew@example.org","group_properties":{"group_active_policy":{},)"
         R"("supported_services":[{"service_enabler":1}]},"group_rule_set":[{"rule_id":"home",)"
         R"("rule_identity_type":4,"identity":{"allow_domain_id":{"domains":["example.org"]}}}]})",
         {"/group_properties/group_active_policy/participants",
          "/group_properties/supported_services/0/media_list",
          "/group_rule_set/0/identity/allow_contact_id",
          "/group_rule_set/0/identity/except_domain_id"}}};
    for (const auto &[document, unset] : rows) {
        const TemporaryFile file{document};
        expect_ok("group create " + file.name());
        const Json first = shown("0");
        for (const char *part : unset)
            EXPECT_TRUE(first.at(Json::json_pointer(part)).is_null()) << part << first.dump(1);
        const TemporaryFile again{first.dump()};
        expect_ok("group delete sip:crew@example.org");
        expect_ok("group create " + again.name());
        EXPECT_EQ(shown("0").dump(), first.dump());
        expect_ok("group delete sip:crew@example.org");
    }
}

TEST_F(Groups, AreEditedInPlace) {
    const TemporaryFile file{kCrew};
    expect_ok("group create " + file.name());
    expect_ok("--slot 1 group set subject sip:crew@example.org Day");
    expect_ok("group add-user sip:crew@example.org tel:+15550102");
    expect_refusal("group add-user sip:crew@example.org tel:+15550102", 20);
    expect_ok("group remove-user sip:crew@example.org tel:+15550101");
    expect_ok("group rule delete sip:crew@example.org guests");
    expect_refusal("group rule delete sip:crew@example.org guests", 19);
    const Json group = shown("0");
    EXPECT_EQ(group["group_properties"]["subject"], "Day");
    EXPECT_EQ(group["group_member_list"]["contacts"].size(), 2u);
    EXPECT_EQ(group["group_member_list"]["contacts"][1]["uri"], "tel:+15550102");
    EXPECT_EQ(group["group_rule_set"].size(), 0u);
    const Json list = run("group list --json").json();
    EXPECT_EQ(list["groups"][0]["group_properties"]["subject"], "Day");
    EXPECT_EQ(run("group profile --json").json()["user_uri"], "tel:+15550100");
}

TEST_F(Groups, SayWhoTakesPartInACall) {
    const TemporaryFile file{kCrew};
    expect_ok("group create " + file.name());
    expect_refusal("group participants sip:crew@example.org", 12);
    expect_ok("ptt call sip:crew@example.org --type group");
    service_.wait_for_error("sub1 signal PocCallIncomingInd");
    expect_ok("--slot 1 ptt answer 1");
    service_.wait_for_error("sub0 signal PocCallEstablished");
    const Json participants = run("group participants sip:crew@example.org --json").json();
    EXPECT_EQ(participants["list_service_uri"], "sip:crew@example.org");
    EXPECT_EQ(participants["conf_participant_entry"].size(), 2u) << participants.dump(1);
}

} // namespace
} // namespace test
