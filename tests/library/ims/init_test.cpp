// SPDX-License-Identifier: Apache-2.0
// Making and releasing handles.
#include "tests/support/bus_observer.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/glib_watch.hpp"
#include "tests/support/with_peer.hpp"

#include <cerrno>
#include <climits>

namespace test {
namespace {

// Must never be stored over by a failing ims_init().
ims_h untouched() {
    static int somewhere;
    return reinterpret_cast<ims_h>(&somewhere);
}

class Init : public WithBus {
  protected:
    // What ims_init() returns when it fails: the handle is left alone.
    int fail(int slot = kSlot) {
        ims_h handle = untouched();
        const int result = ims_init(slot, &handle);
        EXPECT_EQ(handle, untouched());
        return result;
    }

    Call only_registration() {
        const std::vector<Call> calls = peer().calls_to(kRegisterApplication);
        if (calls.size() != 1)
            throw std::runtime_error(std::to_string(calls.size()) + " registrations instead of 1");
        return calls.front();
    }
};

TEST(InitGate, ComesBeforeTheArgumentCheck) {
    set_gate(Gate::kOff);
    EXPECT_EQ(ims_init(0, nullptr), IMS_ERROR_NOT_SUPPORTED);
}

TEST(InitGate, IsTheFirstStepOfEveryCoreFunction) {
    check_gate<ims_init>("ims.cpp");
    reset_platform();
    check_gate<ims_deinit>("ims.cpp");
    reset_platform();
    check_gate<ims_set_notification_cb>("ims.cpp");
    reset_platform();
    check_gate<ims_unset_notification_cb>("ims.cpp");
}

TEST(InitArguments, ANullHandlePointerIsRefused) {
    EXPECT_EQ(ims_init(0, nullptr), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims.cpp", "ims_init", "Invalid parameter");
    EXPECT_TRUE(observed_calls().empty());
}

TEST(InitArguments, ResultCodesHaveTheirValues) {
    EXPECT_EQ(IMS_ERROR_NONE, 0);
    EXPECT_EQ(IMS_ERROR_INVALID_PARAMETER, -22);
    EXPECT_EQ(IMS_ERROR_PERMISSION_DENIED, -13);
    EXPECT_EQ(static_cast<std::uint32_t>(IMS_ERROR_NOT_SUPPORTED), 0xC0000002U);
    EXPECT_EQ(static_cast<std::uint32_t>(IMS_ERROR_OPERATION_FAILED), 0xEFFB0001U);
}

TEST_F(Init, SlotThreeAnsweredFortyTwoYieldsItsPathAndApplicationId) {
    const ims_h handle = init(3);
    const Call registration = only_registration();
    EXPECT_EQ(registration.destination, "org.kelvo.ims");
    EXPECT_EQ(registration.path, "/org/kelvo/ims/sub3");
    EXPECT_EQ(registration.signature, "is");
    const Variant expected = share(g_variant_new("(is)", 3, program_invocation_name));
    EXPECT_EQ(to_text(registration.body.get()), to_text(expected.get()));

    EXPECT_EQ(ims_call_hold_call(handle, 7, nullptr, nullptr), IMS_ERROR_NONE);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    expect_sent(sent[0], "(ii)", "(42, 7)");
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Init, RegistersWithinSixSecondsWithoutFlagsAndCancellable) {
    init();
    const std::vector<ObservedCall> calls = observed_calls();
    ASSERT_EQ(calls.size(), 1U);
    EXPECT_TRUE(calls[0].synchronous);
    EXPECT_EQ(calls[0].interface, "org.kelvo.ims.Registration");
    EXPECT_EQ(calls[0].method, "RegisterApplication");
    EXPECT_FALSE(calls[0].has_reply_type);
    EXPECT_EQ(calls[0].flags, G_DBUS_CALL_FLAGS_NONE);
    EXPECT_EQ(calls[0].timeout_ms, 6000);
    EXPECT_FALSE(calls[0].has_cancellable);
}

TEST_F(Init, AnySlotIsFormattedIntoThePath) {
    for (const int slot : {0, 1, 12, INT_MAX}) {
        init(slot);
        const Call call = peer().calls_to(kRegisterApplication).back();
        EXPECT_EQ(call.path, "/org/kelvo/ims/sub" + std::to_string(slot));
        const Variant sent_slot{g_variant_get_child_value(call.body.get(), 0)};
        EXPECT_EQ(g_variant_get_int32(sent_slot.get()), slot);
    }
}

// The bus layer refuses such a path without an error: no line, no handle.
TEST_F(Init, ANegativeSlotIsFormattedAndTriedLikeAnyOther) {
    for (const int slot : {-1, INT_MIN}) {
        const ExpectGlibCritical refused{"object_path"};
        EXPECT_EQ(fail(slot), IMS_ERROR_OPERATION_FAILED);
        EXPECT_EQ(observed_calls().back().path, "/org/kelvo/ims/sub" + std::to_string(slot));
    }
    EXPECT_TRUE(take_log().empty());
    EXPECT_TRUE(peer().calls().empty());
}

TEST_F(Init, AServiceThatAnswersFiveYieldsNoHandle) {
    peer().on(kRegisterApplication, reply("(ii)", "(5, 42)"));
    EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    expect_one_line("ims.cpp", "ims_init", "Failed to get registration info: 5");
}

TEST_F(Init, EveryOtherResultOfTheServiceFailsToo) {
    for (const int result : {1, -1, 2, INT_MIN, INT_MAX}) {
        const Variant answer = share(g_variant_new("(ii)", result, 42));
        peer().on(kRegisterApplication, reply_with(answer.get()));
        EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
        expect_one_line("ims.cpp", "ims_init",
                        "Failed to get registration info: " + std::to_string(result));
    }
}

TEST_F(Init, AReplyOfAnotherShapeFails) {
    for (const Answer &answer :
         {empty_reply(), reply("(i)", "(0,)"), reply("(s)", "('0',)"), reply("(iu)", "(0, 42)"),
          reply("(uu)", "(0, 42)"), reply("(iii)", "(0, 42, 1)"), reply("(is)", "(0, '42')")}) {
        peer().on(kRegisterApplication, answer);
        EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    }
}

TEST_F(Init, ARefusalByTheServiceIsLogged) {
    for (const Answer &answer : {failure(error_name::kAccessDenied), failure(G_IO_ERROR, 9)}) {
        peer().on(kRegisterApplication, answer);
        EXPECT_EQ(fail(), IMS_ERROR_PERMISSION_DENIED);
        expect_one_line("ims.cpp", "ims_init", "Permission denied");
    }
}

TEST_F(Init, EveryOtherErrorIsSilent) {
    for (const char *name : {error_name::kFailed, error_name::kNoReply, error_name::kTimedOut,
                             error_name::kUnknownMethod, "org.example.Error.Unheard"}) {
        peer().on(kRegisterApplication, failure(name));
        EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    }
    peer().on(kRegisterApplication, failure(G_IO_ERROR, G_IO_ERROR_CANCELLED));
    EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Init, AnAbsentServiceIsASilentFailure) {
    peer_.reset();
    EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Init, AnErrorBesideAReplyIsLogged) {
    set_fault(Fault::kErrorBesideReply);
    EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    expect_one_line("ims.cpp", "ims_init", "dbus error = 5 (odd)");
}

TEST_F(Init, ACallThatYieldsNothingFailsSilently) {
    set_fault(Fault::kNothing);
    EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Init, AFailureLetsGoOfTheConnection) {
    GDBusConnection *own = g_bus_get_sync(G_BUS_TYPE_SYSTEM, nullptr, nullptr);
    ASSERT_NE(own, nullptr);
    SharedConnection connection;
    peer().on(kRegisterApplication, reply("(ii)", "(5, 42)"));
    EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    peer().on(kRegisterApplication, failure(error_name::kFailed));
    EXPECT_EQ(fail(), IMS_ERROR_OPERATION_FAILED);
    EXPECT_FALSE(connection.is_gone());
    g_object_unref(own);
    // Not its reference count: GDBus's own thread holds the connection for moments.
    pump_until([&] { return connection.is_gone(); }, "the connection to be let go of");
}

// The program's name for the time of a test.
class InvocationName {
  public:
    explicit InvocationName(std::string name)
        : name_{std::move(name)}, before_{program_invocation_name} {
        program_invocation_name = name_.data();
    }
    ~InvocationName() { program_invocation_name = before_; }
    InvocationName(const InvocationName &) = delete;
    InvocationName &operator=(const InvocationName &) = delete;

  private:
    std::string name_;
    char *before_;
};

TEST_F(Init, TheInvocationNameIsSentAsItStands) {
    const InvocationName name{"./../bin/d\xc3\xa9mo app"};
    init();
    expect_sent(only_registration(), "(is)", "(3, './../bin/d\xc3\xa9mo app')");
}

TEST_F(Init, AnInvocationNameThatIsNotUtf8DoesNoHarm) {
    const InvocationName name{"/opt/caf\xe9/app"};
    init();
    EXPECT_EQ(only_registration().signature, "is");
}

TEST_F(Init, EachHandleRegistersAndSendsItsOwnApplicationId) {
    int next_id = 100;
    peer().on(kRegisterApplication, [&next_id](const Call &) {
        const Variant answer = share(g_variant_new("(ii)", 0, next_id++));
        return reply_with(answer.get());
    });
    peer().on("org.kelvo.ims.Call.HoldCall", reply("(i)", "(0,)"));
    const ims_h handles[] = {init(0), init(1), init(0)};
    EXPECT_NE(handles[0], handles[2]);
    const char *paths[] = {"/org/kelvo/ims/sub0", "/org/kelvo/ims/sub1", "/org/kelvo/ims/sub0"};
    for (std::size_t i = 0; i < 3; ++i) {
        ResponseRecorder recorder;
        EXPECT_EQ(ims_call_hold_call(handles[i], 7, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_NONE);
        fence();
        ASSERT_EQ(recorder.count(), 1U);
        EXPECT_EQ(recorder.last().handle, handles[i]);
        const Call sent = requests().back();
        EXPECT_EQ(sent.path, paths[i]);
        EXPECT_EQ(to_text(sent.body.get()),
                  to_text(parse("(ii)", "(" + std::to_string(100 + i) + ", 7)").get()));
    }
}

// The bus's own refusal.
class RefusedByTheBus : public Init {
  protected:
    RefusedByTheBus() {
        policy_rules_ = "<deny send_destination=\"org.kelvo.ims\""
                        " send_interface=\"org.kelvo.ims.Registration\"/>\n";
    }
};

TEST_F(RefusedByTheBus, IsARefusalLikeTheServices) {
    EXPECT_EQ(fail(), IMS_ERROR_PERMISSION_DENIED);
    expect_one_line("ims.cpp", "ims_init", "Permission denied");
    EXPECT_TRUE(peer().calls().empty());
}

TEST(BusAddress, NonsenseIsLoggedWithTheBusLayersMessage) {
    setenv("DBUS_SYSTEM_BUS_ADDRESS", "nonsense", 1);
    GError *error = nullptr;
    EXPECT_EQ(g_bus_get_sync(G_BUS_TYPE_SYSTEM, nullptr, &error), nullptr);
    ASSERT_NE(error, nullptr);
    ims_h handle = untouched();
    EXPECT_EQ(ims_init(0, &handle), IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(handle, untouched());
    expect_one_line("ims.cpp", "ims_init",
                    "Error creating dbus connection: " + std::string{error->message} + "\n");
    g_error_free(error);
    unsetenv("DBUS_SYSTEM_BUS_ADDRESS");
}

TEST(BusAddress, ASocketThatIsNotThereIsLogged) {
    setenv("DBUS_SYSTEM_BUS_ADDRESS", "unix:path=/nonexistent/bus", 1);
    ims_h handle = untouched();
    EXPECT_EQ(ims_init(0, &handle), IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(handle, untouched());
    const std::vector<LogLine> lines = take_log();
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_EQ(lines[0].message.rfind("Error creating dbus connection: ", 0), 0U);
    EXPECT_EQ(lines[0].message.back(), '\n');
    unsetenv("DBUS_SYSTEM_BUS_ADDRESS");
}

} // namespace
} // namespace test
