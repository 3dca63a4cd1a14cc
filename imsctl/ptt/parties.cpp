// SPDX-License-Identifier: Apache-2.0
#include "imsctl/ptt/parties.hpp"

#include <algorithm>

namespace imsctl {
namespace {

constexpr std::int32_t kNotGiven = -1;
constexpr std::int32_t kTopPriority = 7;
constexpr std::int32_t kLongestTalk = 3600;

template <class Node>
void link(std::vector<Node> &nodes) {
    for (std::size_t at = 1; at < nodes.size(); ++at)
        nodes[at - 1].next = &nodes[at];
}

std::int32_t uri_type(const std::string &uri) {
    return uri.starts_with("sip:") ? 1 : 0;
}

} // namespace

PttTargets ptt_targets(Arguments &arguments) {
    return {arguments.some_texts("--to", "a party that it goes to; may be given several times"),
            arguments.some_texts("--group", "a group that it goes to, by its URI")};
}

ims_poc_peer_info_s ptt_peer(const std::string &uri, bool is_group) {
    return {uri_type(uri), uri.c_str(), nullptr, is_group, nullptr};
}

PttPeerChain::PttPeerChain(const PttTargets &targets) {
    for (const std::string &party : *targets.parties)
        peers_.push_back(ptt_peer(party));
    for (const std::string &group : *targets.groups)
        peers_.push_back(ptt_peer(group, true));
    link(peers_);
}

PttUserChain::PttUserChain(const std::vector<std::string> &uris, bool is_anonymous) {
    for (const std::string &uri : uris)
        users_.push_back({uri_type(uri), uri.c_str(), nullptr, false, is_anonymous, 0, 0, nullptr});
    link(users_);
}

Argument<std::optional<IntSet>> ptt_media(Arguments &arguments) {
    return arguments.set("--media", "the media", kPttMedia);
}

PttTerms ptt_terms(Arguments &arguments) {
    return {arguments.number_from(0, kTopPriority, "--priority",
                                  "the highest that the floor is asked for with, 0 to 7",
                                  kNotGiven),
            arguments.flag("--no-wait", "never wait for the floor"),
            arguments.number_from(0, kLongestTalk, "--talk-time",
                                  "how many seconds to talk at most; 0: as usual", kNotGiven)};
}

std::optional<IntSet> PttTerms::set() const {
    if (*priority == kNotGiven && !*do_not_wait && *talk_time == kNotGiven)
        return std::nullopt;
    return IntSet{std::max(*priority, 0), *do_not_wait ? 1 : 0, std::max(*talk_time, 0), 0};
}

void store(const std::optional<IntSet> &set, std::int32_t (&member)[IMS_POC_INT_SET_SIZE]) {
    const IntSet values = set.value_or(IntSet{});
    std::copy(values.begin(), values.end(), member);
}

} // namespace imsctl
