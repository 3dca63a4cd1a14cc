// SPDX-License-Identifier: Apache-2.0
// Events with dictionaries in them: what is missing, what is wrong, what is released.
#include "tests/library/poc/event_rows.hpp"
#include "tests/support/released.hpp"
#include "tests/support/with_peer.hpp"

#include <functional>
#include <set>

namespace test {
namespace {

using ::testing::PrintToString;

// A value that stands for a party, a file or a route header, and carries none.
constexpr const char *kAbsent[] = {"<@a{sv} {}>",           "<<<@a{sv} {}>>>",
                                   "<@aa{sv} []>",          "<1>",
                                   "<'sip:a@example.org'>", "<@a{ss} {'uri': 'sip:a@example.org'}>",
                                   "<@a{si} {}>",           "<@av []>",
                                   "<('uri', <'x'>)>",      "<{1: <'x'>}>"};

class NestedEvent : public WithPeer {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        recorder_.inspect_with([this](const Notified &, void *event) {
            if (lines_follow_callback_) {
                EXPECT_TRUE(take_log().empty());
            }
            inspect_(event);
        });
    }

    void send(int id, const char *member, const char *type, const std::string &value,
              std::function<void(void *)> inspect) {
        SCOPED_TRACE(value);
        inspect_ = std::move(inspect);
        const std::size_t before = recorder_.count();
        if (listening_.insert(id).second)
            listen(id, recorder_);
        emit(kPocEvents.interface, member, parse(type, value));
        fence();
        EXPECT_EQ(recorder_.count(), before + 1);
    }

    void send_message(const std::string &first, const std::string &headers,
                      const std::string &second,
                      const std::function<void(const ims_poc_incoming_msg_s &)> &inspect) {
        send(IMS_NOTI_POC_INCOMING_MSG_INFO, "PocIncomingMsgInfo", "(ivsissvsiiiv)",
             "(1, " + first + ", 'one', 2, 'two', 'three', " + headers + ", 'four', 3, 4, 5, " +
                 second + ")",
             [&](void *event) { inspect(*static_cast<ims_poc_incoming_msg_s *>(event)); });
    }

    void send_file(const std::string &attributes,
                   const std::function<void(const ims_poc_incoming_file_s &)> &inspect) {
        send(IMS_NOTI_POC_INCOMING_FILE_TRANSFER, "PocIncomingFileTransfer", "(ivviv)",
             "(1, <{'uri_type': <int64 1>}>, " + attributes + ", 2, <{'uri_type': <int64 1>}>)",
             [&](void *event) { inspect(*static_cast<ims_poc_incoming_file_s *>(event)); });
    }

    void send_advertisement(const std::string &dictionary,
                            const std::function<void(const ims_poc_group_adv_s *)> &inspect) {
        send(IMS_NOTI_POC_GROUP_ADVERTISEMENT, "PocGroupAdvertisement", "(ia{sv})",
             "(7, " + dictionary + ")", [&](void *event) {
                 const auto &advertisement = *static_cast<ims_poc_group_advertisement_s *>(event);
                 EXPECT_EQ(advertisement.value_1, 7);
                 inspect(advertisement.group_adv);
             });
    }

    // Lines of this module, in their order.
    void expect_lines(const std::vector<std::pair<std::string, std::string>> &expected) {
        const std::vector<LogLine> lines = take_log();
        ASSERT_EQ(lines.size(), expected.size()) << PrintToString(lines);
        for (std::size_t at = 0; at < lines.size(); ++at) {
            EXPECT_EQ(lines[at].priority, 6);
            EXPECT_EQ(lines[at].file, "ims_poc.cpp");
            EXPECT_EQ(lines[at].function, expected[at].first);
            EXPECT_EQ(lines[at].message, expected[at].second);
        }
    }

