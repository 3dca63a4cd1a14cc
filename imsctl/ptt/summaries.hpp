// SPDX-License-Identifier: Apache-2.0
// What the fields of the push-to-talk events come to, in words: those of the stand-in service.
#pragma once

#include "imsctl/output/fields.hpp"

namespace imsctl {

std::string summarise_poc_in_progress(const Fields &fields);
std::string summarise_poc_alerting(const Fields &fields);
std::string summarise_poc_crisis(const Fields &fields);
std::string summarise_poc_incoming(const Fields &fields);
std::string summarise_poc_established(const Fields &fields);
std::string summarise_poc_ended(const Fields &fields);

std::string summarise_floor_granted(const Fields &fields);
std::string summarise_floor_idle(const Fields &fields);
std::string summarise_floor_position(const Fields &fields);
std::string summarise_floor_taken(const Fields &fields);
// Rejected, canceled, waited for too long.
std::string summarise_floor_refusal(const Fields &fields);

std::string summarise_poc_modify_request(const Fields &fields);
std::string summarise_poc_modify_status(const Fields &fields);
std::string summarise_poc_advertisement(const Fields &fields);
std::string summarise_poc_participant(const Fields &fields);
std::string summarise_poc_message(const Fields &fields);
std::string summarise_poc_notice(const Fields &fields);
std::string summarise_poc_file(const Fields &fields);
std::string summarise_poc_progress(const Fields &fields);
std::string summarise_poc_terminated(const Fields &fields);

} // namespace imsctl
