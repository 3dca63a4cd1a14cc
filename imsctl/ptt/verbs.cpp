// SPDX-License-Identifier: Apache-2.0
// Push-to-talk calls: placing, answering, changing and ending them; channels.
#include "imsctl/line/requests.hpp"
#include "imsctl/line/watching.hpp"
#include "imsctl/ptt/module.hpp"
#include "imsctl/ptt/parties.hpp"

#include <fmt/format.h>
#include <limits>

namespace imsctl {
namespace {

constexpr const char *kSession = "SESSION,--session";
constexpr const char *kSessionHelp = "the session";

// What the one who places a call says of it.
struct Offer {
    Argument<bool> crisis;
    Argument<bool> automatic;
    Argument<bool> floor;
    Argument<std::string> name;
    Argument<std::optional<IntSet>> media;
    PttTerms terms;
    Argument<std::int32_t> answer_time;
};

Offer offer(Arguments &arguments) {
    return {arguments.flag("--crisis", "place it as a crisis call"),
            arguments.flag("--automatic", "the others answer without being asked"),
            arguments.flag("--floor", "take the floor at once"),
            arguments.text_or("--name", "the caller's name", ""),
            ptt_media(arguments),
            ptt_terms(arguments),
            arguments.number("--answer-time", "how many seconds it rings; 0: as usual", 0)};
}

Action prepare_call(Arguments &arguments) {
    const auto uri = arguments.text_or(
        "URI", "whom to call: a party or a group; nobody with --type channel", "");
    const auto type = arguments.choice("--type", "the kind of call", kPttTypes, 0);
    const Offer given = offer(arguments);
    return [=](Invocation &run) {
        ims_poc_make_call_s info{};
        info.flag_1 = *given.crisis;
        info.flag_2 = *given.automatic;
        info.flag_3 = *given.floor;
        info.text_1 = uri->c_str();
        info.value_1 = *type;
        info.text_2 = given.name->c_str();
        store(*given.media, info.int_set_1);
        store(given.terms.set(), info.int_set_2);
        info.value_2 = *given.answer_time;
        run.request({}, with_record(ims_poc_call_make_call, info), number_as("session_id"));
    };
}

void start_ad_hoc(Invocation &run, const Offer &given, const std::string &subject,
                  const PttUserChain &users) {
    ims_poc_ad_hoc_call_s info{};
    store(*given.media, info.int_set_1);
    info.flag_1 = *given.crisis;
    store(given.terms.set(), info.int_set_2);
    info.text_1 = subject.c_str();
    info.text_2 = given.name->c_str();
    info.flag_2 = *given.automatic;
    info.user_count = users.count();
    info.flag_3 = *given.floor;
    info.value_1 = *given.answer_time;
    info.user_list = users.head();
    run.request({}, with_record(ims_poc_make_ad_hoc_call, info), number_as("session_id"));
}

// The session whose users change; 0 when it is left out.
Argument<std::int32_t> change_of(Arguments &arguments, const char *name, const char *help) {
    return arguments.number_from(1, std::numeric_limits<std::int32_t>::max(), name, help, 0);
}

Action prepare_ad_hoc(Arguments &arguments) {
    const auto uris = arguments.texts("USER", "whom it is about, one or more");
    const auto add_to = change_of(arguments, "--add-to", "add the users to this session");
    const auto remove_from =
        change_of(arguments, "--remove-from", "remove the users from this session");
    const auto subject = arguments.text_or("--subject", "what the call is about", "");
    const auto anonymous = arguments.flag("--anonymous", "hide the users from each other");
    const Offer given = offer(arguments);
    std::vector<std::string> of_new_calls = {"--subject", "--crisis",   "--floor",   "--name",
                                             "--media",   "--priority", "--no-wait", "--talk-time"};
    const auto check_adding = arguments.no_effect_beside("--add-to", of_new_calls);
    of_new_calls.insert(of_new_calls.end(), {"--automatic", "--answer-time"});
    const auto check_removing = arguments.no_effect_beside("--remove-from", of_new_calls);
    return [=](Invocation &run) {
        if (*add_to != 0 && *remove_from != 0)
            throw Failure(FailureKind::kUsage, "--add-to and --remove-from exclude each other");
        check_adding();
        check_removing();
        const PttUserChain users(*uris, *anonymous);
        if (*add_to == 0 && *remove_from == 0)
            return start_ad_hoc(run, given, *subject, users);
        const bool adds = *add_to != 0;
        const ims_poc_users_s info{adds ? *add_to : *remove_from,
                                   users.count(),
                                   *given.automatic ? 1 : 0,
                                   users.head(),
                                   *given.answer_time,
                                   nullptr};
        run.request(session_id_field(info.value_1),
                    with_record(adds ? ims_poc_add_users_to_ad_hoc_call
                                     : ims_poc_remove_users_from_ad_hoc_call,
                                info));
    };
}

ims_poc_call_media_s media_record(std::int32_t session, std::int32_t reference,
                                  const std::optional<IntSet> &media,
                                  const std::optional<IntSet> &terms) {
    ims_poc_call_media_s info{media.has_value(), terms.has_value(), session, reference, {}, {}};
    store(media, info.int_set_1);
    store(terms, info.int_set_2);
    return info;
}

Action prepare_answer(Arguments &arguments) {
    const auto session = arguments.number(kSession, kSessionHelp);
    const auto media = ptt_media(arguments);
    const PttTerms terms = ptt_terms(arguments);
    return [=](Invocation &run) {
        const auto info = media_record(*session, 0, *media, terms.set());
        run.request(session_id_field(*session), with_record(ims_poc_call_answer_call, info));
    };
}

Action on_number(const Argument<std::int32_t> &session, NumberRequest request) {
    return [=](Invocation &run) {
        run.request(session_id_field(*session),
                    [&](ims_h handle, ims_response_cb callback, void *user_data) {
                        return request(handle, *session, callback, user_data);
                    });
    };
}

Action prepare_modify(Arguments &arguments) {
    const auto session = arguments.number(kSession, kSessionHelp);
    const auto accept = arguments.flag("--accept", "accept what a party asks for");
    const auto reject = arguments.flag("--reject", "reject what a party asks for");
    const auto media = ptt_media(arguments);
    const PttTerms terms = ptt_terms(arguments);
    const auto reference =
        arguments.number("--reference", "a number that comes back with the outcome", 0);
    const auto check_rejecting = arguments.no_effect_beside(
        "--reject", {"--media", "--priority", "--no-wait", "--talk-time", "--reference"});
    return [=](Invocation &run) {
        if (*accept && *reject)
            throw Failure(FailureKind::kUsage, "--accept and --reject exclude each other");
        check_rejecting();
        if (*reject)
            return on_number(session, ims_poc_reject_call_modify)(run);
        const auto info = media_record(*session, *reference, *media, terms.set());
        if (!*accept && !info.flag_1 && !info.flag_2)
            throw Failure(FailureKind::kUsage, "nothing is to change",
                          fmt::format("try: imsctl ptt modify {} --media voice,video", *session));
        run.request(session_id_field(*session),
                    with_record(*accept ? ims_poc_accept_call_modify : ims_poc_modify_call, info));
    };
}

using ValuePairRequest = int (*)(ims_h, const ims_poc_value_pair_s *, ims_response_cb, void *);

Action with_value_pair(std::string_view name, const Argument<std::int32_t> &first,
                       const Argument<std::int32_t> &second, ValuePairRequest request) {
    return [=](Invocation &run) {
        const ims_poc_value_pair_s pair{*first, *second};
        run.request({{name, std::int64_t{*first}}}, with_record(request, pair));
    };
}

Action prepare_reject(Arguments &arguments) {
    const auto session = arguments.number(kSession, kSessionHelp);
    const auto reason = arguments.choice("--reason", "why", kRejectReasons, 0);
    return with_value_pair("session_id", session, reason, ims_poc_call_reject_call);
}

Action prepare_end(Arguments &arguments) {
    const auto session = arguments.number(kSession, kSessionHelp);
    const auto scope = arguments.choice("--scope", "for whom it ends", kPttEndScopes, 0);
    return with_value_pair("session_id", session, scope, ims_poc_call_end_call);
}

Action prepare_channel(Arguments &arguments) {
    const auto channel = arguments.number("CHANNEL", "the channel's number; 0 for none");
    const auto mode = arguments.choice("--mode", "what to do there", kPttChannelModes, 0);
    return with_value_pair("channel", channel, mode, ims_poc_set_channel);
}

Action prepare_crisis(Arguments &arguments) {
    const auto session = arguments.number(kSession, kSessionHelp);
    return [=](Invocation &run) {
        run.request(session_id_field(*session),
                    with_record(ims_poc_call_convert_normal_call_to_crisis_call, *session));
    };
}

Action prepare_keep_alive(Arguments &arguments) {
    return with_number(
        arguments.number("SECONDS", "the next one follows within this time; 0: none does"),
        ims_poc_send_keep_alive);
}

std::string in_words(const Event &event) {
    return fmt::format("{} {}", local_clock_time(event.time), event.row->summary(event.fields));
}

Action prepare_watch(Arguments &arguments) {
    const WatchLimits limits = watch_limits(arguments);
    return [=](Invocation &run) {
        std::vector<const EventRow *> rows;
        for (const EventRow &row : ptt_events())
            rows.push_back(&row);
        Watch watch(run, limits, rows, "watching push-to-talk of");
        watch.until_end([&](const Event &event) {
            if (run.output().json())
                show_event(run, event);
            else
                run.output().line(in_words(event));
            return true;
        });
    };
}

constexpr Verb kPttCallVerbs[] = {
    {"ptt call", "place a push-to-talk call", "ptt call sip:all@groups.invalid --type group",
     prepare_call},
    {"ptt adhoc", "call users who are no group yet; add some, or remove them",
     "ptt adhoc +15550101 +15550102 --subject lunch", prepare_ad_hoc},
    {"ptt answer", "answer an incoming call", "ptt answer 1", prepare_answer},
    {"ptt reject", "reject an incoming call", "ptt reject 1 --reason busy", prepare_reject},
    {"ptt end", "leave a call, or end it for all", "ptt end 1 --scope all", prepare_end},
    {"ptt modify", "ask for other media or terms, or answer to a party that asks",
     "ptt modify 1 --media voice,video", prepare_modify},
    {"ptt channel", "tune to a channel", "ptt channel 5 --mode listen", prepare_channel},
    {"ptt crisis", "make a call a crisis call", "ptt crisis 1", prepare_crisis},
    {"ptt keep-alive", "give a sign of life", "ptt keep-alive 30", prepare_keep_alive},
    {"ptt watch", "show what happens, in words, until it is stopped with Ctrl-C or a signal",
     "ptt watch", prepare_watch},
};

} // namespace

std::span<const Verb> ptt_call_verbs() {
    return kPttCallVerbs;
}

} // namespace imsctl
