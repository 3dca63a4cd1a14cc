// SPDX-License-Identifier: Apache-2.0
// Taking the floor for as long as the command, or a key, lasts; and showing who has it.
#include "imsctl/ptt/talk.hpp"

#include "imsctl/line/requests.hpp"
#include "imsctl/line/watching.hpp"
#include "imsctl/ptt/module.hpp"
#include "imsctl/ptt/parties.hpp"
#include "imsctl/ptt/push_key.hpp"

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

// What a release of a floor that is not ours any more is answered with.
constexpr int kWrongState = 13;

class Talk {
  public:
    Talk(Invocation &run, const TalkArguments &given) : run_(run), given_(given) {
        floor_.session_id = *given.session;
        floor_.value_1 = *given.priority;
        floor_.text = given_.name->c_str();
    }

    void ask() {
        wanted_ = true;
        send(ims_poc_call_request_floor);
    }

    // Whatever the service said of it: that may have been about an earlier request.
    void give_back() {
        if (std::exchange(wanted_, false) && !lost_)
            send(ims_poc_call_release_floor);
    }

    // Why the service did not even take a request.
    void check() {
        if (refused_.empty())
            return;
        const std::string message = std::exchange(refused_, "");
        if (!*given_.key) {
            // Without an answer it may be had all the same.
            lost_ = result_ != IMS_RESPONSE_FAILED;
            throw Failure(response_failure(result_).kind, message, response_failure(result_).hint,
                          {{"result", std::int64_t{result_}}});
        }
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
            lose(
                {FailureKind::kCallEnded,
                 event.row->summary(event.fields),
                 "",
                 {{"session_id", *event.number("value_1")}, {"reason", *event.number("value_2")}}});
        case IMS_NOTI_POC_CALL_FLOOR_REJECTED:
        case IMS_NOTI_POC_CALL_FLOOR_CANCELED:
        case IMS_NOTI_POC_CALL_FLOOR_REQUEST_TIMEOUT:
            // Of no importance to one who may press the key again.
            if (!*given_.key)
                lose({FailureKind::kFloor,
                      event.row->summary(event.fields),
                      "",
                      {{"session_id", *event.number("value_1")},
                       {"cause", *event.number("value_6")}}});
            break;
        default:
            break;
        }
    }

    [[noreturn]] void lose(const Failure &failure) {
        lost_ = true;
        throw failure;
    }

    void send(FloorRequest request) {
        ++unanswered_;
        run_.client().send(with_record(request, floor_), [this, request](int result) {
            --unanswered_;
            const bool releases = request == ims_poc_call_release_floor;
            if (result == 0 || (releases && result == kWrongState))
                return;
            const char *what = releases ? "release" : "request";
            refused_ = fmt::format("the floor {}: {}", what, response_failure(result).what());
            result_ = result;
        });
    }

    Invocation &run_;
    const TalkArguments &given_;
    ims_poc_floor_s floor_{};
    bool wanted_ = false; // by the user
    bool lost_ = false;   // for good: nothing is left to give back
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
            rows.push_back(find_event(ptt_events(), id));
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
        const auto is_settled = [&] { return talk.is_settled(); };
        try {
            watch.until_end([&](const Event &event) { return talk.take(event); },
                            [&] {
                                talk.check();
                                return key && key->wants_end();
                            });
        } catch (...) {
            key.reset();
            if (!watch.bus_is_gone()) {
                talk.give_back();
                watch.finish_soon(is_settled);
            }
            throw;
        }
        key.reset(); // so that it does not ask again
        talk.give_back();
        watch.finish(is_settled);
        talk.check();
    };
}

} // namespace imsctl
