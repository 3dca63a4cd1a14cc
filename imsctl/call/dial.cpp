// SPDX-License-Identifier: Apache-2.0
// Placing a call, and following it until it is established or over.
#include "imsctl/call/dial.hpp"

#include "imsctl/call/module.hpp"
#include "imsctl/call/values.hpp"
#include "imsctl/line/requests.hpp"

#include <array>
#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

struct DialArguments {
    Argument<std::string> number;
    Argument<std::int32_t> type;
    std::array<Argument<std::string>, 4> texts;
    Argument<bool> wait;
};

// The events that tell what becomes of a call.
constexpr std::array kFollowed = {
    IMS_NOTI_CALL_IN_PROGRESS, IMS_NOTI_CALL_ALERTING,        IMS_NOTI_CALL_BUSY,
    IMS_NOTI_CALL_ESTABLISHED, IMS_NOTI_CALL_FORWARDED,       IMS_NOTI_CALL_EARLY_MEDIA_START,
    IMS_NOTI_CALL_ERROR,       IMS_NOTI_CALL_STOP_ALERT_TONE, IMS_NOTI_CALL_ENDED,
};

Fields place_call(Client &client, const DialArguments &given) {
    const ims_call_make_info_s info{given.number->c_str(),   *given.type,
                                    given.texts[0]->c_str(), given.texts[1]->c_str(),
                                    given.texts[2]->c_str(), given.texts[3]->c_str()};
    return client.request(with_record(ims_call_make_call, info), number_as("session_id"));
}

// Follows one call. Shows each event to people as it comes and keeps them for programs.
class Follower {
  public:
    Follower(Invocation &run, std::int64_t session_id) : run_(run), session_id_(session_id) {}

    // Returns when the call is established.
    void wait() {
        bool established = false;
        const auto decided = [&] {
            while (run_.client().has_event() && !established)
                established = is_established(run_.client().take_event());
            return established;
        };
        const Seconds limit = run_.settings().timeout;
        if (!run_until(limit, decided))
            throw Failure(FailureKind::kTimeout,
                          fmt::format("call {} was not established within {} s; it goes on",
                                      session_id_, limit),
                          fmt::format("try: imsctl call end {}", session_id_),
                          {{"session_id", session_id_}});
    }

    const Json &events() const { return events_; }

  private:
    bool is_established(const Event &event) {
        if (event.number("session_id") != session_id_)
            return false;
        if (run_.output().json())
            events_.push_back(to_json(event, run_.settings().slot));
        else
            run_.output().line(to_text(event));
        remember_cause(event);
        if (event.row->id == IMS_NOTI_CALL_ENDED)
            throw ended(event);
        return event.row->id == IMS_NOTI_CALL_ESTABLISHED;
    }

    void remember_cause(const Event &event) {
        if (event.row->id == IMS_NOTI_CALL_BUSY)
            cause_ = "the number is busy";
        if (event.row->id == IMS_NOTI_CALL_ERROR)
            cause_ = fmt::format("error {}, {}", to_text(*event.find("error_code")),
                                 to_text(*event.find("text_1")));
    }

    Failure ended(const Event &event) const {
        const auto reason = static_cast<std::int32_t>(event.number("reason").value_or(0));
        const std::string cause = cause_.empty() ? name_of(kEndReasons, reason) : cause_;
        return {FailureKind::kCallEnded,
                fmt::format("call {} ended (reason {}): {}", session_id_, reason, cause),
                "",
                {{"session_id", session_id_}, {"reason", std::int64_t{reason}}}};
    }

    Invocation &run_;
    std::int64_t session_id_;
    std::string cause_;
    Json events_ = Json::array();
};

void dial_and_wait(Invocation &run, const DialArguments &given) {
    for (const int id : kFollowed)
        run.client().watch(*find_event(call_events(), id));
    const Fields placed = place_call(run.client(), given);
    if (placed.empty())
        throw Failure(FailureKind::kService, "the service did not say which session the call has");
    const auto session_id = std::get<std::int64_t>(placed.front().value);
    Follower follower(run, session_id);
    follower.wait();
    Json object = {{"session_id", session_id}, {"outcome", "established"}};
    object["events"] = follower.events();
    run.output().result(object, fmt::format("call {} is established", session_id));
}

} // namespace

Action prepare_dial(Arguments &arguments) {
    DialArguments given;
    given.number = arguments.text("NUMBER", "whom to call: +15550101, tel:+15550101, sip:...");
    given.type = arguments.choice("--type", "the kind of call", kCallTypes, 0);
    for (std::size_t i = 0; i < given.texts.size(); ++i)
        given.texts[i] = arguments.text_or(fmt::format("--text-{}", i + 1),
                                           "a text that the service defines", "");
    given.wait = arguments.flag("--wait", "wait until the call is established or over");
    return [given](Invocation &run) {
        if (*given.wait)
            dial_and_wait(run, given);
        else
            run.output().result(place_call(run.client(), given));
    };
}

} // namespace imsctl
