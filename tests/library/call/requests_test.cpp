// SPDX-License-Identifier: Apache-2.0
// Every row of the call module through every check, and that no row is missing.
#include "tests/library/call/call_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/request_checks.hpp"

#include <algorithm>
#include <set>

namespace test {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Call, Requests, ValuesIn(call_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Call, RequestGates, ValuesIn(call_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Call, Queries, ValuesIn(call_query_rows()), row_name<QueryRow>);
INSTANTIATE_TEST_SUITE_P(Call, QueryGates, ValuesIn(call_query_rows()), row_name<QueryRow>);

TEST(CallRows, CoverEveryDeclaredRequest) {
    std::set<std::string> covered;
    for (const RequestRow &row : call_request_rows())
        EXPECT_TRUE(covered.insert(row.function.name).second)
            << row.function.name << " has two rows";
    EXPECT_EQ(covered.size(), 41U);
    for (const QueryRow &row : call_query_rows())
        covered.insert(row.function.name);

    std::set<std::string> declared = declared_functions("ims_call.h");
    EXPECT_EQ(declared.erase("ims_call_list_info_clear"), 1U); // makes no call
    EXPECT_EQ(covered, declared);
}

} // namespace test
