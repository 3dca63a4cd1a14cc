// SPDX-License-Identifier: Apache-2.0
#include "sim/group/reader.hpp"

#include <limits>

namespace sim {

void GroupReader::text(GroupKey key, std::string &text) {
    if (const auto *content = take<std::string>(key))
        text = *content;
}

void GroupReader::text(GroupKey key, OptionalText &text) {
    if (const auto *content = take<std::string>(key, true))
        text = *content;
}

void GroupReader::number(GroupKey key, std::int32_t &number) {
    using Limits = std::numeric_limits<std::int32_t>;
    const auto *content = take<std::int64_t>(key);
    if (!content)
        return;
    if (*content < Limits::min() || *content > Limits::max())
        fail(key.in(form_), "is {}, which no client can hold", *content);
    else
        number = static_cast<std::int32_t>(*content);
}

void GroupReader::flag(GroupKey key, bool &flag) {
    if (const auto *content = take<bool>(key))
        flag = *content;
}

void GroupReader::member_type(GroupKey key, std::int32_t &type) {
    if (form_ == GroupForm::kRead)
        return number(key, type);
    if (const auto *content = take<bool>(key))
        type = *content ? 1 : 0;
}

void GroupReader::texts(GroupKey list, GroupKey element, std::vector<std::string> &texts) {
    const auto *dictionaries = take<GroupDictionaries>(list);
    if (!dictionaries)
        return;
    texts.reserve(dictionaries->size());
    for (const auto &dictionary : *dictionaries) {
        const Place place{this, list.in(form_), texts.size()};
        auto &text = texts.emplace_back();
        nested(dictionary, place, [&](GroupReader &part) {
            part.text(element, text);
            if (text.empty())
                part.fail(element.in(form_), "is missing or empty");
        });
    }
}

void GroupReader::identity(GroupKey key, std::int32_t type, RuleIdentity &identity) {
    const auto *dictionary = take<GroupDictionary>(key, true);
    // What is read leaves out an identity that is not set: an empty one of type 4 has no parts.
    const bool may_be_empty = form_ == GroupForm::kRead && type == 4;
    if (!dictionary || (dictionary->empty() && !may_be_empty))
        return;
    const Place place{this, key.in(form_), {}};
    switch (type) {
    case 1:
        return fill(*dictionary, place, identity.emplace<RuleContacts>());
    case 2:
        return fill(*dictionary, place, identity.emplace<RuleContactLists>());
    case 4:
        return fill(*dictionary, place, identity.emplace<RuleDomains>());
    default:
        fail(key.in(form_), "holds something, and type {} has nothing", type);
    }
}

const GroupValue *GroupReader::find(std::string_view key, bool optional) {
    const GroupValue *found = nullptr;
    for (std::size_t i = 0; i < dictionary_.size(); ++i) {
        if (dictionary_[i].key != key)
            continue;
        used_[i] = true;
        if (found)
            fail(key, "comes twice");
        found = &dictionary_[i].value;
    }
    if (!found && !optional && form_ == GroupForm::kRead)
        fail(key, "is missing");
    return found;
}

std::string GroupReader::type_of(const GroupValue &value) {
    if (const auto *foreign = std::get_if<ForeignValue>(&value.content))
        return foreign->type;
    constexpr std::string_view kTypes[] = {"x", "b", "s", "a{sv}", "aa{sv}"};
    return std::string(kTypes[value.content.index()]);
}

void GroupReader::finish() {
    for (std::size_t i = 0; i < dictionary_.size(); ++i)
        if (!used_[i])
            fail(dictionary_[i].key, "is no key here");
    for (const auto &count : counts_)
        if (std::cmp_not_equal(count.expected, count.size()))
            fail(count.key, "says {}, and {} came", count.expected, count.size());
}

std::string GroupReader::path() const {
    std::string path;
    for (const auto *reader = this; reader; reader = reader->place_.parent) {
        const auto &[parent, key, index] = reader->place_;
        if (index)
            path.insert(0, fmt::format("{}[{}].", key, *index));
        else if (!key.empty())
            path.insert(0, fmt::format("{}.", key));
    }
    return path;
}

} // namespace sim
