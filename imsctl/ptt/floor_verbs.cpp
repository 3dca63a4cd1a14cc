// SPDX-License-Identifier: Apache-2.0
// The floor: asking for it, giving it back, and who has it.
#include "imsctl/line/requests.hpp"
#include "imsctl/ptt/module.hpp"
#include "imsctl/ptt/parties.hpp"
#include "imsctl/ptt/talk.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

void about_floor(Invocation &run, const ims_poc_floor_s &floor, FloorRequest request) {
    run.request(session_id_field(floor.session_id), with_record(request, floor));
}

Action prepare_request(Arguments &arguments) {
    const auto session = arguments.number("SESSION,--session", "the session");
    const auto media = ptt_media(arguments);
    const auto priority =
        arguments.number("--priority", "how urgent it is, as the service defines it", 0);
    const auto patience =
        arguments.number("--patience", "how many seconds to wait for it; 0: as usual", 0);
    const auto name = arguments.text_or("--name", "the name that the others see", "");
    return [=](Invocation &run) {
        ims_poc_floor_s floor{*session, {}, *priority, *patience, name->c_str()};
        store(*media, floor.int_set);
        about_floor(run, floor, ims_poc_call_request_floor);
    };
}

Action prepare_release(Arguments &arguments) {
    const auto session = arguments.number("SESSION,--session", "the session");
    const auto media = ptt_media(arguments);
    return [=](Invocation &run) {
        ims_poc_floor_s floor{*session, {}, 0, 0, ""};
        store(*media, floor.int_set);
        about_floor(run, floor, ims_poc_call_release_floor);
    };
}

Fields decode_floor_status(void *data) {
    NestedList sessions;
    for (const auto *status = static_cast<const ims_poc_floor_status_s *>(data); status != nullptr;
         status = status->next)
        sessions.entries.push_back(
            {{"session_id", std::int64_t{status->session_id}},
             {"status", std::int64_t{status->status}},
             {"participant_count", std::int64_t{status->participant_count}},
             {"floor_taken_uri", status->floor_taken_uri == nullptr
                                     ? Value()
                                     : Value(std::string(status->floor_taken_uri))}});
    return {{"sessions", std::move(sessions)}};
}

std::string floor_table(const NestedList &sessions) {
    if (sessions.entries.empty())
        return "no sessions";
    std::string table =
        fmt::format("{:<7}  {:<7}  {:<12}  {}", "SESSION", "FLOOR", "PARTICIPANTS", "SPEAKER");
    for (const Fields &fields : sessions.entries) {
        const Value &speaker = fields.back().value;
        const auto *uri = std::get_if<std::string>(&speaker);
        table += fmt::format(
            "\n{:<7}  {:<7}  {:<12}  {}", get<std::int64_t>(fields, "session_id"),
            name_of(kPttFloorStates,
                    static_cast<std::int32_t>(get<std::int64_t>(fields, "status"))),
            get<std::int64_t>(fields, "participant_count"), uri == nullptr ? "-" : escape(*uri));
    }
    return table;
}

Action prepare_status(Arguments &arguments) {
    const auto sessions =
        arguments.some_numbers("SESSION", "the sessions; all of them when left out");
    return [=](Invocation &run) {
        if (sessions->size() > IMS_POC_FLOOR_QUERY_CAPACITY)
            throw Failure(FailureKind::kUsage, fmt::format("at most {} sessions at a time",
                                                           IMS_POC_FLOOR_QUERY_CAPACITY));
        ims_poc_floor_query_s query{static_cast<std::int32_t>(sessions->size()), {}};
        std::copy(sessions->begin(), sessions->end(), query.values);
        const Fields fields = run.client().request(
            with_record(ims_poc_call_request_floor_status, query), decode_floor_status);
        Json object = Json::object();
        add_json(object, fields);
        run.output().result(object, floor_table(get<NestedList>(fields, "sessions")));
    };
}

constexpr Verb kPttFloorVerbs[] = {
    {"ptt floor request", "ask for the floor", "ptt floor request 1", prepare_request},
    {"ptt floor release", "give the floor back, or wait for it no more", "ptt floor release 1",
     prepare_release},
    {"ptt floor status", "show who has the floor", "ptt floor status 1", prepare_status},
    {"ptt talk", "have the floor while the command lasts, and show who has it", "ptt talk 1 --key",
     prepare_ptt_talk},
};

} // namespace

std::span<const Verb> ptt_floor_verbs() {
    return kPttFloorVerbs;
}

} // namespace imsctl
