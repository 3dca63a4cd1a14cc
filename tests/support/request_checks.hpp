// SPDX-License-Identifier: Apache-2.0
// INSTANTIATE_TEST_SUITE_P(Call, Requests, ValuesIn(rows), row_name) runs every check over a table.
#pragma once

#include "tests/support/expectations.hpp"
#include "tests/support/request_row.hpp"
#include "tests/support/with_peer.hpp"

namespace test {

class Requests : public WithPeer, public ::testing::WithParamInterface<RequestRow> {};
class Queries : public WithPeer, public ::testing::WithParamInterface<QueryRow> {};

// What happens before anything is sent needs no bus.
class RequestGates : public ::testing::TestWithParam<RequestRow> {};
class QueryGates : public ::testing::TestWithParam<QueryRow> {};

template <typename Row>
std::string row_name(const ::testing::TestParamInfo<Row> &info) {
    return info.param.function.name;
}

} // namespace test
