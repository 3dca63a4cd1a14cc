// SPDX-License-Identifier: Apache-2.0
#include "imsctl/call/module.hpp"
#include "imsctl/output/fields.hpp"
#include "imsctl/output/output.hpp"

#include <gtest/gtest.h>
#include <ims.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

struct EscapeRow {
    std::string_view text;
    const char *escaped;
};

class Escape : public ::testing::TestWithParam<EscapeRow> {};

TEST_P(Escape, LeavesNothingThatATerminalActsOn) {
    EXPECT_EQ(escape(GetParam().text), GetParam().escaped);
}

using namespace std::string_view_literals;

INSTANTIATE_TEST_SUITE_P(
    All, Escape,
    ::testing::Values(EscapeRow{"plain text", "plain text"}, EscapeRow{"", ""},
                      EscapeRow{"grüße 日本 🙂", "grüße 日本 🙂"},
                      EscapeRow{"a\nb\rc\td", R"(a\nb\rc\td)"},
                      EscapeRow{R"(say "hi" \)", R"(say \"hi\" \\)"},
                      EscapeRow{"\x1b[31mred\x7f", R"(\x1b[31mred\x7f)"},
                      EscapeRow{"a\0b"sv, R"(a\x00b)"},
                      EscapeRow{"bad \xff\xc3 utf-8 \xe2\x82", R"(bad \xff\xc3 utf-8 \xe2\x82)"},
                      // C1 control, direction override, line separator
                      EscapeRow{"\u009b \u202e \u2028", R"(\u{9b} \u{202e} \u{2028})"}));

TEST(Value, BecomesText) {
    EXPECT_EQ(to_text(Value()), "-");
    EXPECT_EQ(to_text(Value(true)), "true");
    EXPECT_EQ(to_text(Value(std::int64_t{-5})), "-5");
    EXPECT_EQ(to_text(Value(std::uint8_t{'#'})), "'#'");
    EXPECT_EQ(to_text(Value(std::uint8_t{7})), R"('\x07')");
    EXPECT_EQ(to_text(Value(std::string("a b"))), R"("a b")");
    EXPECT_EQ(to_text(Value(Bytes{'a', 0, 0xff})), R"("a\x00\xff")");
    EXPECT_EQ(to_text(Value(Binary{{'a', 0, 0xff}})), "6100ff");
    EXPECT_EQ(to_text(Value(Numbers{1, -2})), "[1,-2]");
    EXPECT_EQ(to_text(Value(Texts{"a", std::nullopt})), R"(["a",-])");
}

TEST(Value, BecomesTypedJson) {
    EXPECT_EQ(to_json(Value()).dump(), "null");
    EXPECT_EQ(to_json(Value(true)).dump(), "true");
    EXPECT_EQ(to_json(Value(std::int64_t{-5})).dump(), "-5");
    EXPECT_EQ(to_json(Value(std::uint8_t{'#'})).dump(), "35");
    EXPECT_EQ(to_json(Value(std::string("a\nb"))).dump(), R"("a\nb")");
    EXPECT_EQ(to_json(Value(Bytes{'h', 'e', 'l', 'l', 'o'})).dump(), R"("aGVsbG8=")");
    EXPECT_EQ(to_json(Value(Bytes{})).dump(), R"("")");
    EXPECT_EQ(to_json(Value(Binary{{'h', 'e', 'l', 'l', 'o'}})).dump(), R"("aGVsbG8=")");
    EXPECT_EQ(to_json(Value(Numbers{1, -2})).dump(), "[1,-2]");
    EXPECT_EQ(to_json(Value(Texts{"a", std::nullopt})).dump(), R"(["a",null])");
}

TEST(Fields, KeepTheirOrder) {
    const Fields fields = {{"z", std::int64_t{1}}, {"a", false}, {"m", std::string("t")}};
    Json object = Json::object();
    add_json(object, fields);
    EXPECT_EQ(dump(object), R"({"z":1,"a":false,"m":"t"})");
    EXPECT_EQ(to_text(fields), R"(z=1 a=false m="t")");
}

TEST(Dump, TakesTextsThatAreNotUtf8) {
    EXPECT_TRUE(Json::accept(dump({{"text", "\xff"}})));
}

TEST(Event, HasBothForms) {
    const Event event{find_event(call_events(), IMS_NOTI_CALL_ENDED),
                      {{"session_id", std::int64_t{3}}, {"reason", std::int64_t{16}}},
                      1'700'000'000'123'456};
    EXPECT_EQ(dump(to_json(event, 1)),
              R"({"event":"call-ended","id":521,"slot":1,"time":"2023-11-14T22:13:20.123456Z",)"
              R"("session_id":3,"reason":16})");
    EXPECT_EQ(to_text(event).substr(8), ".123 call-ended session_id=3 reason=16");
    EXPECT_EQ(event.number("reason"), 16);
    EXPECT_EQ(event.number("nothing"), std::nullopt);
}

TEST(Output, FailsWhenNobodyTakesIt) {
    std::FILE *full = std::fopen("/dev/full", "w");
    ASSERT_NE(full, nullptr);
    const Output output(false, full, stderr);
    try {
        output.line("text");
        ADD_FAILURE() << "the line was not written";
    } catch (const Failure &failure) {
        EXPECT_EQ(failure.kind, FailureKind::kOutput);
        EXPECT_EQ(failure.exit_status(), 1);
    }
    std::fclose(full);
}

} // namespace
} // namespace imsctl