    NotificationRecorder recorder_;
    std::set<int> listening_;
    std::function<void(void *)> inspect_;
    bool lines_follow_callback_ = false; // none may have been logged before it
};

constexpr const char *kParty = "<{'uri_type': <int64 1>}>";
constexpr const char *kRoute = "<[{'uri': <'sip:proxy@example.org'>}]>";

const std::pair<std::string, std::string> kNoPeer{"__fetch_peer_info", "user_list is NULL"};
const std::pair<std::string, std::string> kNoRoute{"__fetch_route_header", "user_list is NULL"};
const std::pair<std::string, std::string> kNoFile{"__fetch_file_attributes", "user_list is NULL"};
const std::pair<std::string, std::string> kNoAdv{"__free_group_adv", "No Group Adv Present"};
const std::pair<std::string, std::string> kNoContent{"__free_group_adv",
                                                     "No Group Content Info Present"};

TEST_F(NestedEvent, AbsentPartiesOfAMessageAreNullAndLogged) {
    for (const char *absent : kAbsent) {
        send_message(absent, kRoute, kParty, [](const ims_poc_incoming_msg_s &message) {
            EXPECT_EQ(message.peer_1, nullptr);
            EXPECT_NE(message.route_headers, nullptr);
            EXPECT_NE(message.peer_2, nullptr);
            EXPECT_STREQ(message.text_4, "four");
        });
        expect_lines({kNoPeer});
        send_message(kParty, kRoute, absent, [](const ims_poc_incoming_msg_s &message) {
            EXPECT_NE(message.peer_1, nullptr);
            EXPECT_EQ(message.peer_2, nullptr);
        });
        expect_lines({kNoPeer});
    }
}

TEST_F(NestedEvent, AnAbsentRouteHeaderIsNullAndLogged) {
    for (const char *absent : kAbsent) {
        send_message(kParty, absent, kParty, [](const ims_poc_incoming_msg_s &message) {
            EXPECT_EQ(message.route_headers, nullptr);
        });
        expect_lines({kNoRoute});
    }
    // A dictionary where a list of them is expected.
    send_message(kParty, "<{'uri': <'x'>}>", kParty, [](const ims_poc_incoming_msg_s &message) {
        EXPECT_EQ(message.route_headers, nullptr);
    });
    expect_lines({kNoRoute});
}

TEST_F(NestedEvent, AbsentFileAttributesAreNullAndLogged) {
    for (const char *absent : kAbsent) {
        send_file(absent, [](const ims_poc_incoming_file_s &file) {
            EXPECT_EQ(file.attributes, nullptr);
            EXPECT_NE(file.peer_1, nullptr);
            EXPECT_EQ(file.value_2, 2);
        });
        expect_lines({kNoFile});
    }
}

TEST_F(NestedEvent, EverythingAbsentIsLoggedMemberByMember) {
    send_message("<1>", "<2>", "<3>", [](const ims_poc_incoming_msg_s &message) {
        EXPECT_EQ(message.peer_1, nullptr);
        EXPECT_EQ(message.route_headers, nullptr);
        EXPECT_EQ(message.peer_2, nullptr);
        EXPECT_EQ(message.value_5, 5);
    });
    expect_lines({kNoPeer, kNoRoute, kNoPeer});
    send(IMS_NOTI_POC_MSG_NOTIFICATION, "PocMsgNotification", "(ivsiiv)",
         "(1, <1>, 'one', 2, 3, <@a{sv} {}>)", [](void *event) {
             const auto &notification = *static_cast<ims_poc_msg_event_s *>(event);
             EXPECT_EQ(notification.peer_1, nullptr);
             EXPECT_EQ(notification.peer_2, nullptr);
             EXPECT_EQ(notification.value_3, 3);
         });
    expect_lines({kNoPeer, kNoPeer});
}

// The embedded party of an established call is no pointer: nothing is logged for it.
TEST_F(NestedEvent, AnAbsentEmbeddedPartyIsAllZero) {
    for (const char *absent : kAbsent)
        send(IMS_NOTI_POC_CALL_ESTABLISHED, "PocCallEstablished", "(iibsbvbvv)",
             std::string{"(1, 2, true, 'x', true, <[1]>, true, <[2]>, "} + absent + ")",
             [](void *event) {
                 const ims_poc_peer_info_s &peer =
                     static_cast<ims_poc_call_established_s *>(event)->peer;
                 EXPECT_EQ(peer.uri_type, 0);
                 EXPECT_EQ(peer.uri, nullptr);
                 EXPECT_EQ(peer.display_name, nullptr);
                 EXPECT_FALSE(peer.is_group_uri);
             });
    expect_lines({});
}

TEST_F(NestedEvent, AnAdvertisementWithoutContentHasNoListAndIsLoggedWhenReleased) {
    lines_follow_callback_ = true;
    for (const char *dictionary :
         {"{'subject': <'News'>}",
          "{'subject': <'News'>, 'group_advertisement_content': <@aa{sv} []>}",
          "{'subject': <'News'>, 'group_advertisement_content': <{'content_type': <'x'>}>}",
          "{'subject': <'News'>, 'group_advertisement_content': <['x']>}"}) {
        send_advertisement(dictionary, [](const ims_poc_group_adv_s *adv) {
            ASSERT_NE(adv, nullptr);
            EXPECT_STREQ(adv->subject, "News");
            EXPECT_EQ(adv->call_info, nullptr);
            EXPECT_EQ(adv->remote_uri.uri, nullptr);
            EXPECT_EQ(adv->group_advertisement_content, nullptr);
        });
        expect_lines({kNoContent});
    }
}

TEST_F(NestedEvent, AnEmptyAdvertisementIsNullAndLoggedWhenReleased) {
    lines_follow_callback_ = true;
    send_advertisement("{}", [](const ims_poc_group_adv_s *adv) { EXPECT_EQ(adv, nullptr); });
    expect_lines({kNoAdv});
}

TEST_F(NestedEvent, AdvertisementsOfAnythingElseAreAsGoodAsWhatFits) {
    send_advertisement("{'subject': <int64 1>, 'call_info': <<'info'>>, 'remote_uri': <'sip:x'>, "
                       "'group_advertisement_content': <[{'content_byte': <'not base64!'>}, "
                       "{'content_byte': <0x41>, 'content_type': <1>}, "
                       "{'content_byte': <''>, 'content_disposition': <'render'>}]>}",
                       [](const ims_poc_group_adv_s *adv) {
                           EXPECT_EQ(adv->subject, nullptr);
                           EXPECT_STREQ(adv->call_info, "info");
                           EXPECT_EQ(adv->remote_uri.uri, nullptr);
                           const auto *content = adv->group_advertisement_content;
                           ASSERT_NE(content, nullptr);
                           content = content->next;
                           ASSERT_NE(content, nullptr);
                           EXPECT_EQ(content->content_byte, nullptr);
                           EXPECT_EQ(content->content_length, 0U);
                           EXPECT_EQ(content->content_type, nullptr);
                           content = content->next;
                           ASSERT_NE(content, nullptr);
                           EXPECT_EQ(content->content_length, 0U);
                           EXPECT_STREQ(content->content_disposition, "render");
                           EXPECT_EQ(content->next, nullptr);
                       });
    expect_lines({});
}

TEST_F(NestedEvent, AdvertisementsAreLargeAndKeepTheirOrder) {
    std::string list;
    for (int at = 0; at < 5000; ++at)
        list += (at > 0 ? ", {'content_type': <'" : "{'content_type': <'") + std::to_string(at) +
                "'>, 'content_byte': <'AAAA'>}";
    send_advertisement("{'group_advertisement_content': <[" + list + "]>}",
                       [](const ims_poc_group_adv_s *adv) {
                           int at = 0;
                           for (const auto *content = adv->group_advertisement_content; content;
                                content = content->next) {
                               EXPECT_EQ(content->content_type, std::to_string(at++));
                               EXPECT_EQ(content->content_length, 3U);
                           }
                           EXPECT_EQ(at, 5000);
                       });
}

TEST_F(NestedEvent, ValuesOfAnotherTypeLeaveTheirFieldsOut) {
    send_message("<{'uri_type': <1>, 'uri': <int64 1>, 'display_name': <@ao []>, "
                 "'is_group_uri': <'true'>}>",
                 "<[{'uri': <1>, 'display_name': <2>}]>",
                 "<{'uri_type': <int64 4294967297>, 'is_group_uri': <<true>>, 'uri': <<'x'>>}>",
                 [](const ims_poc_incoming_msg_s &message) {
                     ASSERT_NE(message.peer_1, nullptr);
                     EXPECT_EQ(message.peer_1->uri_type, 0);
                     EXPECT_EQ(message.peer_1->uri, nullptr);
                     EXPECT_EQ(message.peer_1->display_name, nullptr);
                     EXPECT_FALSE(message.peer_1->is_group_uri);
                     ASSERT_NE(message.route_headers, nullptr);
                     EXPECT_EQ(message.route_headers->uri, nullptr);
                     ASSERT_NE(message.peer_2, nullptr);
                     EXPECT_EQ(message.peer_2->uri_type, 1); // cut to 32 bits
                     EXPECT_STREQ(message.peer_2->uri, "x");
                     EXPECT_TRUE(message.peer_2->is_group_uri);
                 });
    send_file("<{'file_name': <1>, 'file_size': <'1'>, 'push': <int64 1>, "
              "'start': <int64 2147483648>, 'end': <int64 -1>}>",
              [](const ims_poc_incoming_file_s &file) {
                  ASSERT_NE(file.attributes, nullptr);
                  EXPECT_EQ(file.attributes->file_name, nullptr);
                  EXPECT_EQ(file.attributes->file_size, 0);
                  EXPECT_FALSE(file.attributes->push);
                  EXPECT_EQ(file.attributes->start, INT32_MIN);
                  EXPECT_EQ(file.attributes->end, -1);
              });
    expect_lines({});
}

TEST_F(NestedEvent, EverythingIsGoneAfterTheCallback) {
    std::vector<const void *> seen;
    send_message("<{'uri': <'sip:a@example.org'>}>", kRoute, kParty,
                 [&](const ims_poc_incoming_msg_s &message) {
                     seen = {message.peer_1, message.peer_1->uri, message.route_headers,
                             message.route_headers->uri, message.peer_2};
                 });
    for (const void *address : seen)
        expect_released(address);
    send_advertisement(
        "{'subject': <'News'>, 'remote_uri': <{'uri': <'sip:a@example.org'>}>, "
        "'group_advertisement_content': <[{'content_byte': <'AAAA'>}]>}",
        [&](const ims_poc_group_adv_s *adv) {
            const auto *content = adv->group_advertisement_content;
            seen = {adv, adv->subject, adv->remote_uri.uri, content, content->content_byte};
        });
    for (const void *address : seen)
        expect_released(address);
}

} // namespace
} // namespace test
