// SPDX-License-Identifier: Apache-2.0
// Each kind of row in both directions, and what does not fit. No bus: values in and out.
#include "src/wire/record_tree.hpp"
#include "tests/support/variant.hpp"

#include <gtest/gtest.h>

#include <cstring>

namespace test {
namespace {

struct Link {
    char *text;
    Link *next;
};

struct Leaf {
    std::int32_t number;
    char *text;
};

struct Root {
    char name[5];
    char *note;
    bool flag;
    std::int32_t number;
    Leaf embedded;
    Leaf *pointed;
    Leaf *only;
    Link *links;
    char **texts;
    std::int32_t text_count;
    Leaf *leaves;
    std::int32_t leaf_count;
    std::int32_t selector;
    void **chosen;
};

constexpr auto kLink = ims::record_tree({ims::value("text", IMS_PLACE(Link, text))});
constexpr auto kLeaf = ims::record_tree({
    ims::value("number", IMS_PLACE(Leaf, number)),
    ims::value("text", IMS_PLACE(Leaf, text)),
});
constexpr auto kText = ims::record_tree({
    ims::value_by_any_key("item", ims::kElement<char *>),
});
constexpr auto kTexts = ims::record_tree({
    ims::array({"sent_texts", "read_texts"}, IMS_PLACE(Root, texts), IMS_PLACE(Root, text_count),
               kText),
    ims::value("text_count", IMS_PLACE(Root, text_count)),
});
constexpr ims::TreeChoice kChoices[] = {{1, kLeaf.view()}, {2, kLink.view()}};
constexpr auto kRoot = ims::record_tree({
    ims::value("name", IMS_PLACE(Root, name)),
    ims::value("note", IMS_PLACE(Root, note)),
    ims::value("flag", IMS_PLACE(Root, flag)),
    ims::value(ims::only_sent("number"), IMS_PLACE(Root, flag)),
    ims::value(ims::only_read("number"), IMS_PLACE(Root, number)),
    ims::part("embedded", IMS_PLACE(Root, embedded), kLeaf, 2),
    ims::pointer("pointed", IMS_PLACE(Root, pointed), kLeaf),
    ims::single("only", IMS_PLACE(Root, only), kLeaf),
    ims::chain("links", IMS_PLACE(Root, links), kLink),
    ims::group({"group_out", "group_in"}, kTexts),
    ims::sized_array("leaves", IMS_PLACE(Root, leaves), IMS_PLACE(Root, leaf_count), kLeaf),
    ims::choice("chosen", IMS_PLACE(Root, chosen), IMS_PLACE(Root, selector), kChoices),
    ims::value("selector", IMS_PLACE(Root, selector)),
});

std::string written(const Root &root) {
    const ims::Variant dictionary = ims::write_record(kRoot, &root);
    return to_text(dictionary.get());
}

std::string expected(std::string_view text) {
    return to_text(parse("a{sv}", text).get());
}

constexpr const char *kEmpty =
    "{'name': <''>, 'flag': <false>, 'number': <false>, 'embedded': <<{'number': <int64 0>}>>, "
    "'pointed': <@a{sv} {}>, 'only': <@aa{sv} []>, 'links': <@aa{sv} []>, "
    "'group_out': <{'sent_texts': <@aa{sv} []>, 'text_count': <int64 0>}>, "
    "'leaves': <@aa{sv} []>, 'chosen': <@a{sv} {}>, 'selector': <int64 0>}";

TEST(RecordTree, WritesAZeroedRecordWithAllButItsTexts) {
    EXPECT_EQ(written(Root{}), expected(kEmpty));
}

TEST(RecordTree, WritesEachKindOfRow) {
    char a[] = "a";
    char b[] = "b";
    Link second{b, nullptr};
    Link first{nullptr, &second};
    Leaf leaf{-1, a};
    char *texts[] = {a, nullptr};
    void *cell = &leaf;
    Root root{"name", a, true, 7, leaf, &leaf, &leaf, &first, texts, 2, &leaf, 1, 1, &cell};
    EXPECT_EQ(
        written(root),
        expected("{'name': <'name'>, 'note': <'a'>, 'flag': <true>, 'number': <true>, "
                 "'embedded': <<{'number': <int64 -1>, 'text': <'a'>}>>, "
                 "'pointed': <{'number': <int64 -1>, 'text': <'a'>}>, "
                 "'only': <[{'number': <int64 -1>, 'text': <'a'>}]>, "
                 "'links': <[{}, {'text': <'b'>}]>, "
                 "'group_out': <{'sent_texts': <[{'item': <'a'>}, {}]>, 'text_count': <int64 2>}>, "
                 "'leaves': <[{'number': <int64 -1>, 'text': <'a'>}]>, "
                 "'chosen': <{'number': <int64 -1>, 'text': <'a'>}>, 'selector': <int64 1>}"));
}

// Rows that are only sent have no key to be read under, and the empty one is not theirs.
TEST(RecordTree, ReadsNothingUnderTheEmptyKey) {
    const ims::Variant dictionary = ims::owned(g_variant_new_parsed(
        "{'': <true>, 'flag': <false>, '': <int64 5>, '': <'text'>, '': <@aa{sv} []>}"));
    // Byte by byte, padding included.
    Root root;
    std::memset(static_cast<void *>(&root), 0, sizeof root);
    ims::read_record(dictionary.get(), kRoot, root);
    const std::string image{reinterpret_cast<const char *>(&root), sizeof root};
    EXPECT_EQ(image, std::string(sizeof root, '\0'));
    ims::release_fields(kRoot, root);
}

TEST(RecordTree, WritesNoMoreLinksThanAsked) {
    Link second{nullptr, nullptr};
    Link first{nullptr, &second};
    for (const auto &[limit, count] : {std::pair{-1, 0U}, {0, 0U}, {1, 1U}, {2, 2U}, {3, 2U}}) {
        const ims::Variant list = ims::write_chain(kLink, &first, limit);
        EXPECT_EQ(g_variant_n_children(list.get()), count) << limit;
    }
}

TEST(RecordTree, SendsACountThatLiesAsItIs) {
    Root root{};
    root.text_count = 3;
    EXPECT_NE(written(root).find("'sent_texts': <@aa{sv} []>, 'text_count': <int64 3>"),
              std::string::npos);
    char *texts[] = {nullptr};
    root.texts = texts;
    root.text_count = -1;
    EXPECT_NE(written(root).find("'sent_texts': <@aa{sv} []>, 'text_count': <int64 -1>"),
              std::string::npos);
}

TEST(RecordTree, TakesABufferWithoutAnEndToItsLastWholeCharacter) {
    Root root{};
    std::memcpy(root.name, "abcde", sizeof root.name);
    EXPECT_NE(written(root).find("'name': <'abcd'>"), std::string::npos);
    std::memcpy(root.name, "abc\xc3\xa9", sizeof root.name);
    EXPECT_NE(written(root).find("'name': <'abc'>"), std::string::npos);
}

TEST(RecordTree, WritesNothingForATextThatIsNotUtf8AtAnyDepth) {
    char bad[] = "caf\xe9";
    Leaf leaf{0, bad};
    Link link{bad, nullptr};
    char *texts[] = {bad};
    void *cell = &leaf;
    const auto is_refused = [](auto change) {
        Root root{};
        change(root);
        return ims::write_record(kRoot, &root) == nullptr;
    };
    EXPECT_TRUE(is_refused([&](Root &root) { root.note = bad; }));
    EXPECT_TRUE(is_refused([&](Root &root) { root.name[0] = '\xe9'; }));
    EXPECT_TRUE(is_refused([&](Root &root) { root.embedded = leaf; }));
    EXPECT_TRUE(is_refused([&](Root &root) { root.pointed = &leaf; }));
    EXPECT_TRUE(is_refused([&](Root &root) { root.only = &leaf; }));
    EXPECT_TRUE(is_refused([&](Root &root) { root.links = &link; }));
    EXPECT_TRUE(is_refused([&](Root &root) { root.texts = texts, root.text_count = 1; }));
    EXPECT_TRUE(is_refused([&](Root &root) { root.chosen = &cell, root.selector = 1; }));
    EXPECT_FALSE(is_refused([&](Root &root) { root.chosen = &cell, root.selector = 3; }));
}

// Every kind of row, the selector and the counts after what depends on them, in layers of variants.
constexpr const char *kFull =
    "{'chosen': <<<{'text': <'link'>}>>>, 'group_in': <{'read_texts': <[{'item': <'a'>}, "
    "{'whatever': <'b'>}]>, 'text_count': <<int64 2>>}>, 'leaves': <[{'number': <int64 1>}, {}]>, "
    "'links': <[{'text': <'1'>}, {'text': <'2'>}]>, 'only': <[{'number': <int64 9>}]>, "
    "'pointed': <{'text': <'p'>}>, 'embedded': <{'text': <'e'>}>, 'number': <int64 4294967298>, "
    "'flag': <true>, 'note': <'note'>, 'name': <'äöü'>, 'selector': <int64 2>, 'other': <1>}";

TEST(RecordTree, ReadsEachKindOfRowInAnyOrder) {
    const Variant dictionary = parse("a{sv}", kFull);
    const ims::Received<kRoot> received{dictionary.get()};
    const Root &root = received.record;
    EXPECT_STREQ(root.name, "äö"); // four bytes and the end
    EXPECT_STREQ(root.note, "note");
    EXPECT_TRUE(root.flag);
    EXPECT_EQ(root.number, 2); // cut to 32 bits
    EXPECT_STREQ(root.embedded.text, "e");
    EXPECT_STREQ(root.pointed->text, "p");
    EXPECT_EQ(root.only->number, 9);
    ASSERT_NE(root.links->next, nullptr);
    EXPECT_STREQ(root.links->text, "1");
    EXPECT_STREQ(root.links->next->text, "2");
    EXPECT_EQ(root.links->next->next, nullptr);
    ASSERT_EQ(root.text_count, 2);
    EXPECT_STREQ(root.texts[0], "a");
    EXPECT_STREQ(root.texts[1], "b");
    ASSERT_EQ(root.leaf_count, 2);
    EXPECT_EQ(root.leaves[0].number, 1);
    EXPECT_STREQ(static_cast<Link *>(*root.chosen)->text, "link");
}

TEST(RecordTree, DropsAnArrayWhoseCountLiesAndKeepsTheCount) {
    for (const auto &[count, stored] :
         {std::pair{"1", 1}, {"3", 3}, {"0", 0}, {"-2", -2}, {"4294967297", 1}}) {
        SCOPED_TRACE(count);
        const Variant dictionary =
            parse("a{sv}", std::string{"{'group_in': <{'text_count': <int64 "} + count +
                               ">, 'read_texts': <[{'item': <'a'>}, {'item': <'b'>}]>}>}");
        const ims::Received<kRoot> received{dictionary.get()};
        EXPECT_EQ(received.record.texts, nullptr);
        EXPECT_EQ(received.record.text_count, stored);
    }
}

TEST(RecordTree, TakesAValueOfAnotherTypeForAMissingOne) {
    for (const char *key : {"name", "note", "flag", "number", "embedded", "pointed", "only",
                            "links", "group_in", "leaves", "chosen", "selector"}) {
        for (const char *value : {"'text'", "int64 1", "1", "true", "@a{sv} {}", "@aa{sv} []",
                                  "@av []", "@as ['a']", "()", "<<uint64 7>>"}) {
            SCOPED_TRACE(std::string{key} + " " + value);
            const Variant dictionary =
                parse("a{sv}", std::string{"{'"} + key + "': <" + value + ">}");
            const ims::Received<kRoot> received{dictionary.get()}; // for its release
        }
    }
    const ims::Received<kRoot> of_numbers{
        parse("a{sv}", "{'number': <7>, 'note': <uint64 7>, 'links': <{'a': <1>}>}").get()};
    EXPECT_EQ(of_numbers.record.number, 0);
    EXPECT_EQ(of_numbers.record.note, nullptr);
    EXPECT_EQ(of_numbers.record.links, nullptr);
}

TEST(RecordTree, KeepsTheLaterFittingValueOfARepeatedKey) {
    const Variant dictionary =
        parse("a{sv}", "{'note': <'first'>, 'note': <'second'>, 'links': <[{'text': <'1'>}]>, "
                       "'links': <[{'text': <'2'>}]>, 'note': <3>, 'links': <'none'>}");
    const ims::Received<kRoot> received{dictionary.get()};
    EXPECT_STREQ(received.record.note, "second");
    EXPECT_STREQ(received.record.links->text, "2");
}

struct Blob {
    const std::uint8_t *bytes;
    std::uint32_t count;
    const Blob *next;
};
struct Blobs {
    const Blob *first;
};

constexpr auto kBlob = ims::record_tree({
    ims::bytes("bytes", IMS_PLACE(Blob, bytes), IMS_PLACE(Blob, count)),
});
constexpr auto kBlobs = ims::record_tree({ims::chain("blobs", IMS_PLACE(Blobs, first), kBlob)});

TEST(RecordTree, ReadsBase64TextAsBytesWithTheirCountAndNeverSendsIt) {
    const Variant dictionary =
        parse("a{sv}", "{'blobs': <[{'bytes': <'AP9h'>}, {'bytes': <''>}, {'bytes': <[0x61]>}]>}");
    const ims::Received<kBlobs> received{dictionary.get()};
    const Blob *blob = received.record.first;
    ASSERT_NE(blob, nullptr);
    ASSERT_EQ(blob->count, 3U);
    EXPECT_EQ(std::memcmp(blob->bytes,
                          "\0\xff"
                          "a",
                          3),
              0);
    EXPECT_EQ(to_text(ims::write_record(kBlob, blob).get()), expected("{}"));
    blob = blob->next;
    EXPECT_EQ(blob->count, 0U);
    blob = blob->next;
    EXPECT_EQ(blob->bytes, nullptr);
    EXPECT_EQ(blob->count, 0U);
    EXPECT_EQ(blob->next, nullptr);
}

TEST(RecordTree, ReadsNothingFromWhatIsNoDictionary) {
    const Variant number = parse("v", "<int64 1>");
    EXPECT_EQ(ims::read_new(number.get(), kLeaf), nullptr);
    EXPECT_EQ(ims::read_chain(number.get(), kLink), nullptr);
    const ims::Received<kLeaf> received{number.get()};
    EXPECT_EQ(received.record.number, 0);
    const Variant empty = parse("aa{sv}", "[]");
    EXPECT_EQ(ims::read_chain(empty.get(), kLink), nullptr);
}

TEST(RecordTree, CopiesTextsToTheEndOfAWholeCharacter) {
    for (const auto &[text, kept] : {std::pair{"", ""},
                                     {"abc", "abc"},
                                     {"abcd", "abc"},
                                     {"ab\xc3\xa9", "ab"},
                                     {"\xf0\x9f\x98\x80", ""},
                                     {"a\xe2\x82\xac", "a"}}) {
        char buffer[4];
        ims::copy_bounded(buffer, sizeof buffer, text);
        EXPECT_STREQ(buffer, kept);
    }
}

} // namespace
} // namespace test
