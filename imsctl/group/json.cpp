// SPDX-License-Identifier: Apache-2.0
#include "imsctl/group/json.hpp"

#include "imsctl/group/reply_records.hpp"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

template <class Record>
Json object_of(Record &record);

Json text_of(const char *text) {
    return text == nullptr ? Json() : Json(text);
}

template <class Element>
Json list_of(Element *elements, std::int32_t count) {
    if (elements == nullptr && count != 0)
        return nullptr;
    Json list = Json::array();
    for (std::int32_t at = 0; elements != nullptr && at < count; ++at) {
        if constexpr (std::is_same_v<Element, char *>)
            list.push_back(text_of(elements[at]));
        else
            list.push_back(object_of(elements[at]));
    }
    return list;
}

class JsonWriter {
  public:
    void operator()(const char *name, bool flag) { object[name] = flag; }
    void operator()(const char *name, std::int32_t number) { object[name] = number; }
    void operator()(const char *name, const char *text) { object[name] = text_of(text); }
    template <class Element>
    void operator()(const char *name, Element *elements, std::int32_t count) {
        object[name] = list_of(elements, count);
    }
    template <class Record>
    requires std::is_class_v<Record>
    void operator()(const char *name, Record &record) { object[name] = object_of(record); }
    template <class Record>
    requires std::is_class_v<Record>
    void operator()(const char *name, Record *record) {
        if constexpr (Linked<Record>) {
            object[name] = Json::array();
            for (; record != nullptr; record = record->next)
                object[name].push_back(object_of(*record));
        } else {
            object[name] = record == nullptr ? Json() : object_of(*record);
        }
    }
    void required(const char *name, const char *text) { object[name] = text; }
    void identity(const char *name, void **cell, std::int32_t type) {
        object[name] = nullptr;
        if (cell == nullptr || *cell == nullptr)
            return;
        with_identity_type(type, [&]<class Record>(Record *) {
            object[name] = object_of(*static_cast<Record *>(*cell));
        });
    }

    Json object = Json::object();
};

template <class Record>
Json object_of(Record &record) {
    JsonWriter writer;
    visit_fields(writer, record);
    return std::move(writer.object);
}

bool is_part(const Json &value) {
    return value.is_object() || (value.is_array() && !value.empty() && value[0].is_structured());
}

std::string plain_text(const Json &value) {
    if (value.is_string())
        return quote(value.get_ref<const std::string &>());
    if (!value.is_array())
        return value.dump();
    std::string texts;
    for (const Json &element : value)
        texts += (texts.empty() ? "" : ",") + (element.is_null() ? "-" : plain_text(element));
    return fmt::format("[{}]", texts);
}

void add_outline(std::string &lines, const Json &object, const std::string &lead,
                 std::size_t indent);

// Nothing for a part in which nothing stands.
void add_part(std::string &lines, const std::string &name, const Json &part, std::size_t indent) {
    const std::string margin(indent + 2, ' ');
    std::string inside;
    if (part.is_object()) {
        add_outline(inside, part, margin, indent + 2);
    } else {
        for (const Json &element : part)
            add_outline(inside, element, margin + "- ", indent + 4);
    }
    if (!inside.empty())
        lines += fmt::format("{:{}}{}:\n{}", "", indent, name, inside);
}

// The lead stands before the first line, the indent before those that follow.
void add_outline(std::string &lines, const Json &object, const std::string &lead,
                 std::size_t indent) {
    std::string plain;
    for (const auto &[name, value] : object.items()) {
        if (!value.is_null() && !is_part(value) && !(value.is_array() && value.empty()))
            plain += fmt::format("{}{}={}", plain.empty() ? "" : " ", name, plain_text(value));
    }
    if (!plain.empty() || lead.ends_with("- "))
        lines += lead + (plain.empty() ? "-" : plain) + "\n";
    for (const auto &[name, value] : object.items()) {
        if (is_part(value))
            add_part(lines, name, value, indent);
    }
}

} // namespace

Json to_json(ims_xdm_group_info_s &group) {
    return object_of(group);
}

Json to_json(ims_xdm_shared_group_list_s &list) {
    Json groups = Json::array();
    for (std::int32_t at = 0; list.groups != nullptr && at < list.count; ++at)
        groups.push_back(list.groups[at] == nullptr ? Json() : object_of(*list.groups[at]));
    return {{"version", text_of(list.version)}, {"count", list.count}, {"groups", groups}};
}

Json to_json(ims_xdm_participant_groups_s &groups) {
    return object_of(groups);
}

Json to_json(ims_xdm_user_profile_s &profile) {
    return object_of(profile);
}

Json to_json(ims_xdm_participant_info_s &info) {
    return object_of(info);
}

std::string outline(const Json &object) {
    std::string lines;
    add_outline(lines, object, "", 0);
    if (!lines.empty())
        lines.pop_back();
    return lines.empty() ? "nothing" : lines;
}

} // namespace imsctl
