// SPDX-License-Identifier: Apache-2.0
// The reader of group documents on what no honest service sends, and on very large ones.
#include "src/xdm_records.hpp"
#include "tests/library/xdm/answered.hpp"
#include "tests/library/xdm/child_counter.hpp"
#include "tests/library/xdm/mutations.hpp"
#include "tests/library/xdm/sample.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

struct ReleaseGroup {
    void operator()(ims_xdm_group_info_s *group) const { ims::release_new(ims::kGroupInfo, group); }
};
using Group = std::unique_ptr<ims_xdm_group_info_s, ReleaseGroup>;

Group read(GVariant *document) {
    return Group{ims::read_new(document, ims::kGroupInfo)};
}

// What was read, in a form that can be compared: as it would be sent.
struct Image {
    std::string bytes;
    friend bool operator==(const Image &, const Image &) = default;
    friend void PrintTo(const Image &image, std::ostream *out) {
        *out << image.bytes.size() << " bytes"; // the trace says which
    }
};

Image image_of(GVariant *document) {
    const Group group = read(document);
    const ims::Variant written = ims::write_record(ims::kGroupInfo, group.get());
    return {{static_cast<const char *>(g_variant_get_data(written.get())),
             g_variant_get_size(written.get())}};
}

class Reader : public ::testing::Test {
  protected:
    void for_each_entry(const std::function<void(std::size_t)> &check) {
        const std::size_t count = entries_in(document_.get());
        ASSERT_GT(count, 150U);
        for (std::size_t number = 0; number < count && !HasFailure(); ++number) {
            SCOPED_TRACE(number);
            check(number);
        }
    }
    Image image_with(std::size_t number, const Change &change) {
        return image_of(with_changed_entry(document_.get(), number, change).get());
    }
    // An entry with another value, which is given as GVariant text.
    static Change value(const char *text) {
        return [text](GVariantBuilder *dictionary, const char *key, GVariant *) {
            g_variant_builder_add(dictionary, "{s@v}", key, parse("v", text).get());
        };
    }

    Variant document_ = parse("a{sv}", kAnsweredGroup);
};

TEST_F(Reader, TakesAValueOfATypeThatNoKeyHasForAMissingOne) {
    const Change none = [](auto...) {};
    for_each_entry([&](std::size_t number) {
        const Image without = image_with(number, none);
        for (const char *other : {"<uint16 7>", "<(1, 2)>", "<@av []>", "<<<byte 1>>>"}) {
            SCOPED_TRACE(other);
            EXPECT_EQ(image_with(number, value(other)), without);
        }
    });
}

// What is read of these depends on the key; that it is released, and nothing else, is the
// sanitizers' business.
TEST_F(Reader, SurvivesEveryValueUnderEveryKey) {
    for_each_entry([&](std::size_t number) {
        for (const char *other : {"<'text'>", "<true>", "<int64 -1>", "<int64 9223372036854775807>",
                                  "<@a{sv} {}>", "<@aa{sv} []>", "<[@a{sv} {}, {}, {}]>"}) {
            SCOPED_TRACE(other);
            EXPECT_FALSE(image_with(number, value(other)).bytes.empty());
        }
    });
}

TEST_F(Reader, KeepsTheLaterOfTwoValuesAndTheFittingOne) {
    // A domain under another key than its own would not be alone any more.
    document_ = answered(parse("a{sv}", kSentGroup).get());
    const Image whole = image_of(document_.get());
    for_each_entry([&](std::size_t number) {
        const auto twice = [&](const char *first, const char *last) {
            return image_with(number,
                              [=](GVariantBuilder *dictionary, const char *key, GVariant *content) {
                                  if (first)
                                      value(first)(dictionary, key, content);
                                  g_variant_builder_add(dictionary, "{sv}", key, content);
                                  if (last)
                                      value(last)(dictionary, key, content);
                              });
        };
        for (const char *other : {"<'text'>", "<true>", "<int64 9>", "<@a{sv} {}>"}) {
            SCOPED_TRACE(other);
            EXPECT_EQ(twice(other, nullptr), whole);
        }
        EXPECT_EQ(twice(nullptr, "<uint16 1>"), whole);
    });
}

TEST_F(Reader, PeelsAnyNumberOfVariants) {
    const Image whole = image_of(document_.get());
    for_each_entry([&](std::size_t number) {
        for (const int layers : {1, 2, 8}) {
            EXPECT_EQ(image_with(number,
                                 [layers](GVariantBuilder *dictionary, const char *key,
                                          GVariant *content) {
                                     GVariant *wrapped = content;
                                     for (int layer = 0; layer < layers; ++layer)
                                         wrapped = g_variant_new_variant(wrapped);
                                     g_variant_builder_add(dictionary, "{sv}", key, wrapped);
                                 }),
                      whole);
        }
    });
}

// A value as it comes off the wire: bytes that GLib has not looked at, cut off anywhere.
TEST_F(Reader, SurvivesBytesThatAreCutOff) {
    const gsize size = g_variant_get_size(document_.get());
    const auto *bytes = static_cast<const char *>(g_variant_get_data(document_.get()));
    for (gsize length = 0; length < size; length += 5) {
        GBytes *part = g_bytes_new(bytes, length);
        const Variant cut = share(g_variant_new_from_bytes(G_VARIANT_TYPE_VARDICT, part, FALSE));
        g_bytes_unref(part);
        EXPECT_FALSE(image_of(cut.get()).bytes.empty());
    }
}

Variant document_of(int members) {
    GVariantBuilder list;
    g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
    for (int number = 0; number < members; ++number) {
        const std::string uri = "sip:" + std::to_string(number) + "@example.org";
        GVariantBuilder member;
        g_variant_builder_init(&member, G_VARIANT_TYPE_VARDICT);
        g_variant_builder_add(&member, "{sv}", "disp_name", g_variant_new_string("Member"));
        g_variant_builder_add(&member, "{sv}", "uri", g_variant_new_string(uri.c_str()));
        g_variant_builder_add(&member, "{sv}", "type", g_variant_new_int64(number));
        g_variant_builder_add(&list, "a{sv}", &member);
    }
    return share(g_variant_new_parsed(
        "{'group_member_list': <{'contacts': <{'num_of_contacts': <%x>, 'contacts_v': <%v>}>}>}",
        static_cast<gint64>(members), g_variant_builder_end(&list)));
}

std::size_t work_of_reading(int members) {
    const Variant document = document_of(members);
    const std::size_t before = children_taken();
    const Group group = read(document.get());
    const std::size_t work = children_taken() - before;
    EXPECT_EQ(group->group_member_list->num_of_contacts, members);
    EXPECT_NE(group->group_member_list->contacts, nullptr);
    if (group->group_member_list->contacts) {
        EXPECT_EQ(group->group_member_list->contacts[members - 1].type, members - 1);
    }
    return work;
}

TEST(ReaderOfLargeDocuments, DoesTheSameWorkForEachMember) {
    const std::size_t thousand = work_of_reading(1000);
    const std::size_t one_more = work_of_reading(1001) - thousand;
    EXPECT_GT(one_more, 0U);
    EXPECT_EQ(work_of_reading(10000), thousand + 9000 * one_more);
}

} // namespace
} // namespace test
