// SPDX-License-Identifier: Apache-2.0
// A document that came back against the one that was sent.
#pragma once

#include "ims.h"

namespace test {

// Expects what must come back of a document. A part that was missing comes back empty, a member's
// type is the service's, and of a rule's media only four were sent.
void expect_same_document(const ims_xdm_group_info_s &sent, const ims_xdm_group_info_s &received);

} // namespace test
