// SPDX-License-Identifier: Apache-2.0
// Every row of the push-to-talk module through every check, and that no row is missing.
#include "tests/library/poc/poc_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/request_checks.hpp"

namespace test {
namespace {

std::vector<RequestRow> rows() {
    std::vector<RequestRow> all = poc_call_rows();
    for (RequestRow &row : poc_message_rows())
        all.push_back(std::move(row));
    return all;
}

} // namespace

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Poc, Requests, ValuesIn(rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Poc, RequestGates, ValuesIn(rows()), row_name<RequestRow>);

TEST(PocRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(rows().size(), 27U);
    EXPECT_EQ(functions_of(rows()), declared_functions("ims_poc.h"));
}

} // namespace test
