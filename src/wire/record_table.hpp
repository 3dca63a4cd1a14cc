// SPDX-License-Identifier: Apache-2.0
// The tables of record trees: see record_tree.hpp.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <type_traits>
#include <utility>

namespace ims {

// The name of a value in either direction; none where the value does not travel that way.
struct Keys {
    const char *sent;
    std::string_view read;

    // NOLINTNEXTLINE(google-explicit-constructor): a row with one key states it as a literal.
    consteval Keys(const char *both) : sent{both}, read{both} {}
    consteval Keys(const char *when_sent, std::string_view when_read)
        : sent{when_sent}, read{when_read} {}
};
consteval Keys only_sent(const char *key) {
    return {key, std::string_view{}};
}
consteval Keys only_read(const char *key) {
    return {nullptr, key};
}

// Where a record has a field. A macro, because offsetof takes names.
template <typename Record, typename Member>
struct Place {
    std::size_t offset;
};
#define IMS_PLACE(record, member)                                                                  \
    ims::Place<record, decltype(record::member)> {                                                 \
        offsetof(record, member)                                                                   \
    }

// For a list whose elements are not records but bare texts or pointers: the element.
template <typename Element>
inline constexpr Place<Element, Element> kElement{0};

enum class RowKind : std::uint8_t {
    kFlag,       // "b", one byte
    kNumber,     // "x", an int32_t: widened when sent, cut to 32 bits when read
    kText,       // "s", left out when NULL; a copy when read
    kBytes,      // "s", base64 text that is read into bytes and their count
    kInlineText, // "s", a buffer in the record
    kPart,       // "a{sv}", a record in this one, or some of this one's own fields
    kPointer,    // "a{sv}", a pointer to a record; empty when NULL
    kSingle,     // "aa{sv}", a pointer to a record: a list of one, or empty when NULL
    kChain,      // "aa{sv}", a pointer to the first of records that are linked by `next`
    kArray,      // "aa{sv}", a pointer to records, and a count that travels beside the list
    kSizedArray, // "aa{sv}", the same with a count that does not travel: the list's own length
    kChoice,     // "a{sv}", a cell with a pointer to one of several records
};

struct TreeRow;
struct TreeChoice;

// What the three routines see of a table.
struct Tree {
    const TreeRow *rows = nullptr;
    std::size_t count = 0;
    std::size_t size = 0; // of the record
    std::size_t next = 0; // the offset of the link
};

struct TreeRow {
    Keys keys;
    RowKind kind;
    std::size_t offset;
    std::size_t extent = 0; // a buffer's size; the offset of a count or of a selector
    Tree tree{};
    const TreeChoice *choices = nullptr;
    std::size_t choice_count = 0;
    int layers = 1;       // of "v" around the value, the dictionary's own one included
    bool any_key = false; // reads whatever single key there is
};

// Which record a selector stands for.
struct TreeChoice {
    std::int32_t selector;
    Tree tree;
};

// A row that knows whose it is, so that a table cannot mix the fields of two records.
template <typename Record>
struct RowOf {
    TreeRow row;
};

inline constexpr std::size_t kMaxRows = 32;

template <typename Record, std::size_t Count>
class RecordTree {
    static_assert(Count <= kMaxRows);

    static constexpr std::size_t next_offset() {
        if constexpr (requires { Record::next; })
            return offsetof(Record, next);
        else
            return 0;
    }

    std::array<TreeRow, Count> rows_;

    template <std::size_t... Index>
    consteval RecordTree(const RowOf<Record> (&rows)[Count], std::index_sequence<Index...>)
        : rows_{rows[Index].row...} {}

  public:
    consteval explicit RecordTree(const RowOf<Record> (&rows)[Count])
        : RecordTree(rows, std::make_index_sequence<Count>{}) {
        for (std::size_t at = 0; at < Count; ++at) {
            for (std::size_t other = 0; other < at; ++other) {
                const std::string_view key = rows_[at].keys.read;
                if (!key.empty() && key == rows_[other].keys.read)
                    throw "a key stands in the table twice";
            }
        }
    }

