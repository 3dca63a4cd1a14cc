// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/fields.hpp"

#include <optional>
#include <utility>

namespace sim {

// Makes the dictionary of a record, its keys in wire order.
class GroupWriter {
  public:
    static constexpr bool kReads = false;

    explicit GroupWriter(GroupForm form) : form_(form) {}

    GroupForm form() const { return form_; }
    GroupDictionary take() { return std::move(dictionary_); }

    void text(GroupKey key, const std::string &text) { add(key, text); }
    void text(GroupKey key, const OptionalText &text) {
        if (text)
            add(key, *text);
    }
    void number(GroupKey key, std::int32_t number) { add(key, std::int64_t{number}); }
    void flag(GroupKey key, bool flag) { add(key, flag); }
    void member_type(GroupKey key, std::int32_t type) {
        if (form_ == GroupForm::kRead)
            number(key, type);
        else
            flag(key, type != 0);
    }
    void texts(GroupKey list, GroupKey element, const std::vector<std::string> &texts) {
        GroupDictionaries dictionaries;
        for (const auto &text : texts)
            dictionaries.push_back({{std::string(element.in(form_)), {text}}});
        add(list, std::move(dictionaries));
    }
    template <typename T>
    void count(GroupKey key, const std::vector<T> &list) {
        add(key, static_cast<std::int64_t>(list.size()));
    }

    template <typename Describe>
    void part(GroupKey key, Describe describe_part) {
        GroupWriter writer(form_);
        describe_part(writer);
        add(key, writer.take());
    }
    template <typename Record>
    void record(GroupKey key, const Record &record) {
        add(key, dictionary_of(record));
    }
    template <typename Record>
    void record(GroupKey key, const std::optional<Record> &record) {
        if (record)
            add(key, dictionary_of(*record));
        else
            add_unset(key);
    }
    template <typename Record>
    void list(GroupKey key, const std::vector<Record> &records) {
        GroupDictionaries dictionaries;
        for (const auto &record : records)
            dictionaries.push_back(dictionary_of(record));
        add(key, std::move(dictionaries));
    }
    template <typename Record>
    void at_most_one(GroupKey key, const std::optional<Record> &record) {
        add(key, record ? GroupDictionaries{dictionary_of(*record)} : GroupDictionaries());
    }
    void identity(GroupKey key, std::int32_t, const RuleIdentity &identity) {
        std::visit([&](const auto &content) { add_identity(key, content); }, identity);
    }

  private:
    // Clients take an empty dictionary for a part that is set, yet send one for a part that is not.
    void add_unset(GroupKey part) {
        if (form_ == GroupForm::kWritten)
            add(part, GroupDictionary());
    }
    void add_identity(GroupKey key, std::monostate) { add_unset(key); }
    template <typename Content>
    void add_identity(GroupKey key, const Content &content) {
        add(key, dictionary_of(content));
    }
    template <typename Record>
    GroupDictionary dictionary_of(const Record &record) const {
        GroupWriter writer(form_);
        describe(writer, record);
        return writer.take();
    }
    template <typename Content>
    void add(GroupKey key, Content &&content) {
        dictionary_.push_back({std::string(key.in(form_)), {std::forward<Content>(content)}});
    }

    GroupForm form_;
    GroupDictionary dictionary_;
};

template <typename Record>
GroupDictionary write_record(const Record &record, GroupForm form) {
    GroupWriter writer(form);
    describe(writer, record);
    return writer.take();
}

} // namespace sim
