// SPDX-License-Identifier: Apache-2.0
// Showing what arrives as short messages, put together and in words.
#include "imsctl/sms/watch.hpp"

#include "imsctl/line/requests.hpp"
#include "imsctl/line/watching.hpp"
#include "imsctl/sms/delivery_report.hpp"
#include "imsctl/sms/module.hpp"
#include "imsctl/sms/received_message.hpp"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

class Inbox {
  public:
    Inbox(Invocation &run, bool with_reports) : run_(run), with_reports_(with_reports) {}

    // Whether there was something to show: a part of a message is not.
    bool take(const Event &event) {
        const auto *tpdu = std::get_if<Binary>(event.find("tpdu"));
        const Received received = read_.read(tpdu->bytes);
        if (with_reports_ && received.wants_report)
            acknowledge(event);
        if (!received.is_complete())
            return false;
        show(event, received);
        return true;
    }

    void finish(Watch &watch) {
        watch.finish([&] { return unanswered_ == 0; });
        if (read_.incomplete() > 0)
            run_.output().note(fmt::format("messages that lack parts: {}", read_.incomplete()));
    }

  private:
    void show(const Event &event, const Received &received) const {
        const Output &output = run_.output();
        output.line(output.json() ? dump(to_json(received, event, run_.settings().slot))
                                  : to_text(received, event));
    }

    // Others want to see the next message meanwhile: nobody waits for the answer.
    void acknowledge(const Event &event) {
        const auto number = static_cast<std::int32_t>(*event.number("member_3"));
        const tpdu::Octets octets = delivery_report_tpdu(std::nullopt);
        const ims_sms_deliver_report_s report =
            delivery_report(octets, {report_code::kReceived, number});
        ++unanswered_;
        const auto answered = [this, number](int result) {
            --unanswered_;
            if (result != 0)
                run_.output().note(
                    fmt::format("imsctl: sms watch: the delivery report on message {}: {}", number,
                                response_failure(result).what()));
        };
        run_.client().send(with_record(ims_sms_send_deliver_report, report), answered);
    }

    Invocation &run_;
    bool with_reports_;
    MessageReader read_;
    int unanswered_ = 0;
};

} // namespace

Action prepare_sms_watch(Arguments &arguments) {
    const auto silent = arguments.flag("--no-report", "do not answer with delivery reports");
    const WatchLimits limits = watch_limits(arguments);
    return [=](Invocation &run) {
        Watch watch(run, limits, {find_event(sms_events(), IMS_NOTI_SMS_INCOMING_SMS)},
                    "watching the short messages of");
        Inbox inbox(run, !*silent);
        watch.until_end([&](const Event &event) { return inbox.take(event); });
        inbox.finish(watch);
    };
}

} // namespace imsctl
