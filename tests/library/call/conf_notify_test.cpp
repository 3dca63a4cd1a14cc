// SPDX-License-Identifier: Apache-2.0
// CallConfNotifyReceived carries two counts beside its two arrays, and the service may be wrong
// about them.
#include "tests/library/call/event_rows.hpp"
#include "tests/support/with_peer.hpp"

#include <climits>
#include <cstdlib>
#include <numeric>

namespace test {
namespace {

constexpr std::size_t kLimit = 65536;

// What the callback found.
struct Found {
    std::int32_t session_id;
    std::int32_t value_count;
    std::int32_t text_count;
    std::vector<std::int32_t> values;
    std::vector<std::string> texts; // "(NULL)" for a missing one
};

class ConfNotify : public WithPeer {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        recorder_.inspect_with([this](const Notified &, void *event) { read(event); });
        listen(IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED, recorder_);
    }

    // As many elements as came or are claimed, whichever is more: so many must be readable.
    void send(const std::string &text, std::size_t values, std::size_t texts) {
        send(parse("(ivivi)", text), values, texts);
    }

    void send(const Variant &body, std::size_t values, std::size_t texts) {
        readable_values_ = values;
        readable_texts_ = texts;
        emit(kCallEvents.interface, "CallConfNotifyReceived", body);
        fence();
    }

    void read(void *event) {
        const auto &record = *static_cast<ims_call_conf_notify_s *>(event);
        Found found{record.session_id, record.value_count, record.text_count, {}, {}};
        for (std::size_t i = 0; i < readable_values_; ++i) {
            found.values.push_back(record.values[i]);
            record.values[i] = 1; // the application may write there as well
        }
        for (std::size_t i = 0; i < readable_texts_; ++i) {
            found.texts.emplace_back(record.texts[i] ? record.texts[i] : "(NULL)");
            std::free(record.texts[i]);
            record.texts[i] = nullptr;
        }
        found_.push_back(std::move(found));
    }

    void expect_dropped(const std::string &text) { expect_dropped(parse("(ivivi)", text)); }
    void expect_dropped(const Variant &body) {
        send(body, 0, 0);
        EXPECT_EQ(recorder_.count(), 0U);
        const std::vector<LogLine> lines = take_log();
        ASSERT_EQ(lines.size(), 1U) << ::testing::PrintToString(lines);
        EXPECT_EQ(lines[0].priority, 6);
        EXPECT_EQ(lines[0].file, "ims_call.cpp");
        EXPECT_EQ(lines[0].function, "on_call_signal_emit_handler");
    }

    NotificationRecorder recorder_;
    std::vector<Found> found_;
    std::size_t readable_values_ = 0;
    std::size_t readable_texts_ = 0;
};

// "(ivivi)" with so many elements and these counts.
Variant body_of(std::size_t values, std::int32_t value_count, std::size_t texts,
                std::int32_t text_count) {
    std::vector<std::int32_t> numbers(values);
    std::iota(numbers.begin(), numbers.end(), 1);
    GVariant *ints = g_variant_new_fixed_array(G_VARIANT_TYPE_INT32, numbers.data(), numbers.size(),
                                               sizeof(std::int32_t));
    const std::vector<const char *> names(texts, "t");
    GVariant *strings =
        g_variant_new_strv(names.empty() ? nullptr : names.data(), static_cast<gssize>(texts));
    return share(g_variant_new("(ivivi)", 1, ints, value_count, strings, text_count));
}

TEST_F(ConfNotify, TwoIntsAndThreeTextsYieldArraysOfTwoAndThree) {
    send("(5, <[10, 20]>, 2, <['a', 'b', 'c']>, 3)", 2, 3);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].session_id, 5);
    EXPECT_EQ(found_[0].value_count, 2);
    EXPECT_EQ(found_[0].values, (std::vector<std::int32_t>{10, 20}));
    EXPECT_EQ(found_[0].text_count, 3);
    EXPECT_EQ(found_[0].texts, (std::vector<std::string>{"a", "b", "c"}));
    EXPECT_TRUE(take_log().empty());
}

TEST_F(ConfNotify, CountsThatAreTooLargeAreFilledUpWithZeroes) {
    send("(5, <[10, 20]>, 5, <['a']>, 3)", 5, 3);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].value_count, 5);
    EXPECT_EQ(found_[0].values, (std::vector<std::int32_t>{10, 20, 0, 0, 0}));
    EXPECT_EQ(found_[0].text_count, 3);
    EXPECT_EQ(found_[0].texts, (std::vector<std::string>{"a", "(NULL)", "(NULL)"}));
    EXPECT_TRUE(take_log().empty());
}

