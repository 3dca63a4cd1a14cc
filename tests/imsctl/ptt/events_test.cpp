// SPDX-License-Identifier: Apache-2.0
// Every push-to-talk event: as monitor shows it, to programs, and as watch tells it in words.
#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

struct PttEventRow {
    const char *name;
    int id;
    const char *signal;
    const char *type;
    const char *body;
    const char *json; // without event, id, slot and time
    const char *words;
};

#define PARTY "<{'uri_type': <int64 0>, 'uri': <'tel:+1'>, 'display_name': <'Ann \\u001b'>}>"
#define PARTY_AS_JSON                                                                              \
    R"({"uri_type":0,"uri":"tel:+1","display_name":"Ann \u001b","is_group_uri":false})"
#define FLOOR_TYPE "(ivisisiiis)"
#define FLOOR_BODY "(1, <[1, 0, 0, 0]>, 2, 'tel:+1', 3, 'Ann', 4, 5, 6, 'six')"
#define FLOOR_AS_JSON                                                                              \
    R"({"value_1":1,"int_set_1":[1,0,0,0],"value_2":2,"text_1":"tel:+1","value_3":3,)"             \
    R"("text_2":"Ann","value_4":4,"value_5":5,"value_6":6,"text_3":"six"})"

const PttEventRow kPttEvents[] = {
    {"poc-call-incoming-ind", 0x401, "PocCallIncomingInd", "(bbbbssssssiivv)",
     "(true, true, false, true, 'tel:+1', 'Ann', 'tel:+2', 'sip:g@x', 'Group', 'tel:+3', 1, 1, "
     "<[1, 0, 1, 1]>, <[0, 0, 0, 0]>)",
     R"({"flag_1":true,"flag_2":true,"flag_3":false,"flag_4":true,"text_1":"tel:+1",)"
     R"("text_2":"Ann","text_3":"tel:+2","text_4":"sip:g@x","text_5":"Group","text_6":"tel:+3",)"
     R"("value_1":1,"value_2":1,"int_set_1":[1,0,1,1],"int_set_2":[0,0,0,0]})",
     "session 1: crisis group call from \"Ann\" (tel:+1) to \"Group\" (sip:g@x), "
     "answered automatically"},
    {"poc-call-in-progress", 0x402, "PocCallInProgress", "(i)", "(1,)", R"({"value_1":1})",
     "session 1: calling"},
    {"poc-call-alerting", 0x403, "PocCallAlerting", "(i)", "(1,)", R"({"value_1":1})",
     "session 1: ringing there"},
    {"poc-call-established", 0x404, "PocCallEstablished", "(iibsbvbvv)",
     "(1, 0, true, 'tel:+1', false, <[1, 0, 1, 0]>, false, <[0]>, " PARTY ")",
     R"({"value_1":1,"value_2":0,"flag_1":true,"text_1":"tel:+1","flag_2":false,)"
     R"("int_set_1":[1,0,1,0],"flag_3":false,"int_set_2":[0,0,0,0],"peer":)" PARTY_AS_JSON "}",
     R"(session 1: one-to-one call with "Ann \x1b" (tel:+1), voice, messages)"},
    {"poc-call-ended", 0x405, "PocCallEnded", "(ii)", "(1, 3)", R"({"value_1":1,"value_2":3})",
     "session 1: declined"},
    {"poc-call-floor-granted", 0x406, "PocCallFloorGranted", FLOOR_TYPE, FLOOR_BODY, FLOOR_AS_JSON,
     "session 1: the floor is yours for 5 s"},
    {"poc-call-floor-rejected", 0x407, "PocCallFloorRejected", FLOOR_TYPE, FLOOR_BODY,
     FLOOR_AS_JSON, "session 1: no floor, withdrawn"},
    {"poc-call-floor-idle", 0x408, "PocCallFloorIdle", FLOOR_TYPE, FLOOR_BODY, FLOOR_AS_JSON,
     "session 1: nobody has the floor"},
    {"poc-call-floor-queue-position", 0x409, "PocCallFloorQueuePosition", FLOOR_TYPE, FLOOR_BODY,
     FLOOR_AS_JSON, "session 1: waiting at position 4, \"Ann\" (tel:+1) has the floor"},
    {"poc-call-floor-canceled", 0x40a, "PocCallFloorCanceled", FLOOR_TYPE, FLOOR_BODY,
     FLOOR_AS_JSON, "session 1: no floor, withdrawn"},
    {"poc-call-floor-taken", 0x40b, "PocCallFloorTaken", FLOOR_TYPE, FLOOR_BODY, FLOOR_AS_JSON,
     "session 1: \"Ann\" (tel:+1) has the floor"},
    {"poc-call-modify-request", 0x40c, "PocCallModifyRequest", "(bbiivv)",
     "(true, false, 1, 7, <[1, 1, 0, 0]>, <[0, 0, 0, 0]>)",
     R"({"flag_1":true,"flag_2":false,"value_1":1,"value_2":7,"int_set_1":[1,1,0,0],)"
     R"("int_set_2":[0,0,0,0]})",
     "session 1: a party asks for voice, video"},
    {"poc-call-modify-status", 0x40d, "PocCallModifyStatus", "(bbbiivv)",
     "(false, true, false, 1, 7, <[0, 0, 0, 1]>, <[0, 0, 0, 0]>)",
     R"({"flag_1":false,"flag_2":true,"flag_3":false,"value_1":1,"value_2":7,)"
     R"("int_set_1":[0,0,0,1],"int_set_2":[0,0,0,0]})",
     "session 1: not changed, files"},
    {"poc-call-floor-request-timeout", 0x40e, "PocCallFloorRequestTimeout", FLOOR_TYPE, FLOOR_BODY,
     FLOOR_AS_JSON, "session 1: no floor, withdrawn"},
    {"poc-call-crisis-call-initiated", 0x40f, "PocCallCrisisCallInitiated", "(i)", "(1,)",
     R"({"value_1":1})", "session 1: a crisis call from now on"},
    {"poc-group-advertisement", 0x410, "PocGroupAdvertisement", "(ia{sv})",
     "(1, {'subject': <'lunch'>, 'remote_uri': " PARTY ", 'group_advertisement_content': "
     "<[{'content_byte': <'aGk='>, 'content_type': <'text/plain'>}]>})",
     R"({"value_1":1,"group_adv":{"subject":"lunch","call_info":null,"remote_uri":)" PARTY_AS_JSON
     R"(,"group_advertisement_content":[{"content_byte":"aGk=","content_type":"text/plain",)"
     R"("content_disposition":null}]}})",
     R"(group "Ann \x1b" (tel:+1): "lunch")"},
    {"poc-group-conf-participant-info", 0x411, "PocGroupConfParticipantInfo", "(iss)",
     "(1, 'tel:+3', 'connected')", R"({"value_1":1,"text_1":"tel:+3","text_2":"connected"})",
     "session 1: tel:+3 connected"},
    {"poc-incoming-msg-info", 0x412, "PocIncomingMsgInfo", "(ivsissvsiiiv)",
     "(1, " PARTY ", 'id', 3, 'text/plain', 'Hi\\n', <[{'uri': <'sip:p'>}]>, '', 0, 60, 0, <1>)",
     R"({"value_1":1,"peer_1":)" PARTY_AS_JSON
     R"(,"text_1":"id","value_2":3,"text_2":"text/plain","text_3":"Hi\n",)"
     R"("route_headers":[{"uri":"sip:p","display_name":null}],"text_4":"","value_3":0,)"
     R"("value_4":60,"value_5":0,"peer_2":null})",
     R"(message 1 from "Ann \x1b" (tel:+1): "Hi\n")"},
    {"poc-msg-notification", 0x413, "PocMsgNotification", "(ivsiiv)",
     "(1, <{'uri': <'tel:+2'>}>, 'id', 2, 0, <2>)",
     R"({"value_1":1,"peer_1":{"uri_type":0,"uri":"tel:+2","display_name":null,)"
     R"("is_group_uri":false},"text_1":"id","value_2":2,"value_3":0,"peer_2":null})",
     "message 1: read by tel:+2"},
    {"poc-incoming-file-transfer", 0x414, "PocIncomingFileTransfer", "(ivviv)",
     "(1, <1>, <{'file_name': <'a \"b\"'>, 'file_size': <int64 9>, 'transfer_id': <'t-1'>}>, 2, "
     "<2>)",
     R"({"value_1":1,"peer_1":null,"attributes":{"file_name":"a \"b\"","file_description":null,)"
     R"("file_size":9,"push":false,"start":0,"end":0,"transfer_id":"t-1","content_type":null,)"
     R"("file_type":null},"value_2":2,"peer_2":null})",
     R"(transfer 1 from somebody: "a \"b\"", 9 bytes, id "t-1")"},
    {"poc-file-transfer-progress", 0x415, "PocFileTransferProgress", "(iiii)", "(1, 4, 9, 2)",
     R"({"value_1":1,"value_2":4,"value_3":9,"value_4":2})", "transfer 1: 4 of 9 bytes"},
    {"poc-file-transfer-terminated", 0x416, "PocFileTransferTerminated", "(iii)", "(1, 0, 2)",
     R"({"value_1":1,"value_2":0,"value_3":2})", "transfer 1: complete"},
};
static_assert(std::size(kPttEvents) == 22);

