// SPDX-License-Identifier: Apache-2.0
#include "tests/support/request_checks.hpp"

#include "tests/support/bus_observer.hpp"

namespace test {

TEST_P(QueryGates, LookAtNoArgumentWhenTheFeatureIsOffOrUnknown) {
    check_gate(GetParam().module.unit, GetParam().function.name,
               GetParam().function.call_with_nothing);
}

TEST_P(Queries, RefuseMissingPointersAndSendNothing) {
    const QueryRow &row = GetParam();
    for (const Variation<MakeQuery> &missing : row.function.null_arguments) {
        SCOPED_TRACE(missing.what);
        EXPECT_EQ(missing.call(handle_), IMS_ERROR_INVALID_PARAMETER);
        expect_one_line(row.module.unit, row.function.name, "Invalid parameter");
        EXPECT_TRUE(requests().empty());
    }
}

TEST_P(Queries, SendTheirTupleToTheirMethod) {
    const QueryRow &row = GetParam();
    peer().on(full_method(row), reply(row.reply_type, row.reply));
    const int queries_before = gate_queries();
    EXPECT_EQ(row.function.call(handle_), IMS_ERROR_NONE);
    EXPECT_EQ(gate_queries(), queries_before + 1);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    EXPECT_EQ(sent[0].interface, row.module.interface);
    EXPECT_EQ(sent[0].member, row.method);
    expect_sent(sent[0], row.type, row.arguments);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Queries, CallWithoutFlagsAndCancellableAndWithTheTimeLimit) {
    const QueryRow &row = GetParam();
    peer().on(full_method(row), reply(row.reply_type, row.reply));
    EXPECT_EQ(row.function.call(handle_), IMS_ERROR_NONE);
    expect_call_arguments(true, row.module.interface, row.method);
}

TEST_P(Queries, ReportARefusalUnderTheirOwnName) {
    const QueryRow &row = GetParam();
    for (const Answer &answer : {failure(error_name::kAccessDenied), failure(G_IO_ERROR, 9)}) {
        peer().on(full_method(row), answer);
        EXPECT_EQ(row.function.call(handle_), IMS_ERROR_PERMISSION_DENIED);
        expect_one_line(row.module.unit, row.function.name, "Permission denied");
    }
}

TEST_P(Queries, FailWithoutALineOnEveryOtherError) {
    const QueryRow &row = GetParam();
    const Answer answers[] = {failure(error_name::kFailed),
                              failure(error_name::kNoReply),
                              failure(error_name::kTimedOut),
                              failure(error_name::kUnknownMethod),
                              failure(G_IO_ERROR, G_IO_ERROR_CANCELLED),
                              failure("org.example.Error.Unheard")};
    for (const Answer &answer : answers) {
        peer().on(full_method(row), answer);
        EXPECT_EQ(row.function.call(handle_), IMS_ERROR_OPERATION_FAILED);
    }
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Queries, FailWithTheModulesMessageWhenTheServiceRefuses) {
    const QueryRow &row = GetParam();
    peer().on(full_method(row), reply(row.reply_type, row.refused_reply));
    EXPECT_EQ(row.function.call(handle_), IMS_ERROR_OPERATION_FAILED);
    expect_one_line(row.module.unit, row.function.name, row.refused_message);
}

TEST_P(Queries, SurviveACallThatYieldsNeitherReplyNorError) {
    const QueryRow &row = GetParam();
    peer().on(full_method(row), reply(row.reply_type, row.reply));
    set_fault(Fault::kNothing);
    EXPECT_EQ(row.function.call(handle_), IMS_ERROR_OPERATION_FAILED);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Queries, ReportAnErrorBesideAReply) {
    const QueryRow &row = GetParam();
    peer().on(full_method(row), reply(row.reply_type, row.reply));
    set_fault(Fault::kErrorBesideReply);
    EXPECT_EQ(row.function.call(handle_), IMS_ERROR_OPERATION_FAILED);
    expect_one_line(row.module.unit, row.function.name, "dbus error = 5 (odd)");
}

TEST_P(Queries, FailOnAReplyOfAnotherShape) {
    const QueryRow &row = GetParam();
    const std::pair<std::string, std::string> shapes[] = {{"(i)", "(0,)"},
                                                          {"(s)", "('x',)"},
                                                          {"(ii)", "(0, 1)"},
                                                          {"(iu)", "(0, 1)"},
                                                          {"(iua{sv})", "(0, 1, {})"},
                                                          {"(iuaa{ss})", "(0, 0, [])"},
                                                          {"(iiaa{sv})", "(0, 0, [])"},
                                                          {"(iuaa{sv})", "(0, 0, [])"},
                                                          {"(iuaa{sv}i)", "(0, 0, [], 0)"},
                                                          {"(uuaa{sv})", "(0, 0, [])"},
                                                          {"(buuiii)", "(true, 1, 2, 3, 4, 0)"},
                                                          {"(buuiiii)", "(true, 1, 2, 3, 4, 5, 0)"},
                                                          {"(iuuiiii)", "(1, 1, 2, 3, 4, 5, 0)"},
                                                          {"(ibuuiii)", "(0, true, 1, 2, 3, 4, 5)"},
                                                          {"(iiui)", "(0, 1, 2, 3)"},
                                                          {"(iuii)", "(0, 1, 2, 3)"},
                                                          {"(iiii)", "(0, 1, 2, 3)"},
                                                          {"(iiuii)", "(0, 1, 2, 3, 4)"},
                                                          {"((iiui))", "((0, 1, 2, 3),)"}};
    std::vector<Answer> answers{empty_reply()};
    for (const auto &[type, value] : shapes)
        if (type != row.reply_type)
            answers.push_back(reply(type, value));
    for (const Answer &answer : answers) {
        peer().on(full_method(row), answer);
        EXPECT_EQ(row.function.call(handle_), IMS_ERROR_OPERATION_FAILED);
    }
}

} // namespace test
