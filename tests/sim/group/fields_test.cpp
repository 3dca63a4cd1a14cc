// SPDX-License-Identifier: Apache-2.0
// Documents that are read, and those that are refused.
#include "sim/group/reader.hpp"
#include "sim/group/writer.hpp"

#include "tests/sim/group/samples.hpp"

#include <algorithm>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sim::test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using enum GroupForm;

using Path = std::vector<std::string>;

// Calls `visit` with each dictionary of a tree, its path, and itself in the tree.
template <typename Visit>
void for_each_dictionary(GroupDictionary &dictionary, const Path &path, Visit visit) {
    visit(dictionary, path);
    for (auto &[key, value] : dictionary) {
        Path below = path;
        below.push_back(key);
        if (auto *inner = std::get_if<GroupDictionary>(&value.content))
            for_each_dictionary(*inner, below, visit);
        if (auto *list = std::get_if<GroupDictionaries>(&value.content))
            for (auto &inner : *list)
                for_each_dictionary(inner, below, visit);
    }
}

// Reads the whole document anew each time that `change` has done something to one of its
// dictionaries, and undoes that. `change` is given a dictionary and the place of one of its keys.
template <typename Change, typename Check>
void for_each_change(GroupForm form, Change change, Check check) {
    auto whole = write_record(sample_group(), form);
    int changes = 0;
    for_each_dictionary(whole, {}, [&](GroupDictionary &dictionary, const Path &path) {
        const auto kept = dictionary;
        for (std::size_t i = 0; i < kept.size(); ++i) {
            if (change(dictionary, i)) {
                SCOPED_TRACE(fmt::format("{}/{}", fmt::join(path, "/"), kept[i].key));
                ++changes;
                check(read_record<GroupDocument>(whole, form), kept[i].key);
            }
            dictionary = kept;
        }
    });
    // The sample has that many counts, and more of everything else.
    EXPECT_GE(changes, 13);
}

TEST(GroupFields, EveryDocumentComesBackFromBothForms) {
    GroupDocument empty_parts{.uri = "sip:a@example.org",
                              .properties = GroupProperties{},
                              .members = GroupMembers{},
                              .rules = {GroupRule{.identity = RuleDomains{}, .identity_type = 4}}};
    for (const auto &group :
         {sample_group(), empty_parts, GroupDocument{.uri = "sip:b@example.org"}})
        for (const auto form : {kWritten, kRead}) {
            const auto read = read_record<GroupDocument>(write_record(group, form), form);
            ASSERT_TRUE(read) << read.refusal().reason;
            EXPECT_EQ(*read, group);
        }
}

TEST(GroupFields, EveryKeyOfAnotherTypeIsRefused) {
    for (const auto form : {kWritten, kRead})
        for_each_change(
            form,
            [](GroupDictionary &dictionary, std::size_t i) {
                dictionary[i].value.content = ForeignValue{"d"};
                return true;
            },
            [](const auto &read, const std::string &key) {
                ASSERT_FALSE(read);
                EXPECT_EQ(read.code(), Result::kInvalidArgument);
                EXPECT_THAT(read.refusal().reason, HasSubstr(key + " is \""));
                EXPECT_THAT(read.refusal().reason, HasSubstr("\"d\" came"));
            });
}

TEST(GroupFields, ARepeatedKeyIsRefused) {
    for_each_change(
        kWritten,
        [](GroupDictionary &dictionary, std::size_t i) {
            dictionary.push_back(GroupEntry(dictionary[i]));
            return true;
        },
        [](const auto &read, const std::string &key) {
            ASSERT_FALSE(read);
            EXPECT_THAT(read.refusal().reason, HasSubstr(key + " comes twice"));
        });
}

TEST(GroupFields, AKeyThatDoesNotExistIsRefusedAtEveryLevel) {
    for_each_change(
        kWritten,
        [](GroupDictionary &dictionary, std::size_t i) {
            dictionary.insert(dictionary.begin() + static_cast<std::ptrdiff_t>(i),
                              {"nothing", {true}});
            return true;
        },
        [](const auto &read, const std::string &) {
            ASSERT_FALSE(read);
            EXPECT_THAT(read.refusal().reason, HasSubstr("nothing is no key here"));
        });
}