    constexpr Tree view() const noexcept {
        // NOLINTNEXTLINE(bugprone-sizeof-expression): an element may be a bare pointer.
        return {rows_.data(), Count, sizeof(Record), next_offset()};
    }
};

template <typename Record, std::size_t Count>
consteval RecordTree<Record, Count> record_tree(const RowOf<Record> (&rows)[Count]) {
    return RecordTree<Record, Count>{rows};
}

// Not consteval: clang 14 takes no such call inside another consteval function.
template <typename Record, typename Member>
constexpr RowOf<Record> value(Keys keys, Place<Record, Member> place) {
    if constexpr (std::is_same_v<Member, bool>)
        return {{keys, RowKind::kFlag, place.offset}};
    else if constexpr (std::is_same_v<Member, std::int32_t>)
        return {{keys, RowKind::kNumber, place.offset}};
    else if constexpr (std::is_same_v<Member, char *> || std::is_same_v<Member, const char *>)
        return {{keys, RowKind::kText, place.offset}};
    else {
        static_assert(std::is_same_v<std::remove_extent_t<Member>, char>,
                      "no dictionary value has this type");
        return {{keys, RowKind::kInlineText, place.offset, std::extent_v<Member>}};
    }
}

// Bytes that come as base64 text; they are never sent.
template <typename Record>
consteval RowOf<Record> bytes(const char *key, Place<Record, const std::uint8_t *> place,
                              Place<Record, std::uint32_t> count) {
    return {{only_read(key), RowKind::kBytes, place.offset, count.offset}};
}

// A value that is alone in its dictionary and may be read under any key.
template <typename Record, typename Member>
consteval RowOf<Record> value_by_any_key(Keys keys, Place<Record, Member> place) {
    RowOf<Record> row = value(keys, place);
    row.row.any_key = true;
    return row;
}

template <typename Record, typename Member, std::size_t Count>
consteval RowOf<Record> part(Keys keys, Place<Record, Member> place,
                             const RecordTree<Member, Count> &tree, int layers = 1) {
    return {{keys, RowKind::kPart, place.offset, 0, tree.view(), nullptr, 0, layers}};
}

// Some of the record's own fields in a dictionary of their own.
template <typename Record, std::size_t Count>
consteval RowOf<Record> group(Keys keys, const RecordTree<Record, Count> &tree, int layers = 1) {
    return {{keys, RowKind::kPart, 0, 0, tree.view(), nullptr, 0, layers}};
}

template <typename Record, typename Target, std::size_t Count>
consteval RowOf<Record> pointer(Keys keys, Place<Record, Target *> place,
                                const RecordTree<Target, Count> &tree, int layers = 1) {
    return {{keys, RowKind::kPointer, place.offset, 0, tree.view(), nullptr, 0, layers}};
}

template <typename Record, typename Target, std::size_t Count>
consteval RowOf<Record> single(Keys keys, Place<Record, Target *> place,
                               const RecordTree<Target, Count> &tree) {
    return {{keys, RowKind::kSingle, place.offset, 0, tree.view()}};
}

template <typename Record, typename Link, std::size_t Count>
consteval RowOf<Record> chain(Keys keys, Place<Record, Link *> place,
                              const RecordTree<std::remove_const_t<Link>, Count> &tree) {
    static_assert(std::is_same_v<decltype(Link::next), Link *>);
    return {{keys, RowKind::kChain, place.offset, 0, tree.view()}};
}

// The count has a row of its own in the same table.
template <typename Record, typename Element, std::size_t Count>
consteval RowOf<Record> array(Keys keys, Place<Record, Element *> place,
                              Place<Record, std::int32_t> count,
                              const RecordTree<Element, Count> &tree) {
    return {{keys, RowKind::kArray, place.offset, count.offset, tree.view()}};
}

template <typename Record, typename Element, std::size_t Count>
consteval RowOf<Record> sized_array(Keys keys, Place<Record, Element *> place,
                                    Place<Record, std::int32_t> count,
                                    const RecordTree<Element, Count> &tree) {
    return {{keys, RowKind::kSizedArray, place.offset, count.offset, tree.view()}};
}

// The selector has a row of its own in the same table. Another value than those listed carries no
// record.
template <typename Record, std::size_t Count>
consteval RowOf<Record> choice(Keys keys, Place<Record, void **> place,
                               Place<Record, std::int32_t> selector,
                               const TreeChoice (&choices)[Count]) {
    return {{keys, RowKind::kChoice, place.offset, selector.offset, {}, choices, Count}};
}

} // namespace ims