TEST_F(ConfNotify, CountsThatAreTooSmallAreCarriedAsSentBesideAllElements) {
    send("(5, <[10, 20, 30]>, 1, <['a', 'b', 'c']>, 2)", 3, 3);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].value_count, 1);
    EXPECT_EQ(found_[0].values, (std::vector<std::int32_t>{10, 20, 30}));
    EXPECT_EQ(found_[0].text_count, 2);
    EXPECT_EQ(found_[0].texts, (std::vector<std::string>{"a", "b", "c"}));
}

TEST_F(ConfNotify, CountsThatAreNegativeOrZeroAreCarriedAsSentBesideAllElements) {
    for (const std::int32_t count : {0, -1, INT_MIN}) {
        const std::string text = std::to_string(count);
        send("(5, <[10, 20]>, " + text + ", <['a']>, " + text + ")", 2, 1);
        ASSERT_FALSE(found_.empty());
        EXPECT_EQ(found_.back().value_count, count);
        EXPECT_EQ(found_.back().text_count, count);
        EXPECT_EQ(found_.back().values, (std::vector<std::int32_t>{10, 20}));
        EXPECT_EQ(found_.back().texts, (std::vector<std::string>{"a"}));
    }
    EXPECT_EQ(found_.size(), 3U);
}

TEST_F(ConfNotify, EmptyArraysWithCountsYieldZeroes) {
    send("(5, <@ai []>, 2, <@as []>, 1)", 2, 1);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].values, (std::vector<std::int32_t>{0, 0}));
    EXPECT_EQ(found_[0].texts, (std::vector<std::string>{"(NULL)"}));
}

TEST_F(ConfNotify, EmptyArraysWithoutCountsAreDelivered) {
    send("(5, <@ai []>, 0, <@as []>, 0)", 0, 0);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].value_count, 0);
    EXPECT_EQ(found_[0].text_count, 0);
    send("(5, <@ai []>, -1, <@as []>, -1)", 0, 0);
    EXPECT_EQ(found_.size(), 2U);
}

TEST_F(ConfNotify, TheLargestUnfilledCountIsStillBelieved) {
    send(body_of(1, kLimit, 1, kLimit), kLimit, kLimit);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].value_count, std::int32_t{kLimit});
    EXPECT_EQ(found_[0].text_count, std::int32_t{kLimit});
    EXPECT_EQ(found_[0].values.front(), 1);
    EXPECT_EQ(found_[0].values.back(), 0);
    EXPECT_EQ(found_[0].texts.front(), "t");
    EXPECT_EQ(found_[0].texts.back(), "(NULL)");
    EXPECT_TRUE(take_log().empty());
}

TEST_F(ConfNotify, ALargerCountThatTheArrayFillsIsDelivered) {
    send(body_of(kLimit + 1, kLimit + 1, kLimit + 2, kLimit + 1), kLimit + 1, kLimit + 2);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].values.back(), std::int32_t{kLimit + 1});
    EXPECT_EQ(found_[0].texts.back(), "t");
    EXPECT_TRUE(take_log().empty());
}

TEST_F(ConfNotify, MoreElementsThanTheLimitWithASmallCountAreDelivered) {
    send(body_of(kLimit + 10, 1, 1, 1), kLimit + 10, 1);
    ASSERT_EQ(found_.size(), 1U);
    EXPECT_EQ(found_[0].value_count, 1);
}

TEST_F(ConfNotify, AnUnfilledCountAboveTheLimitDropsTheEvent) {
    expect_dropped("(5, <[1]>, 65537, <['a']>, 1)");
    expect_dropped("(5, <[1]>, 1, <['a']>, 65537)");
    expect_dropped("(5, <[1]>, 2147483647, <['a']>, 1)");
    expect_dropped("(5, <[1]>, 1, <['a']>, 2147483647)");
    expect_dropped("(5, <[1]>, 2147483647, <['a']>, 2147483647)");
    expect_dropped(body_of(kLimit, kLimit + 1, 1, 1));
    expect_dropped(body_of(kLimit + 1, kLimit + 2, 1, 1));
}

TEST_F(ConfNotify, VariantsThatHoldSomethingElseDropTheEvent) {
    for (const char *text :
         {"(5, <['a']>, 1, <['a']>, 1)", "(5, <[1]>, 1, <[1]>, 1)", "(5, <@au [1]>, 1, <['a']>, 1)",
          "(5, <@ax [1]>, 1, <['a']>, 1)", "(5, <1>, 1, <['a']>, 1)", "(5, <[1]>, 1, <'a'>, 1)",
          "(5, <<[1]>>, 1, <['a']>, 1)", "(5, <[1]>, 1, <@ao ['/a']>, 1)",
          "(5, <[1]>, 1, <[<'a'>]>, 1)", "(5, <@ay []>, 0, <@as []>, 0)",
          "(5, <@ai []>, 0, <@aas []>, 0)", "(5, <[[1]]>, 1, <['a']>, 1)",
          "(5, <(1, 2)>, 2, <['a']>, 1)"}) {
        SCOPED_TRACE(text);
        expect_dropped(text);
    }
}

} // namespace
} // namespace test
