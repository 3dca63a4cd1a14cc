// SPDX-License-Identifier: Apache-2.0
#include "tests/support/request_checks.hpp"

#include "tests/support/bus_observer.hpp"

namespace test {
namespace {

Answer row_reply(const RequestRow &row) {
    return reply(row.reply_type, row.reply);
}

// What the callback of a reply receives.
void expect_data(const RequestRow &row, void *data) {
    if (row.check_data)
        row.check_data(data);
    else
        EXPECT_EQ(data, nullptr);
}

// Makes the request and waits for its outcome, whose data is the row's or, where it failed, NULL.
Response outcome(const RequestRow &row, ims_h handle, bool with_data) {
    ResponseRecorder recorder{[&](const Response &, void *data) {
        if (with_data)
            expect_data(row, data);
        else
            EXPECT_EQ(data, nullptr);
    }};
    EXPECT_EQ(row.function.call(handle, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
    pump_until([&] { return recorder.count() > 0; }, "the callback of " + row.function.name);
    return recorder.last();
}

void expect_failure(const RequestRow &row, ims_h handle, int result) {
    const Response response = outcome(row, handle, false);
    EXPECT_EQ(response.handle, handle);
    EXPECT_EQ(response.result, result);
}

} // namespace

TEST_P(RequestGates, LookAtNoArgumentWhenTheFeatureIsOffOrUnknown) {
    check_gate(GetParam().module.unit, GetParam().function.name,
               GetParam().function.call_with_nothing);
}

TEST_P(Requests, RefuseMissingPointersAndSendNothing) {
    const RequestRow &row = GetParam();
    for (const Variation<MakeRequest> &missing : null_arguments(row)) {
        SCOPED_TRACE(missing.what);
        ResponseRecorder &recorder = lasting_recorder();
        EXPECT_EQ(missing.call(handle_, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_INVALID_PARAMETER);
        expect_one_line(row.module.unit, row.function.name, "Invalid parameter");
        EXPECT_TRUE(requests().empty());
        EXPECT_EQ(recorder.count(), 0U);
    }
}

TEST_P(Requests, RefuseTextsThatAreNotUtf8AndSendNothing) {
    const RequestRow &row = GetParam();
    for (const Variation<MakeRequest> &bad : bad_texts(row)) {
        SCOPED_TRACE(bad.what);
        ResponseRecorder &recorder = lasting_recorder();
        EXPECT_EQ(bad.call(handle_, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_INVALID_PARAMETER);
        expect_one_line(row.module.unit, row.function.name, "Invalid parameter");
        EXPECT_TRUE(requests().empty());
        EXPECT_EQ(recorder.count(), 0U);
    }
}

TEST_P(Requests, SendTheirTupleToTheirMethod) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), row_reply(row));
    const int queries_before = gate_queries();
    outcome(row, handle_, true);
    EXPECT_EQ(gate_queries(), queries_before + 1);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    EXPECT_EQ(sent[0].interface, row.module.interface);
    EXPECT_EQ(sent[0].member, row.method);
    expect_sent(sent[0], row.type, row.arguments);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Requests, CallWithoutFlagsAndCancellableAndWithTheTimeLimit) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), row_reply(row));
    outcome(row, handle_, true);
    expect_call_arguments(false, row.module.interface, row.method);
}

TEST_P(Requests, HandTheReplyToTheCallbackOnce) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), row_reply(row));
    ResponseRecorder recorder{[&](const Response &, void *data) { expect_data(row, data); }};
    ASSERT_EQ(row.function.call(handle_, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
    EXPECT_EQ(recorder.count(), 0U); // never before the request returns
    fence();
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.last().handle, handle_);
    EXPECT_EQ(recorder.last().result, 0);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Requests, PassTheServicesOwnResultsThrough) {
    const RequestRow &row = GetParam();
    const bool is_logged = !row.refused_message.empty();
    const Variant success = parse(row.reply_type, row.reply);
    for (const int result : {1, 2, 77, -1, G_MININT32, G_MAXINT32}) {
        SCOPED_TRACE(result);
        const Variant refused = with_first(success.get(), g_variant_new_int32(result));
        peer().on(full_method(row), reply_with(refused.get()));
        const Response response = outcome(row, handle_, !is_logged);
        EXPECT_EQ(response.handle, handle_);
        EXPECT_EQ(response.result, result);
        if (is_logged)
            expect_one_line(row.module.unit, row.handler,
                            row.refused_message + std::to_string(result));
    }
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Requests, AreSentWithoutACallbackAndLeaveNothingBehind) {
    const RequestRow &row = GetParam();
    const Answer answers[] = {row_reply(row), failure(error_name::kFailed),
                              failure(G_IO_ERROR, G_IO_ERROR_CANCELLED), reply("(x)", "(1,)"),
                              empty_reply()};
    for (const Answer &answer : answers) {
        peer().on(full_method(row), answer);
        EXPECT_EQ(row.function.call(handle_, nullptr, nullptr), IMS_ERROR_NONE);
        fence();
    }
    EXPECT_EQ(requests().size(), std::size(answers));
    EXPECT_TRUE(take_log().empty());

    peer().on(full_method(row), failure(error_name::kAccessDenied));
    EXPECT_EQ(row.function.call(handle_, nullptr, nullptr), IMS_ERROR_NONE);
    fence();
    expect_one_line(row.module.unit, row.handler, "Permission denied");
}

