// SPDX-License-Identifier: Apache-2.0
// What the list of a get request becomes, for each of the three services.
#include "tests/library/ss/services.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/released.hpp"
#include "tests/support/with_peer.hpp"

#include <climits>

namespace test {
namespace {

constexpr const char *kUnit = "ims_ss.cpp";
constexpr const char *kType = "(iuaa{sv})";

// A callback's data, copied while it was there.
struct Received {
    int result = -1;
    bool has_list = false;
    std::uint32_t count = 0;
    const void *entries = nullptr;
    std::vector<std::vector<std::int32_t>> numbers;
};

class StatusList : public WithPeer, public ::testing::WithParamInterface<Service> {
  protected:
    const Service &service() { return GetParam(); }

    Received ask(const std::string &answer) {
        peer().on(service().method, reply(kType, answer));
        Received received;
        ResponseRecorder recorder{[&](const Response &response, void *data) {
            received.result = response.result;
            received.has_list = data != nullptr;
            if (data)
                copy(*static_cast<ims_ss_status_list_s *>(data), received);
        }};
        EXPECT_EQ(service().ask(handle_, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
        fence();
        EXPECT_EQ(recorder.count(), 1U);
        return received;
    }

    // The only entry's numbers.
    std::vector<std::int32_t> ask_for_one(const std::string &dictionary) {
        const Received received = ask(list_reply("1", {dictionary}));
        EXPECT_EQ(received.result, 0);
        EXPECT_EQ(received.numbers.size(), 1U);
        EXPECT_TRUE(take_log().empty());
        return received.numbers.empty() ? std::vector<std::int32_t>{} : received.numbers[0];
    }

    // As many numbers as the service has keys.
    std::vector<std::int32_t> counting_from(std::int32_t first) {
        std::vector<std::int32_t> numbers(service().keys.size());
        for (std::int32_t &number : numbers)
            number = first++;
        return numbers;
    }
    std::vector<std::int32_t> all(std::int32_t number) {
        return std::vector<std::int32_t>(service().keys.size(), number);
    }

    // One dictionary with this text for each key.
    std::string each_key(const std::function<std::string(const std::string &key)> &entry) {
        std::string text;
        for (const char *key : service().keys)
            text += (text.empty() ? "" : ", ") + entry("'" + std::string{key} + "'");
        return "{" + text + "}";
    }

  private:
    void copy(const ims_ss_status_list_s &list, Received &received) {
        received.count = list.count;
        received.entries = service().entries(list);
        for (std::size_t i = 0; i < list.count; ++i)
            received.numbers.push_back(service().entry(list, i).numbers);
    }
};

INSTANTIATE_TEST_SUITE_P(Ss, StatusList, ::testing::ValuesIn(services()),
                         [](const auto &tested) { return tested.param.name; });

TEST_P(StatusList, HasAnEntryForEachDictionary) {
    for (const unsigned count : {1U, 2U, 3U, 1000U}) {
        std::vector<std::string> dictionaries;
        for (unsigned i = 0; i < count; ++i)
            dictionaries.push_back(dictionary(service(), static_cast<std::int32_t>(10 * i + 1)));
        const Received received = ask(list_reply(std::to_string(count), dictionaries));
        EXPECT_EQ(received.result, 0);
        EXPECT_EQ(received.count, count);
        EXPECT_NE(received.entries, nullptr);
        ASSERT_EQ(received.numbers.size(), count);
        for (unsigned i = 0; i < count; ++i)
            EXPECT_EQ(received.numbers[i], counting_from(static_cast<std::int32_t>(10 * i + 1)));
    }
    EXPECT_TRUE(take_log().empty());
}

// A count that the list does not have, and how the warning prints it.
struct Lie {
    const char *count;
    std::size_t dictionaries;
    const char *printed;
};

constexpr Lie kLies[] = {{"3", 2, "3"},
                         {"1", 2, "1"},
                         {"2", 1, "2"},
                         {"0", 2, "0"},
                         {"1", 0, "1"},
                         {"2147483647", 1, "2147483647"},
                         {"2147483648", 1, "-2147483648"},
                         {"4294967295", 2, "-1"},
                         {"4294967295", 0, "-1"}};

TEST_P(StatusList, CountThreeOfTwoIsAnEmptyListWithResultZeroAndAWarning) {
    const Received received =
        ask(list_reply("3", {dictionary(service(), 1), dictionary(service(), 11)}));
    EXPECT_EQ(received.result, 0);
    EXPECT_TRUE(received.has_list);
    EXPECT_EQ(received.count, 0U);
    EXPECT_EQ(received.entries, nullptr);
    expect_one_warning(kUnit, service().handler, std::string{service().count_warning} + "[3]");
}

TEST_P(StatusList, CountNoneOfNoneIsAnEmptyListWithAWarningToo) {
    const Received received = ask("(0, 0, [])");
    EXPECT_EQ(received.result, 0);
    EXPECT_TRUE(received.has_list);
    EXPECT_EQ(received.count, 0U);
    EXPECT_EQ(received.entries, nullptr);
    expect_one_warning(kUnit, service().handler, std::string{service().count_warning} + "[0]");
}

TEST_P(StatusList, EveryOtherCountThatLiesIsAnEmptyListWithAWarning) {
    for (const auto &[count, dictionaries, printed] : kLies) {
        SCOPED_TRACE(count);
        const Received received = ask(
            list_reply(count, std::vector<std::string>(dictionaries, dictionary(service(), 1))));
        EXPECT_EQ(received.result, 0);
        EXPECT_TRUE(received.has_list);
        EXPECT_EQ(received.count, 0U);
        EXPECT_EQ(received.entries, nullptr);
        expect_one_warning(kUnit, service().handler,
                           std::string{service().count_warning} + "[" + printed + "]");
    }
}

TEST_P(StatusList, AnUnknownKeyIsIgnoredAndAMissingStatusIsZero) {
    const std::vector<std::int32_t> numbers =
        ask_for_one("{'ss_class': <7>, 'ss_colour': <8>, 'extra': <'x'>}");
    ASSERT_GE(numbers.size(), 2U);
    EXPECT_EQ(numbers[0], 7);
    EXPECT_EQ(numbers[1], 0);
}

TEST_P(StatusList, KeysThatOnlyLookAlikeAreIgnored) {
    EXPECT_EQ(ask_for_one("{'': <1>, 'SS_CLASS': <2>, 'ss_class ': <3>, 'ss_clas': <4>, "
                          "'ss_statuss': <5>, 'nested': <{'ss_class': <6>}>}"),
              all(0));
}

TEST_P(StatusList, AnEmptyDictionaryIsAnEntryOfZeroes) {
    EXPECT_EQ(ask_for_one("{}"), all(0));
    const Received received =
        ask(list_reply("3", {dictionary(service(), 1), "{}", dictionary(service(), 5)}));
    ASSERT_EQ(received.numbers.size(), 3U);
    EXPECT_EQ(received.numbers[0], counting_from(1));
    EXPECT_EQ(received.numbers[1], all(0));
    EXPECT_EQ(received.numbers[2], counting_from(5));
}

TEST_P(StatusList, KeysOfTheOtherServicesAreIgnored) {
    std::string every_key = "{'cf_uri': <'tel:1'>";
    for (const Service &other : services())
        for (const char *key : other.keys)
            every_key += ", '" + std::string{key} + "': <9>";
    EXPECT_EQ(ask_for_one(every_key + "}"), all(9));
}

TEST_P(StatusList, KeysMayComeInAnyOrder) {
    std::string backwards;
    std::int32_t number = 1;
    for (const char *key : service().keys)
        backwards = "'" + std::string{key} + "': <" + std::to_string(number++) + ">" +
                    (backwards.empty() ? "" : ", ") + backwards;
    EXPECT_EQ(ask_for_one("{" + backwards + "}"), counting_from(1));
}

TEST_P(StatusList, NumbersOfTheWholeRangeAreKept) {
    EXPECT_EQ(ask_for_one(each_key([](const auto &key) { return key + ": <-2147483648>"; })),
              all(INT_MIN));
    EXPECT_EQ(ask_for_one(each_key([](const auto &key) { return key + ": <2147483647>"; })),
              all(INT_MAX));
}

TEST_P(StatusList, AValueOfAnotherTypeCountsAsMissing) {
    for (const char *value :
         {"uint32 7", "int64 7", "int16 7", "byte 7", "true", "7.0", "'7'", "[7]", "<7>", "(7,)",
          "objectpath '/7'", "@a{sv} {}", "{'value': <7>}"}) {
        SCOPED_TRACE(value);
        EXPECT_EQ(ask_for_one(each_key([&](const auto &key) { return key + ": <" + value + ">"; })),
                  all(0));
    }
}

TEST_P(StatusList, AKeyGivenTwiceKeepsTheLaterValue) {
    EXPECT_EQ(ask_for_one(each_key([](const auto &key) {
                  return key + ": <1>, " + key + ": <2>, " + key + ": <3>";
              })),
              all(3));
}

TEST_P(StatusList, AKeyGivenAgainWithAnotherTypeKeepsTheEarlierValue) {
    EXPECT_EQ(ask_for_one(each_key([](const auto &key) {
                  return key + ": <1>, " + key + ": <'2'>, " + key + ": <uint32 3>";
              })),
              all(1));
}

TEST_P(StatusList, ARefusalBringsNoDataWhateverTheList) {
    for (const char *rest : {"0, []", "1, [{'ss_class': <1>}]", "7, [{'ss_class': <1>}]"}) {
        const Received received = ask(std::string{"(-5, "} + rest + ")");
        EXPECT_EQ(received.result, -5);
        EXPECT_FALSE(received.has_list);
        expect_one_line(kUnit, service().handler, std::string{service().refusal} + "-5");
    }
}

TEST_P(StatusList, RefusalsAndCountsAreLoggedWithoutACallbackToo) {
    peer().on(service().method, reply(kType, "(6, 0, [])"));
    EXPECT_EQ(service().ask(handle_, nullptr, nullptr), IMS_ERROR_NONE);
    fence();
    expect_one_line(kUnit, service().handler, std::string{service().refusal} + "6");
    peer().on(service().method, reply(kType, list_reply("2", {dictionary(service(), 1)})));
    EXPECT_EQ(service().ask(handle_, nullptr, nullptr), IMS_ERROR_NONE);
    fence();
    expect_one_warning(kUnit, service().handler, std::string{service().count_warning} + "[2]");
}

TEST_P(StatusList, IsGoneAfterTheCallback) {
    const Received received = ask(list_reply("1", {dictionary(service(), 1)}));
    expect_released(received.entries);
}

TEST_P(StatusList, OutlivesAHandleThatItsCallbackReleases) {
    init(4); // keeps the connection for the fence
    peer().on(service().method, reply(kType, list_reply("1", {dictionary(service(), 1)})));
    ResponseRecorder recorder{[&](const Response &response, void *data) {
        ASSERT_NE(data, nullptr);
        forget(response.handle);
        EXPECT_EQ(ims_deinit(response.handle), IMS_ERROR_NONE);
        const Entry entry = service().entry(*static_cast<ims_ss_status_list_s *>(data), 0);
        EXPECT_EQ(entry.numbers, counting_from(1));
        if (service().has_uri) {
            EXPECT_STREQ(entry.uri, "tel:7");
        }
    }};
    EXPECT_EQ(service().ask(handle_, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

} // namespace
} // namespace test
