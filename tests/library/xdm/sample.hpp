// SPDX-License-Identifier: Apache-2.0
// A group document with everything in it, as it is sent and as the service answers it.
#pragma once

#include "ims.h"

#include <string>

namespace test {

// The records have room for texts that they own; a sample's are not written to.
inline char *text(const char *literal) {
    return const_cast<char *>(literal);
}

template <std::size_t Size>
void set_inline(char (&buffer)[Size], const char *literal) {
    std::string{literal}.copy(buffer, Size - 1);
}

extern const ims_xdm_member_entry_s kAlice; // type 5, active
extern const ims_xdm_member_list_s kMembers;
extern const ims_xdm_session_policy_s kPolicy;
extern const ims_xdm_age_restriction_s kAges;
extern const ims_xdm_group_rule_s kRules; // the first of four
extern const ims_xdm_group_info_s kGroup;

// The same as GVariant text.
extern const std::string kSentMembers;
extern const std::string kSentPolicy;
extern const std::string kSentAges;
extern const std::string kSentRules;
extern const std::string kSentGroup;
extern const std::string kAnsweredMembers;
extern const std::string kAnsweredRules;
extern const std::string kAnsweredGroup;

} // namespace test
