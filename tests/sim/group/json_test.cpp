// SPDX-License-Identifier: Apache-2.0
#include "sim/group/json.hpp"
#include "sim/group/store.hpp"

#include "tests/sim/group/samples.hpp"
#include "tests/sim/settings/directory.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

namespace sim::test {
namespace {

using nlohmann::ordered_json;
using testing::HasSubstr;

GroupState sample_state() {
    return {5,
            {sample_group(), {.uri = "sip:b@example.org"}},
            {{"tel:+15550100", "sip:crew@example.org", "mine", true}}};
}

TEST(GroupJson, EverythingComesBack) {
    for (const auto &state : {sample_state(), GroupState()}) {
        const auto restored = groups_from_json(groups_to_json(state));
        ASSERT_TRUE(restored) << restored.refusal().reason;
        EXPECT_EQ(*restored, state);
    }
}

TEST(GroupJson, NoPartOfAFileIsAFile) {
    const auto text = groups_to_json(sample_state());
    // The last two characters are the closing brace and the line end.
    for (std::size_t length = 0; length + 2 <= text.size(); length += 23)
        EXPECT_FALSE(groups_from_json(text.substr(0, length))) << length;
    EXPECT_FALSE(groups_from_json(text.substr(0, text.size() - 2)));
    EXPECT_FALSE(groups_from_json(text + "{}"));
}

TEST(GroupJson, ForeignAndDamagedFilesAreRefusedWithTheReason) {
    struct Damage {
        const char *pointer;
        ordered_json value; // null takes the member away
        const char *why;
    };
    const Damage damages[] = {
        {"/format", "something else", "no file of ims-sim's groups"},
        {"/format", nullptr, "no file of ims-sim's groups"},
        {"/version", 2, "version is not 1"},
        {"/version", nullptr, "version is missing"},
        {"/revision", "1", "revision is \"x\" here, and \"s\" came"},
        {"/extra", 1, "extra is no key here"},
        {"/groups", nullptr, "groups is missing"},
        {"/groups", 1, "groups is \"aa{sv}\" here, and \"x\" came"},
        {"/groups/0", 1, "groups is \"aa{sv}\" here, and \"an array of number\" came"},
        {"/groups/1/group_uri", "", "\"group_uri\" is missing or empty"},
        {"/groups/1/group_uri", "sip:crew@example.org", "\"sip:crew@example.org\" comes twice"},
        {"/groups/1/group_uri", std::string("a\0b", 3), "\"a text with a NUL\" came"},
        {"/groups/0/group_member_list/contacts/num_of_contacts", 3,
         "groups[0].group_member_list.contacts.num_of_contacts says 3, and 2 came"},
        {"/groups/0/group_member_list/contacts/num_of_contacts", 2147483648U,
         "which no client can hold"},
        {"/groups/0/group_member_list/contacts/num_of_contacts", 18446744073709551615UL,
         "\"t\" came"},
        {"/groups/0/group_member_list/contacts/num_of_contacts", 2.0, "\"number\" came"},
        {"/groups/0/group_member_list/contacts/contacts_v/1/uri", "tel:+15550100",
         "group \"sip:crew@example.org\": the member \"tel:+15550100\" comes twice"},
        {"/groups/0/group_rule_set/0/rule_id", nullptr,
         "groups[0].group_rule_set[0].rule_id is missing"},
        {"/participant_groups/0/group_list_name", "", "a list of tel:+15550100 has no name"},
        {"/participant_groups/0/group_uri", "sip:no@example.org", "a group that does not exist"},
    };
    for (const auto &damage : damages) {
        auto whole = ordered_json::parse(groups_to_json(sample_state()));
        const ordered_json::json_pointer pointer(damage.pointer);
        if (damage.value.is_null())
            whole[pointer.parent_pointer()].erase(pointer.back());
        else
            whole[pointer] = damage.value;
        const auto state = groups_from_json(whole.dump());
        ASSERT_FALSE(state) << damage.pointer;
        EXPECT_THAT(state.refusal().reason, HasSubstr(damage.why)) << damage.pointer;
    }
    for (const auto *text :
         {"", "[]", "null", "42", "{}", "\xff", "{\"format\": \"ims-sim groups\"}"})
        EXPECT_FALSE(groups_from_json(text)) << text;
}

class GroupStore : public testing::Test {
  protected:
    std::optional<std::string> keep(GroupModel &model) {
        const auto store = Store::open(directory_.path());
        return store ? keep_groups(*store, model) : store.refusal().reason;
    }

    TemporaryDirectory directory_;
};

TEST_F(GroupStore, EverythingIsFoundAgain) {
    GroupState expected;
    {
        GroupModel model;
        ASSERT_EQ(keep(model), std::nullopt);
        EXPECT_TRUE(std::filesystem::is_empty(directory_.path()));
        ASSERT_TRUE(model.create(sample_group()));
        ASSERT_TRUE(model.set_default("tel:+15550100", "mine", "sip:crew@example.org", true));
        expected = model.state();
    }
    GroupModel model;
    ASSERT_EQ(keep(model), std::nullopt);
    EXPECT_EQ(model.state(), expected);
}

TEST_F(GroupStore, ADamagedFileIsNamedAndKept) {
    const auto path = directory_.file("groups.json");
    const auto half = groups_to_json(sample_state()).substr(0, 1000);
    put_content(path, half);
    GroupModel model;
    const auto error = keep(model);
    ASSERT_TRUE(error);
    EXPECT_THAT(*error, HasSubstr("cannot use " + path));
    EXPECT_EQ(content_of(path), half);
}

} // namespace
} // namespace sim::test
