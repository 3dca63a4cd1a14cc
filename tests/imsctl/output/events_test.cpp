// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/events.hpp"
#include "tests/imsctl/in_process.hpp"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <ims.h>
#include <set>

namespace imsctl {
namespace {

const EventRow &event_row(int id) {
    return *find_event(catalogue().events(), id);
}

TEST(EventTable, HasEachEventOnceInTheOrderOfTheIds) {
    std::set<std::string_view> names;
    int last = 0;
    for (const EventRow &row : catalogue().events()) {
        EXPECT_GT(row.id, last) << row.name;
        last = row.id;
        EXPECT_TRUE(names.insert(row.name).second) << row.name;
        EXPECT_TRUE(row.name.starts_with(row.module)) << row.name;
        EXPECT_EQ(find_event(catalogue().events(), row.id), &row);
    }
    EXPECT_EQ(find_event(catalogue().events(), 0x214), nullptr);
}

TEST(EventTable, HasAllEventsOfCalls) {
    for (int id = IMS_NOTI_CALL_INCOMING_IND; id <= IMS_NOTI_CALL_USSD_INDICATION; ++id)
        EXPECT_NE(find_event(catalogue().events(), id), nullptr) << id;
    EXPECT_NE(find_event(catalogue().events(), IMS_NOTI_CALL_DTMF_EVENT), nullptr);
}

TEST(EventTable, HasTheEventsOfRegistrationMessagesAndLogin) {
    for (const int id :
         {IMS_NOTI_REG_REGISTRATION_STATUS, IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS,
          IMS_NOTI_SMS_INCOMING_SMS, IMS_NOTI_SMS_SEND_SMS_ACK, IMS_NOTI_SMS_DELIVERY_REPORT_ACK,
          IMS_NOTI_LOGIN_STATE})
        EXPECT_NE(find_event(catalogue().events(), id), nullptr) << id;
}

TEST(EventTable, HasAllEventsOfPushToTalkEachInWords) {
    for (int id = IMS_NOTI_POC_CALL_INCOMING_IND; id <= IMS_NOTI_POC_FILE_TRANSFER_TERMINATED;
         ++id) {
        ASSERT_NE(find_event(catalogue().events(), id), nullptr) << id;
        EXPECT_NE(event_row(id).summary, nullptr) << id;
    }
}

// The JSON object has keys of its own beside the fields.
TEST(EventTable, HasNoFieldNamedLikeTheEnvelope) {
    for (const EventRow &row : catalogue().events()) {
        std::set<std::string_view> names = {"event", "id", "slot", "time"};
        for (const FieldRow &field : row.fields)
            EXPECT_TRUE(names.insert(field.name).second) << row.name << ' ' << field.name;
    }
}

// That the texts are released is for LeakSanitizer to see.
TEST(TakeFields, TakesOverTheTexts) {
    ims_call_incoming_s record{};
    record.session_id = 3;
    record.number = strdup("tel:+1");
    record.text_1 = strdup("");
    record.flag_1 = true;
    const Fields fields = take_fields(event_row(IMS_NOTI_CALL_INCOMING_IND), &record);
    EXPECT_EQ(to_text(fields), "session_id=3 number=\"tel:+1\" call_type=0 text_1=\"\" text_2=- "
                               "text_3=- text_4=- text_5=- flag_1=true");
}

TEST(TakeFields, CopiesBytes) {
    const std::uint8_t data[] = {1, 2};
    ims_call_change_request_s record{3, 1, data, 2};
    EXPECT_EQ(to_text(take_fields(event_row(IMS_NOTI_CALL_CHANGE_REQUEST), &record)),
              R"(session_id=3 call_type=1 data="\x01\x02")");
    record.data = nullptr;
    record.length = 0;
    EXPECT_EQ(to_text(take_fields(event_row(IMS_NOTI_CALL_CHANGE_REQUEST), &record)),
              R"(session_id=3 call_type=1 data="")");
}

TEST(TakeFields, CopiesATpdu) {
    const std::uint8_t tpdu[] = {0, 0xFF};
    ims_sms_incoming_s record{2, tpdu, 3, 4};
    const EventRow &row = event_row(IMS_NOTI_SMS_INCOMING_SMS);
    EXPECT_EQ(to_text(take_fields(row, &record)), "tpdu=00ff member_3=3 member_4=4");
    record = {0, nullptr, 3, 4};
    EXPECT_EQ(to_text(take_fields(row, &record)), "tpdu= member_3=3 member_4=4");
}

TEST(TakeFields, KeepsUnsignedNumbers) {
    ims_registration_info_s record{2, 0xFFFFFFFF, 0, -1, 0, 0};
    EXPECT_EQ(to_text(take_fields(event_row(IMS_NOTI_REG_REGISTRATION_STATUS), &record)),
              "registered=true value_1=4294967295 value_2=0 value_3=-1 value_4=0 value_5=0");
}

struct SummaryRow {
    int id;
    Fields fields;
    const char *summary;
};

Fields registration_fields(bool registered, std::int64_t network, std::int64_t features,
                           std::int64_t reason) {
    return {{"registered", registered},
            {"value_1", network},
            {"value_2", features},
            {"value_3", reason}};
}

TEST(Summary, NamesWhatIsKnownAndShowsTheRest) {
    const SummaryRow rows[] = {
        {IMS_NOTI_REG_REGISTRATION_STATUS, registration_fields(true, 1, 15, 0),
         "registered over LTE for voice, video, short messages, USSD"},
        {IMS_NOTI_REG_REGISTRATION_STATUS, registration_fields(true, 0, 0, 0),
         "registered over no network for nothing"},
        {IMS_NOTI_REG_REGISTRATION_STATUS, registration_fields(true, 9, 0x12, 0),
         "registered over 9 for video, 16"},
        {IMS_NOTI_REG_REGISTRATION_STATUS, registration_fields(false, 1, 15, 1),
         "not registered: under way"},
        {IMS_NOTI_REG_REGISTRATION_STATUS, registration_fields(false, 1, 15, 4294967297),
         "not registered: 4294967297"},
        {IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, registration_fields(true, 1, 0, 0),
         "registered for emergency calls over LTE"},
        {IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS, registration_fields(false, 0, 0, 0),
         "not registered for emergency calls: asked for"},
        {IMS_NOTI_LOGIN_STATE, registration_fields(false, 0, 0, 2), "logged out: flight mode"},
        {IMS_NOTI_LOGIN_STATE, registration_fields(false, 1, 1, 0), "logging in"},
        {IMS_NOTI_LOGIN_STATE, registration_fields(false, 3, 1, 0), "3"},
    };
    for (const SummaryRow &row : rows)
        EXPECT_EQ(event_row(row.id).summary(row.fields), row.summary);
}

TEST(TakeFields, TrustsTheCountsOfAConference) {
    std::int32_t values[] = {7, 0};
    char *texts[] = {strdup("a"), nullptr};
    ims_call_conf_notify_s record{3, values, 2, texts, 2};
    const EventRow &row = event_row(IMS_NOTI_CALL_CONF_NOTIFY_RECEIVED);
    EXPECT_EQ(to_text(take_fields(row, &record)), R"(session_id=3 values=[7,0] texts=["a",-])");
    record = {3, nullptr, -1, nullptr, 0};
    EXPECT_EQ(to_text(take_fields(row, &record)), "session_id=3 values=[] texts=[]");
}

} // namespace
} // namespace imsctl
