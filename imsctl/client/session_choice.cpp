// SPDX-License-Identifier: Apache-2.0
#include "imsctl/client/session_choice.hpp"

#include "imsctl/client/call_values.hpp"

#include <fmt/format.h>
#include <fmt/ranges.h>

namespace imsctl {
namespace {

std::string describe_all(const std::vector<const ims_call_info_s *> &calls) {
    std::vector<std::string> parts;
    parts.reserve(calls.size());
    for (const auto *call : calls)
        parts.push_back(describe(*call));
    return fmt::format("{}", fmt::join(parts, ", "));
}

std::vector<const ims_call_info_s *> pointers(std::span<const ims_call_info_s> calls) {
    std::vector<const ims_call_info_s *> all;
    for (const auto &call : calls)
        all.push_back(&call);
    return all;
}

} // namespace

const Fitting kAnyCall{"calls", [](const ims_call_info_s &) { return true; }};
const Fitting kRingingHere{"calls that ring here", [](const ims_call_info_s &call) {
                               return call.call_state == call_state::kIncoming ||
                                      call.call_state == call_state::kWaiting;
                           }};
const Fitting kInConversation{"active calls", [](const ims_call_info_s &call) {
                                  return call.call_state == call_state::kActive ||
                                         call.call_state == call_state::kHeldByPeer;
                              }};
const Fitting kOnHold{"calls on hold", [](const ims_call_info_s &call) {
                          return call.call_state == call_state::kHeld;
                      }};
const Fitting kEstablished{"established calls", [](const ims_call_info_s &call) {
                               return kInConversation.test(call) || kOnHold.test(call);
                           }};
const Fitting kConference{"conferences",
                          [](const ims_call_info_s &call) { return call.bconfcall; }};
const Fitting kVideoCall{"video calls",
                         [](const ims_call_info_s &call) { return call.call_type == kVideo; }};

std::string describe(const ims_call_info_s &call) {
    return fmt::format("{} ({}, {}{})", call.session_id,
                       call.peer_uri == nullptr ? "-" : escape(call.peer_uri),
                       name_of(kCallStates, call.call_state), call.bconfcall ? ", conference" : "");
}

std::int32_t choose_session(const Fitting &fitting, std::span<const ims_call_info_s> calls) {
    if (calls.empty())
        throw Failure(FailureKind::kSession, "there are no calls",
                      "try: imsctl call dial +15550101, or another --slot");
    std::vector<const ims_call_info_s *> candidates;
    for (const auto &call : calls)
        if (fitting.test(call))
            candidates.push_back(&call);
    if (candidates.size() == 1)
        return candidates.front()->session_id;
    if (candidates.empty())
        throw Failure(FailureKind::kSession,
                      fmt::format("there are no {}; all calls: {}", fitting.what,
                                  describe_all(pointers(calls))));
    throw Failure(FailureKind::kSession,
                  fmt::format("there are {} {}: {}", candidates.size(), fitting.what,
                              describe_all(candidates)),
                  "say which one: SESSION or --session SESSION");
}

std::int32_t SessionChoice::resolve(Client &client) const {
    if (*given_)
        return **given_;
    const CallList list = client.call_list();
    return choose_session(*fitting_, {list->entries, list->count});
}

} // namespace imsctl
