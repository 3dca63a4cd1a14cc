// SPDX-License-Identifier: Apache-2.0
// Every row of the module through every check.
#include "tests/library/xdm/xdm_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/request_checks.hpp"

namespace test {
namespace {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Xdm, Requests, ValuesIn(xdm_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Xdm, RequestGates, ValuesIn(xdm_request_rows()), row_name<RequestRow>);

TEST(XdmRows, CoverEveryDeclaredFunction) {
    EXPECT_EQ(functions_of(xdm_request_rows()), declared_functions("ims_xdm.h"));
    EXPECT_EQ(xdm_request_rows().size(), 24U);
}

} // namespace
} // namespace test
