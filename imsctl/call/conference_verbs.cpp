// SPDX-License-Identifier: Apache-2.0
// Calls with more than two parties.
#include "imsctl/call/module.hpp"
#include "imsctl/call/session_value.hpp"
#include "imsctl/call/values.hpp"
#include "imsctl/line/requests.hpp"

namespace imsctl {
namespace {

// The records want a chain of texts; this is one, over texts that live longer.
class ParticipantChain {
  public:
    explicit ParticipantChain(const std::vector<std::string> &texts) : nodes_(texts.size()) {
        for (std::size_t i = 0; i < texts.size(); ++i)
            nodes_[i] = {texts[i].c_str(), i + 1 < texts.size() ? &nodes_[i + 1] : nullptr};
    }

    const ims_call_participant_s *head() const { return nodes_.empty() ? nullptr : nodes_.data(); }
    std::int32_t count() const { return static_cast<std::int32_t>(nodes_.size()); }

  private:
    std::vector<ims_call_participant_s> nodes_;
};

Action prepare_start(Arguments &arguments) {
    const auto numbers = arguments.texts("NUMBER", "whom to invite, one or more");
    const auto type = arguments.choice("--type", "the kind of call", kCallTypes, 0);
    return [=](Invocation &run) {
        const ParticipantChain chain(*numbers);
        const ims_call_conference_s info{*type, chain.count(), chain.head()};
        run.request({}, with_record(ims_call_start_conference, info),
                    number_in_place_as("session_id"));
    };
}

Action prepare_modify(Arguments &arguments) {
    const auto change = arguments.choice("CHANGE", "what to do", kConferenceChanges);
    const auto numbers = arguments.texts("NUMBER", "whom, one or more");
    const auto session = arguments.session_option(kConference);
    return [=](Invocation &run) {
        const ParticipantChain chain(*numbers);
        const ims_call_conference_modify_s info{session.resolve(run.client()), *change,
                                                chain.count(), chain.head()};
        run.request(session_id_field(info.session_id),
                    with_record(ims_call_modify_participants_in_conference, info),
                    number_in_place_as("value_1"));
    };
}

Action prepare_add_user(Arguments &arguments) {
    const auto number = arguments.text("NUMBER", "whom to invite");
    const auto type = arguments.choice("--type", "the kind of call", kCallTypes, 0);
    const auto session = arguments.session_option(kConference);
    return [=](Invocation &run) {
        const ims_call_conf_user_s info{session.resolve(run.client()), number->c_str(), *type};
        run.request(session_id_field(info.session_id),
                    with_record(ims_call_add_user_for_conference_call, info));
    };
}

Action prepare_nway_start(Arguments &arguments) {
    const auto first = arguments.session("FIRST,--first", kInConversation);
    const auto second = arguments.session("SECOND,--second", kOnHold);
    const auto type = arguments.choice("--type", "the kind of call", kCallTypes, 0);
    return [=](Invocation &run) {
        const std::int32_t first_id = first.resolve(run.client());
        const ims_call_id_info_s info{first_id, second.resolve(run.client()), *type};
        run.request({}, with_record(ims_call_start_nway_conference_call, info),
                    number_as("session_id"));
    };
}

Action prepare_nway_change(Arguments &arguments, PairRequest request) {
    const auto call = arguments.number("CALL", "the session of the call");
    return on_session(arguments.session_option(kConference), call, request);
}

constexpr Verb kConferenceVerbs[] = {
    {"call conference start", "start a conference with a list of parties",
     "call conference start +15550101 +15550150", prepare_start},
    {"call conference modify", "add parties to a conference, or remove them",
     "call conference modify add +15550151", prepare_modify},
    {"call conference merge", "merge the active and the held call", "call conference merge",
     [](Arguments &) { return plain(ims_call_merge_calls, number_as("session_id")); }},
    {"call conference add-user", "invite one party into a conference",
     "call conference add-user +15550151", prepare_add_user},
    {"call conference nway start", "make a conference of two calls",
     "call conference nway start 1 2", prepare_nway_start},
    {"call conference nway add", "take a call into a conference",
     "call conference nway add 4 --session 3",
     [](Arguments &arguments) {
         return prepare_nway_change(arguments, ims_call_add_participant_to_nway_conference_call);
     }},
    {"call conference nway remove", "remove a call from a conference",
     "call conference nway remove 2 --session 3",
     [](Arguments &arguments) {
         return prepare_nway_change(arguments,
                                    ims_call_remove_participant_from_nway_conference_call);
     }},
};

} // namespace

std::span<const Verb> conference_verbs() {
    return kConferenceVerbs;
}

} // namespace imsctl
