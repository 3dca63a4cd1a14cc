// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"
#include "sim/group/fields.hpp"

#include <functional>
#include <optional>
#include <utility>

namespace sim {

// Fills a record from one dictionary. The first thing that is wrong is kept with its place, and
// nothing after it matters. A key may be left out of a document that is being written, where it
// then has its empty value; what is read leaves out nothing but texts and parts that are not set.
class GroupReader {
  public:
    static constexpr bool kReads = true;

    GroupForm form() const { return form_; }

    void text(GroupKey key, std::string &text);
    void text(GroupKey key, OptionalText &text);
    void number(GroupKey key, std::int32_t &number);
    void flag(GroupKey key, bool &flag);
    // Written as a flag, read as a number.
    void member_type(GroupKey key, std::int32_t &type);

    // A list of dictionaries with one text each.
    void texts(GroupKey list, GroupKey element, std::vector<std::string> &texts);
    // How long a list must be that is read before or after.
    template <typename T>
    void count(GroupKey key, const std::vector<T> &list) {
        std::int32_t expected = 0;
        number(key, expected);
        counts_.push_back({key.in(form_), expected, [&list] { return list.size(); }});
    }

    template <typename Describe>
    void part(GroupKey key, Describe describe_part) {
        if (const auto *dictionary = take<GroupDictionary>(key))
            nested(*dictionary, {this, key.in(form_), {}}, describe_part);
    }
    template <typename Record>
    void record(GroupKey key, Record &record) {
        part(key, [&](auto &part) { describe(part, record); });
    }
    // No dictionary and an empty one mean that there is none.
    template <typename Record>
    void record(GroupKey key, std::optional<Record> &record) {
        const auto *dictionary = take<GroupDictionary>(key, true);
        if (dictionary && !dictionary->empty())
            fill(*dictionary, {this, key.in(form_), {}}, record.emplace());
    }
    template <typename Record>
    void list(GroupKey key, std::vector<Record> &records) {
        const auto *dictionaries = take<GroupDictionaries>(key);
        if (!dictionaries)
            return;
        records.reserve(dictionaries->size());
        for (const auto &dictionary : *dictionaries) {
            const Place place{this, key.in(form_), records.size()};
            fill(dictionary, place, records.emplace_back());
        }
    }
    template <typename Record>
    void at_most_one(GroupKey key, std::optional<Record> &record) {
        std::vector<Record> records;
        list(key, records);
        if (records.size() > 1)
            fail(key.in(form_), "holds {} entries instead of one", records.size());
        else if (!records.empty())
            record = std::move(records.front());
    }
    void identity(GroupKey key, std::int32_t type, RuleIdentity &identity);

  private:
    // Where something is wrong and what.
    using Error = std::optional<std::string>;

    template <typename Record>
    friend Answer<Record> read_record(const GroupDictionary &dictionary, GroupForm form);
    template <typename Record>
    friend Answer<std::vector<Record>> read_records(const GroupDictionaries &dictionaries,
                                                    GroupForm form);

    // Where a dictionary stands: under a key, or in the list under that key.
    struct Place {
        const GroupReader *parent = nullptr;
        std::string_view key;
        std::optional<std::size_t> index;
    };
    struct Count {
        std::string_view key;
        std::int32_t expected;
        std::function<std::size_t()> size;
    };

    GroupReader(const GroupDictionary &dictionary, GroupForm form, Error &error, Place place)
        : dictionary_(dictionary), form_(form), error_(error), place_(place),
          used_(dictionary.size()) {}

    template <typename Describe>
    void nested(const GroupDictionary &dictionary, const Place &place, Describe describe_part) {
        GroupReader reader(dictionary, form_, error_, place);
        describe_part(reader);
        reader.finish();
    }
    template <typename Record>
    void fill(const GroupDictionary &dictionary, const Place &place, Record &record) {
        nested(dictionary, place, [&](auto &part) { describe(part, record); });
    }

    // What can only be said once everything is read.
    void finish();

    // The value of a key. None when it did not come; another type is wrong.
    template <typename T>
    const T *take(GroupKey key, bool optional = false) {
        const auto *value = find(key.in(form_), optional);
        const auto *content = value ? std::get_if<T>(&value->content) : nullptr;
        if (value && !content)
            fail(key.in(form_), "is \"{}\" here, and \"{}\" came", type_of(GroupValue{T()}),
                 type_of(*value));
        return content;
    }
    const GroupValue *find(std::string_view key, bool optional);
    static std::string type_of(const GroupValue &value);

    std::string path() const;
    template <typename... Args>
    void fail(std::string_view key, fmt::format_string<Args...> text, Args &&...args) {
        if (!error_)
            error_ =
                fmt::format("{}{} {}", path(), key, fmt::format(text, std::forward<Args>(args)...));
    }

    const GroupDictionary &dictionary_;
    GroupForm form_;
    Error &error_;
    Place place_;
    std::vector<bool> used_;
    std::vector<Count> counts_;
};

template <typename Record>
Answer<Record> read_record(const GroupDictionary &dictionary, GroupForm form) {
    GroupReader::Error error;
    Record record;
    GroupReader reader(dictionary, form, error, {});
    describe(reader, record);
    reader.finish();
    if (error)
        return refuse(Result::kInvalidArgument, "{}", *error);
    return record;
}

template <typename Record>
Answer<std::vector<Record>> read_records(const GroupDictionaries &dictionaries, GroupForm form) {
    GroupReader::Error error;
    std::vector<Record> records;
    for (const auto &dictionary : dictionaries) {
        GroupReader reader(dictionary, form, error, {nullptr, "", records.size()});
        describe(reader, records.emplace_back());
        reader.finish();
    }
    if (error)
        return refuse(Result::kInvalidArgument, "{}", *error);
    return records;
}

} // namespace sim
