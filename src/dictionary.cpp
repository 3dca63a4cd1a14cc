// SPDX-License-Identifier: Apache-2.0
#include "dictionary.hpp"

#include "field_at.hpp"

#include <bitset>
#include <charconv>
#include <cstring>

namespace ims {
namespace {

std::int32_t number_in(std::string_view text) noexcept {
    std::int32_t number = 0;
    const auto [end, failure] = std::from_chars(text.data(), text.data() + text.size(), number);
    return failure == std::errc{} && end == text.data() + text.size() ? number : 0;
}

bool read_field(GVariant *value, const FieldRow &row, void *record) noexcept {
    // The values that are read have basic types, each a class of its own.
    const GVariantClass type = g_variant_classify(value);
    const bool is_text = type == G_VARIANT_CLASS_STRING;
    switch (row.kind) {
    case FieldKind::kInt32:
        if (type != G_VARIANT_CLASS_INT32)
            return false;
        at<std::int32_t>(record, row.offset) = g_variant_get_int32(value);
        return true;
    case FieldKind::kBoolean:
        if (type != G_VARIANT_CLASS_BOOLEAN)
            return false;
        at<bool>(record, row.offset) = g_variant_get_boolean(value) != FALSE;
        return true;
    case FieldKind::kOwnText:
        if (is_text)
            at<char *>(record, row.offset) = g_variant_dup_string(value, nullptr);
        return is_text;
    case FieldKind::kLentText:
        if (is_text)
            at<const char *>(record, row.offset) = g_variant_get_string(value, nullptr);
        return is_text;
    case FieldKind::kTextAndNumber:
        // Another type empties the field: the key was there, and brought no text.
        at<char *>(record, row.offset) = is_text ? g_variant_dup_string(value, nullptr) : nullptr;
        at<std::int32_t>(record, row.offset + kNumberOffset) =
            is_text ? number_in(g_variant_get_string(value, nullptr)) : 0;
        return true;
    }
    return false;
}

// The values of a record as they are written, and what they take up together.
class FieldWriter {
  public:
    explicit FieldWriter(const void *record) noexcept : record_{record} {}

    // A floating value, or NULL for a text that cannot cross the bus.
    GVariant *write(const FieldRow &row, WriteAs as) noexcept;
    gsize size() const noexcept { return size_; }

  private:
    // What an entry takes up beside its key and its text: the number in a text's place, types,
    // padding, ends.
    static constexpr gsize kEntryOverhead = 48;

    GVariant *write_number(std::int32_t number, WriteAs as) const noexcept;
    GVariant *write_text(const char *text) noexcept;

    const void *record_;
    gsize size_ = 0;
};

GVariant *FieldWriter::write_number(std::int32_t number, WriteAs as) const noexcept {
    if (as == WriteAs::kDecimalText)
        return g_variant_new_take_string(g_strdup_printf("%d", number));
    return g_variant_new_int32(number);
}

GVariant *FieldWriter::write_text(const char *text) noexcept {
    if (text == nullptr)
        return nullptr;
    const gsize length = std::strlen(text);
    size_ += length;
    return g_utf8_validate_len(text, length, nullptr) ? g_variant_new_string(text) : nullptr;
}

GVariant *FieldWriter::write(const FieldRow &row, WriteAs as) noexcept {
    size_ += row.key_length + kEntryOverhead;
    switch (row.kind) {
    case FieldKind::kInt32:
        return write_number(at<std::int32_t>(record_, row.offset), as);
    case FieldKind::kBoolean:
        return g_variant_new_boolean(at<bool>(record_, row.offset));
    case FieldKind::kOwnText:
    case FieldKind::kLentText:
        return write_text(at<const char *>(record_, row.offset));
    case FieldKind::kTextAndNumber:
        return write_number(at<std::int32_t>(record_, row.offset + kNumberOffset), as);
    }
    return nullptr;
}

// The row of a key. A service that sends the keys in the table's order is met by the guess.
const FieldRow *find_row(FieldsView fields, std::string_view key, std::size_t guess) noexcept {
    if (guess < fields.rows.size() && fields.rows[guess].name() == key)
        return &fields.rows[guess];
    const auto found = std::lower_bound(fields.by_key.begin(), fields.by_key.end(), key,
                                        [&](std::uint16_t row, std::string_view wanted) {
                                            return fields.rows[row].name() < wanted;
                                        });
    if (found == fields.by_key.end() || fields.rows[*found].name() != key)
        return nullptr;
    return &fields.rows[*found];
}

} // namespace

// Walks backwards: the later value of a repeated key is met first, so that no copy of a text is
// made only to be overwritten.
void read_dictionary(GVariant *dictionary, FieldsView fields, void *record) noexcept {
    std::bitset<kMaxFields> filled;
    std::size_t guess = fields.rows.size() - 1;
    for (gsize left = g_variant_n_children(dictionary); left > 0; --left) {
        const Variant entry{g_variant_get_child_value(dictionary, left - 1)};
        const Variant key{g_variant_get_child_value(entry.get(), 0)};
        gsize length = 0;
        const char *name = g_variant_get_string(key.get(), &length);
        const FieldRow *row = find_row(fields, {name, length}, guess);
        if (row == nullptr)
            continue;
        const auto number = static_cast<std::size_t>(row - fields.rows.data());
        guess = number - 1;
        if (filled[number])
            continue;
        const Variant boxed_value{g_variant_get_child_value(entry.get(), 1)};
        const Variant value{g_variant_get_child_value(boxed_value.get(), 0)};
        filled[number] = read_field(value.get(), *row, record);
    }
}

void clear_record(FieldsView fields, void *record, std::size_t size) noexcept {
    for (const FieldRow &row : fields.rows) {
        if (row.kind == FieldKind::kOwnText || row.kind == FieldKind::kTextAndNumber)
            g_free(at<char *>(record, row.offset));
    }
    std::memset(record, 0, size);
}

DictionaryKeys::DictionaryKeys(FieldsView fields) noexcept {
    keys_.reserve(fields.rows.size());
    for (const FieldRow &row : fields.rows)
        keys_.push_back(owned(g_variant_new_string(row.key.data())));
}

Sized write_dictionary(FieldsView fields, const DictionaryKeys &keys,
                       std::span<const WriteStep> plan, const void *record) noexcept {
    FieldWriter writer{record};
    std::vector<GVariant *> entries;
    entries.reserve(plan.size());
    for (const WriteStep &step : plan) {
        GVariant *value = writer.write(fields.rows[step.row], step.as);
        if (value == nullptr) {
            for (GVariant *entry : entries)
                g_variant_unref(entry);
            return {};
        }
        entries.push_back(g_variant_new_dict_entry(keys[step.row], g_variant_new_variant(value)));
    }
    return {owned(g_variant_new_array(G_VARIANT_TYPE("{sv}"), entries.data(), entries.size())),
            writer.size()};
}

std::uint32_t checked_count(const char *subject, std::uint32_t count, GVariant *list,
                            std::uint32_t capacity, Site site) noexcept {
    const bool is_true = count != 0 && count == g_variant_n_children(list);
    if (!is_true || count > capacity)
        log_warning(site, "%s list count is NOT valid - Count: [%d]", subject, count);
    return is_true ? std::min(count, capacity) : 0;
}

} // namespace ims