class PttEvents : public ::testing::Test {
  protected:
    // What a verb shows of every event, one a line.
    std::string output_of(const std::string &words) {
        Process process(imsctl_command(split(words + " --count 22")), strict_environment());
        process.wait_for_error(" slot 0\n");
        for (const PttEventRow &row : kPttEvents)
            peer_.emit_signal("/org/kelvo/ims/sub0", "org.kelvo.ims.Poc", row.signal,
                              parse(row.type, row.body));
        EXPECT_EQ(process.wait(), 0) << process.both();
        return process.output();
    }

    void expect_json(const std::string &words) {
        const auto lines = json_lines(output_of(words));
        ASSERT_EQ(lines.size(), std::size(kPttEvents));
        for (std::size_t at = 0; at < lines.size(); ++at) {
            Json object = lines[at];
            object.erase("time");
            Json expected = {
                {"event", kPttEvents[at].name}, {"id", kPttEvents[at].id}, {"slot", 0}};
            expected.update(Json::parse(kPttEvents[at].json));
            EXPECT_EQ(object.dump(), expected.dump());
        }
    }

    PrivateBus bus_;
    ScriptedPeer peer_{bus_.address()};
};

TEST_F(PttEvents, AreJsonObjectsForPrograms) {
    expect_json("monitor --module poc --json");
    expect_json("ptt watch --json");
}

TEST_F(PttEvents, AreToldInWords) {
    std::string expected;
    for (const PttEventRow &row : kPttEvents)
        expected += std::string(row.words) + "\n";
    std::istringstream output{output_of("ptt watch")};
    std::string told;
    for (std::string line; std::getline(output, line);)
        told += line.substr(std::string_view("00:00:00.000 ").size()) + "\n";
    EXPECT_EQ(told, expected);
}

TEST_F(PttEvents, HaveTheirFieldsAndTheirWordsInTheMonitor) {
    const std::string output = output_of("monitor");
    for (const PttEventRow &row : kPttEvents)
        EXPECT_THAT(output, testing::HasSubstr(std::string(": ") + row.words + "\n")) << row.name;
    EXPECT_THAT(output,
                testing::HasSubstr(R"(peer_1={uri_type=0 uri="tel:+1" display_name="Ann \x1b" )"
                                   R"(is_group_uri=false} text_1="id")"));
    EXPECT_THAT(output, testing::HasSubstr(R"(route_headers=[{uri="sip:p" display_name=-}])"));
}

} // namespace
} // namespace test
