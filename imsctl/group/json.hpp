// SPDX-License-Identifier: Apache-2.0
// What the service tells about groups, as JSON and for people. Counts are not in it: a list has its
// own length, and is null when the service's count was wrong.
#pragma once

#include "imsctl/output/fields.hpp"

#include <ims.h>

namespace imsctl {

// The keys are the names of the record's fields.
Json to_json(ims_xdm_group_info_s &group);
Json to_json(ims_xdm_shared_group_list_s &list);
Json to_json(ims_xdm_participant_groups_s &groups);
Json to_json(ims_xdm_user_profile_s &profile);
Json to_json(ims_xdm_participant_info_s &info);

// An indented outline: the plain values of an object in one line, its parts below. What is missing
// is left out.
std::string outline(const Json &object);

} // namespace imsctl
