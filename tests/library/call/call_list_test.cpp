// SPDX-License-Identifier: Apache-2.0
// What the call list's reply becomes.
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <algorithm>
#include <cstdlib>
#include <cstring>

namespace test {
namespace {

constexpr const char *kMethod = "org.kelvo.ims.Call.CallListInfo";
constexpr int kWarningPriority = 5;

// The record between bytes that nobody may touch.
struct Guarded {
    Guarded() {
        std::memset(before, 0xA5, sizeof before);
        std::memset(after, 0xA5, sizeof after);
    }
    ~Guarded() { ims_call_list_info_clear(&list); }
    Guarded(const Guarded &) = delete;
    Guarded &operator=(const Guarded &) = delete;

    bool is_intact() const {
        const auto untouched = [](unsigned char byte) { return byte == 0xA5; };
        return std::all_of(before, std::end(before), untouched) &&
               std::all_of(after, std::end(after), untouched);
    }

    unsigned char before[4096];
    ims_call_list_info_s list{};
    unsigned char after[4096];
};

class CallList : public WithPeer {
  protected:
    int ask(const std::string &text) {
        peer().on(kMethod, reply("(iuaa{sv})", text));
        return ims_call_get_call_list_info(handle_, &list());
    }

    // Every byte of the record, so that nothing uninitialised decides a test.
    void fill_record(int byte) { std::memset(static_cast<void *>(&list()), byte, sizeof list()); }

    // Entries and count as bytes, for "nothing was written".
    std::string image() {
        return {reinterpret_cast<const char *>(&list()), sizeof(ims_call_list_info_s)};
    }

    void expect_count_warning(const std::string &count) {
        const std::vector<LogLine> lines = take_log();
        ASSERT_EQ(lines.size(), 1U) << ::testing::PrintToString(lines);
        EXPECT_EQ(lines[0].priority, kWarningPriority);
        EXPECT_EQ(lines[0].log_id, 2);
        EXPECT_EQ(lines[0].tag, "MEGORE");
        EXPECT_EQ(lines[0].file, "ims_call.cpp");
        EXPECT_EQ(lines[0].function, "ims_call_get_call_list_info");
        EXPECT_EQ(lines[0].message, "Call list count is NOT valid - Count: [" + count + "]");
    }

    ims_call_list_info_s &list() { return guarded_.list; }
    ims_call_info_s &entry(std::size_t at) { return list().entries[at]; }