TEST_P(Requests, TellOfARefusalWithTwoAndOneLine) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), failure(error_name::kAccessDenied));
    expect_failure(row, handle_, 2);
    expect_one_line(row.module.unit, row.handler, "Permission denied");
}

TEST_P(Requests, TakeCodeNineOfAnyDomainForARefusal) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), failure(G_IO_ERROR, 9));
    expect_failure(row, handle_, 2);
    expect_one_line(row.module.unit, row.handler, "Permission denied");
}

TEST_P(Requests, TellOfEveryOtherErrorWithOneAndNoLine) {
    const RequestRow &row = GetParam();
    for (const char *name : {error_name::kNoReply, error_name::kFailed, error_name::kTimedOut,
                             error_name::kUnknownMethod, "org.example.Error.Unheard"}) {
        SCOPED_TRACE(name);
        peer().on(full_method(row), failure(name));
        expect_failure(row, handle_, 1);
    }
    peer().on(full_method(row), failure(G_IO_ERROR, G_IO_ERROR_TIMED_OUT));
    expect_failure(row, handle_, 1);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Requests, SayNothingOfACancelledCall) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), failure(G_IO_ERROR, 19));
    ResponseRecorder &recorder = lasting_recorder();
    ASSERT_EQ(row.function.call(handle_, ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(recorder.count(), 0U);
    EXPECT_TRUE(take_log().empty());
    EXPECT_EQ(requests().size(), 1U);

    peer().on(full_method(row), row_reply(row));
    EXPECT_EQ(outcome(row, handle_, true).result, 0);
    EXPECT_EQ(recorder.count(), 0U);
}

TEST_P(Requests, TakeCodeNineteenOfAnotherDomainForAFailure) {
    const RequestRow &row = GetParam();
    // Code 19 of the D-Bus domain is a time-out, and of the last domain nothing known.
    for (const GQuark domain : {G_DBUS_ERROR, G_FILE_ERROR, G_RESOLVER_ERROR}) {
        SCOPED_TRACE(g_quark_to_string(domain));
        peer().on(full_method(row), failure(domain, 19));
        expect_failure(row, handle_, 1);
    }
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Requests, TakeAReplyOfAnotherShapeForAFailure) {
    const RequestRow &row = GetParam();
    const std::pair<std::string, std::string> shapes[] = {{"(i)", "(0,)"},
                                                          {"(u)", "(0,)"},
                                                          {"(x)", "(0,)"},
                                                          {"(s)", "('x',)"},
                                                          {"(b)", "(true,)"},
                                                          {"(v)", "(<0>,)"},
                                                          {"(ai)", "([0],)"},
                                                          {"(ii)", "(0, 7)"},
                                                          {"(iu)", "(0, 7)"},
                                                          {"(ib)", "(0, true)"},
                                                          {"(is)", "(0, 'x')"},
                                                          {"(iis)", "(0, 7, 'x')"},
                                                          {"(iiis)", "(0, 7, 8, '')"},
                                                          {"(iii)", "(0, 1, 2)"},
                                                          {"(iiii)", "(0, 1, 2, 3)"},
                                                          {"(iiiu)", "(0, 1, 2, 3)"},
                                                          {"(iiiii)", "(0, 1, 2, 3, 4)"},
                                                          {"(iuaa{sv})", "(0, 0, [])"},
                                                          {"(iiaa{sv})", "(0, 0, [])"},
                                                          {"(iua{sv})", "(0, 0, {})"},
                                                          {"(iuaa{ss})", "(0, 0, [])"},
                                                          {"(iuav)", "(0, 0, [])"},
                                                          {"(iuv)", "(0, 0, <@aa{sv} []>)"},
                                                          {"(iuaa{sv}i)", "(0, 0, [], 0)"},
                                                          {"((i))", "((0,),)"}};
    for (const auto &[type, value] : shapes) {
        if (type == row.reply_type)
            continue;
        SCOPED_TRACE(type);
        peer().on(full_method(row), reply(type, value));
        expect_failure(row, handle_, 1);
    }
}

TEST_P(Requests, SurviveACallThatYieldsNeitherReplyNorError) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), row_reply(row));
    set_fault(Fault::kNothing);
    expect_failure(row, handle_, 1);
    set_fault(Fault::kNone);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Requests, TakeAReplyWithoutABodyForAFailure) {
    const RequestRow &row = GetParam();
    peer().on(full_method(row), empty_reply());
    expect_failure(row, handle_, 1);
}

} // namespace test
