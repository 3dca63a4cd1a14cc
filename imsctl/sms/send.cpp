// SPDX-License-Identifier: Apache-2.0
// Sending a text as one short message or as many as it takes.
#include "imsctl/sms/send.hpp"

#include "imsctl/line/requests.hpp"
#include "imsctl/sms/module.hpp"
#include "imsctl/sms/short_message.hpp"

#include <algorithm>
#include <fmt/format.h>
#include <limits>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

constexpr std::int32_t kNotGiven = std::numeric_limits<std::int32_t>::min();

struct SendArguments {
    Argument<std::string> number;
    Argument<std::string> text;
    Argument<std::string> data;
    Argument<std::string> service_centre;
    Argument<std::string> validity;
    Argument<bool> status_report;
    Argument<std::int32_t> message_class;
    Argument<std::int32_t> reference;
    Argument<std::int32_t> option;
    Argument<bool> wait;
};

constexpr const char *kHint = "try: imsctl sms send +15550101 'See you at 8'";

[[noreturn]] void refuse(std::string_view name, std::string_view problem) {
    throw Failure(FailureKind::kUsage, fmt::format("{}: {}", name, problem), kHint);
}

// As people write it and as `call dial` takes it: "tel:", separators and parameters are no part
// of the number. The letters a to c, which an address can hold, are none that anybody dials.
tpdu::Address address(std::string_view name, const std::string &number) {
    constexpr std::string_view kScheme = "tel:";
    constexpr std::string_view kSeparators = " -.()";
    constexpr std::string_view kDialled = "+0123456789*#";
    std::string bare = number.substr(number.starts_with(kScheme) ? kScheme.size() : 0);
    bare.resize(std::min(bare.find(';'), bare.size()));
    std::erase_if(bare, [&](char letter) { return kSeparators.find(letter) != kSeparators.npos; });
    const auto address = tpdu::number_address(bare);
    if (!address || bare.find_first_not_of(kDialled) != bare.npos)
        refuse(name, fmt::format("{} is not a number of 1 to {} digits", quote(number),
                                 tpdu::kMaxAddressSemiOctets));
    return *address;
}

tpdu::Octets octets(const std::string &text) {
    auto octets = tpdu::from_hex(text);
    if (!octets)
        refuse("--data", fmt::format("{} is not made of octets in hexadecimal", quote(text)));
    return *std::move(octets);
}

tpdu::MessageClass message_class(std::int32_t value) {
    constexpr std::int32_t kLast = 3;
    if (value < 0 || value > kLast)
        refuse("--class", fmt::format("{} is not from 0 to {}", value, kLast));
    return static_cast<tpdu::MessageClass>(value);
}

tpdu::Validity validity(const std::string &text) {
    const auto validity = parse_validity(text);
    if (!validity)
        refuse("--validity", validity.error().message);
    return *validity;
}

Submission submission(const SendArguments &given) {
    if (given.text->empty() == given.data->empty())
        throw Failure(FailureKind::kUsage, "one of TEXT and --data is needed", kHint);
    Submission submission;
    submission.destination = address("NUMBER", *given.number);
    submission.text = *given.text;
    if (!given.data->empty())
        submission.data = octets(*given.data);
    if (*given.message_class != kNotGiven)
        submission.message_class = message_class(*given.message_class);
    if (!given.validity->empty())
        submission.validity = validity(*given.validity);
    submission.status_report = *given.status_report;
    submission.reference =
        *given.reference != kNotGiven
            ? static_cast<std::uint8_t>(*given.reference)
            : usual_reference(tpdu::to_text(submission.destination), *given.text + *given.data);
    return submission;
}

// Without a number the type of address stands alone: the network takes its own service centre.
tpdu::Octets service_centre(const std::string &number) {
    constexpr std::uint8_t kUnknownIsdn = 0x81;
    if (number.empty())
        return {0, kUnknownIsdn};
    return tpdu::encode_address(address("--sca", number)).value();
}

Submitted compose_or_refuse(const Submission &submission) {
    auto submitted = compose(submission);
    if (!submitted)
        refuse(submission.data ? "--data" : "TEXT", submitted.error().message);
    return *std::move(submitted);
}

struct SendOptions {
    tpdu::Octets service_centre;
    std::int32_t option; // kNotGiven: tells the service whether more parts follow
    bool wait;
};

