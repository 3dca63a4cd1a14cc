// SPDX-License-Identifier: Apache-2.0
#include "imsctl/ptt/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kPttVerbGroups[] = {
    {"ptt", "push-to-talk"},
    {"ptt floor", "the right to talk"},
    {"ptt message", "messages"},
    {"ptt file", "file transfer"},
    {"ptt record", "recording of calls"},
};

} // namespace

Module ptt_module() {
    return {
        kPttVerbGroups, {ptt_call_verbs(), ptt_floor_verbs(), ptt_content_verbs()}, {ptt_events()}};
}

} // namespace imsctl
