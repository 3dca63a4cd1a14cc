// SPDX-License-Identifier: Apache-2.0
#include "imsctl/ptt/summaries.hpp"

#include "imsctl/ptt/values.hpp"

#include <fmt/format.h>
#include <fmt/ranges.h>

namespace imsctl {
namespace {

std::int64_t number(const Fields &fields, std::string_view name) {
    return get<std::int64_t>(fields, name);
}

std::string named(NamedValues names, const Fields &fields, std::string_view name) {
    return name_of(names, static_cast<std::int32_t>(number(fields, name)));
}

// As much of a text as the service sent.
std::string text(const Fields &fields, std::string_view name) {
    for (const Field &field : fields)
        if (field.name == name)
            if (const auto *value = std::get_if<std::string>(&field.value))
                return *value;
    return "";
}

// `"Ann" (tel:+15550101)`, or the address alone.
std::string party(const std::string &uri, const std::string &name) {
    const std::string address = uri.empty() ? "somebody" : escape(uri);
    return name.empty() ? address : fmt::format("{} ({})", quote(name), address);
}

std::string party(const Fields &fields, std::string_view name) {
    for (const Field &field : fields)
        if (field.name == name)
            if (const auto *peer = std::get_if<Nested>(&field.value))
                return party(text(peer->fields, "uri"), text(peer->fields, "display_name"));
    return "somebody";
}

std::string media(const Fields &fields, std::string_view name) {
    const auto &set = get<Numbers>(fields, name);
    std::vector<std::string_view> parts;
    for (std::size_t at = 0; at < std::size(kPttMedia) && at < set.size(); ++at)
        if (set[at] != 0)
            parts.push_back(kPttMedia[at]);
    return parts.empty() ? "the usual media" : fmt::format("{}", fmt::join(parts, ", "));
}

std::string session(const Fields &fields) {
    return fmt::format("session {}", number(fields, "value_1"));
}

} // namespace

std::string summarise_ptt_in_progress(const Fields &fields) {
    return fmt::format("{}: calling", session(fields));
}

std::string summarise_ptt_alerting(const Fields &fields) {
    return fmt::format("{}: ringing there", session(fields));
}

std::string summarise_ptt_crisis(const Fields &fields) {
    return fmt::format("{}: a crisis call from now on", session(fields));
}

std::string summarise_ptt_incoming(const Fields &fields) {
    const std::string group = text(fields, "text_4");
    return fmt::format("session {}: {}{} call from {}{}{}", number(fields, "value_1"),
                       get<bool>(fields, "flag_1") ? "crisis " : "",
                       named(kPttTypes, fields, "value_2"),
                       party(text(fields, "text_1"), text(fields, "text_2")),
                       group.empty() ? "" : " to " + party(group, text(fields, "text_5")),
                       get<bool>(fields, "flag_2") ? ", answered automatically" : "");
}

std::string summarise_ptt_established(const Fields &fields) {
    return fmt::format(
        "{}: {}{} call with {}, {}", session(fields), get<bool>(fields, "flag_2") ? "crisis " : "",
        named(kPttTypes, fields, "value_2"), party(fields, "peer"), media(fields, "int_set_1"));
}

std::string summarise_ptt_ended(const Fields &fields) {
    return fmt::format("{}: {}", session(fields), named(kPttEndReasons, fields, "value_2"));
}

std::string summarise_floor_granted(const Fields &fields) {
    return fmt::format("{}: the floor is yours for {} s", session(fields),
                       number(fields, "value_5"));
}

std::string summarise_floor_idle(const Fields &fields) {
    return fmt::format("{}: nobody has the floor", session(fields));
}

std::string summarise_floor_position(const Fields &fields) {
    return fmt::format("{}: waiting at position {}, {} has the floor", session(fields),
                       number(fields, "value_4"),
                       party(text(fields, "text_1"), text(fields, "text_2")));
}

std::string summarise_floor_taken(const Fields &fields) {
    return fmt::format("{}: {} has the floor", session(fields),
                       party(text(fields, "text_1"), text(fields, "text_2")));
}

std::string summarise_floor_refusal(const Fields &fields) {
    return fmt::format("{}: no floor, {}", session(fields),
                       named(kPttFloorCauses, fields, "value_6"));
}

std::string summarise_ptt_modify_request(const Fields &fields) {
    return fmt::format("{}: a party asks for {}", session(fields), media(fields, "int_set_1"));
}

std::string summarise_ptt_modify_status(const Fields &fields) {
    return fmt::format("{}: {}, {}", session(fields),
                       get<bool>(fields, "flag_1") ? "changed" : "not changed",
                       media(fields, "int_set_1"));
}

std::string summarise_ptt_advertisement(const Fields &fields) {
    for (const Field &field : fields)
        if (field.name == "group_adv")
            if (const auto *adv = std::get_if<Nested>(&field.value))
                return fmt::format("group {}: {}", party(adv->fields, "remote_uri"),
                                   quote(text(adv->fields, "subject")));
    return "a group of which nothing is told";
}

std::string summarise_ptt_participant(const Fields &fields) {
    return fmt::format("{}: {} {}", session(fields), party(text(fields, "text_1"), ""),
                       escape(text(fields, "text_2")));
}

std::string summarise_ptt_message(const Fields &fields) {
    return fmt::format("message {} from {}: {}", number(fields, "value_1"), party(fields, "peer_1"),
                       quote(text(fields, "text_3")));
}

std::string summarise_ptt_notice(const Fields &fields) {
    return fmt::format("message {}: {} by {}", number(fields, "value_1"),
                       named(kPttNotices, fields, "value_2"), party(fields, "peer_1"));
}

std::string summarise_ptt_file(const Fields &fields) {
    const std::string from = party(fields, "peer_1");
    for (const Field &field : fields)
        if (field.name == "attributes")
            if (const auto *file = std::get_if<Nested>(&field.value))
                return fmt::format(
                    "transfer {} from {}: {}, {} bytes, id {}", number(fields, "value_1"), from,
                    quote(text(file->fields, "file_name")), number(file->fields, "file_size"),
                    quote(text(file->fields, "transfer_id")));
    return fmt::format("transfer {} from {}", number(fields, "value_1"), from);
}

std::string summarise_ptt_progress(const Fields &fields) {
    return fmt::format("transfer {}: {} of {} bytes", number(fields, "value_1"),
                       number(fields, "value_2"), number(fields, "value_3"));
}

std::string summarise_ptt_terminated(const Fields &fields) {
    return fmt::format("transfer {}: {}", number(fields, "value_1"),
                       named(kPttFileEnds, fields, "value_2"));
}

} // namespace imsctl
