// SPDX-License-Identifier: Apache-2.0
// INSTANTIATE_TEST_SUITE_P(Call, Events, ValuesIn(events_of(kModule, rows)), event_name) runs every
// check over a table.
#pragma once

#include "tests/support/event_row.hpp"
#include "tests/support/with_peer.hpp"

#include <string>

namespace test {

class Events : public WithPeer, public ::testing::WithParamInterface<ModuleEvent> {};

inline std::string event_name(const ::testing::TestParamInfo<ModuleEvent> &tested) {
    return tested.param.row.name;
}

} // namespace test
