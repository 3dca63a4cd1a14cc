// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"
#include "sim/call/model.hpp"
#include "sim/call/ussd.hpp"

namespace sim {

// org.kelvo.ims.Call: requests to the model, answers and events to the bus.
class CallInterface {
  public:
    CallInterface(CallModel &calls, UssdService &ussd) : calls_(calls), ussd_(ussd) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Call";
    Interface describe();

  private:
    using Outcome = Answer<Variant>;

    Outcome make_call(const Request &request);
    Outcome send_ussd(const Request &request);
    Outcome answer_call(const Request &request);
    Outcome end_call(const Request &request);
    Outcome reject_call(const Request &request);
    Outcome hold_call(const Request &request);
    Outcome resume_call(const Request &request);
    Outcome swap_call(const Request &request);
    Outcome upgrade_call(const Request &request);
    Outcome downgrade_call(const Request &request);
    Outcome change_call(const Request &request);
    Outcome accept_change_request(const Request &request);
    Outcome reject_change_request(const Request &request);
    Outcome send_dtmf(const Request &request);
    Outcome start_dtmf(const Request &request);
    Outcome stop_dtmf(const Request &request);
    Outcome voice_record(const Request &request);
    Outcome send_tty_data(const Request &request);
    Outcome set_tty_mode(const Request &request);
    Outcome get_tty_mode(const Request &request);
    Outcome is_muted(const Request &request);
    Outcome toggle_mute(const Request &request);
    Outcome set_speaker_mode(const Request &request);
    Outcome set_volume(const Request &request);
    Outcome get_max_volume(const Request &request);
    Outcome add_user_for_conference_call(const Request &request);
    Outcome indicate_srvcc_ho_started(const Request &request);
    Outcome indicate_srvcc_ho_failed(const Request &request);
    Outcome set_auto_response(const Request &request);
    Outcome set_emergency_pdn_info(const Request &request);
    Outcome register_emergency_pdn(const Request &request);
    Outcome deregister_emergency_pdn(const Request &request);
    Outcome start_nway_conference_call(const Request &request);
    Outcome merge_calls(const Request &request);
    Outcome add_participant(const Request &request);
    Outcome remove_participant(const Request &request);
    Outcome is_in_epdg_call(const Request &request);
    Outcome update_ssac_info(const Request &request);
    Outcome change_epdg_audio_path(const Request &request);
    Outcome start_conference(const Request &request);
    Outcome modify_participants(const Request &request);
    Outcome call_list_info(const Request &request);

    static const MethodRow<CallInterface> kMethods[];

    CallModel &calls_;
    UssdService &ussd_;
};

} // namespace sim