TEST(GroupFields, ACountThatDoesNotFitItsListIsRefused) {
    for (const std::int64_t wrong : {-1, 1, 1'000'000'000})
        for_each_change(
            kWritten,
            [&](GroupDictionary &dictionary, std::size_t i) {
                auto *number = std::get_if<std::int64_t>(&dictionary[i].value.content);
                const bool count = number && dictionary[i].key.starts_with("num_of_");
                if (count)
                    *number += wrong;
                return count;
            },
            [](const auto &read, const std::string &key) {
                ASSERT_FALSE(read);
                EXPECT_THAT(read.refusal().reason, HasSubstr(key + " says "));
            });
}

TEST(GroupFields, WhatIsWrittenMayBeIncompleteAndWhatIsKeptMayNot) {
    const auto optional = [](std::string_view key) {
        constexpr std::string_view kOptional[] = {
            "channel_id", "version", "as_id", "area_id", "disp_name", "assign", "position", "rank",
            "start_time", "end_time", "from_age", "to_age",
            // Parts.
            "group_properties", "group_member_list", "group_session_active_policy", "participants",
            "rule_identity", "rule_media_list", "allow_domain_id", "except_domain_id",
            "except_contact_id"};
        return std::ranges::find(kOptional, key) != std::end(kOptional);
    };
    const auto take_away = [](GroupDictionary &dictionary, std::size_t i) {
        dictionary.erase(dictionary.begin() + static_cast<std::ptrdiff_t>(i));
        return true;
    };
    for_each_change(kRead, take_away, [&](const auto &read, const std::string &key) {
        if (read)
            EXPECT_TRUE(optional(key)) << key;
        else
            EXPECT_THAT(read.refusal().reason, HasSubstr(key + " is missing"));
    });
    const auto read = read_record<GroupDocument>({}, kWritten);
    ASSERT_TRUE(read);
    EXPECT_EQ(*read, GroupDocument());
}

// Clients read an empty dictionary as a part that is set.
TEST(GroupFields, PartsThatAreNotSetAreEmptyWhenWrittenAndLeftOutWhenRead) {
    const GroupDocument group{.uri = "sip:a@example.org"};
    const auto rule = [](std::int32_t type) { return GroupRule{.id = "r", .identity_type = type}; };
    const auto empty_parts = [](auto whole) {
        Path parts;
        for_each_dictionary(whole, {}, [&](GroupDictionary &dictionary, const Path &path) {
            if (dictionary.empty())
                parts.push_back(path.back());
        });
        return parts;
    };
    EXPECT_THAT(empty_parts(write_record(group, kWritten)),
                ElementsAre("group_properties", "group_member_list"));
    EXPECT_THAT(empty_parts(write_record(group, kRead)), IsEmpty());
    EXPECT_THAT(empty_parts(write_record(SessionPolicy{}, kWritten)), ElementsAre("participants"));
    EXPECT_THAT(empty_parts(write_record(SessionPolicy{}, kRead)), IsEmpty());
    for (const std::int32_t type : {0, 1, 2, 3, 4}) {
        EXPECT_THAT(empty_parts(write_record(rule(type), kWritten)),
                    ElementsAre("rule_identity", "rule_media_list"));
        EXPECT_THAT(empty_parts(write_record(rule(type), kRead)), IsEmpty());
    }
    EXPECT_THAT(empty_parts(write_record(RuleDomains{}, kWritten)),
                ElementsAre("allow_domain_id", "allow_contact_id", "except_domain_id",
                            "except_contact_id"));
    EXPECT_EQ(write_record(RuleDomains{}, kRead).size(), 0u);
}

TEST(GroupFields, AnEmptyPartIsOneThatIsNotSetInBothForms) {
    for (const auto form : {kWritten, kRead}) {
        auto whole = write_record(GroupDocument{.uri = "sip:a@example.org"}, kRead);
        whole.push_back({"group_properties", {GroupDictionary()}});
        whole.push_back({"group_member_list", {GroupDictionary()}});
        const auto read = read_record<GroupDocument>(whole, form);
        ASSERT_TRUE(read) << read.refusal().reason;
        EXPECT_EQ(*read, GroupDocument{.uri = "sip:a@example.org"});
    }
}

TEST(GroupFields, RefusalsNameThePlace) {
    auto group = sample_group();
    group.members->contacts.resize(3);
    auto whole = write_record(group, kWritten);
    const auto at = [](GroupDictionary & dictionary, std::string_view key) -> auto & {
        return std::ranges::find(dictionary, key, &GroupEntry::key)->value.content;
    };
    auto &members = std::get<GroupDictionary>(at(whole, "group_member_list"));
    auto &contacts = std::get<GroupDictionary>(at(members, "contacts"));
    auto &third = std::get<GroupDictionaries>(at(contacts, "contacts_v"))[2];
    std::get<GroupDictionary>(at(third, "status_v")).push_back({"rank", {std::int64_t{1}}});
    EXPECT_EQ(read_record<GroupDocument>(whole, kWritten).refusal().reason,
              "group_member_list.contacts.contacts_v[2].status_v.rank is \"s\" here, and \"x\" "
              "came");
    EXPECT_EQ(read_records<GroupRule>({{{"rule_id", {"a"}}}, {{"rule_id", {true}}}}, kWritten)
                  .refusal()
                  .reason,
              "[1].rule_id is \"s\" here, and \"b\" came");
}

TEST(GroupFields, ListsOfTextsHoldTexts) {
    const auto read = [](GroupDictionaries elements) {
        const auto count = static_cast<std::int64_t>(elements.size());
        return read_record<GroupMembers>(
            {{"contact_lists",
              {GroupDictionary{{"contact_lists_v", {std::move(elements)}},
                               {"num_of_ct_lists", {count}}}}}},
            kWritten);
    };
    EXPECT_TRUE(read({}));
    EXPECT_TRUE(read({{{"contact_lists", {"a"}}}}));
    // An element without a text is what clients send for a missing one.
    EXPECT_THAT(read({{{"contact_lists", {"a"}}}, {}}).refusal().reason,
                HasSubstr("contact_lists.contact_lists_v[1].contact_lists is missing or empty"));
    EXPECT_FALSE(read({{{"contact_lists", {""}}}}));
}

TEST(GroupFields, NumbersThatNoClientCanHoldAreRefused) {
    const auto read = [](std::int64_t number) {
        return read_record<SessionPolicy>({{"max_duration", {number}}}, kWritten);
    };
    EXPECT_EQ(read(INT32_MAX)->max_duration, INT32_MAX);
    EXPECT_EQ(read(INT32_MIN)->max_duration, INT32_MIN);
    EXPECT_FALSE(read(std::int64_t{INT32_MAX} + 1));
    EXPECT_FALSE(read(std::int64_t{INT32_MIN} - 1));
}

TEST(GroupFields, TheTypeOfARuleSaysWhatItsIdentityIs) {
    const auto read = [](std::int64_t type, GroupDictionary identity) {
        // The type may come after it.
        return read_record<GroupRule>({{"rule_condition",
                                        {GroupDictionary{{"rule_identity", {std::move(identity)}},
                                                         {"rule_identity_type", {type}}}}}},
                                      kWritten);
    };
    const GroupDictionary contacts = {{"contacts", {GroupDictionaries{}}},
                                      {"num_of_contacts", {std::int64_t{0}}}};
    EXPECT_TRUE(std::holds_alternative<RuleContacts>(read(1, contacts)->identity));
    EXPECT_FALSE(read(2, contacts));
    EXPECT_FALSE(read(4, contacts));
    EXPECT_THAT(read(3, contacts).refusal().reason,
                HasSubstr("rule_identity holds something, and type 3 has nothing"));
    for (const std::int64_t type : {0, 1, 2, 3, 4}) {
        const auto nothing = read(type, {});
        EXPECT_TRUE(std::holds_alternative<std::monostate>(nothing->identity));
        EXPECT_EQ(nothing->identity_type, type);
    }
}

TEST(GroupFields, AServiceHasOneMediaListAtMost) {
    const auto read = [](std::size_t lists) {
        return read_record<SupportedService>(
            {{"media_list_v", {GroupDictionaries(lists, {{"audio", {true}}})}}}, kWritten);
    };
    EXPECT_EQ(read(0)->media, std::nullopt);
    EXPECT_TRUE(read(1)->media->audio);
    EXPECT_THAT(read(2).refusal().reason, HasSubstr("media_list_v holds 2 entries"));
}

} // namespace
} // namespace sim::test
