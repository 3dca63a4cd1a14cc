// SPDX-License-Identifier: Apache-2.0
// Push-to-talk parties, sets and terms from a command line to the library's records.
#pragma once

#include "imsctl/line/verbs.hpp"
#include "imsctl/ptt/values.hpp"

namespace imsctl {

// "--to" and "--group", as many as are wanted.
struct PttTargets {
    Argument<std::vector<std::string>> parties;
    Argument<std::vector<std::string>> groups;
};
PttTargets ptt_targets(Arguments &arguments);

ims_poc_peer_info_s ptt_peer(const std::string &uri, bool is_group = false);

// The records want chains; these are some, over texts that live longer.
class PttPeerChain {
  public:
    explicit PttPeerChain(const PttTargets &targets);
    const ims_poc_peer_info_s *head() const { return peers_.empty() ? nullptr : peers_.data(); }

  private:
    std::vector<ims_poc_peer_info_s> peers_;
};

class PttUserChain {
  public:
    PttUserChain(const std::vector<std::string> &uris, bool is_anonymous);
    const ims_poc_user_s *head() const { return users_.data(); }
    std::int32_t count() const { return static_cast<std::int32_t>(users_.size()); }

  private:
    std::vector<ims_poc_user_s> users_;
};

// "--media"
Argument<std::optional<IntSet>> ptt_media(Arguments &arguments);

// "--priority", "--no-wait" and "--talk-time": on which terms a participant takes the floor.
struct PttTerms {
    Argument<std::int32_t> priority;
    Argument<bool> do_not_wait;
    Argument<std::int32_t> talk_time;

    // Nothing when none of them was given.
    std::optional<IntSet> set() const;
};
PttTerms ptt_terms(Arguments &arguments);

// All zero when there is none.
void store(const std::optional<IntSet> &set, std::int32_t (&member)[IMS_POC_INT_SET_SIZE]);

} // namespace imsctl
