// SPDX-License-Identifier: Apache-2.0
#include "imsctl/ss/list.hpp"

#include "imsctl/ss/values.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <memory>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

Value number(std::int32_t value) {
    return std::int64_t{value};
}

Fields fields_of(const ims_ss_cw_info_s &entry) {
    return {{"ss_class", number(entry.ss_class)}, {"ss_status", number(entry.ss_status)}};
}

Fields fields_of(const ims_ss_cf_info_s &entry) {
    return {{"ss_class", number(entry.ss_class)},
            {"ss_status", number(entry.ss_status)},
            {"cf_type", number(entry.cf_type)},
            {"no_reply_time", number(entry.no_reply_time)},
            {"cf_uri_length", number(entry.cf_uri_length)},
            {"cf_uri_type", number(entry.cf_uri_type)},
            {"cf_uri", entry.cf_uri == nullptr ? Value() : Value(std::string(entry.cf_uri))}};
}

Fields fields_of(const ims_ss_cb_info_s &entry) {
    return {{"ss_class", number(entry.ss_class)},
            {"ss_status", number(entry.ss_status)},
            {"cb_type", number(entry.cb_type)}};
}

template <class Entry>
std::vector<Fields> all_fields(const Entry *entries, std::uint32_t count) {
    std::vector<Fields> all;
    for (const Entry &entry : std::span(entries, entries == nullptr ? 0 : count))
        all.push_back(fields_of(entry));
    return all;
}

constexpr StatusColumn kClassColumn{"CLASS", kServiceClasses};
constexpr StatusColumn kStatusColumn{"STATUS", kSwitch};

constexpr StatusColumn kWaitingColumns[] = {kClassColumn, kStatusColumn};
constexpr StatusColumn kHidden{"", {}};
constexpr StatusColumn kForwardingColumns[] = {
    kClassColumn, kStatusColumn, {"CONDITION", kForwardingConditions}, {"SECONDS", {}}, kHidden,
    kHidden,      {"TARGET", {}}};
constexpr StatusColumn kBarringColumns[] = {kClassColumn, kStatusColumn, {"CALLS", kBarringTypes}};

std::string cell(const StatusColumn &column, const Value &value) {
    if (const auto *plain = std::get_if<std::int64_t>(&value))
        return name_of(column.names, static_cast<std::int32_t>(*plain));
    const auto *text = std::get_if<std::string>(&value);
    return text == nullptr || text->empty() ? "-" : escape(*text);
}

using Row = std::vector<std::string>;

// All columns but the last are as wide as their widest cell.
std::string aligned(const std::vector<Row> &rows) {
    std::vector<std::size_t> widths(rows.front().size());
    for (const Row &row : rows)
        for (std::size_t i = 0; i + 1 < row.size(); ++i)
            widths[i] = std::max(widths[i], row[i].size() + 2);
    std::string text;
    for (const Row &row : rows) {
        text += text.empty() ? "" : "\n";
        for (std::size_t i = 0; i < row.size(); ++i)
            text += fmt::format("{:<{}}", row[i], widths[i]);
    }
    return text;
}

} // namespace

const StatusList kWaitingList{kWaitingColumns, [](const ims_ss_status_list_s &list) {
                                  return all_fields(list.entries.call_waiting, list.count);
                              }};
const StatusList kForwardingList{kForwardingColumns, [](const ims_ss_status_list_s &list) {
                                     return all_fields(list.entries.call_forwarding, list.count);
                                 }};
const StatusList kBarringList{kBarringColumns, [](const ims_ss_status_list_s &list) {
                                  return all_fields(list.entries.call_barring, list.count);
                              }};

std::string status_table(const StatusList &list, const std::vector<Fields> &entries) {
    if (entries.empty())
        return "the service lists nothing";
    std::vector<Row> rows(1);
    for (const StatusColumn &column : list.columns)
        if (!column.title.empty())
            rows.front().emplace_back(column.title);
    for (const Fields &entry : entries) {
        Row &row = rows.emplace_back();
        for (std::size_t i = 0; i < entry.size(); ++i)
            if (!list.columns[i].title.empty())
                row.push_back(cell(list.columns[i], entry[i].value));
    }
    return aligned(rows);
}

void show_list(Invocation &run, const Start &start, const StatusList &list) {
    // Outlives a request that nobody waits for any more.
    const auto entries = std::make_shared<std::vector<Fields>>();
    run.client().request(start, [entries, &list](void *data) -> Fields {
        if (data != nullptr)
            *entries = list.entries(*static_cast<const ims_ss_status_list_s *>(data));
        return {};
    });
    Json array = Json::array();
    for (const Fields &entry : *entries)
        add_json(array.emplace_back(Json::object()), entry);
    run.output().result({{"entries", array}}, status_table(list, *entries));
}

} // namespace imsctl
