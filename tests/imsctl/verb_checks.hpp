// SPDX-License-Identifier: Apache-2.0
// INSTANTIATE_TEST_SUITE_P(All, ServiceVerbs, ValuesIn(rows), verb_name) runs a table of verbs
// against a scripted service: what each sends, and what it shows of the reply.
#pragma once

#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include <gtest/gtest.h>
#include <ostream>

namespace test {

struct VerbRow {
    const char *line;
    std::size_t verb_words; // how many of the words are the verb
    const char *method;     // "Login.Logout"
    const char *sent_type;  // "" for no parameters
    const char *sent;
    const char *reply_type;
    const char *reply;
    const char *refusal; // the same with the result 77
    const char *json;    // without the verb
    const char *text;
    const char *line_logged = ""; // the end of the library's one line about this reply
};

void PrintTo(const VerbRow &row, std::ostream *out);

std::string verb_name(const ::testing::TestParamInfo<VerbRow> &row);

class WithService : public ::testing::Test {
  protected:
    void answer(const std::string &method, const char *type, const char *text) {
        peer_.on("org.kelvo.ims." + method, reply(type, text));
    }

    std::vector<Call> calls_to(const std::string &method) const {
        return peer_.calls_to("org.kelvo.ims." + method);
    }

    PrivateBus bus_;
    ScriptedPeer peer_{bus_.address()};
};

class ServiceVerbs : public WithService, public ::testing::WithParamInterface<VerbRow> {};

} // namespace test
