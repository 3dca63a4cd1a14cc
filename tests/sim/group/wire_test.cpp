// SPDX-License-Identifier: Apache-2.0
#include "sim/group/wire.hpp"

#include "sim/group/reader.hpp"
#include "sim/group/writer.hpp"

#include "tests/sim/group/samples.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sim::test {
namespace {

using testing::HasSubstr;

Answer<GroupDictionary> read_text(const std::string &text) {
    const auto value = Variant::adopt(
        g_variant_parse(G_VARIANT_TYPE_VARDICT, text.c_str(), nullptr, nullptr, nullptr));
    return wire::read_dictionary(value.get());
}

// One key in each dictionary, this many below each other.
Variant nested(int levels) {
    GVariant *value = g_variant_new_int64(1);
    for (int i = 0; i < levels; ++i) {
        GVariantBuilder builder;
        g_variant_builder_init(&builder, G_VARIANT_TYPE_VARDICT);
        g_variant_builder_add(&builder, "{sv}", "k", value);
        value = g_variant_builder_end(&builder);
    }
    return Variant(value);
}

TEST(GroupWire, ADocumentComesBack) {
    for (const auto form : {GroupForm::kWritten, GroupForm::kRead}) {
        const auto sent = wire::write_dictionary(write_record(sample_group(), form));
        EXPECT_STREQ(g_variant_get_type_string(sent.get()), "a{sv}");
        const auto received = wire::read_dictionary(sent.get());
        ASSERT_TRUE(received);
        const auto group = read_record<GroupDocument>(*received, form);
        ASSERT_TRUE(group) << group.refusal().reason;
        EXPECT_EQ(*group, sample_group());
    }
}

TEST(GroupWire, NestedValuesAreWrappedOnce) {
    const GroupDictionary tree = {{"part", {GroupDictionary{{"flag", {true}}}}},
                                  {"list", {GroupDictionaries{{}}}},
                                  {"none", {GroupDictionaries()}}};
    EXPECT_EQ(wire::write_dictionary(tree).print(),
              "{'part': <{'flag': <true>}>, 'list': <[@a{sv} {}]>, 'none': <@aa{sv} []>}");
}

TEST(GroupWire, AnyNumberOfVariantsIsPeeled) {
    for (const auto *text : {"{'a': <{'b': <int64 1>}>}", "{'a': <<{'b': <<int64 1>>}>>}",
                             "{'a': <<<{'b': <<<<int64 1>>>>}>>>}"}) {
        const auto read = read_text(text);
        ASSERT_TRUE(read);
        EXPECT_EQ(wire::write_dictionary(*read).print(), "{'a': <{'b': <int64 1>}>}") << text;
    }
}

TEST(GroupWire, ValuesOfOtherTypesKeepTheirType) {
    for (const auto *value :
         {"1", "uint32 1", "1.5", "byte 0x01", "['a']", "[<1>]", "(1, 2)", "@a{ss} {}", "[int64 1]",
          "objectpath '/'", "@av []", "@mb nothing"}) {
        const auto read = read_text(fmt::format("{{'a': <{}>}}", value));
        ASSERT_TRUE(read);
        const auto *foreign = std::get_if<ForeignValue>(&(*read)[0].value.content);
        ASSERT_TRUE(foreign) << value;
        const auto parsed =
            Variant::adopt(g_variant_parse(nullptr, value, nullptr, nullptr, nullptr));
        EXPECT_EQ(foreign->type, g_variant_get_type_string(parsed.get()));
    }
}

TEST(GroupWire, DepthIsBounded) {
    EXPECT_TRUE(wire::read_dictionary(nested(16).get()));
    for (const int levels : {17, 30, 60})
        EXPECT_THAT(wire::read_dictionary(nested(levels).get()).refusal().reason,
                    HasSubstr("deeper than 16"));
}

TEST(GroupWire, SizeIsBounded) {
    constexpr std::size_t kMost = 1'000'000;
    const auto list_of = [](std::size_t count) {
        GVariant *const empty =
            g_variant_ref_sink(g_variant_new_array(G_VARIANT_TYPE("{sv}"), nullptr, 0));
        const std::vector<GVariant *> entries(count, empty);
        const Variant list(g_variant_new_array(G_VARIANT_TYPE_VARDICT, entries.data(), count));
        g_variant_unref(empty);
        return wire::read_dictionaries(list.get());
    };
    const auto most = list_of(kMost);
    ASSERT_TRUE(most);
    EXPECT_EQ((*most).size(), kMost);
    EXPECT_THAT(list_of(kMost + 1).refusal().reason, HasSubstr("more than 1000000 values"));
}

} // namespace
} // namespace sim::test
