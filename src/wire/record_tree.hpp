// SPDX-License-Identifier: Apache-2.0
// Record trees: records that hold records, as nested "a{sv}" dictionaries in both directions. A
// table beside each record lists its keys in the order in which they are sent, with the key that is
// read where it is another one:
//
//     inline constexpr auto kStatus = record_tree({
//         value("assign", IMS_PLACE(ims_xdm_member_status_s, assign)),
//         value("rank", IMS_PLACE(ims_xdm_member_status_s, rank)),
//     });
//     inline constexpr auto kMember = record_tree({
//         value("uri", IMS_PLACE(ims_xdm_member_entry_s, uri)),
//         part("status_v", IMS_PLACE(ims_xdm_member_entry_s, status), kStatus),
//     });
//
//     pack<"(@a{sv})">(write_record(kMember, member));
//     const Received<kMember> member{dictionary.get()};
//
// One writer, one reader and one releaser run over all tables, so what is read is what is released.
// A table names only tables that stand before it: nothing nests deeper than the tables do.
#pragma once

#include "glib.hpp"
#include "record_table.hpp"

#include <limits>

namespace ims {

namespace tree {

inline const GVariantType *list_type() noexcept {
    return G_VARIANT_TYPE("aa{sv}");
}

// The record that the row's selector stands for, or NULL.
const Tree *chosen(const TreeRow &row, const void *record) noexcept;

// The length of a text, at most so many bytes, without a character that the limit would cut.
std::size_t whole_length(const char *text, std::size_t limit) noexcept;

Variant write_record(const Tree &tree, const void *record) noexcept;
Variant write_chain(const Tree &tree, const void *head, std::int32_t limit) noexcept;
void read_record(GVariant *value, const Tree &tree, void *record) noexcept;
void *read_new(GVariant *value, const Tree &tree) noexcept;
void *read_chain(GVariant *value, const Tree &tree) noexcept;
void release_fields(const Tree &tree, void *record) noexcept;
void release_new(const Tree &tree, void *record) noexcept;
void release_chain(const Tree &tree, void *head) noexcept;

} // namespace tree

// As "a{sv}"; empty when NULL. Nothing when one of the texts in the tree is not valid UTF-8.
template <typename Record, std::size_t Count>
Variant write_record(const RecordTree<Record, Count> &tree,
                     const std::type_identity_t<Record> *record) noexcept {
    return tree::write_record(tree.view(), record);
}

// As "aa{sv}": all links, or the first ones.
template <typename Link, std::size_t Count>
Variant write_chain(const RecordTree<Link, Count> &tree, const std::type_identity_t<Link> *head,
                    std::int32_t limit = std::numeric_limits<std::int32_t>::max()) noexcept {
    return tree::write_chain(tree.view(), head, limit);
}

// The readers peel any number of variants off a value. Keys may come in any order; a value of
// another type counts as missing; of a key that comes twice the later fitting value stays.

// Fills a zeroed record. release_fields() takes back what it then owns.
template <typename Record, std::size_t Count>
void read_record(GVariant *value, const RecordTree<Record, Count> &tree,
                 std::type_identity_t<Record> &zeroed) noexcept {
    tree::read_record(value, tree.view(), &zeroed);
}

template <typename Record, std::size_t Count>
void release_fields(const RecordTree<Record, Count> &tree,
                    std::type_identity_t<Record> &record) noexcept {
    tree::release_fields(tree.view(), &record);
}

// A new record from a dictionary, or NULL when there is none. release_new() takes it back.
template <typename Record, std::size_t Count>
Record *read_new(GVariant *value, const RecordTree<Record, Count> &tree) noexcept {
    return static_cast<Record *>(tree::read_new(value, tree.view()));
}

template <typename Record, std::size_t Count>
void release_new(const RecordTree<Record, Count> &tree,
                 std::type_identity_t<Record> *record) noexcept {
    tree::release_new(tree.view(), record);
}

// New records from a list of dictionaries, in the list's order. release_chain() takes them back.
template <typename Link, std::size_t Count>
Link *read_chain(GVariant *value, const RecordTree<Link, Count> &tree) noexcept {
    return static_cast<Link *>(tree::read_chain(value, tree.view()));
}

template <typename Link, std::size_t Count>
void release_chain(const RecordTree<Link, Count> &tree, std::type_identity_t<Link> *head) noexcept {
    tree::release_chain(tree.view(), head);
}

namespace tree {

template <typename Record, std::size_t Count>
Record record_of(const RecordTree<Record, Count> &);

template <const auto &Table>
using RecordOf = decltype(record_of(Table));

} // namespace tree

// A record that was read, for as long as the scope lasts.
template <const auto &Table>
struct Received {
    explicit Received(GVariant *value) noexcept { read_record(value, Table, record); }
    ~Received() { release_fields(Table, record); }
    Received(const Received &) = delete;
    Received &operator=(const Received &) = delete;

    tree::RecordOf<Table> record{};
};

// A chain that was read, for as long as the scope lasts.
template <const auto &Table>
struct ReceivedChain {
    explicit ReceivedChain(GVariant *value) noexcept : head{read_chain(value, Table)} {}
    ~ReceivedChain() { release_chain(Table, head); }
    ReceivedChain(const ReceivedChain &) = delete;
    ReceivedChain &operator=(const ReceivedChain &) = delete;

    tree::RecordOf<Table> *head;
};

// Copies as much of a text as a buffer holds, to the end of a whole character, and ends it.
void copy_bounded(char *buffer, std::size_t size, const char *text) noexcept;

} // namespace ims
