// SPDX-License-Identifier: Apache-2.0
// Record trees from dictionaries, and their release.
#include "field_at.hpp"
#include "record_tree.hpp"
#include "wire.hpp"

#include <algorithm>
#include <cstring>
#include <span>
#include <utility>

namespace ims {
namespace {

void *after(void *record, std::size_t offset) noexcept {
    return static_cast<std::byte *>(record) + offset;
}

const GVariantType *type_of(RowKind kind) noexcept {
    switch (kind) {
    case RowKind::kFlag:
        return G_VARIANT_TYPE_BOOLEAN;
    case RowKind::kNumber:
        return G_VARIANT_TYPE_INT64;
    case RowKind::kText:
    case RowKind::kBytes:
    case RowKind::kInlineText:
        return G_VARIANT_TYPE_STRING;
    case RowKind::kPart:
    case RowKind::kPointer:
    case RowKind::kChoice:
        return G_VARIANT_TYPE_VARDICT;
    case RowKind::kSingle:
    case RowKind::kChain:
    case RowKind::kArray:
    case RowKind::kSizedArray:
        break;
    }
    return tree::list_type();
}

// Zeroed memory; nothing when there is not enough, for the size is the service's.
void *new_elements(const Tree &tree, gsize count) noexcept {
    return g_try_malloc0_n(count, tree.size);
}

void *read_elements(GVariant *list, const Tree &tree) noexcept {
    const gsize count = g_variant_n_children(list);
    void *elements = count > 0 ? new_elements(tree, count) : nullptr;
    for (gsize index = 0; elements != nullptr && index < count; ++index) {
        const Variant child{g_variant_get_child_value(list, index)};
        tree::read_record(child.get(), tree, after(elements, index * tree.size));
    }
    return elements;
}

// The number of records that an array has: none without the array, whatever the count says.
std::int32_t element_count(const TreeRow &row, const void *record) noexcept {
    if (at<const void *>(record, row.offset) == nullptr)
        return 0;
    return std::max(at<std::int32_t>(record, row.extent), 0);
}

void read_choice(GVariant *value, const TreeRow &row, void *record) noexcept {
    const Tree *tree = tree::chosen(row, record);
    if (tree == nullptr)
        return;
    auto *cell = static_cast<void **>(g_malloc0(sizeof(void *)));
    *cell = tree::read_new(value, *tree);
    at<void **>(record, row.offset) = cell;
}

void read_scalar(GVariant *value, const TreeRow &row, void *record) noexcept {
    switch (row.kind) {
    case RowKind::kFlag:
        at<bool>(record, row.offset) = g_variant_get_boolean(value) != FALSE;
        break;
    case RowKind::kNumber:
        at<std::int32_t>(record, row.offset) =
            static_cast<std::int32_t>(g_variant_get_int64(value));
        break;
    case RowKind::kText:
        at<char *>(record, row.offset) = g_variant_dup_string(value, nullptr);
        break;
    case RowKind::kBytes: {
        Decoded decoded = base64_decode(g_variant_get_string(value, nullptr));
        at<const guchar *>(record, row.offset) = decoded.bytes.release();
        at<std::uint32_t>(record, row.extent) = static_cast<std::uint32_t>(decoded.count);
        break;
    }
    case RowKind::kInlineText:
        copy_bounded(&at<char>(record, row.offset), row.extent,
                     g_variant_get_string(value, nullptr));
        break;
    default:
        break;
    }
}

// What may depend on the numbers of the same dictionary.
void read_nested(GVariant *value, const TreeRow &row, void *record) noexcept {
    const auto store = [&row, record](void *target) { at<void *>(record, row.offset) = target; };
    switch (row.kind) {
    case RowKind::kPart:
        tree::read_record(value, row.tree, after(record, row.offset));
        break;
    case RowKind::kPointer:
        store(tree::read_new(value, row.tree));
        break;
    case RowKind::kSingle:
        if (g_variant_n_children(value) > 0)
            store(tree::read_new(Variant{g_variant_get_child_value(value, 0)}.get(), row.tree));
        break;
    case RowKind::kChain:
        store(tree::read_chain(value, row.tree));
        break;
    case RowKind::kArray: {
        const auto count = at<std::int32_t>(record, row.extent);
        if (count >= 1 && std::cmp_equal(count, g_variant_n_children(value)))
            store(read_elements(value, row.tree));
        break;
    }
    case RowKind::kSizedArray: {
        const gsize count = g_variant_n_children(value);
        if (std::in_range<std::int32_t>(count))
            store(read_elements(value, row.tree));
        if (at<void *>(record, row.offset) != nullptr)
            at<std::int32_t>(record, row.extent) = static_cast<std::int32_t>(count);
        break;
    }
    case RowKind::kChoice:
        read_choice(value, row, record);
        break;
    default:
        break;
    }
}

bool is_scalar(RowKind kind) noexcept {
    return kind <= RowKind::kInlineText;
}

// The number of the row that reads a key. A service that sends the keys in the table's order is
// met by the guess.
std::size_t row_of(const Tree &tree, std::string_view key, std::size_t guess) noexcept {
    // No row is read under this one: it marks those that are only sent.
    if (key.empty())
        return tree.count;
    if (guess < tree.count && tree.rows[guess].keys.read == key)
        return guess;
    std::size_t number = 0;
    while (number < tree.count && tree.rows[number].keys.read != key)
        ++number;
    return number;
}

} // namespace

void copy_bounded(char *buffer, std::size_t size, const char *text) noexcept {
    const std::size_t length = tree::whole_length(text, size - 1);
    std::memcpy(buffer, text, length);
    buffer[length] = '\0';
}

namespace tree {

// Walks backwards, so that of a repeated key the later value is met first and kept.
void read_record(GVariant *value, const Tree &tree, void *record) noexcept {
    const Variant dictionary = peeled(value);
    if (!g_variant_is_of_type(dictionary.get(), G_VARIANT_TYPE_VARDICT))
        return;
    std::array<Variant, kMaxRows> values;
    const gsize entries = g_variant_n_children(dictionary.get());
    std::size_t guess = tree.count - 1;
    for (gsize left = entries; left > 0; --left) {
        const Variant entry{g_variant_get_child_value(dictionary.get(), left - 1)};
        const Variant key{g_variant_get_child_value(entry.get(), 0)};
        std::size_t number = row_of(tree, g_variant_get_string(key.get(), nullptr), guess);
        if (number == tree.count && entries == 1 && tree.rows[0].any_key)
            number = 0;
        if (number == tree.count)
            continue;
        guess = number - 1;
        if (values[number])
            continue;
        Variant content = peeled(Variant{g_variant_get_child_value(entry.get(), 1)}.get());
        if (g_variant_is_of_type(content.get(), type_of(tree.rows[number].kind)))
            values[number] = std::move(content);
    }
    for (const bool nested : {false, true}) {
        for (std::size_t number = 0; number < tree.count; ++number) {
            const TreeRow &row = tree.rows[number];
            if (!values[number] || is_scalar(row.kind) == nested)
                continue;
            if (nested)
                read_nested(values[number].get(), row, record);
            else
                read_scalar(values[number].get(), row, record);
        }
    }
}

void *read_new(GVariant *value, const Tree &tree) noexcept {
    const Variant dictionary = peeled(value);
    if (!g_variant_is_of_type(dictionary.get(), G_VARIANT_TYPE_VARDICT))
        return nullptr;
    void *record = g_malloc0(tree.size);
    read_record(dictionary.get(), tree, record);
    return record;
}

void *read_chain(GVariant *value, const Tree &tree) noexcept {
    const Variant list = peeled(value);
    if (!g_variant_is_of_type(list.get(), list_type()))
        return nullptr;
    void *head = nullptr;
    void **link = &head;
    const gsize count = g_variant_n_children(list.get());
    for (gsize index = 0; index < count; ++index) {
        *link = read_new(Variant{g_variant_get_child_value(list.get(), index)}.get(), tree);
        link = &at<void *>(*link, tree.next);
    }
    return head;
}

void release_fields(const Tree &tree, void *record) noexcept {
    for (const TreeRow &row : std::span{tree.rows, tree.count}) {
        if (row.keys.read.empty())
            continue;
        switch (row.kind) {
        case RowKind::kFlag:
        case RowKind::kNumber:
        case RowKind::kInlineText:
            break;
        case RowKind::kText:
        case RowKind::kBytes:
            g_free(at<void *>(record, row.offset));
            break;
        case RowKind::kPart:
            release_fields(row.tree, after(record, row.offset));
            break;
        case RowKind::kPointer:
        case RowKind::kSingle:
            release_new(row.tree, at<void *>(record, row.offset));
            break;
        case RowKind::kChain:
            release_chain(row.tree, at<void *>(record, row.offset));
            break;
        case RowKind::kArray:
        case RowKind::kSizedArray: {
            void *elements = at<void *>(record, row.offset);
            for (std::int32_t index = 0; index < element_count(row, record); ++index)
                release_fields(row.tree, after(elements, index * row.tree.size));
            g_free(elements);
            break;
        }
        case RowKind::kChoice:
            if (void **cell = at<void **>(record, row.offset)) {
                if (const Tree *tree_of_choice = chosen(row, record))
                    release_new(*tree_of_choice, *cell);
                g_free(cell);
            }
            break;
        }
    }
}

void release_new(const Tree &tree, void *record) noexcept {
    if (record == nullptr)
        return;
    release_fields(tree, record);
    g_free(record);
}

void release_chain(const Tree &tree, void *head) noexcept {
    while (head != nullptr) {
        void *next = at<void *>(head, tree.next);
        release_new(tree, head);
        head = next;
    }
}

} // namespace tree
} // namespace ims
