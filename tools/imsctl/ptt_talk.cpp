// SPDX-License-Identifier: Apache-2.0
// Taking the floor for as long as the command, or a key, lasts; and showing who has it.
#include "ptt_talk.hpp"

#include "ptt_parties.hpp"
#include "push_key.hpp"
#include "requests.hpp"
#include "watching.hpp"

#include <fmt/format.h>

namespace imsctl {
namespace {

struct TalkArguments {
    Argument<std::int32_t> session;
    Argument<std::int32_t> priority;
    Argument<std::string> name;
    Argument<bool> key;
    WatchLimits limits;
};

constexpr int kFollowed[] = {
    IMS_NOTI_POC_CALL_ENDED,
    IMS_NOTI_POC_CALL_FLOOR_GRANTED,
    IMS_NOTI_POC_CALL_FLOOR_REJECTED,
    IMS_NOTI_POC_CALL_FLOOR_IDLE,
    IMS_NOTI_POC_CALL_FLOOR_QUEUE_POSITION,
    IMS_NOTI_POC_CALL_FLOOR_CANCELED,
    IMS_NOTI_POC_CALL_FLOOR_TAKEN,
    IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT,
};

class Talk {
  public:
    Talk(Invocation &run, const TalkArguments &given) : run_(run), given_(given) {
        floor_.session_id = *given.session;
        floor_.value_1 = *given.priority;
        floor_.text = given_.name->c_str();
    }

    void ask() {
        wanted_ = true;
        send("request", ims_poc_call_request_floor);
    }

    // Whether it is had, waited for, or not even answered yet.
    void give_back() {
        if (std::exchange(wanted_, false))
            send("release", ims_poc_call_release_floor);
    }

    // Why the service did not even take a request.
    void check() {
        if (refused_.empty())
            return;
        const std::string message = std::exchange(refused_, "");
        if (!*given_.key)
            throw Failure(response_failure(result_).kind, message, response_failure(result_).hint,
                          {{"result", std::int64_t{result_}}});
        run_.output().note("imsctl: ptt talk: " + message);
    }

    bool is_settled() const { return unanswered_ == 0; }

    // Whether it was about this session.
    bool take(const Event &event) {
        if (event.number("value_1") != floor_.session_id)
            return false;
        if (run_.output().json())
            show_event(run_, event);
        else
            run_.output().line(fmt::format("{} {}", local_clock_time(event.time),
                                           event.row->summary(event.fields)));
        look_at(event);
        return true;
    }

  private:
    void look_at(const Event &event) {
        switch (event.row->id) {
        case IMS_NOTI_POC_CALL_ENDED:
            wanted_ = false;
            throw Failure(
                FailureKind::kCallEnded, event.row->summary(event.fields), "",
                {{"session_id", *event.number("value_1")}, {"reason", *event.number("value_2")}});
        case IMS_NOTI_POC_CALL_FLOOR_REJECTED:
        case IMS_NOTI_POC_CALL_FLOOR_CANCELED:
        case IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT:
            lose(event);
            break;
        default:
            break;
        }
    }

    // Of no importance when it was given back, or to one who may press the key again.
    void lose(const Event &event) {
        if (!std::exchange(wanted_, false) || *given_.key)
            return;
        throw Failure(
            FailureKind::kFloor, event.row->summary(event.fields), "",
            {{"session_id", *event.number("value_1")}, {"cause", *event.number("value_6")}});
    }

    void send(std::string_view what,
              int (*request)(ims_h, const ims_poc_floor_s *, ims_response_cb, void *)) {
        ++unanswered_;
        run_.client().send(with_record(request, floor_), [this, what](int result) {
            --unanswered_;
            if (result == 0)
                return;
            if (what == "request")
                wanted_ = false;
            refused_ = fmt::format("the floor {}: {}", what, response_failure(result).what());
            result_ = result;
        });
    }

    Invocation &run_;
    const TalkArguments &given_;
    ims_poc_floor_s floor_{};
    bool wanted_ = false;
    int unanswered_ = 0;
    int result_ = 0;
    std::string refused_;
};

} // namespace

Action prepare_ptt_talk(Arguments &arguments) {
    const TalkArguments given{
        arguments.number("SESSION,--session", "the session"),
        arguments.number("--priority", "how urgent it is, as the service defines it", 0),
        arguments.text_or("--name", "the name that the others see", ""),
        arguments.flag("--key", "only while a key of the terminal is held; q ends"),
        watch_limits(arguments)};
    return [given](Invocation &run) {
        std::vector<const EventRow *> rows;
        for (const int id : kFollowed)
            rows.push_back(find_event(id));
        Watch watch(run, given.limits, rows,
                    fmt::format("talking in session {} of", *given.session));
        Talk talk(run, given);
        std::optional<PushKey> key;
        if (*given.key) {
            key.emplace(PushKey::Actions{[&] { talk.ask(); }, [&] { talk.give_back(); }});
            run.output().note("hold a key to talk, q ends");
        } else {
            talk.ask();
        }
        watch.until_end([&](const Event &event) { return talk.take(event); },
                        [&] {
                            talk.check();
                            return key && key->wants_end();
                        });
        talk.give_back();
        watch.finish([&] { return talk.is_settled(); });
        talk.check();
    };
}

} // namespace imsctl
