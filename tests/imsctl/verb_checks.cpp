// SPDX-License-Identifier: Apache-2.0
#include "tests/imsctl/verb_checks.hpp"

#include <algorithm>
#include <gmock/gmock.h>

namespace test {
namespace {

std::string verb_of(const VerbRow &row) {
    const auto words = split(row.line);
    std::string verb = words[0];
    for (std::size_t i = 1; i < row.verb_words; ++i)
        verb += ' ' + words[i];
    return verb;
}

// The library logs on standard error.
void expect_logged(const VerbRow &row, const Outcome &outcome) {
    const std::string end = row.line_logged;
    if (end.empty()) {
        EXPECT_EQ(outcome.error, "");
        return;
    }
    EXPECT_EQ(std::count(outcome.error.begin(), outcome.error.end(), '\n'), 1);
    EXPECT_THAT(outcome.error, testing::EndsWith(end + "\n"));
}

} // namespace

void PrintTo(const VerbRow &row, std::ostream *out) {
    *out << row.line;
}

std::string verb_name(const ::testing::TestParamInfo<VerbRow> &row) {
    std::string name = row.param.method + std::to_string(row.index);
    std::erase(name, '.');
    return name;
}

TEST_P(ServiceVerbs, SendsItsRequestOnceAndShowsTheReply) {
    const VerbRow &row = GetParam();
    answer(row.method, row.reply_type, row.reply);
    const Outcome outcome = run_imsctl(split(row.line));
    EXPECT_EQ(outcome.status, 0);
    expect_logged(row, outcome);
    EXPECT_EQ(outcome.output, row.text + std::string("\n"));

    const auto calls = calls_to(row.method);
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(calls[0].path, "/org/kelvo/ims/sub0");
    if (row.sent_type[0] == '\0')
        EXPECT_EQ(calls[0].signature, "");
    else
        EXPECT_EQ(to_text(calls[0].body.get()), to_text(parse(row.sent_type, row.sent).get()));
    // Registering, and nothing besides.
    EXPECT_EQ(peer_.calls().size(), 2u);
}

TEST_P(ServiceVerbs, ShowsTheReplyAsOneJsonObject) {
    const VerbRow &row = GetParam();
    answer(row.method, row.reply_type, row.reply);
    const Outcome outcome = run_imsctl(split(row.line + std::string(" --json")));
    EXPECT_EQ(outcome.status, 0);
    expect_logged(row, outcome);
    Json expected = {{"verb", verb_of(row)}};
    expected.update(Json::parse(row.json));
    EXPECT_EQ(outcome.json().dump(), expected.dump());
}

TEST_P(ServiceVerbs, FailsWithTheServicesOwnResult) {
    const VerbRow &row = GetParam();
    answer(row.method, row.reply_type, row.refusal);
    const Outcome outcome = run_imsctl(split(row.line + std::string(" --json")));
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["verb"], verb_of(row));
    EXPECT_EQ(outcome.json()["error"]["kind"], "service");
    EXPECT_EQ(outcome.json()["error"]["result"], 77);
    EXPECT_THAT(outcome.error, testing::HasSubstr("the service answered with result 77"));
}

} // namespace test
