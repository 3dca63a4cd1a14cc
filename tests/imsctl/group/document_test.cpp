// SPDX-License-Identifier: Apache-2.0
// Group documents as far as no service is needed: what is wrong with a file, and the schema.
#include "imsctl/group/document.hpp"
#include "imsctl/group/json.hpp"
#include "imsctl/group/schema.hpp"
#include "imsctl/output/failure.hpp"
#include "tests/imsctl/group/documents.hpp"
#include "tests/imsctl/temporary_file.hpp"

#include <fstream>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

using test::TemporaryFile;
using testing::ElementsAre;

// What a file is refused for.
std::vector<std::string> problems_of(const std::string &content) {
    const TemporaryFile file(content);
    Storage storage;
    try {
        read_group(file.name(), storage);
    } catch (const Failure &failure) {
        EXPECT_EQ(failure.kind, FailureKind::kInput);
        std::vector<std::string> problems;
        for (const auto &problem : std::get<Texts>(failure.details.at(1).value))
            problems.push_back(*problem);
        return problems;
    }
    return {};
}

TEST(GroupDocuments, ComeBackAsTheyWere) {
    const TemporaryFile file(test::kGroupJson);
    Storage storage;
    EXPECT_EQ(to_json(*read_group(file.name(), storage)).dump(),
              Json::parse(test::kGroupJson).dump());
}

TEST(GroupDocuments, MayLeaveOutWhatIsEmpty) {
    const TemporaryFile file(R"({"group_uri":"sip:g","version":null,"$schema":"x","verb":"y"})");
    Storage storage;
    const ims_xdm_group_info_s &group = *read_group(file.name(), storage);
    EXPECT_STREQ(group.group_uri, "sip:g");
    EXPECT_EQ(group.version, nullptr);
    EXPECT_EQ(group.group_properties, nullptr);
    EXPECT_EQ(group.group_member_list, nullptr);
    EXPECT_EQ(group.group_rule_set, nullptr);
}

TEST(GroupDocuments, AreRefusedForEverythingThatIsWrong) {
    EXPECT_THAT(problems_of("{}"), ElementsAre("there is no \"group_uri\""));
    EXPECT_THAT(problems_of("[]"), ElementsAre("this is not a JSON object"));
    EXPECT_THAT(problems_of("{\n\"group_uri\":"), ElementsAre("this is not JSON from line 2 on"));
    EXPECT_THAT(problems_of(R"({"group_uri":"a","group_uri":"b"})"),
                ElementsAre("an object has the key \"group_uri\" twice"));
    EXPECT_THAT(problems_of("{\"a\":[{},{\"b\":1,\n\"b\":2},{\"b\":3}],\"a\":1,\n1e999}"),
                ElementsAre("an object has the key \"b\" twice",
                            "an object has the key \"a\" twice",
                            "this is not JSON from line 3 on"));
    EXPECT_THAT(problems_of(R"({"group_uri":1e999})"),
                ElementsAre("this is not JSON from line 1 on"));
    EXPECT_THAT(problems_of(R"({"group_uri":"a","versoin":"1"})"),
                ElementsAre("there is no key \"versoin\"; did you mean \"version\"?"));
    EXPECT_THAT(problems_of(R"({"group_uri":")" + std::string(129, 'u') + R"("})"),
                ElementsAre("group_uri: the text has 129 bytes, and 128 are the most"));
    EXPECT_THAT(problems_of(R"({"group_uri":"a\u0000b"})"),
                ElementsAre("group_uri: a text cannot hold a zero character"));
}

TEST(GroupDocuments, AreRefusedWithThePlaceOfWhatIsWrong) {
    EXPECT_THAT(
        problems_of(R"({"group_uri":"g","version":7,"group_properties":{"is_searchable":"yes",)"
                    R"("group_qoe":2147483648,"max_participants":1.5,"group_active_policy":[],)"
                    R"("age_restrictions":[{"from_age":6}]},"group_member_list":{"contacts":)"
                    R"([{"uri":"a"},{},7],"ext_ref":[null,1]},"group_rule_set":[{"rule_id":"r",)"
                    R"("rule_identity_type":3,"identity":{}}]})"),
        ElementsAre("version: this has to be a text",
                    "group_properties.is_searchable: this has to be true or false",
                    "group_properties.max_participants: this has to be a whole number",
                    "group_properties.group_qoe: 2147483648 has more than 32 bits",
                    "group_properties.group_active_policy: this has to be an object",
                    "group_properties.age_restrictions[0].from_age: this has to be a text",
                    "group_member_list.contacts[1]: there is no \"uri\"",
                    "group_member_list.contacts[2]: this has to be an object",
                    "group_member_list.ext_ref[1]: this has to be a text",
                    "group_rule_set[0].identity: the rule_identity_type 3 has no identity"));
}

