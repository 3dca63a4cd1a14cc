// SPDX-License-Identifier: Apache-2.0
// What the fields of the push-to-talk events come to, in words: those of the stand-in service.
#pragma once

#include "imsctl/output/fields.hpp"

namespace imsctl {

std::string summarise_ptt_in_progress(const Fields &fields);
std::string summarise_ptt_alerting(const Fields &fields);
std::string summarise_ptt_crisis(const Fields &fields);
std::string summarise_ptt_incoming(const Fields &fields);
std::string summarise_ptt_established(const Fields &fields);
std::string summarise_ptt_ended(const Fields &fields);

std::string summarise_floor_granted(const Fields &fields);
std::string summarise_floor_idle(const Fields &fields);
std::string summarise_floor_position(const Fields &fields);
std::string summarise_floor_taken(const Fields &fields);
// Rejected, canceled, waited for too long.
std::string summarise_floor_refusal(const Fields &fields);

std::string summarise_ptt_modify_request(const Fields &fields);
std::string summarise_ptt_modify_status(const Fields &fields);
std::string summarise_ptt_advertisement(const Fields &fields);
std::string summarise_ptt_participant(const Fields &fields);
std::string summarise_ptt_message(const Fields &fields);
std::string summarise_ptt_notice(const Fields &fields);
std::string summarise_ptt_file(const Fields &fields);
std::string summarise_ptt_progress(const Fields &fields);
std::string summarise_ptt_terminated(const Fields &fields);

} // namespace imsctl
