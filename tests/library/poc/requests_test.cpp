// SPDX-License-Identifier: Apache-2.0
// Every row of the push-to-talk module through every check, and that no row is missing.
#include "tests/library/poc/poc_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/request_checks.hpp"

namespace test {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Poc, Requests, ValuesIn(poc_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Poc, RequestGates, ValuesIn(poc_request_rows()), row_name<RequestRow>);

TEST(PocRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(poc_request_rows().size(), 27U);
    EXPECT_EQ(functions_of(poc_request_rows()), declared_functions("ims_poc.h"));
}

} // namespace test