class Sending {
  public:
    Sending(Invocation &run, const Submitted &submitted, SendOptions options)
        : run_(run), submitted_(submitted), options_(std::move(options)) {
        if (options_.wait)
            run_.client().watch(*find_event(sms_events(), IMS_NOTI_SMS_SEND_SMS_ACK));
    }

    void send_all() {
        for (const SubmittedPart &part : submitted_.parts) {
            Fields known = fields_of(part);
            try {
                send(part);
                if (options_.wait)
                    await_acknowledgement(part, known);
            } catch (Failure &failure) {
                failure.details.insert(failure.details.end(), known.begin(), known.end());
                throw;
            }
            ++sent_;
            report(known);
        }
        if (run_.output().json())
            run_.output().result(
                {{"alphabet", std::string(to_string(submitted_.alphabet))}, {"parts", reported_}},
                "");
    }

  private:
    Fields fields_of(const SubmittedPart &part) const {
        return {{"part", static_cast<std::int64_t>(sent_ + 1)},
                {"of", static_cast<std::int64_t>(submitted_.parts.size())},
                {"reference", std::int64_t{part.reference}}};
    }

    std::int32_t option() const {
        const bool is_last = sent_ + 1 == submitted_.parts.size();
        return options_.option != kNotGiven ? options_.option : is_last ? 0 : 1;
    }

    void send(const SubmittedPart &part) {
        // The library rewrites the first byte: each part needs an address of its own.
        tpdu::Octets centre = options_.service_centre;
        const ims_sms_send_info_s info{
            part.tpdu.data(), static_cast<std::int32_t>(part.tpdu.size()), centre.data(), option()};
        run_.client().request(with_record(ims_sms_send_sms, info));
    }

    void await_acknowledgement(const SubmittedPart &part, Fields &known) {
        std::optional<Event> mine;
        const auto arrived = [&] {
            while (!mine && run_.client().has_event()) {
                Event event = run_.client().take_event();
                if (event.number("member_3") == part.reference)
                    mine = std::move(event);
            }
            return mine.has_value();
        };
        const Seconds limit = run_.settings().timeout;
        if (!run_until(limit, arrived))
            throw Failure(FailureKind::kTimeout,
                          fmt::format("no acknowledgement within {} s", limit));
        known.push_back({"message_number", *mine->find("member_1")});
        if (mine->number("member_2") != 0)
            throw Failure(FailureKind::kNotSent,
                          fmt::format("part {} of {} is {}", sent_ + 1, submitted_.parts.size(),
                                      mine->row->summary(mine->fields)),
                          "", {{"cause", *mine->find("member_2")}});
    }

    void report(const Fields &known) {
        if (run_.output().json())
            add_json(reported_.emplace_back(Json::object()), known);
        else
            run_.output().line(to_text(known));
    }

    Invocation &run_;
    const Submitted &submitted_;
    const SendOptions options_;
    std::size_t sent_ = 0;
    Json reported_ = Json::array();
};

} // namespace

Action prepare_sms_send(Arguments &arguments) {
    SendArguments given;
    given.number = arguments.text("NUMBER", "whom to: +15550101");
    given.text = arguments.text_or("TEXT", "what to send", "");
    given.data = arguments.text_or("--data", "octets in hexadecimal instead of TEXT", "");
    given.service_centre = arguments.text_or("--sca", "the service centre's number", "");
    given.validity = arguments.text_or(
        "--validity", "how long to try: a number with s, m, h, d or w behind it", "");
    given.status_report = arguments.flag("--report", "ask for a report on the delivery");
    given.message_class =
        arguments.choice("--class", "how it is stored", kMessageClasses, kNotGiven);
    given.reference = arguments.number_from(
        0, std::numeric_limits<std::uint8_t>::max(), "--reference",
        "the first part's reference (default: made of number and text)", kNotGiven);
    given.option = arguments.number(
        "--option", "the send option (default: 1 when more parts follow, else 0)", kNotGiven);
    given.wait = arguments.flag("--wait", "wait until the service centre has taken each part");
    return [given](Invocation &run) {
        const Submitted submitted = compose_or_refuse(submission(given));
        Sending(run, submitted, {service_centre(*given.service_centre), *given.option, *given.wait})
            .send_all();
    };
}

} // namespace imsctl
