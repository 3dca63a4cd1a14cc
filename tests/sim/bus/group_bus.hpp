// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/wire.hpp"
#include "sim/group/writer.hpp"
#include "tests/sim/bus/served_with_state.hpp"
#include "tests/sim/group/samples.hpp"

// org.kelvo.ims.Xdm of the real program.
namespace sim::test {

constexpr const char *kCrew = "sip:crew@example.org";

// As clients write it, or as the service answers it.
template <typename Record>
std::string text_of(const Record &record, GroupForm form) {
    return wire::write_dictionary(write_record(record, form)).print();
}

class XdmBus : public ServedWithState {
  protected:
    XdmBus() { register_on_slots(); }

    Reply call(const char *method, const std::string &arguments, int slot = 0) {
        return client_->call(slot, kXdm, method, arguments);
    }
    // The method with a group and one more argument.
    std::string edit(const char *method, const std::string &argument) {
        return call(method, fmt::format("('{}', {})", kCrew, argument)).body;
    }
    std::string create(const GroupDocument &group) {
        return call("XdmCreateGroup", "(" + text_of(group, GroupForm::kWritten) + ",)").body;
    }
    std::string fetch(const std::string &uri = kCrew, int slot = 0) {
        const auto reply = call("XdmFetchSharedGroup", fmt::format("('{}', '')", uri), slot);
        EXPECT_EQ(reply.type, "(ia{sv})");
        return reply.body;
    }
    static std::string answer_of(const GroupDocument &group) {
        return "(0, " + text_of(group, GroupForm::kRead) + ")";
    }
    void restart(int signal) {
        ServedWithState::restart(signal);
        register_on_slots();
    }

  private:
    void register_on_slots() {
        for (const int slot : {0, 1})
            client_->register_application(slot);
    }
};

} // namespace sim::test
