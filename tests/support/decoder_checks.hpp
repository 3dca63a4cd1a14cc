// SPDX-License-Identifier: Apache-2.0
// The decoders called by themselves, as no bus calls them. For executables that link the static
// library: the shared one does not export them.
#pragma once

#include "src/notifications.hpp"
#include "tests/support/event_row.hpp"
#include "tests/support/platform_capture.hpp"
#include "tests/support/recorders.hpp"
#include "tests/support/variant.hpp"

#include <gtest/gtest.h>

#include <string>

namespace test {

struct DecodedEvent {
    ims::Decoder decode;
    ModuleEvent event;
};

inline void PrintTo(const DecodedEvent &decoded, std::ostream *out) {
    PrintTo(decoded.event, out);
}

std::vector<DecodedEvent> decoded_events_of(ims::Decoder decode, const EventModule &module,
                                            std::span<const EventRow> rows);

class DecodedEvents : public ::testing::TestWithParam<DecodedEvent> {};

inline std::string decoded_name(const ::testing::TestParamInfo<DecodedEvent> &tested) {
    return tested.param.event.row.name;
}

// The decoders pass the handle on and look at nothing in it.
ims_h some_handle();

// As the subscription of this recorder would be served.
void decode(ims::Decoder decoder, ims_h handle, int id, const Variant &parameters,
            NotificationRecorder &recorder);

// Whatever the id: one error line, and nothing else looked at.
void expect_null_handle_is_logged(ims::Decoder decoder, const EventModule &module,
                                  std::span<const int> ids);

// Nobody is called, and one warning names the id.
void expect_unknown_id_is_logged(ims::Decoder decoder, const EventModule &module, int id,
                                 const std::string &message);

} // namespace test
