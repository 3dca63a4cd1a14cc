// SPDX-License-Identifier: Apache-2.0
// The bytes of a written dictionary beside those that GLib makes of the same entries. No bus.
#include "src/wire/dictionary.hpp"
#include "tests/support/variant.hpp"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

namespace test {
namespace {

struct Timer {
    char *text;
    std::int32_t value;
};

struct Record {
    const char *first;
    std::int32_t number;
    bool flag;
    Timer timer;
    const char *last;
};

constexpr auto kFields = ims::field_table({
    IMS_FIELD(Record, first),
    IMS_FIELD(Record, number),
    IMS_FIELD(Record, flag),
    IMS_FIELD(Record, timer),
    IMS_FIELD(Record, last),
});
constexpr ims::WriteRule kRules[] = {
    {"timer", ims::WriteAs::kItself, ims::WriteAs::kDecimalText, ""},
    {"flag", ims::WriteAs::kItself, ims::WriteAs::kOtherField, "last"},
};
constexpr auto kUpdate = ims::write_plan(kFields, kRules, &ims::WriteRule::update);
constexpr auto kAdd = ims::write_plan(kFields, kRules, &ims::WriteRule::add);

constexpr auto kOnlyText = ims::field_table({IMS_FIELD(Record, first)});
constexpr auto kOnlyTextPlan =
    ims::write_plan(kOnlyText, std::span<const ims::WriteRule>{}, &ims::WriteRule::update);

Variant built(std::initializer_list<std::pair<const char *, GVariant *>> entries) {
    GVariantBuilder builder;
    g_variant_builder_init(&builder, G_VARIANT_TYPE_VARDICT);
    for (const auto &[key, value] : entries)
        g_variant_builder_add(&builder, "{sv}", key, value);
    return Variant{g_variant_ref_sink(g_variant_builder_end(&builder))};
}

std::string bytes_of(GVariant *value) {
    return {static_cast<const char *>(g_variant_get_data(value)), g_variant_get_size(value)};
}

void expect_same(GVariant *written, GVariant *expected, const std::string &what) {
    ASSERT_NE(written, nullptr) << what;
    ASSERT_TRUE(g_variant_is_of_type(written, G_VARIANT_TYPE_VARDICT)) << what;
    EXPECT_TRUE(bytes_of(written) == bytes_of(expected)) << what;
}

TEST(WrittenDictionary, HasTheBytesOfOneThatIsBuilt) {
    for (const std::int32_t number : {0, 1, -1, INT32_MAX, INT32_MIN}) {
        const Record record{"one", number, number > 0, {nullptr, number}, "\xc3\xa9"};
        const std::string what = std::to_string(number);
        const auto updated = ims::write_dictionary(kFields, kUpdate, &record);
        expect_same(updated.get(),
                    built({{"first", g_variant_new_string("one")},
                           {"number", g_variant_new_int32(number)},
                           {"flag", g_variant_new_boolean(number > 0)},
                           {"timer", g_variant_new_int32(number)},
                           {"last", g_variant_new_string("\xc3\xa9")}})
                        .get(),
                    what);
        const auto added = ims::write_dictionary(kFields, kAdd, &record);
        expect_same(added.get(),
                    built({{"first", g_variant_new_string("one")},
                           {"number", g_variant_new_int32(number)},
                           {"last", g_variant_new_string("\xc3\xa9")},
                           {"timer", g_variant_new_string(what.c_str())},
                           {"last", g_variant_new_string("\xc3\xa9")}})
                        .get(),
                    what);
    }
}

// Ends of entries and of the dictionary take one byte, two or four, depending on their size.
TEST(WrittenDictionary, HasTheBytesOfOneThatIsBuiltAtEveryLengthOfItsTexts) {
    const auto check = [](std::size_t length) {
        const std::string text(length, 'x');
        const Record record{text.c_str(), 5, true, {nullptr, 6}, "last"};
        expect_same(ims::write_dictionary(kFields, kUpdate, &record).get(),
                    built({{"first", g_variant_new_string(text.c_str())},
                           {"number", g_variant_new_int32(5)},
                           {"flag", g_variant_new_boolean(TRUE)},
                           {"timer", g_variant_new_int32(6)},
                           {"last", g_variant_new_string("last")}})
                        .get(),
                    "five entries, " + std::to_string(length));
        expect_same(ims::write_dictionary(kOnlyText, kOnlyTextPlan, &record).get(),
                    built({{"first", g_variant_new_string(text.c_str())}}).get(),
                    "one entry, " + std::to_string(length));
    };
    for (std::size_t length = 0; length < 600; ++length)
        check(length);
    for (std::size_t length = 65'300; length < 65'600; ++length)
        check(length);
    check(1 << 20);
}

struct Numbers {
    const char *text;
    std::int32_t n01, n02, n03, n04, n05, n06, n07, n08, n09, n10, n11, n12, n13, n14, n15, n16;
    std::int32_t n17, n18, n19, n20, n21, n22, n23, n24, n25, n26, n27, n28, n29, n30, n31, n32;
};

consteval auto numbers_table() {
    ims::Field fields[33]{IMS_FIELD(Numbers, text)};
    constexpr std::string_view kKeys = "n01n02n03n04n05n06n07n08n09n10n11n12n13n14n15n16"
                                       "n17n18n19n20n21n22n23n24n25n26n27n28n29n30n31n32";
    for (std::size_t at = 1; at < std::size(fields); ++at)
        fields[at] = ims::field<std::int32_t>(kKeys.substr(3 * (at - 1), 3),
                                              offsetof(Numbers, n01) + 4 * (at - 1));
    return ims::field_table(fields);
}

// The text pushes what follows it, entries and their ends, across the end of the writer's block.
TEST(WrittenDictionary, HasRoomForItsEntriesWhateverIsBeforeThem) {
    static constexpr auto kNumbers = numbers_table();
    static constexpr auto kPlan =
        ims::write_plan(kNumbers, std::span<const ims::WriteRule>{}, &ims::WriteRule::update);
    for (std::size_t length = 0; length < 5000; ++length) {
        const std::string text(length, 'x');
        Numbers record{};
        record.text = text.c_str();
        record.n32 = static_cast<std::int32_t>(length);
        const auto dictionary = ims::write_dictionary(kNumbers, kPlan, &record);
        Numbers back{};
        ims::read_dictionary(dictionary.get(), kNumbers, &back);
        ASSERT_EQ(text, back.text);
        ASSERT_EQ(back.n32, record.n32);
    }
}

TEST(WrittenDictionary, TakesAnyByteButZeroForTrue) {
    for (const unsigned char byte : {0, 1, 2, 255}) {
        Record record{"one", 1, false, {nullptr, 1}, "two"};
        *reinterpret_cast<unsigned char *>(&record.flag) = byte;
        const auto dictionary = ims::write_dictionary(kFields, kUpdate, &record);
        gboolean flag = byte == 0;
        EXPECT_TRUE(g_variant_lookup(dictionary.get(), "flag", "b", &flag));
        EXPECT_EQ(flag, byte != 0 ? TRUE : FALSE);
        EXPECT_TRUE(g_variant_is_normal_form(dictionary.get()));
    }
}

TEST(WrittenDictionary, IsNoneForAMissingOrBrokenText) {
    Record record{"one", 1, true, {nullptr, 1}, "two"};
    record.last = nullptr;
    EXPECT_EQ(ims::write_dictionary(kFields, kUpdate, &record), nullptr);
    record.last = "\xff";
    EXPECT_EQ(ims::write_dictionary(kFields, kUpdate, &record), nullptr);
    record.last = "two";
    EXPECT_NE(ims::write_dictionary(kFields, kUpdate, &record), nullptr);
}

TEST(WrittenDictionary, IsNoneWhenItsTextsAreTooLargeTogether) {
    const std::string half(ims::kMaxTupleSize / 2, 'x');
    Record record{half.c_str(), 1, true, {nullptr, 1}, "two"};
    EXPECT_NE(ims::write_dictionary(kFields, kUpdate, &record), nullptr);
    record.last = half.c_str();
    EXPECT_EQ(ims::write_dictionary(kFields, kUpdate, &record), nullptr);
    const std::string whole(ims::kMaxTupleSize, 'x');
    record.last = whole.c_str();
    EXPECT_EQ(ims::write_dictionary(kFields, kUpdate, &record), nullptr);
}

TEST(WrittenDictionary, IsAsLargeAsARequestMayBeAtMost) {
    const auto size_with = [](const std::string &text) {
        return g_variant_get_size(built({{"first", g_variant_new_string(text.c_str())}}).get());
    };
    const gsize edge = ims::kMaxTupleSize - size_with(std::string(1 << 20, 'x')) + (1 << 20);
    for (const gsize length : {edge - 1, edge, edge + 1}) {
        const std::string text(length, 'x');
        const Record record{text.c_str(), 0, false, {nullptr, 0}, nullptr};
        const auto dictionary = ims::write_dictionary(kOnlyText, kOnlyTextPlan, &record);
        EXPECT_EQ(dictionary != nullptr, size_with(text) <= ims::kMaxTupleSize) << length - edge;
        EXPECT_EQ(dictionary != nullptr, length <= edge) << length - edge;
    }
}

TEST(WrittenDictionary, IsReadBack) {
    const Record record{"one", -7, true, {nullptr, 12}, "two"};
    const auto dictionary = ims::write_dictionary(kFields, kAdd, &record);
    Record back{};
    ims::read_dictionary(dictionary.get(), kFields, &back);
    EXPECT_STREQ(back.first, "one");
    EXPECT_EQ(back.number, -7);
    EXPECT_STREQ(back.timer.text, "12");
    EXPECT_EQ(back.timer.value, 12);
    EXPECT_STREQ(back.last, "two");
    g_free(back.timer.text);
}

} // namespace
} // namespace test
