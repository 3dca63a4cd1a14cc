// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/output.hpp"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <fmt/format.h>
#include <glib.h>
#include <memory>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

struct DateTimeUnref {
    void operator()(GDateTime *time) const { g_date_time_unref(time); }
};
using DateTime = std::unique_ptr<GDateTime, DateTimeUnref>;

struct Free {
    void operator()(char *text) const { g_free(text); }
};
using GlibText = std::unique_ptr<char, Free>;

constexpr std::int64_t kMicroseconds = 1'000'000;

std::string iso_time(std::int64_t time) {
    const DateTime utc(g_date_time_new_from_unix_utc(time / kMicroseconds));
    const GlibText text(g_date_time_format(utc.get(), "%Y-%m-%dT%H:%M:%S"));
    return fmt::format("{}.{:06}Z", text.get(), time % kMicroseconds);
}

} // namespace

std::string local_clock_time(std::int64_t time) {
    const DateTime local(g_date_time_new_from_unix_local(time / kMicroseconds));
    const GlibText text(g_date_time_format(local.get(), "%H:%M:%S"));
    return fmt::format("{}.{:03}", text.get(), time % kMicroseconds / 1000);
}

const Value *Event::find(std::string_view name) const {
    const auto field = std::find_if(fields.begin(), fields.end(),
                                    [&](const Field &each) { return each.name == name; });
    return field == fields.end() ? nullptr : &field->value;
}

std::optional<std::int64_t> Event::number(std::string_view name) const {
    const Value *value = find(name);
    const auto *number = value == nullptr ? nullptr : std::get_if<std::int64_t>(value);
    return number == nullptr ? std::nullopt : std::optional(*number);
}

std::string to_text(const EventRow &row, const Fields &fields) {
    const std::string text = to_text(fields);
    return row.summary == nullptr ? text : fmt::format("{}: {}", text, row.summary(fields));
}

std::string to_text(const Event &event) {
    return fmt::format("{} {} {}", local_clock_time(event.time), event.row->name,
                       to_text(*event.row, event.fields));
}

Json to_json(const Event &event, int slot) {
    Json object = {{"event", std::string(event.row->name)},
                   {"id", event.row->id},
                   {"slot", slot},
                   {"time", iso_time(event.time)}};
    add_json(object, event.fields);
    return object;
}

void Output::result(const Fields &fields) const {
    Json object = Json::object();
    add_json(object, fields);
    result(object, fields.empty() ? "ok" : to_text(fields));
}

void Output::result(const EventRow &row, const Fields &fields) const {
    Json object = Json::object();
    add_json(object, fields);
    result(object, to_text(row, fields));
}

void Output::result(const Json &object, const std::string &text) const {
    if (!json_)
        return line(text);
    Json whole = {{"verb", verb_}};
    whole.update(object);
    line(dump(whole));
}

void Output::text(const std::string &text) const {
    if (std::fwrite(text.data(), 1, text.size(), out_) == text.size() && std::fflush(out_) == 0)
        return;
    if (errno == EPIPE)
        throw ReaderGone();
    throw Failure(FailureKind::kOutput,
                  fmt::format("cannot write the output: {}", std::strerror(errno)));
}

void Output::note(const std::string &text) const {
    // Whether anybody takes it does not matter.
    std::fputs((text + '\n').c_str(), err_);
    std::fflush(err_);
}

void Output::failure(const Failure &failure) const {
    const auto [for_programs, for_people] = failure_texts(failure);
    std::fwrite(for_programs.data(), 1, for_programs.size(), out_);
    std::fflush(out_);
    std::fwrite(for_people.data(), 1, for_people.size(), err_);
    std::fflush(err_);
}

LastWords Output::failure_texts(const Failure &failure) const {
    std::string for_programs;
    if (json_) {
        Json object = Json::object();
        if (!verb_.empty())
            object["verb"] = verb_;
        object["error"] = failure.to_json();
        for_programs = dump(object) + '\n';
    }
    std::string for_people =
        fmt::format("imsctl: {}{}{}\n", verb_, verb_.empty() ? "" : ": ", failure.what());
    if (!failure.hint.empty())
        for_people += failure.hint + '\n';
    return {for_programs, for_people};
}

} // namespace imsctl
