// SPDX-License-Identifier: Apache-2.0
// Record trees as dictionaries.
#include "field_at.hpp"
#include "record_tree.hpp"

#include <cstring>
#include <span>

namespace ims {
namespace {

const void *after(const void *record, std::size_t offset) noexcept {
    return static_cast<const std::byte *>(record) + offset;
}

// An array of values, or nothing when one of them was missing.
class List {
  public:
    explicit List(const GVariantType *type) noexcept { g_variant_builder_init(&builder_, type); }
    ~List() { g_variant_builder_clear(&builder_); }
    List(const List &) = delete;
    List &operator=(const List &) = delete;

    void add(const Variant &child) noexcept {
        if (child)
            g_variant_builder_add_value(&builder_, child.get());
        else
            is_complete_ = false;
    }
    Variant finish() noexcept {
        return is_complete_ ? owned(g_variant_builder_end(&builder_)) : nullptr;
    }

  private:
    GVariantBuilder builder_;
    bool is_complete_ = true;
};

Variant text_value(const char *text, std::size_t length) noexcept {
    if (!g_utf8_validate(text, static_cast<gssize>(length), nullptr))
        return nullptr;
    return owned(g_variant_new_take_string(g_strndup(text, length)));
}

Variant write_array(const Tree &tree, const void *elements, std::int32_t count) noexcept {
    List list{tree::list_type()};
    for (std::int32_t index = 0; elements != nullptr && index < count; ++index)
        list.add(tree::write_record(tree, after(elements, index * tree.size)));
    return list.finish();
}

Variant write_choice(const TreeRow &row, const void *record) noexcept {
    const Tree *tree = tree::chosen(row, record);
    void *const *cell = at<void **>(record, row.offset);
    return tree::write_record(tree != nullptr ? *tree : Tree{},
                              tree != nullptr && cell != nullptr ? *cell : nullptr);
}

// Nothing for a text that cannot cross the bus.
Variant value_of(const TreeRow &row, const void *record) noexcept {
    const void *place = after(record, row.offset);
    switch (row.kind) {
    case RowKind::kFlag:
        // A byte: C code may have left another value than 0 or 1.
        return owned(g_variant_new_boolean(at<std::uint8_t>(record, row.offset) != 0));
    case RowKind::kNumber:
        return owned(g_variant_new_int64(at<std::int32_t>(record, row.offset)));
    case RowKind::kText: {
        const char *text = at<const char *>(record, row.offset);
        return text_value(text, std::strlen(text));
    }
    case RowKind::kBytes:
        break;
    case RowKind::kInlineText: {
        const char *text = &at<char>(record, row.offset);
        return text_value(text, tree::whole_length(text, row.extent - 1));
    }
    case RowKind::kPart:
        return tree::write_record(row.tree, place);
    case RowKind::kPointer:
        return tree::write_record(row.tree, at<const void *>(record, row.offset));
    case RowKind::kSingle:
        return write_array(row.tree, at<const void *>(record, row.offset), 1);
    case RowKind::kChain:
        return tree::write_chain(row.tree, at<const void *>(record, row.offset), INT32_MAX);
    case RowKind::kArray:
    case RowKind::kSizedArray:
        return write_array(row.tree, at<const void *>(record, row.offset),
                           at<std::int32_t>(record, row.extent));
    case RowKind::kChoice:
        return write_choice(row, record);
    }
    return nullptr;
}

bool is_sent(const TreeRow &row, const void *record) noexcept {
    return row.keys.sent != nullptr &&
           (row.kind != RowKind::kText || at<const char *>(record, row.offset) != nullptr);
}

Variant entry_of(const TreeRow &row, const void *record) noexcept {
    Variant value = value_of(row, record);
    for (int layer = 0; value && layer < row.layers; ++layer)
        value = owned(g_variant_new_variant(value.get()));
    if (!value)
        return nullptr;
    return owned(g_variant_new_dict_entry(g_variant_new_string(row.keys.sent), value.get()));
}

} // namespace

namespace tree {

// The record that the row's selector stands for, or nothing.
const Tree *chosen(const TreeRow &row, const void *record) noexcept {
    const auto selector = at<std::int32_t>(record, row.extent);
    for (const TreeChoice &choice : std::span{row.choices, row.choice_count}) {
        if (choice.selector == selector)
            return &choice.tree;
    }
    return nullptr;
}

// The length of a text without a character that a limit would cut.
std::size_t whole_length(const char *text, std::size_t limit) noexcept {
    std::size_t length = strnlen(text, limit + 1);
    if (length <= limit)
        return length;
    length = limit;
    while (length > 0 && (static_cast<unsigned char>(text[length]) & 0xC0U) == 0x80U)
        --length;
    return length;
}

Variant write_record(const Tree &tree, const void *record) noexcept {
    List dictionary{G_VARIANT_TYPE_VARDICT};
    if (record != nullptr) {
        for (const TreeRow &row : std::span{tree.rows, tree.count}) {
            if (is_sent(row, record))
                dictionary.add(entry_of(row, record));
        }
    }
    return dictionary.finish();
}

Variant write_chain(const Tree &tree, const void *head, std::int32_t limit) noexcept {
    List list{list_type()};
    for (; head != nullptr && limit > 0; --limit) {
        list.add(write_record(tree, head));
        head = at<const void *>(head, tree.next);
    }
    return list.finish();
}

} // namespace tree
} // namespace ims
