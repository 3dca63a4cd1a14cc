// SPDX-License-Identifier: Apache-2.0
// Every method that only registered applications may call, one row each: what it takes, what it
// answers and where it learns who asks.
#include "tests/sim/bus/bus_client.hpp"

#include "sim/base/result.hpp"

#include <limits>
#include <ostream>

namespace sim::test {
namespace {

using testing::HasSubstr;

enum Application { kNotNamed, kFirst, kLast };

struct Row {
    const char *interface;
    const char *method;
    const char *in;
    const char *out;
    Application application;
    gsize result_at = 0;
};

std::ostream &operator<<(std::ostream &out, const Row &row) {
    return out << row.method;
}

constexpr Row kRows[] = {
    {kCall, "MakeCall", "(isissss)", "(ii)", kFirst},
    {kCall, "SendUssd", "(iiis)", "(i)", kFirst},
    {kCall, "AnswerCall", "(iiii)", "(i)", kFirst},
    {kCall, "EndCall", "(iiii)", "(i)", kFirst},
    {kCall, "RejectCall", "(iii)", "(i)", kFirst},
    {kCall, "HoldCall", "(ii)", "(i)", kFirst},
    {kCall, "ResumeCall", "(ii)", "(i)", kFirst},
    {kCall, "SwapCall", "(i)", "(i)", kFirst},
    {kCall, "UpgradeCall", "(iii)", "(i)", kFirst},
    {kCall, "DowngradeCall", "(iii)", "(i)", kFirst},
    {kCall, "ChangeCall", "(iii)", "(iis)", kFirst},
    {kCall, "AcceptChangeRequest", "(ii)", "(i)", kFirst},
    {kCall, "RejectChangeRequest", "(ii)", "(i)", kFirst},
    {kCall, "SendDtmf", "(iis)", "(i)", kFirst},
    {kCall, "StartDtmf", "(iiy)", "(i)", kFirst},
    {kCall, "StopDtmf", "(ii)", "(i)", kFirst},
    {kCall, "VoiceRecord", "(iiis)", "(i)", kFirst},
    {kCall, "SendTtyData", "(iis)", "(i)", kFirst},
    {kCall, "SetTtyMode", "(ii)", "(i)", kFirst},
    {kCall, "GetTtyMode", "()", "(iiis)", kNotNamed},
    {kCall, "IsMuted", "(ii)", "(ib)", kFirst},
    {kCall, "ToggleMute", "(ii)", "(i)", kFirst},
    {kCall, "SetSpeakerMode", "(iii)", "(i)", kFirst},
    {kCall, "SetVolume", "(iii)", "(i)", kFirst},
    {kCall, "GetMaxVolume", "(ii)", "(ii)", kFirst},
    {kCall, "AddUserForConferenceCall", "(iisi)", "(i)", kFirst},
    {kCall, "IndicateSrvccHoStarted", "(ii)", "(i)", kFirst},
    {kCall, "IndicateSrvccHoFailed", "(ii)", "(i)", kFirst},
    {kCall, "SetAutoResponse", "(iii)", "(i)", kFirst},
    {kCall, "SetEmergencyPdnInfo", "(isivs)", "(i)", kFirst},
    {kCall, "RegisterEmergencyPdn", "()", "(i)", kNotNamed},
    {kCall, "DeregisterEmergencyPdn", "()", "(i)", kNotNamed},
    {kCall, "StartNwayConferenceCall", "(iiii)", "(ii)", kFirst},
    {kCall, "MergeCalls", "(i)", "(ii)", kFirst},
    {kCall, "AddParticipantToNwayConferenceCall", "(iii)", "(i)", kFirst},
    {kCall, "RemoveParticipantFromNwayConferenceCall", "(iii)", "(i)", kFirst},
    {kCall, "IsInEpdgCall", "(i)", "(ib)", kFirst},
    {kCall, "UpdateSsacInfo", "(iiiiii)", "(i)", kFirst},
    {kCall, "ChangeEpdgAudioPath", "(ii)", "(i)", kFirst},
    {kCall, "StartConference", "(iiv)", "(ii)", kNotNamed},
    {kCall, "ModifyParticipantsInConference", "(iiiv)", "(ii)", kNotNamed},
    {kCall, "CallListInfo", "(i)", "(iuaa{sv})", kFirst},
    {kRegistration, "GetRegistrationInfo", "()", "(buuiiii)", kNotNamed, 6},
    {kRegistration, "EnableFlightMode", "()", "(i)", kNotNamed},
    {kLogin, "Login", "(ssii)", "(i)", kLast},
    {kLogin, "Logout", "(i)", "(i)", kFirst},
    {kLogin, "GetLoginState", "(ii)", "(iiui)", kLast},
    {kSms, "SendSms", "(isisi)", "(iiii)", kFirst},
    {kSms, "SendDeliverReport", "(iisii)", "(iiii)", kFirst},
    {kSs, "SetCallWaiting", "(iii)", "(i)", kFirst},
    {kSs, "GetCallWaiting", "(ii)", "(iuaa{sv})", kFirst},
    {kSs, "SetCallForwarding", "(iiiiiiis)", "(i)", kFirst},
    {kSs, "GetCallForwarding", "(iii)", "(iuaa{sv})", kFirst},
    {kSs, "SetCallBarring", "(iiiis)", "(i)", kFirst},
    {kSs, "GetCallBarring", "(iii)", "(iuaa{sv})", kFirst},
    {kVt, "StartCamera", "(ii)", "(i)", kNotNamed},
    {kVt, "StopCamera", "(i)", "(i)", kNotNamed},
    {kVt, "HideMe", "(is)", "(i)", kNotNamed},
    {kVt, "ShowMe", "(i)", "(i)", kNotNamed},
    {kVt, "SwitchCamera", "(i)", "(i)", kNotNamed},
    {kVt, "SetVideoOrientation", "(ii)", "(i)", kNotNamed},
    {kVt, "GetZoom", "(ii)", "(ii)", kNotNamed},
    {kVt, "SetZoom", "(iii)", "(i)", kNotNamed},
    {kVt, "HoldVideo", "(i)", "(i)", kNotNamed},
    {kVt, "ResumeVideo", "(i)", "(i)", kNotNamed},
    {kVt, "CaptureSurfaceImage", "(iis)", "(i)", kNotNamed},
    {kVt, "StartRecordVideo", "(iiisi)", "(i)", kNotNamed},
    {kVt, "PauseRecordVideo", "(ii)", "(i)", kNotNamed},
    {kVt, "ResumeRecordVideo", "(ii)", "(i)", kNotNamed},
    {kVt, "CancelRecordVideo", "(ii)", "(i)", kNotNamed},
    {kVt, "StopRecordVideo", "(ii)", "(i)", kNotNamed},
    {kVt, "StartFileCast", "(is)", "(i)", kNotNamed},
    {kVt, "StopFileCast", "(i)", "(i)", kNotNamed},
    {kVt, "SwapVideoSurface", "(i)", "(i)", kNotNamed},
    {kVt, "SwipeVideo", "(iiiiii)", "(i)", kNotNamed},
    {kVt, "SetNearEndSurface", "(iiv)", "(i)", kNotNamed},
    {kVt, "SetFarEndSurface", "(iiv)", "(i)", kNotNamed},
    {kVt, "SetActiveSessionId", "(i)", "(i)", kNotNamed},
    {kVt, "ReUsePixMapId", "(iii)", "(i)", kNotNamed},
    {kVt, "ReleasePixMapId", "(ii)", "(i)", kNotNamed},
    {kVt, "SetWindowId", "(iiiiii)", "(i)", kNotNamed},
    {kVt, "SetCameraBuffer", "(is)", "(i)", kNotNamed},
    {kVt, "SetMediaBuffer", "(is)", "(i)", kNotNamed},
    {kPoc, "PocMakeCall", "(bbbsisvvi)", "(ii)", kNotNamed},
    {kPoc, "PocMakeAdHocConfCall", "(vbvssbibivi)", "(ii)", kNotNamed},
    {kPoc, "PocAddUsersToAdHocConfCall", "(iiiviv)", "(i)", kNotNamed},
    {kPoc, "PocRemoveUsersFromAdHocConfCall", "(iiiviv)", "(i)", kNotNamed},
    {kPoc, "PocCallConvertToCrisisCall", "(i)", "(i)", kNotNamed},
    {kPoc, "PocAnswerCall", "(bbiivv)", "(i)", kNotNamed},
    {kPoc, "PocRejectCall", "(ii)", "(i)", kNotNamed},
    {kPoc, "PocEndCall", "(ii)", "(i)", kNotNamed},
    {kPoc, "PocRequestFloor", "(iviis)", "(i)", kNotNamed},
    {kPoc, "PocReleaseFloor", "(iv)", "(i)", kNotNamed},
    {kPoc, "PocRequestFloorStatus", "(v)", "(iaa{sv})", kNotNamed},
    {kPoc, "PocModifyCall", "(bbiivv)", "(i)", kNotNamed},
    {kPoc, "PocAcceptModifyCall", "(bbiivv)", "(i)", kNotNamed},
    {kPoc, "PocRejectModifyCall", "(i)", "(i)", kNotNamed},
    {kPoc, "PocSetChannel", "(ii)", "(i)", kNotNamed},
    {kPoc, "PocStartCallRecording", "(iiis)", "(ia{sv})", kNotNamed},
    {kPoc, "PocPauseCallRecording", "(i)", "(i)", kNotNamed},
    {kPoc, "PocResumeCallRecording", "(i)", "(i)", kNotNamed},
    {kPoc, "PocStopCallRecording", "(i)", "(i)", kNotNamed},
    {kPoc, "PocCancelCallRecording", "(i)", "(i)", kNotNamed},
    {kPoc, "PocSendMsg", "(isvissivi)", "(iiii)", kNotNamed},
    {kPoc, "PocSendReceivedMsgNoti", "(isvvsi)", "(iiii)", kNotNamed},
    {kPoc, "PocTransferFile", "(ivvv)", "(iii)", kNotNamed},
    {kPoc, "PocAcceptFileTransfer", "(is)", "(iii)", kNotNamed},
    {kPoc, "PocARejectFileTransfer", "(is)", "(iii)", kNotNamed},
    {kPoc, "PocCancelFileTransfer", "(i)", "(iii)", kNotNamed},
    {kPoc, "PocSendKeepAlive", "(i)", "(i)", kNotNamed},
    {kXdm, "XdmCreateGroup", "(a{sv})", "(i)", kNotNamed},
    {kXdm, "XdmDeleteGroup", "(s)", "(i)", kNotNamed},
    {kXdm, "XdmFetchSharedGroup", "(ss)", "(ia{sv})", kNotNamed},
    {kXdm, "XdmFetchAllSharedGroups", "(s)", "(ia{sv})", kNotNamed},
    {kXdm, "XdmFetchAllParticipantGroups", "(s)", "(ia{sv})", kNotNamed},
    {kXdm, "XdmFetchSharedUserProfile", "(s)", "(ia{sv})", kNotNamed},
    {kXdm, "XdmAddUserToSharedGroup", "(sa{sv})", "(i)", kNotNamed},
    {kXdm, "XdmRemoveUserFromSharedGroup", "(sa{sv})", "(i)", kNotNamed},
    {kXdm, "XdmAddGroupRule", "(saa{sv})", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupRule", "(saa{sv})", "(i)", kNotNamed},
    {kXdm, "XdmDeleteGroupRule", "(ss)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupDisplayName", "(ss)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupSubject", "(ss)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupSearchable", "(sb)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupInviteMembers", "(sb)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupMaxParticipants", "(si)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupAutoAdvertisements", "(sb)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupQoe", "(si)", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupSessionActivePolicy", "(sa{sv})", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupSessionServiceList", "(sa{sv})", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupAgeRestriction", "(saa{sv})", "(i)", kNotNamed},
    {kXdm, "XdmModifyGroupAttributes", "(sssbbiba{sv})", "(i)", kNotNamed},
    {kXdm, "XdmModifyDefaultGroup", "(ssb)", "(i)", kNotNamed},
    {kXdm, "XdmGetParticipantInfo", "(s)", "(ia{sv})", kNotNamed},
};

struct Values {
    gint32 number;
    std::string text;
    const char *variant; // as text
};

GVariant *value_of(const GVariantType *type, const Values &values) {
    if (g_variant_type_equal(type, G_VARIANT_TYPE_INT32))
        return g_variant_new_int32(values.number);
    if (g_variant_type_equal(type, G_VARIANT_TYPE_BYTE))
        return g_variant_new_byte(static_cast<guint8>(values.number));
    if (g_variant_type_equal(type, G_VARIANT_TYPE_STRING))
        return g_variant_new_string(values.text.c_str());
    if (g_variant_type_equal(type, G_VARIANT_TYPE_VARIANT))
        return g_variant_new_variant(
            g_variant_parse(nullptr, values.variant, nullptr, nullptr, nullptr));
    // No data at all stands for the default of any other type.
    return g_variant_new_from_data(type, nullptr, 0, FALSE, nullptr, nullptr);
}

// The same value for every member of a type, with this application in its place.
Variant arguments_of(const Row &row, int application, const Values &values) {
    std::vector<GVariant *> members;
    const auto *type = g_variant_type_first(G_VARIANT_TYPE(row.in));
    while (type) {
        const auto *next = g_variant_type_next(type);
        const bool names =
            (row.application == kFirst && members.empty()) || (row.application == kLast && !next);
        members.push_back(names ? g_variant_new_int32(application) : value_of(type, values));
        type = next;
    }
    return Variant(g_variant_new_tuple(members.data(), members.size()));
}

Variant empty_arguments(const Row &row, int application) {
    return arguments_of(row, application, {0, "", "@as []"});
}

gint32 result_of(const Reply &reply, const Row &row) {
    gint32 result = -1;
    g_variant_get_child(reply.value.get(), row.result_at, "i", &result);
    return result;
}

class BusMethods : public Served, public testing::WithParamInterface<Row> {
  protected:
    Reply ask(Variant arguments) {
        return client_->call(slot_path(0), GetParam().interface, GetParam().method,
                             std::move(arguments));
    }
};

TEST_P(BusMethods, IsRefusedToAnApplicationThatIsNotRegistered) {
    const auto reply = ask(empty_arguments(GetParam(), 9));
    ASSERT_EQ(reply.type, GetParam().out) << reply.error << ": " << reply.text;
    EXPECT_EQ(result_of(reply, GetParam()), static_cast<gint32>(Result::kUnknownApplication));
    EXPECT_THAT(program_->read_errors("refused"), HasSubstr("call RegisterApplication first"));
}

TEST_P(BusMethods, AnswersInItsTypeOnceRegistered) {
    const int application = client_->register_application(0);
    const auto reply = ask(empty_arguments(GetParam(), application));
    ASSERT_EQ(reply.type, GetParam().out) << reply.error << ": " << reply.text;
    EXPECT_NE(result_of(reply, GetParam()), static_cast<gint32>(Result::kUnknownApplication));
}

TEST_P(BusMethods, TakesNoOtherSignature) {
    client_->register_application(0);
    const Row &row = GetParam();
    const Variant arguments = empty_arguments(row, 1);
    std::vector<GVariant *> members;
    std::vector<Variant> owners;
    for (gsize i = 0; i < g_variant_n_children(arguments.get()); ++i) {
        owners.push_back(Variant::adopt(g_variant_get_child_value(arguments.get(), i)));
        members.push_back(owners.back().get());
    }
    members.push_back(g_variant_new_string("too much"));
    const auto reply = ask(Variant(g_variant_new_tuple(members.data(), members.size())));
    EXPECT_EQ(reply.error, "org.freedesktop.DBus.Error.InvalidArgs");
    EXPECT_THAT(reply.text, HasSubstr(fmt::format("{} takes \"{}\"", row.method, row.in)));
}

TEST_P(BusMethods, AnswersInItsTypeWhateverTheValues) {
    const std::string many(100000, '1');
    const Values values[] = {
        {std::numeric_limits<gint32>::min(), many, "['+15550101', '', '112']"},
        {std::numeric_limits<gint32>::max(), "\n\x1b[2J{}%s%n", "<<<1>>>"},
        {-1, "AAAAAAAA", "@a{sv} {}"},
        {1, "+15550101", "['1']"},
        {1, "sip:1@\xe2\x82\xac", "@ai []"},
        {2, "====", "''"},
    };
    const int application = client_->register_application(0);
    for (const auto &value : values) {
        const auto reply = ask(arguments_of(GetParam(), application, value));
        EXPECT_EQ(reply.type, GetParam().out) << reply.error << ": " << reply.text;
    }
    EXPECT_EQ(client_->call(0, "org.freedesktop.DBus.Peer", "Ping").body, "()");
}

INSTANTIATE_TEST_SUITE_P(All, BusMethods, testing::ValuesIn(kRows),
                         [](const auto &test) { return std::string(test.param.method); });

} // namespace
} // namespace sim::test
