// SPDX-License-Identifier: Apache-2.0
// Who has the floor: the values that are asked with, the list that comes back.
#include "tests/support/expectations.hpp"
#include "tests/support/released.hpp"
#include "tests/support/with_peer.hpp"

#include <climits>

namespace test {
namespace {

constexpr const char *kMethod = "org.kelvo.ims.Poc.PocRequestFloorStatus";

struct QueryCase {
    const char *name;
    std::int32_t count;
    const char *array;
};

// The values are 7, 8, 9 and so on. The service wants four at least.
constexpr QueryCase kQueryCases[] = {{"OneIsFilledUpToFour", 1, "[7, -1, -1, -1]"},
                                     {"TwoAreFilledUpToFour", 2, "[7, 8, -1, -1]"},
                                     {"ThreeAreFilledUpToFour", 3, "[7, 8, 9, -1]"},
                                     {"NoneIsFourTimesMinusOne", 0, "[-1, -1, -1, -1]"},
                                     {"FourAreSentAsTheyAre", 4, "[7, 8, 9, 10]"},
                                     {"SixAreSentAsTheyAre", 6, "[7, 8, 9, 10, 11, 12]"},
                                     {"ANegativeCountIsMadeUpFor", -2, "[-1, -1, -1, -1, -1, -1]"}};

class FloorQuery : public WithPeer, public ::testing::WithParamInterface<QueryCase> {};

INSTANTIATE_TEST_SUITE_P(Poc, FloorQuery, ::testing::ValuesIn(kQueryCases),
                         [](const auto &tested) { return std::string{tested.param.name}; });

ims_poc_floor_query_s query_of(std::int32_t count) {
    ims_poc_floor_query_s query{count, {}};
    for (std::int32_t at = 0; at < IMS_POC_FLOOR_QUERY_CAPACITY; ++at)
        query.values[at] = 7 + at;
    return query;
}

TEST_P(FloorQuery, IsSentAsAnArray) {
    const ims_poc_floor_query_s query = query_of(GetParam().count);
    EXPECT_EQ(ims_poc_call_request_floor_status(handle_, &query, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    expect_sent(sent[0], "(v)", std::string{"(<"} + GetParam().array + ">,)");
}

class FloorStatus : public WithPeer {
  protected:
    // Asks, with this reply, and looks at what the callback gets.
    void ask(const char *value, ResponseRecorder &recorder) {
        peer().on(kMethod, reply("(iaa{sv})", value));
        const ims_poc_floor_query_s query = query_of(1);
        ASSERT_EQ(ims_poc_call_request_floor_status(handle_, &query, ResponseRecorder::callback,
                                                    &recorder),
                  IMS_ERROR_NONE);
        fence();
        ASSERT_EQ(recorder.count(), 1U);
    }

    void expect_refused(std::int32_t count) {
        const ims_poc_floor_query_s query = query_of(count);
        EXPECT_EQ(ims_poc_call_request_floor_status(handle_, &query, nullptr, nullptr),
                  IMS_ERROR_INVALID_PARAMETER);
        expect_one_line("ims_poc.cpp", "ims_poc_call_request_floor_status", "Invalid parameter");
        EXPECT_TRUE(requests().empty());
    }
};

TEST_F(FloorStatus, AsksWithAsManyValuesAsTheRecordHolds) {
    const ims_poc_floor_query_s query = query_of(IMS_POC_FLOOR_QUERY_CAPACITY);
    EXPECT_EQ(ims_poc_call_request_floor_status(handle_, &query, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    const Variant boxed{g_variant_get_child_value(sent[0].body.get(), 0)};
    const Variant values{g_variant_get_variant(boxed.get())};
    gsize count = 0;
    const auto *first = static_cast<const std::int32_t *>(
        g_variant_get_fixed_array(values.get(), &count, sizeof(std::int32_t)));
    ASSERT_EQ(count, gsize{IMS_POC_FLOOR_QUERY_CAPACITY});
    EXPECT_EQ(first[0], 7);
    EXPECT_EQ(first[count - 1], 70);
}

TEST_F(FloorStatus, RefusesToAskWithMoreValuesThanTheRecordHolds) {
    expect_refused(IMS_POC_FLOOR_QUERY_CAPACITY + 1);
    expect_refused(INT_MAX);
}

TEST_F(FloorStatus, RefusesANegativeCountThatTheBusCouldNotCarry) {
    expect_refused(INT_MIN);
    expect_refused(-5000000);
}

TEST_F(FloorStatus, OfNoSessionIsNoList) {
    ResponseRecorder recorder;
    ask("(0, [])", recorder);
    EXPECT_EQ(recorder.last().result, 0);
    EXPECT_FALSE(recorder.last().has_data);
}

TEST_F(FloorStatus, KeepsTheOrderOfTheReply) {
    std::vector<int> sessions;
    ResponseRecorder recorder{[&](const Response &, void *data) {
        for (const auto *at = static_cast<ims_poc_floor_status_s *>(data); at; at = at->next)
            sessions.push_back(at->session_id);
    }};
    ask("(0, [{'session_id': <int64 9>}, {'session_id': <int64 3>}, {'session_id': <int64 7>}])",
        recorder);
    EXPECT_EQ(sessions, (std::vector<int>{9, 3, 7}));
}

TEST_F(FloorStatus, ComesWithEveryResult) {
    ResponseRecorder recorder{[](const Response &, void *data) {
        ASSERT_NE(data, nullptr);
        EXPECT_EQ(static_cast<ims_poc_floor_status_s *>(data)->session_id, 9);
    }};
    ask("(-5, [{'session_id': <int64 9>}])", recorder);
    EXPECT_EQ(recorder.last().result, -5);
}

TEST_F(FloorStatus, CutsIntegersToThirtyTwoBits) {
    ResponseRecorder recorder{[](const Response &, void *data) {
        const auto &status = *static_cast<ims_poc_floor_status_s *>(data);
        EXPECT_EQ(status.session_id, 1);         // 2^32 + 1
        EXPECT_EQ(status.status, INT32_MIN);     // 2^31
        EXPECT_EQ(status.participant_count, -1); // 2^63 - 1
    }};
    ask("(0, [{'session_id': <int64 4294967297>, 'status': <int64 2147483648>, "
        "'participant_count': <int64 9223372036854775807>}])",
        recorder);
}

TEST_F(FloorStatus, LeavesOutWhatItDoesNotKnowOrCannotRead) {
    ResponseRecorder recorder{[](const Response &, void *data) {
        const auto &status = *static_cast<ims_poc_floor_status_s *>(data);
        EXPECT_EQ(status.session_id, 0);
        EXPECT_EQ(status.status, 2);
        EXPECT_EQ(status.participant_count, 0);
        EXPECT_EQ(status.floor_taken_uri, nullptr);
        ASSERT_NE(status.next, nullptr); // an empty dictionary is a session too
        EXPECT_EQ(status.next->session_id, 0);
        EXPECT_EQ(status.next->floor_taken_uri, nullptr);
        EXPECT_EQ(status.next->next, nullptr);
    }};
    ask("(0, [{'session_id': <'nine'>, 'unheard': <int64 1>, 'status': <<int64 2>>, "
        "'participant_count': <3>, 'floor_taken_uri': <int64 4>}, @a{sv} {}])",
        recorder);
}

TEST_F(FloorStatus, IsGoneAfterTheCallback) {
    const void *status = nullptr;
    const void *uri = nullptr;
    ResponseRecorder recorder{[&](const Response &, void *data) {
        status = data;
        uri = static_cast<ims_poc_floor_status_s *>(data)->floor_taken_uri;
        EXPECT_STREQ(static_cast<const char *>(uri), "sip:a@example.org");
    }};
    ask("(0, [{'floor_taken_uri': <'sip:a@example.org'>}])", recorder);
    expect_released(status);
    expect_released(uri);
}

TEST_F(FloorStatus, OfManySessionsIsWhole) {
    GVariantBuilder list;
    g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
    constexpr std::int64_t kCount = 20000;
    for (std::int64_t at = 0; at < kCount; ++at) {
        GVariantDict entry;
        g_variant_dict_init(&entry, nullptr);
        g_variant_dict_insert_value(&entry, "session_id", g_variant_new_int64(at));
        g_variant_builder_add_value(&list, g_variant_dict_end(&entry));
    }
    const Variant body = share(g_variant_new("(i@aa{sv})", 0, g_variant_builder_end(&list)));
    peer().on(kMethod, reply_with(body.get()));
    std::int64_t seen = 0;
    ResponseRecorder recorder{[&](const Response &, void *data) {
        for (const auto *at = static_cast<ims_poc_floor_status_s *>(data); at; at = at->next)
            EXPECT_EQ(at->session_id, seen++);
    }};
    const ims_poc_floor_query_s query = query_of(1);
    EXPECT_EQ(
        ims_poc_call_request_floor_status(handle_, &query, ResponseRecorder::callback, &recorder),
        IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(seen, kCount);
}

} // namespace
} // namespace test