    Guarded guarded_;
};

// "(0, count, [dictionaries])" with so many calls, whose session is their index.
std::string reply_of(unsigned count) {
    std::string text = "(0, " + std::to_string(count) + ", [";
    for (unsigned i = 0; i < count; ++i) {
        const std::string number = std::to_string(i);
        text += (i ? ", " : "") + std::string{"{'session_id': <"} + number +
                ">, 'peer_uri': <'sip:" + number + "@example.org'>}";
    }
    return text + "])";
}

TEST_F(CallList, FillsTwoEntriesWhoseTextsTheCallerOwns) {
    EXPECT_EQ(ask("(0, 2, [{'session_id': <11>, 'peer_uri': <'sip:a'>, 'call_type': <-2>, "
                  "'bmocall': <true>, 'call_state': <4>, 'bconfcall': <false>}, "
                  "{'bconfcall': <true>, 'call_state': <5>, 'bmocall': <false>, "
                  "'call_type': <6>, 'peer_uri': <'sip:b'>, 'session_id': <12>}])"),
              IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 2U);
    EXPECT_EQ(entry(0).session_id, 11);
    EXPECT_STREQ(entry(0).peer_uri, "sip:a");
    EXPECT_EQ(entry(0).call_type, -2);
    EXPECT_TRUE(entry(0).bmocall);
    EXPECT_EQ(entry(0).call_state, 4);
    EXPECT_FALSE(entry(0).bconfcall);
    EXPECT_EQ(entry(1).session_id, 12);
    EXPECT_STREQ(entry(1).peer_uri, "sip:b");
    EXPECT_EQ(entry(1).call_type, 6);
    EXPECT_FALSE(entry(1).bmocall);
    EXPECT_EQ(entry(1).call_state, 5);
    EXPECT_TRUE(entry(1).bconfcall);
    EXPECT_TRUE(take_log().empty());

    for (std::size_t i : {0U, 1U}) {
        std::free(entry(i).peer_uri); // a copy of the caller's own
        entry(i).peer_uri = nullptr;
    }
}

TEST_F(CallList, StoresBooleansAsOneByteOfZeroOrOne) {
    fill_record(0x5A);
    EXPECT_EQ(ask("(0, 1, [{'bmocall': <true>, 'bconfcall': <false>}])"), IMS_ERROR_NONE);
    unsigned char bytes[2] = {};
    std::memcpy(&bytes[0], &entry(0).bmocall, 1);
    std::memcpy(&bytes[1], &entry(0).bconfcall, 1);
    EXPECT_EQ(bytes[0], 1);
    EXPECT_EQ(bytes[1], 0);
    fill_record(0);
}

TEST_F(CallList, CountThreeOfTwoIsASuccessWithoutEntries) {
    const std::string text =
        "(0, 3, [{'session_id': <11>, 'peer_uri': <'sip:a'>}, {'session_id': <12>}])";
    fill_record(0x5A);
    const std::string before = image();
    EXPECT_EQ(ask(text), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 0U);
    expect_count_warning("3");
    EXPECT_EQ(image().substr(sizeof list().count), before.substr(sizeof list().count));
    fill_record(0);
}

TEST_F(CallList, CountOneOfTwoIsASuccessWithoutEntries) {
    EXPECT_EQ(ask("(0, 1, [{'session_id': <11>}, {'session_id': <12>}])"), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 0U);
    expect_count_warning("1");
    EXPECT_EQ(entry(0).session_id, 0);
}

TEST_F(CallList, AnEmptyListIsASuccessWithTheWarning) {
    list().count = 9;
    EXPECT_EQ(ask("(0, 0, [])"), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 0U);
    expect_count_warning("0");
}

TEST_F(CallList, CountNoneOfTwoIsASuccessWithoutEntries) {
    EXPECT_EQ(ask("(0, 0, [{'session_id': <11>}, {'session_id': <12>}])"), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 0U);
    expect_count_warning("0");
}

TEST_F(CallList, ACountThatIsLargerThanAnArrayCanBeDoesNoHarm) {
    EXPECT_EQ(ask("(0, 4294967295, [{'session_id': <11>}])"), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 0U);
    expect_count_warning("-1"); // the line's format is a signed one
    EXPECT_TRUE(guarded_.is_intact());
}

TEST_F(CallList, TheServicesRefusalStoresItsCountAndNothingElse) {
    fill_record(0x5A);
    const std::string before = image();
    EXPECT_EQ(ask("(4, 2, [{'session_id': <11>, 'peer_uri': <'sip:a'>}, {}])"),
              IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(list().count, 2U);
    expect_one_line("ims_call.cpp", "ims_call_get_call_list_info", "Failed to get Call Info: 4");
    EXPECT_EQ(image().substr(sizeof list().count), before.substr(sizeof list().count));
    fill_record(0);
}

TEST_F(CallList, TheRecordIsUntouchedWhenNoUsableReplyComes) {
    fill_record(0x5A);
    const std::string before = image();
    const std::pair<Answer, int> answers[] = {
        {failure(error_name::kAccessDenied), IMS_ERROR_PERMISSION_DENIED},
        {failure(error_name::kNoReply), IMS_ERROR_OPERATION_FAILED},
        {empty_reply(), IMS_ERROR_OPERATION_FAILED},
        {reply("(iuaa{ss})", "(0, 1, [{'peer_uri': 'sip:a'}])"), IMS_ERROR_OPERATION_FAILED},
        {reply("(iiaa{sv})", "(0, 1, [{'session_id': <11>}])"), IMS_ERROR_OPERATION_FAILED}};
    for (const auto &[answer, result] : answers) {
        peer().on(kMethod, answer);
        EXPECT_EQ(ims_call_get_call_list_info(handle_, &list()), result);
        EXPECT_EQ(image(), before);
    }
    EXPECT_EQ(ims_call_get_call_list_info(nullptr, &list()), IMS_ERROR_INVALID_PARAMETER);
    set_gate(Gate::kOff);
    EXPECT_EQ(ims_call_get_call_list_info(handle_, &list()), IMS_ERROR_NOT_SUPPORTED);
    EXPECT_EQ(image(), before);
    fill_record(0);
}

TEST_F(CallList, AMissingKeyLeavesTheCallersValue) {
    char own_text[] = "the caller's";
    entry(0) = {1, own_text, 2, true, 3, true};
    EXPECT_EQ(ask("(0, 1, [{'session_id': <11>}])"), IMS_ERROR_NONE);
    EXPECT_EQ(entry(0).session_id, 11);
    EXPECT_EQ(entry(0).peer_uri, own_text);
    EXPECT_EQ(entry(0).call_type, 2);
    EXPECT_TRUE(entry(0).bmocall);
    EXPECT_EQ(entry(0).call_state, 3);
    EXPECT_TRUE(entry(0).bconfcall);

    EXPECT_EQ(ask("(0, 1, [{}])"), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 1U);
    EXPECT_EQ(entry(0).session_id, 11);
    EXPECT_EQ(entry(0).peer_uri, own_text);
    EXPECT_TRUE(take_log().empty());
    entry(0).peer_uri = nullptr;
}

TEST_F(CallList, ATextIsOverwrittenAndTheCallersKeptIntact) {
    char own_text[] = "the caller's";
    entry(0).peer_uri = own_text;
    EXPECT_EQ(ask("(0, 1, [{'peer_uri': <'first'>, 'peer_uri': <'second'>}])"), IMS_ERROR_NONE);
    EXPECT_STREQ(entry(0).peer_uri, "second");
    EXPECT_STREQ(own_text, "the caller's");
}

TEST_F(CallList, UnknownKeysAreSkipped) {
    EXPECT_EQ(ask("(0, 1, [{'peer_name': <'x'>, 'session_id': <11>, '': <1>, 'Session_id': <2>, "
                  "'session_id ': <3>, 'session': <4>, 'nested': <{'session_id': <5>}>}])"),
              IMS_ERROR_NONE);
    EXPECT_EQ(entry(0).session_id, 11);
    EXPECT_EQ(entry(0).peer_uri, nullptr);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(CallList, AValueOfAnotherTypeCountsAsMissing) {
    char own_text[] = "the caller's";
    entry(0) = {1, own_text, 2, true, 3, true};
    EXPECT_EQ(ask("(0, 1, [{'session_id': <uint32 11>, 'peer_uri': <5>, 'call_type': <int64 9>, "
                  "'bmocall': <0>, 'call_state': <'4'>, 'bconfcall': <<false>>}])"),
              IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 1U);
    EXPECT_EQ(entry(0).session_id, 1);
    EXPECT_EQ(entry(0).peer_uri, own_text);
    EXPECT_EQ(entry(0).call_type, 2);
    EXPECT_TRUE(entry(0).bmocall);
    EXPECT_EQ(entry(0).call_state, 3);
    EXPECT_TRUE(entry(0).bconfcall);
    entry(0).peer_uri = nullptr;
}

TEST_F(CallList, ATextOfAnotherKindCountsAsMissing) {
    EXPECT_EQ(ask("(0, 1, [{'peer_uri': <objectpath '/sip/a'>}])"), IMS_ERROR_NONE);
    EXPECT_EQ(entry(0).peer_uri, nullptr);
    EXPECT_EQ(ask("(0, 1, [{'peer_uri': <['sip:a']>}])"), IMS_ERROR_NONE);
    EXPECT_EQ(entry(0).peer_uri, nullptr);
}

TEST_F(CallList, AKeyGivenTwiceKeepsTheLaterValue) {
    EXPECT_EQ(ask("(0, 1, [{'session_id': <1>, 'peer_uri': <'first'>, 'bmocall': <true>, "
                  "'session_id': <2>, 'peer_uri': <'second'>, 'bmocall': <false>, "
                  "'session_id': <3>}])"),
              IMS_ERROR_NONE);
    EXPECT_EQ(entry(0).session_id, 3);
    EXPECT_STREQ(entry(0).peer_uri, "second");
    EXPECT_FALSE(entry(0).bmocall);
}

TEST_F(CallList, AKeyGivenAgainWithAnotherTypeKeepsTheEarlierValue) {
    EXPECT_EQ(ask("(0, 1, [{'session_id': <1>, 'peer_uri': <'first'>, 'session_id': <'2'>, "
                  "'peer_uri': <2>}])"),
              IMS_ERROR_NONE);
    EXPECT_EQ(entry(0).session_id, 1);
    EXPECT_STREQ(entry(0).peer_uri, "first");
}

TEST_F(CallList, SixtyFourCallsFit) {
    EXPECT_EQ(ask(reply_of(64)), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 64U);
    EXPECT_EQ(entry(63).session_id, 63);
    EXPECT_STREQ(entry(63).peer_uri, "sip:63@example.org");
    EXPECT_TRUE(take_log().empty());
    EXPECT_TRUE(guarded_.is_intact());
}

TEST_F(CallList, OfMoreThanSixtyFourCallsTheFirstAreKeptWithTheWarning) {
    for (const unsigned count : {65U, 70U, 1000U}) {
        EXPECT_EQ(ask(reply_of(count)), IMS_ERROR_NONE);
        EXPECT_EQ(list().count, 64U);
        EXPECT_EQ(entry(0).session_id, 0);
        EXPECT_EQ(entry(63).session_id, 63);
        EXPECT_STREQ(entry(63).peer_uri, "sip:63@example.org");
        expect_count_warning(std::to_string(count));
        EXPECT_TRUE(guarded_.is_intact());
        ims_call_list_info_clear(&list());
    }
}

TEST_F(CallList, ASecondQueryOverwritesTheRecord) {
    EXPECT_EQ(ask(reply_of(3)), IMS_ERROR_NONE);
    ims_call_list_info_clear(&list());
    EXPECT_EQ(ask("(0, 1, [{'session_id': <8>}])"), IMS_ERROR_NONE);
    EXPECT_EQ(list().count, 1U);
    EXPECT_EQ(entry(0).session_id, 8);
    EXPECT_EQ(entry(1).session_id, 0);
}

TEST_F(CallList, TheQueryDoesNotRunTheMainContext) {
    bool ran = false;
    g_idle_add_once([](gpointer flag) { *static_cast<bool *>(flag) = true; }, &ran);
    EXPECT_EQ(ask("(0, 0, [])"), IMS_ERROR_NONE);
    EXPECT_FALSE(ran);
    pump_until([&] { return ran; }, "the idle function");
}

TEST(CallListClear, FreesEveryTextAndZeroesTheRecordWithoutTheFeature) {
    set_gate(Gate::kOff);
    ims_call_list_info_s list{};
    list.count = 1;
    for (ims_call_info_s &call : list.entries)
        call = {1, strdup("sip:a@example.org"), 2, true, 3, true};
    ims_call_list_info_clear(&list);
    EXPECT_EQ(list.count, 0U);
    for (std::size_t i = 0; i < IMS_CALL_LIST_CAPACITY; ++i) {
        EXPECT_EQ(list.entries[i].peer_uri, nullptr);
        EXPECT_EQ(list.entries[i].session_id, 0);
        EXPECT_FALSE(list.entries[i].bconfcall);
    }
    ims_call_list_info_clear(&list);
    ims_call_list_info_clear(nullptr);
    EXPECT_EQ(gate_queries(), 0);
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