TEST(GroupRules, NeedATypeForAnIdentity) {
    const auto problems_of_rule = [](const std::string &keys) {
        return problems_of(R"({"group_uri":"g","group_rule_set":[{"rule_id":"r",)" + keys + "}]}");
    };
    const auto kForgotten = "group_rule_set[0]: there is no \"rule_identity_type\", which an "
                            "identity needs";
    EXPECT_THAT(problems_of_rule(R"("identity":{"contacts":[]})"), ElementsAre(kForgotten));
    EXPECT_THAT(problems_of_rule(R"("rule_identity_type":null,"identity":{})"),
                ElementsAre(kForgotten));
    EXPECT_THAT(
        problems_of_rule(R"("rule_identity_type":0,"identity":{})"),
        ElementsAre("group_rule_set[0].identity: the rule_identity_type 0 has no identity"));
    EXPECT_THAT(problems_of_rule(R"("rule_identity_type":2,"identity":{"domains":[]})"),
                ElementsAre("group_rule_set[0].identity: there is no key \"domains\""));
    EXPECT_THAT(problems_of_rule(R"("identity":null)"), ElementsAre());
}

TEST(GroupRules, HaveTheIdentityOfTheirType) {
    const TemporaryFile file(
        R"([{"rule_id":"1","rule_identity_type":1,"identity":{"contacts":[{"uri":"sip:a"}]}},)"
        R"({"rule_id":"4","rule_identity_type":4,"identity":{"allow_domain_id":{"domains":["d"]},)"
        R"("except_contact_id":{"contacts":[{"uri":"sip:b"}]}}}])");
    Storage storage;
    const ims_xdm_group_rule_s *first = read_rules(file.name(), storage);
    const auto *entries = static_cast<ims_xdm_identity_entries_s *>(*first->identity);
    ASSERT_EQ(entries->num_of_contacts, 1);
    EXPECT_STREQ(entries->contacts[0].uri, "sip:a");
    const auto *domains = static_cast<ims_xdm_identity_domains_s *>(*first->next->identity);
    ASSERT_EQ(domains->allow_domain_id->num_of_domain_id, 1);
    EXPECT_STREQ(domains->allow_domain_id->domains[0], "d");
    EXPECT_EQ(domains->allow_contact_id, nullptr);
    EXPECT_STREQ(domains->except_contact_id->contacts[0].uri, "sip:b");
}

// A list whose count was wrong is not an empty one.
TEST(GroupJson, IsNullForAListThatWasDropped) {
    ims_xdm_member_list_s members{};
    members.num_of_contacts = 3;
    ims_xdm_group_info_s group{};
    group.group_member_list = &members;
    const Json list = to_json(group)["group_member_list"];
    EXPECT_TRUE(list["contacts"].is_null());
    EXPECT_EQ(list["ext_ref"].dump(), "[]");
}

// What a rule's identity may be for each type, and that it is none for every other.
TEST(GroupSchema, TiesAnIdentityToItsType) {
    const Json conditions = group_schema()["$defs"]["rule"]["allOf"];
    ASSERT_EQ(conditions.size(), 4u);
    const auto condition = [](const std::string &type) {
        return R"({"properties":{"rule_identity_type":)" + type +
               R"(},"required":["rule_identity_type"]})";
    };
    const char *const kinds[][2] = {
        {"1", "identity-entries"}, {"2", "identity-urls"}, {"4", "identity-domains"}};
    for (std::size_t at = 0; at < std::size(kinds); ++at) {
        const auto &[type, kind] = kinds[at];
        EXPECT_EQ(conditions[at]["if"].dump(), condition(R"({"const":)" + std::string(type) + "}"));
        EXPECT_EQ(conditions[at]["then"].dump(),
                  R"({"properties":{"identity":{"anyOf":[{"type":"null"},{"$ref":"#/$defs/)" +
                      std::string(kind) + R"("}]}}})");
    }
    EXPECT_EQ(conditions[3]["if"].dump(), condition(R"({"enum":[1,2,4]})"));
    EXPECT_EQ(conditions[3]["else"].dump(), R"({"properties":{"identity":{"type":"null"}}})");
}

// The published file. imsctl prints it: imsctl group schema.
TEST(GroupSchema, IsThePublishedOne) {
    const std::ifstream file(IMSCTL_GROUP_SCHEMA);
    std::ostringstream published;
    published << file.rdbuf();
    EXPECT_EQ(published.str(), group_schema().dump(2) + "\n");
}

} // namespace
} // namespace imsctl
