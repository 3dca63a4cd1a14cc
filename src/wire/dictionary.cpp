// SPDX-License-Identifier: Apache-2.0
#include "dictionary.hpp"

#include "field_at.hpp"

#include <bitset>
#include <charconv>
#include <cstring>
#include <vector>

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

// How many bytes each offset takes in a container that ends with some of them.
gsize offset_width(gsize content, gsize offsets) noexcept {
    if (content + offsets <= UINT8_MAX)
        return 1;
    return content + 2 * offsets <= UINT16_MAX ? 2 : 4;
}

// An "a{sv}" as the bytes that GLib serialises one to, in a single block. As values of their own
// its entries would take a dozen allocations each, and as many releases.
class DictionaryBytes {
  public:
    explicit DictionaryBytes(gsize entries) noexcept;

    // False for an entry that would make the dictionary too large to cross the bus.
    bool add(std::string_view key, char type, const void *value, gsize size) noexcept;
    // Nothing when it has become too large all the same.
    Variant finish() noexcept;

  private:
    static constexpr gsize kAlignment = 8;
    // What an entry takes at most beside its key and its value: padding before it and before the
    // value, two zeros, a type, an offset.
    static constexpr gsize kMaxEntryOverhead = 2 * (kAlignment - 1) + 2 + 1 + 4;
    // So that the block seldom grows.
    static constexpr gsize kUsualEntrySize = 64;

    void append(const void *data, gsize size) noexcept {
        std::memcpy(block_->data + size_, data, size);
        size_ += size;
    }
    void pad() noexcept {
        for (; size_ % kAlignment != 0; ++size_)
            block_->data[size_] = 0;
    }
    void append_offset(gsize offset, gsize width) noexcept;
    // The array grows by powers of two by itself.
    void make_room(gsize size) noexcept {
        if (size_ + size > block_->len)
            g_byte_array_set_size(block_.get(), static_cast<guint>(size_ + size));
    }

    ByteArray block_{g_byte_array_new()};
    gsize size_ = 0;
    std::vector<gsize> ends_;
};

DictionaryBytes::DictionaryBytes(gsize entries) noexcept {
    g_byte_array_set_size(block_.get(), static_cast<guint>(entries * kUsualEntrySize));
    ends_.reserve(entries);
}

// Offsets are little-endian on every machine; numbers are the machine's own.
void DictionaryBytes::append_offset(gsize offset, gsize width) noexcept {
    for (; width > 0; --width, offset >>= 8)
        block_->data[size_++] = static_cast<guint8>(offset & UINT8_MAX);
}

bool DictionaryBytes::add(std::string_view key, char type, const void *value, gsize size) noexcept {
    if (size > kMaxTupleSize || size_ > kMaxTupleSize - size)
        return false;
    make_room(key.size() + size + kMaxEntryOverhead);
    pad();
    const gsize start = size_;
    append(key.data(), key.size());
    append("", 1);
    const gsize key_end = size_ - start;
    pad();
    append(value, size);
    append("", 1);
    append(&type, 1);
    append_offset(key_end, offset_width(size_ - start, 1));
    ends_.push_back(size_);
    return true;
}

Variant DictionaryBytes::finish() noexcept {
    const gsize width = offset_width(size_, ends_.size());
    make_room(ends_.size() * width);
    for (const gsize end : ends_)
        append_offset(end, width);
    if (size_ > kMaxTupleSize)
        return nullptr;
    g_byte_array_set_size(block_.get(), static_cast<guint>(size_));
    GBytes *bytes = g_byte_array_free_to_bytes(block_.release());
    Variant dictionary = owned(g_variant_new_from_bytes(G_VARIANT_TYPE_VARDICT, bytes, TRUE));
    g_bytes_unref(bytes);
    return dictionary;
}

bool write_number(DictionaryBytes &dictionary, std::string_view key, std::int32_t number,
                  WriteAs as) noexcept {
    if (as != WriteAs::kDecimalText)
        return dictionary.add(key, 'i', &number, sizeof number);
    std::array<char, 12> text{};
    std::to_chars(text.begin(), text.end(), number);
    return dictionary.add(key, 's', text.data(), std::strlen(text.data()) + 1);
}

bool write_text(DictionaryBytes &dictionary, std::string_view key, const char *text) noexcept {
    return text != nullptr && g_utf8_validate(text, -1, nullptr) &&
           dictionary.add(key, 's', text, std::strlen(text) + 1);
}

bool write_field(DictionaryBytes &dictionary, const FieldRow &row, WriteAs as,
                 const void *record) noexcept {
    switch (row.kind) {
    case FieldKind::kInt32:
        return write_number(dictionary, row.name(), at<std::int32_t>(record, row.offset), as);
    case FieldKind::kBoolean: {
        // A byte: C code may have left another value than 0 or 1.
        const guint8 flag = at<guint8>(record, row.offset) != 0 ? 1 : 0;
        return dictionary.add(row.name(), 'b', &flag, sizeof flag);
    }
    case FieldKind::kOwnText:
    case FieldKind::kLentText:
        return write_text(dictionary, row.name(), at<const char *>(record, row.offset));
    case FieldKind::kTextAndNumber:
        return write_number(dictionary, row.name(),
                            at<std::int32_t>(record, row.offset + kNumberOffset), as);
    }
    return false;
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

Variant write_dictionary(FieldsView fields, std::span<const WriteStep> plan,
                         const void *record) noexcept {
    DictionaryBytes dictionary{plan.size()};
    for (const WriteStep &step : plan) {
        if (!write_field(dictionary, fields.rows[step.row], step.as, record))
            return nullptr;
    }
    return dictionary.finish();
}

} // namespace ims
