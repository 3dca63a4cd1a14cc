// SPDX-License-Identifier: Apache-2.0
// Which call a verb is about, when the user does not say so.
#pragma once

#include "imsctl/client/invocation.hpp"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string_view>

namespace imsctl {

// The calls that a verb can be about.
struct Fitting {
    std::string_view what; // "calls that ring here"
    bool (*test)(const ims_call_info_s &call);
};

extern const Fitting kAnyCall;
extern const Fitting kRingingHere;
extern const Fitting kInConversation;
extern const Fitting kOnHold;
extern const Fitting kEstablished;
extern const Fitting kConference;
extern const Fitting kVideoCall;

// The only call that fits; a Failure that names the calls when there is none or more than one.
std::int32_t choose_session(const Fitting &fitting, std::span<const ims_call_info_s> calls);

// "1 (tel:+15550101, active)"
std::string describe(const ims_call_info_s &call);

// The session that was given, or else the one that the call list decides.
class SessionChoice {
  public:
    explicit SessionChoice(const Fitting &fitting)
        : fitting_(&fitting), given_(std::make_shared<std::optional<std::int32_t>>()) {}

    void give(std::int32_t session_id) const { *given_ = session_id; }

    std::int32_t resolve(Client &client) const;

  private:
    const Fitting *fitting_;
    std::shared_ptr<std::optional<std::int32_t>> given_;
};

} // namespace imsctl
