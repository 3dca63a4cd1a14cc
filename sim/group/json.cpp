// SPDX-License-Identifier: Apache-2.0
#include "sim/group/json.hpp"

#include "sim/group/reader.hpp"
#include "sim/group/writer.hpp"

#include <limits>
#include <nlohmann/json.hpp>

namespace sim {

void describe(auto &form, Like<GroupPlacement> auto &placement) {
    form.text("user", placement.user);
    form.text("group_uri", placement.group_uri);
    form.text("group_list_name", placement.list);
    form.flag("is_default_group", placement.is_default);
}

namespace {

using Json = nlohmann::ordered_json;

constexpr const char *kFormat = "ims-sim groups";
constexpr std::int32_t kVersion = 1;

// The whole file.
struct GroupFile {
    std::string format = kFormat;
    std::int32_t version = kVersion;
    GroupState state;
};

void describe(auto &form, Like<GroupFile> auto &file) {
    form.text("format", file.format);
    form.number("version", file.version);
    form.number("revision", file.state.revision);
    form.list("groups", file.state.groups);
    form.list("participant_groups", file.state.placements);
}

Json json_of(const GroupDictionary &dictionary);

Json json_of(const GroupValue &value) {
    if (const auto *number = std::get_if<std::int64_t>(&value.content))
        return *number;
    if (const auto *flag = std::get_if<bool>(&value.content))
        return *flag;
    if (const auto *text = std::get_if<std::string>(&value.content))
        return *text;
    if (const auto *dictionary = std::get_if<GroupDictionary>(&value.content))
        return json_of(*dictionary);
    Json list = Json::array();
    for (const auto &dictionary : std::get<GroupDictionaries>(value.content))
        list.push_back(json_of(dictionary));
    return list;
}

Json json_of(const GroupDictionary &dictionary) {
    Json object = Json::object();
    for (const auto &[key, value] : dictionary)
        object[key] = json_of(value);
    return object;
}

GroupDictionary dictionary_of(const Json &object);

decltype(GroupValue::content) content_of(const Json &value) {
    if (value.is_number_unsigned() &&
        value.get<std::uint64_t>() > std::uint64_t{std::numeric_limits<std::int64_t>::max()})
        return ForeignValue{"t"};
    if (value.is_number_integer())
        return value.get<std::int64_t>();
    if (value.is_boolean())
        return value.get<bool>();
    // Such a text cannot travel.
    if (value.is_string() && value.get_ref<const std::string &>().find('\0') != std::string::npos)
        return ForeignValue{"a text with a NUL"};
    if (value.is_string())
        return value.get<std::string>();
    if (value.is_object())
        return dictionary_of(value);
    if (!value.is_array())
        return ForeignValue{value.type_name()};
    GroupDictionaries list;
    for (const auto &entry : value) {
        if (!entry.is_object())
            return ForeignValue{fmt::format("an array of {}", entry.type_name())};
        list.push_back(dictionary_of(entry));
    }
    return list;
}

GroupDictionary dictionary_of(const Json &object) {
    GroupDictionary dictionary;
    for (const auto &[key, value] : object.items())
        dictionary.push_back({key, {content_of(value)}});
    return dictionary;
}

Answer<GroupState> state_of(const Json &whole) {
    if (!whole.is_object() || whole.value("format", Json()) != kFormat)
        return refuse(Result::kFailed, "this is no file of ims-sim's groups");
    auto file = read_record<GroupFile>(dictionary_of(whole), GroupForm::kRead);
    if (!file)
        return refuse(Result::kFailed, "{}", file.refusal().reason);
    if ((*file).version != kVersion)
        return refuse(Result::kFailed, "its version is not {}", kVersion);
    if (const auto contradiction = find_contradiction(file->state))
        return refuse(Result::kFailed, "{}", *contradiction);
    return std::move((*file).state);
}

} // namespace

std::string groups_to_json(const GroupState &state) {
    return json_of(write_record(GroupFile{.state = state}, GroupForm::kRead)).dump(2) + "\n";
}

Answer<GroupState> groups_from_json(const std::string &text) {
    try {
        return state_of(Json::parse(text));
    } catch (const Json::exception &error) {
        return refuse(Result::kFailed, "{}", error.what());
    }
}

} // namespace sim
