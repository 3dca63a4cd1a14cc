// SPDX-License-Identifier: Apache-2.0
// Every row of the settings module through every check.
#include "tests/library/settings/settings_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/request_checks.hpp"

#include <set>

namespace test {
namespace {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Settings, Requests, ValuesIn(settings_request_rows()),
                         row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Settings, RequestGates, ValuesIn(settings_request_rows()),
                         row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Settings, Queries, ValuesIn(settings_query_rows()), row_name<QueryRow>);
INSTANTIATE_TEST_SUITE_P(Settings, QueryGates, ValuesIn(settings_query_rows()), row_name<QueryRow>);

TEST(SettingsRows, CoverEveryDeclaredCall) {
    std::set<std::string> covered{
        "ims_get_network_environment", // has its own test: no result fails it
        "ims_global_settings_clear", "ims_profile_clear", "ims_profile_list_clear"}; // no calls
    for (const RequestRow &row : settings_request_rows())
        covered.insert(row.function.name);
    for (const QueryRow &row : settings_query_rows())
        covered.insert(row.function.name);
    EXPECT_EQ(covered, declared_functions("ims_settings.h"));
}

} // namespace
} // namespace test
