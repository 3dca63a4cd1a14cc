// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"
#include "sim/ptt/files.hpp"
#include "sim/ptt/messages.hpp"
#include "sim/ptt/model.hpp"
#include "sim/ptt/recorder.hpp"

namespace sim {

// org.kelvo.ims.Poc: requests to the models, answers and events to the bus.
class PttInterface {
  public:
    PttInterface(PttCalls &calls, PttRecorder &recorder, PttMessages &messages, PttFiles &files)
        : calls_(calls), recorder_(recorder), messages_(messages), files_(files) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Poc";
    Interface describe();

  private:
    using Outcome = Answer<Variant>;

    Outcome make_call(const Request &request);
    Outcome make_ad_hoc_call(const Request &request);
    Outcome add_users(const Request &request);
    Outcome remove_users(const Request &request);
    Outcome convert_to_crisis(const Request &request);
    Outcome answer_call(const Request &request);
    Outcome reject_call(const Request &request);
    Outcome end_call(const Request &request);
    Outcome request_floor(const Request &request);
    Outcome release_floor(const Request &request);
    Outcome request_floor_status(const Request &request);
    Outcome modify_call(const Request &request);
    Outcome accept_modify_call(const Request &request);
    Outcome reject_modify_call(const Request &request);
    Outcome set_channel(const Request &request);
    Outcome start_recording(const Request &request);
    Outcome pause_recording(const Request &request);
    Outcome resume_recording(const Request &request);
    Outcome stop_recording(const Request &request);
    Outcome cancel_recording(const Request &request);
    Outcome send_message(const Request &request);
    Outcome send_notice(const Request &request);
    Outcome transfer_file(const Request &request);
    Outcome accept_file(const Request &request);
    Outcome reject_file(const Request &request);
    Outcome cancel_file(const Request &request);
    Outcome send_keep_alive(const Request &request);

    static const MethodRow<PttInterface> kMethods[];

    PttCalls &calls_;
    PttRecorder &recorder_;
    PttMessages &messages_;
    PttFiles &files_;
};

} // namespace sim
