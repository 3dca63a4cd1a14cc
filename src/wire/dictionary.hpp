// SPDX-License-Identifier: Apache-2.0
// Field tables: which key of an "a{sv}" dictionary stands for which field of a record. One reader
// and one writer run over all of them.
//
//     constexpr auto kCallFields = field_table({IMS_FIELD(ims_call_info_s, session_id), ...});
//     read_dictionary(dictionary, kCallFields, &call);
//
// A finished table holds no pointers: it needs no relocation and no work when the library is
// loaded.
#pragma once

#include "wire.hpp"

#include <algorithm>
#include <array>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>

namespace ims {

// A value that the service sends as text and takes as a number: {char *text; int32_t value;}.
template <typename Record>
concept TextAndNumber = requires(Record record) {
    { record.text } -> std::same_as<char *&>;
    { record.value } -> std::same_as<std::int32_t &>;
}
&&offsetof(Record, text) == 0 && offsetof(Record, value) == sizeof(char *);
inline constexpr std::size_t kNumberOffset = sizeof(char *);

enum class FieldKind : std::uint8_t {
    kInt32,         // "i"
    kBoolean,       // "b", one byte
    kOwnText,       // "s", a copy that the record's owner frees
    kLentText,      // "s", borrowed from the dictionary
    kTextAndNumber, // read as "s" into both halves, written as "i" from the number
};

template <typename Member>
consteval FieldKind field_kind() {
    if constexpr (std::is_same_v<Member, std::int32_t>)
        return FieldKind::kInt32;
    else if constexpr (std::is_same_v<Member, bool>)
        return FieldKind::kBoolean;
    else if constexpr (std::is_same_v<Member, char *>)
        return FieldKind::kOwnText;
    else if constexpr (std::is_same_v<Member, const char *>)
        return FieldKind::kLentText;
    else {
        static_assert(TextAndNumber<Member>, "no dictionary value has this type");
        return FieldKind::kTextAndNumber;
    }
}

// A row as the modules state it.
struct Field {
    std::string_view key;
    FieldKind kind;
    std::size_t offset;
    std::size_t size;
    std::size_t alignment;
};

template <typename Member>
consteval Field field(std::string_view key, std::size_t offset) {
    return {key, field_kind<Member>(), offset, sizeof(Member), alignof(Member)};
}

// A field whose key is its own name. A macro, because offsetof takes names.
#define IMS_FIELD(record, member)                                                                  \
    ims::field<decltype(record::member)>(#member, offsetof(record, member))

inline constexpr std::size_t kMaxKeyLength = 39;
inline constexpr std::size_t kMaxFields = 512;

struct FieldRow {
    std::array<char, kMaxKeyLength + 1> key;
    std::uint8_t key_length;
    FieldKind kind;
    std::uint16_t offset;

    constexpr std::string_view name() const noexcept { return {key.data(), key_length}; }
};

// What the reader and the writer see of a table: its rows, and their numbers in the order of keys.
struct FieldsView {
    std::span<const FieldRow> rows;
    std::span<const std::uint16_t> by_key;
};

template <std::size_t Count>
struct FieldTable {
    static_assert(Count <= kMaxFields);

    constexpr operator FieldsView() const noexcept { return {rows, by_key}; }
    constexpr const FieldRow &operator[](std::size_t at) const noexcept { return rows[at]; }
    static constexpr std::size_t size() noexcept { return Count; }

    std::array<FieldRow, Count> rows{};
    std::array<std::uint16_t, Count> by_key{};
};

// A function, not a constructor: gcc 12 puts what a consteval constructor made into writable
// memory.
template <std::size_t Count>
consteval FieldTable<Count> field_table(const Field (&fields)[Count]) {
    FieldTable<Count> table;
    for (std::size_t at = 0; at < Count; ++at) {
        const Field &field = fields[at];
        if (field.key.size() > kMaxKeyLength || field.offset > UINT16_MAX)
            throw "the key is too long or the record too large";
        FieldRow &row = table.rows[at];
        std::copy(field.key.begin(), field.key.end(), row.key.begin());
        row.key_length = static_cast<std::uint8_t>(field.key.size());
        row.kind = field.kind;
        row.offset = static_cast<std::uint16_t>(field.offset);
        table.by_key[at] = static_cast<std::uint16_t>(at);
    }
    const auto key_of = [&table](std::uint16_t row) { return table.rows[row].name(); };
    std::sort(table.by_key.begin(), table.by_key.end(),
              [&](std::uint16_t a, std::uint16_t b) { return key_of(a) < key_of(b); });
    for (std::size_t at = 1; at < Count; ++at) {
        if (key_of(table.by_key[at - 1]) == key_of(table.by_key[at]))
            throw "a key stands in the table twice";
    }
    return table;
}

// Whether the rows are all fields of the record, in the order of their declaration.
template <typename Record>
consteval bool is_whole_record(std::span<const Field> fields) {
    std::size_t end = 0;
    for (const Field &field : fields) {
        if (field.offset != (end + field.alignment - 1) / field.alignment * field.alignment)
            return false;
        end = field.offset + field.size;
    }
    return (end + alignof(Record) - 1) / alignof(Record) * alignof(Record) == sizeof(Record);
}

// Stores the values of the known keys in a record. A key that is missing or whose value has another
// type leaves its field as it was; of a key that comes twice the later value stays.
void read_dictionary(GVariant *dictionary, FieldsView fields, void *record) noexcept;

// Fills the records from the first dictionaries of a list.
template <typename Record>
void read_list(GVariant *list, FieldsView fields, std::span<Record> records) noexcept {
    for (std::size_t at = 0; at < records.size(); ++at) {
        const Variant dictionary{g_variant_get_child_value(list, at)};
        read_dictionary(dictionary.get(), fields, &records[at]);
    }
}

// Frees the texts that a record owns and zeroes it.
void clear_record(FieldsView fields, void *record, std::size_t size) noexcept;

// How a row is written.
enum class WriteAs : std::uint8_t {
    kItself,
    kOtherField,  // the key and the value of another row
    kDecimalText, // a number as "s"
};

// An exception from writing each row as itself, for a record that is updated and for one that is
// added.
struct WriteRule {
    std::string_view key;
    WriteAs update;
    WriteAs add;
    std::string_view other;
};

struct WriteStep {
    std::uint16_t row;
    WriteAs as;
};

// What is written, in order: a step a row, after the rules of one of the two directions.
template <std::size_t Count>
consteval std::array<WriteStep, Count> write_plan(const FieldTable<Count> &fields,
                                                  std::span<const WriteRule> rules,
                                                  WriteAs WriteRule::*direction) {
    const auto row_of = [&fields](std::string_view key) {
        for (std::size_t row = 0; row < Count; ++row) {
            if (fields[row].name() == key)
                return row;
        }
        throw "no such key";
    };
    std::array<WriteStep, Count> plan{};
    for (std::size_t row = 0; row < Count; ++row)
        plan[row] = {static_cast<std::uint16_t>(row), WriteAs::kItself};
    for (const WriteRule &rule : rules) {
        WriteStep &step = plan[row_of(rule.key)];
        step.as = rule.*direction;
        if (step.as == WriteAs::kOtherField)
            step.row = static_cast<std::uint16_t>(row_of(rule.other));
    }
    return plan;
}

// Writes a record as "a{sv}"; nothing when one of its texts is NULL or not valid UTF-8, or when it
// is too large to cross the bus.
Variant write_dictionary(FieldsView fields, std::span<const WriteStep> plan,
                         const void *record) noexcept;

} // namespace ims
