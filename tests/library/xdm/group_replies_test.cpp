// SPDX-License-Identifier: Apache-2.0
// Group documents as the service answers them, and their release.
#include "tests/library/xdm/sample.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/released.hpp"
#include "tests/support/with_peer.hpp"

namespace test {
namespace {

constexpr const char *kFetch = "org.kelvo.ims.Xdm.XdmFetchSharedGroup";
constexpr const char *kFetchAll = "org.kelvo.ims.Xdm.XdmFetchAllSharedGroups";

class GroupReplies : public WithPeer {
  protected:
    using Look = std::function<void(const ims_xdm_group_info_s &)>;
    using LookAtAll = std::function<void(const ims_xdm_shared_group_list_s &)>;

    // Fetches a document that the peer answers with, and looks at it while it is there.
    void fetch(const std::string &dictionary, const Look &look) {
        peer().on(kFetch, reply("(ia{sv})", "(0, " + dictionary + ")"));
        ResponseRecorder recorder{[&](const Response &response, void *data) {
            EXPECT_EQ(response.result, 0);
            ASSERT_NE(data, nullptr);
            look(*static_cast<ims_xdm_group_info_s *>(data));
        }};
        ASSERT_EQ(
            ims_xdm_fetch_shared_group(handle_, &kGroup, ResponseRecorder::callback, &recorder),
            IMS_ERROR_NONE);
        pump_until([&] { return recorder.count() > 0; }, "the document");
    }
    void fetch_all(const std::string &dictionary, const LookAtAll &look) {
        peer().on(kFetchAll, reply("(ia{sv})", "(0, " + dictionary + ")"));
        ResponseRecorder recorder{[&](const Response &response, void *data) {
            EXPECT_EQ(response.result, 0);
            ASSERT_NE(data, nullptr);
            look(*static_cast<ims_xdm_shared_group_list_s *>(data));
        }};
        ASSERT_EQ(
            ims_xdm_fetch_all_shared_groups(handle_, "", ResponseRecorder::callback, &recorder),
            IMS_ERROR_NONE);
        pump_until([&] { return recorder.count() > 0; }, "the documents");
    }
};

void expect_alice(const ims_xdm_member_entry_s &entry) {
    EXPECT_STREQ(entry.uri, "sip:alice@example.org");
    EXPECT_STREQ(entry.disp_name, "Alice");
    EXPECT_STREQ(entry.status.assign, "site");
    EXPECT_STREQ(entry.status.position, "lead");
    EXPECT_STREQ(entry.status.rank, "first");
    EXPECT_TRUE(entry.stt);
    EXPECT_TRUE(entry.active);
    EXPECT_FALSE(entry.auto_join);
    EXPECT_EQ(entry.type, 5);
}

void expect_bob(const ims_xdm_member_entry_s &entry) {
    EXPECT_STREQ(entry.uri, "sip:bob@example.org");
    EXPECT_EQ(entry.disp_name, nullptr);
    EXPECT_EQ(entry.status.assign, nullptr);
    EXPECT_FALSE(entry.active);
    EXPECT_TRUE(entry.auto_join);
    EXPECT_EQ(entry.type, 1);
}

void expect_members(const ims_xdm_member_list_s *list) {
    ASSERT_NE(list, nullptr);
    ASSERT_EQ(list->num_of_ct_lists, 2);
    ASSERT_NE(list->contact_lists, nullptr);
    EXPECT_STREQ(list->contact_lists[0], "friends");
    EXPECT_EQ(list->contact_lists[1], nullptr);
    ASSERT_EQ(list->num_of_contacts, 2);
    ASSERT_NE(list->contacts, nullptr);
    expect_alice(list->contacts[0]);
    expect_bob(list->contacts[1]);
    ASSERT_EQ(list->num_of_ct_lists_ref, 1);
    ASSERT_NE(list->ext_ref, nullptr);
    EXPECT_STREQ(list->ext_ref[0], "http://example.org/lists/1");
    ASSERT_EQ(list->num_of_ct_ref, 2);
    ASSERT_NE(list->entry_ref, nullptr);
    EXPECT_STREQ(list->entry_ref[0], "entry 1");
    EXPECT_STREQ(list->entry_ref[1], "entry 2");
}

void expect_properties(const ims_xdm_group_properties_s *properties) {
    ASSERT_NE(properties, nullptr);
    EXPECT_STREQ(properties->display_name, "Team é");
    EXPECT_STREQ(properties->subject, "What we do");
    EXPECT_TRUE(properties->is_searchable);
    EXPECT_FALSE(properties->inv_members);
    EXPECT_EQ(properties->max_participants, 12);
    EXPECT_STREQ(properties->as_id, "as-1");
    EXPECT_STREQ(properties->area_id, "area-1");
    EXPECT_TRUE(properties->auto_grp_advertisements);
    EXPECT_EQ(properties->group_qoe, -3);

    const ims_xdm_session_policy_s *policy = properties->group_active_policy;
    ASSERT_NE(policy, nullptr);
    EXPECT_EQ(policy->min_participants, 2);
    EXPECT_EQ(policy->max_duration, 3600);
    expect_members(policy->participants);
    const ims_xdm_schedule_s *schedule = policy->schedule;
    ASSERT_NE(schedule, nullptr);
    EXPECT_STREQ(schedule->start_time, "08:00");
    EXPECT_STREQ(schedule->end_time, "12:00");
    ASSERT_NE(schedule->next, nullptr);
    EXPECT_STREQ(schedule->next->start_time, "18:00");
    EXPECT_EQ(schedule->next->end_time, nullptr);
    EXPECT_EQ(schedule->next->next, nullptr);

    const ims_xdm_supported_service_s *service = properties->supported_services;
    ASSERT_NE(service, nullptr);
    EXPECT_EQ(service->service_enabler, 3);
    ASSERT_NE(service->media_list, nullptr);
    EXPECT_TRUE(service->media_list->audio);
    EXPECT_FALSE(service->media_list->video);
    EXPECT_TRUE(service->media_list->pager_mode);
    ASSERT_NE(service->next, nullptr);
    EXPECT_EQ(service->next->service_enabler, -4);
    EXPECT_EQ(service->next->media_list, nullptr);
    EXPECT_EQ(service->next->next, nullptr);

    const ims_xdm_age_restriction_s *ages = properties->age_restrictions;
    ASSERT_NE(ages, nullptr);
    EXPECT_STREQ(ages->from_age, "6");
    EXPECT_STREQ(ages->to_age, "14");
    ASSERT_NE(ages->next, nullptr);
    EXPECT_STREQ(ages->next->from_age, "65");
    EXPECT_EQ(ages->next->to_age, nullptr);
}

void expect_first_rule(const ims_xdm_group_rule_s &rule) {
    EXPECT_STREQ(rule.rule_id, "by name");
    EXPECT_EQ(rule.rule_identity_type, IMS_XDM_IDENTITY_ENTRIES);
    EXPECT_TRUE(rule.is_list_member);
    ASSERT_NE(rule.identity, nullptr);
    const auto *entries = static_cast<ims_xdm_identity_entries_s *>(*rule.identity);
    ASSERT_EQ(entries->num_of_contacts, 1);
    ASSERT_NE(entries->contacts, nullptr);
    expect_alice(entries->contacts[0]);
    // All seven media, where four are sent.
    ASSERT_NE(rule.media_list, nullptr);
    EXPECT_TRUE(rule.media_list->audio);
    EXPECT_TRUE(rule.media_list->group_advertisement);
    EXPECT_TRUE(rule.media_list->pager_mode);
    EXPECT_FALSE(rule.media_list->poc_speech);
    const bool actions[] = {rule.allow_conf_state,
                            rule.allow_invite_users_dynamically,
                            rule.join_handling,
                            rule.allow_init_conf,
                            rule.allow_sub_conf,
                            rule.allow_private_message,
                            rule.allow_media_handling,
                            rule.allow_anonymity,
                            rule.block_group_adver_send,
                            rule.is_key_participant,
                            rule.remove_media_handling,
                            rule.allow_expelling,
                            rule.allow_hndl_multiple_streams,
                            rule.allow_ltd_participating_info};
    for (std::size_t at = 0; at < std::size(actions); ++at)
        EXPECT_EQ(actions[at], at % 2 == 0) << at;
}

void expect_other_rules(const ims_xdm_group_rule_s *by_list) {
    ASSERT_NE(by_list, nullptr);
    EXPECT_STREQ(by_list->rule_id, "by list");
    ASSERT_NE(by_list->identity, nullptr);
    const auto *urls = static_cast<ims_xdm_identity_urls_s *>(*by_list->identity);
    ASSERT_EQ(urls->num_of_contact_list_url, 1);
    ASSERT_NE(urls->urls, nullptr);
    EXPECT_STREQ(urls->urls[0], "http://example.org/lists/2");

    const ims_xdm_group_rule_s *by_domain = by_list->next;
    ASSERT_NE(by_domain, nullptr);
    ASSERT_NE(by_domain->identity, nullptr);
    const auto *domains = static_cast<ims_xdm_identity_domains_s *>(*by_domain->identity);
    ASSERT_NE(domains->allow_domain_id, nullptr);
    ASSERT_EQ(domains->allow_domain_id->num_of_domain_id, 2);
    ASSERT_NE(domains->allow_domain_id->domains, nullptr);
    EXPECT_STREQ(domains->allow_domain_id->domains[0], "example.org");
    EXPECT_STREQ(domains->allow_domain_id->domains[1], "example.com"); // under another key
    EXPECT_EQ(domains->allow_contact_id, nullptr);
    EXPECT_EQ(domains->except_domain_id, nullptr);
    ASSERT_NE(domains->except_contact_id, nullptr);
    ASSERT_EQ(domains->except_contact_id->num_of_contact_id, 1);
    ASSERT_NE(domains->except_contact_id->contacts, nullptr);
    expect_bob(domains->except_contact_id->contacts[0]);

    const ims_xdm_group_rule_s *nobody = by_domain->next;
    ASSERT_NE(nobody, nullptr);
    EXPECT_EQ(nobody->rule_identity_type, 3);
    EXPECT_EQ(nobody->identity, nullptr);
    EXPECT_EQ(nobody->next, nullptr);
}

TEST_F(GroupReplies, BringTheWholeDocument) {
    fetch(kAnsweredGroup, [](const ims_xdm_group_info_s &group) {
        EXPECT_STREQ(group.group_uri, "sip:team@example.org");
        EXPECT_STREQ(group.channel_id, "channel 9");
        EXPECT_STREQ(group.version, "7");
        expect_properties(group.group_properties);
        expect_members(group.group_member_list);
        ASSERT_NE(group.group_rule_set, nullptr);
        expect_first_rule(*group.group_rule_set);
        expect_other_rules(group.group_rule_set->next);
    });
    EXPECT_TRUE(take_log().empty());
}

TEST_F(GroupReplies, AreReleasedAfterTheCallback) {
    const ims_xdm_group_info_s *document = nullptr;
    const ims_xdm_member_entry_s *contacts = nullptr;
    void **cell = nullptr;
    fetch(kAnsweredGroup, [&](const ims_xdm_group_info_s &group) {
        document = &group;
        contacts = group.group_member_list->contacts;
        cell = group.group_rule_set->identity;
    });
    expect_released(document);
    expect_released(contacts);
    expect_released(cell);
}

// The outbound keys mean nothing in an answer, where the service has others.
TEST_F(GroupReplies, AreNotReadWithTheKeysThatAreSent) {
    fetch(kSentGroup, [](const ims_xdm_group_info_s &group) {
        ASSERT_NE(group.group_properties, nullptr);
        EXPECT_EQ(group.group_properties->group_active_policy, nullptr);
        ASSERT_NE(group.group_member_list, nullptr);
        EXPECT_EQ(group.group_member_list->contact_lists, nullptr);
        EXPECT_EQ(group.group_member_list->num_of_ct_lists, 0);
        EXPECT_EQ(group.group_member_list->ext_ref, nullptr);
        EXPECT_EQ(group.group_member_list->entry_ref, nullptr);
        ASSERT_NE(group.group_member_list->contacts, nullptr);   // the same key both ways
        EXPECT_EQ(group.group_member_list->contacts[0].type, 0); // a flag is no number
        ASSERT_NE(group.group_rule_set, nullptr);
        EXPECT_EQ(group.group_rule_set->rule_identity_type, 0);
        EXPECT_FALSE(group.group_rule_set->allow_conf_state);
    });
}

TEST_F(GroupReplies, NameTheMissingPartsWhenTheyAreReleased) {
    fetch("{}", [](const ims_xdm_group_info_s &group) {
        EXPECT_STREQ(group.group_uri, "");
        EXPECT_EQ(group.group_properties, nullptr);
        EXPECT_TRUE(take_log().empty()); // not before the callback
    });
    const std::vector<LogLine> lines = take_log();
    ASSERT_EQ(messages(lines), (std::vector<std::string>{"No Group Properties Info Present",
                                                         "No Group Members List Info Present",
                                                         "No Group Rule Info Present"}));
    for (const LogLine &line : lines) {
        EXPECT_EQ(line.priority, 6);
        EXPECT_EQ(line.file, "ims_xdm.cpp");
        EXPECT_EQ(line.function, "__free_group_info");
    }
}

TEST_F(GroupReplies, DropAListWhoseCountLies) {
    fetch("{'group_member_list': <{'contacts': <{'num_of_contacts': <int64 2>, 'contacts_v': "
          "<[{'uri': <'a'>}, {'uri': <'b'>}, {'uri': <'c'>}]>}>}>}",
          [](const ims_xdm_group_info_s &group) {
              ASSERT_NE(group.group_member_list, nullptr);
              EXPECT_EQ(group.group_member_list->contacts, nullptr);
              EXPECT_EQ(group.group_member_list->num_of_contacts, 2);
          });
}

struct InlineText {
    const char *name;
    std::size_t size; // of its buffer
    std::string before, after;
    const char *(*of)(const ims_xdm_group_info_s &);
};

const std::vector<InlineText> &inline_texts() {
    using Group = ims_xdm_group_info_s;
    static const std::vector<InlineText> texts{
        {"group_uri", 129, "{'group_uri': <'", "'>}",
         [](const Group &group) -> const char * { return group.group_uri; }},
        {"display_name", 101, "{'group_properties': <{'display_name': <'", "'>}>}",
         [](const Group &group) -> const char * { return group.group_properties->display_name; }},
        {"subject", 257, "{'group_properties': <{'subject': <'", "'>}>}",
         [](const Group &group) -> const char * { return group.group_properties->subject; }},
        {"rule_id", 101, "{'group_rule_set': <[{'rule_id': <'", "'>}]>}",
         [](const Group &group) -> const char * { return group.group_rule_set->rule_id; }},
        {"a member's uri", 1537,
         "{'group_member_list': <{'contacts': <{'num_of_contacts': <int64 1>, 'contacts_v': "
         "<[{'uri': <'",
         "'>}]>}>}>}",
         [](const Group &group) -> const char * {
             return group.group_member_list->contacts[0].uri;
         }},
    };
    return texts;
}

TEST_F(GroupReplies, CutTextsToTheirBuffersAtAWholeCharacter) {
    for (const InlineText &text : inline_texts()) {
        SCOPED_TRACE(text.name);
        const auto read = [&](const std::string &sent, const std::string &expected) {
            fetch(text.before + sent + text.after,
                  [&](const ims_xdm_group_info_s &group) { EXPECT_EQ(text.of(group), expected); });
        };
        // All sizes are odd, and a terminator is in them.
        std::string pairs;
        for (std::size_t character = 0; character < text.size / 2; ++character)
            pairs += "é";
        const std::string whole(text.size - 1, 'u');
        read(whole, whole);
        read(whole + "v", whole);
        read(pairs, pairs);
        read(pairs + "é", pairs);
        read("x" + pairs, "x" + pairs.substr(0, text.size - 3));
        read("xx" + pairs, "xx" + pairs.substr(0, text.size - 3));
    }
}

// The identity comes before its type here, the list before its count, and both in variants.
TEST_F(GroupReplies, AreReadWhateverTheOrderOfTheirKeys) {
    fetch("{'group_rule_set': <<<[{'rule_condition_v': <<{'rule_identity': "
          "<<{'ref_ct_list_url': <<[{'ref_ct_list_url': <<'a'>>}]>>, 'num_of_contact_list_url': "
          "<<int64 1>>}>>, 'rule_identity_type_v': <<int64 2>>}>>}]>>>}",
          [](const ims_xdm_group_info_s &group) {
              ASSERT_NE(group.group_rule_set, nullptr);
              ASSERT_NE(group.group_rule_set->identity, nullptr);
              const auto *urls =
                  static_cast<ims_xdm_identity_urls_s *>(*group.group_rule_set->identity);
              ASSERT_NE(urls->urls, nullptr);
              EXPECT_STREQ(urls->urls[0], "a");
          });
}

TEST_F(GroupReplies, BringAllDocuments) {
    fetch_all("{'version': <'3'>, 'groups_v': <[{'group_info': <" + kAnsweredGroup +
                  ">}, {'other': <1>}]>, 'count': <int64 2>}",
              [](const ims_xdm_shared_group_list_s &list) {
                  EXPECT_STREQ(list.version, "3");
                  ASSERT_EQ(list.count, 2);
                  ASSERT_NE(list.groups, nullptr);
                  ASSERT_NE(list.groups[0], nullptr);
                  expect_members(list.groups[0]->group_member_list);
                  EXPECT_EQ(list.groups[1], nullptr); // an element without a document
              });
    expect_one_line("ims_xdm.cpp", "__free_group_info", "No Group Info Present");
}

TEST_F(GroupReplies, BringNoDocumentsWhenTheCountLies) {
    for (const int count : {0, 1, 2, 4, -3}) {
        SCOPED_TRACE(count);
        fetch_all("{'groups_v': <[{'group_info': <" + kAnsweredGroup +
                      ">}, {}, {}]>, 'count': <int64 " + std::to_string(count) + ">}",
                  [count](const ims_xdm_shared_group_list_s &list) {
                      EXPECT_EQ(list.groups, nullptr);
                      EXPECT_EQ(list.count, count);
                      EXPECT_EQ(list.version, nullptr);
                  });
    }
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
