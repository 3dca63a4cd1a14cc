// SPDX-License-Identifier: Apache-2.0
// An ims_init() that gets no memory.
#include "tests/support/bus_observer.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

// In failing_new.cpp.
extern bool out_of_memory;

namespace test {
namespace {

class Allocation : public WithBus {};

TEST_F(Allocation, InitReportsThatThereIsNoMemory) {
    ims_h handle = nullptr;
    out_of_memory = true;
    const int result = ims_init(0, &handle);
    out_of_memory = false;
    EXPECT_EQ(result, IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(handle, nullptr);
    expect_one_line("ims.cpp", "ims_init", "Memory allocation failed!");
    EXPECT_TRUE(observed_calls().empty());
}

TEST_F(Allocation, InitWorksAgainWhenThereIs) {
    EXPECT_NE(init(), nullptr);
}

} // namespace
} // namespace test
