// SPDX-License-Identifier: Apache-2.0
#include "tests/support/decoder_checks.hpp"

#include "tests/support/expectations.hpp"
#include "tests/support/malformed.hpp"

namespace test {
namespace {

// A signal without a body arrives as an empty tuple.
Variant as_parameters(const Variant &body) {
    return share(body ? body.get() : g_variant_new("()"));
}

} // namespace

std::vector<DecodedEvent> decoded_events_of(ims::Decoder decode, const EventModule &module,
                                            std::span<const EventRow> rows) {
    std::vector<DecodedEvent> decoded;
    for (const ModuleEvent &event : events_of(module, rows))
        decoded.push_back({decode, event});
    return decoded;
}

ims_h some_handle() {
    static ims_client_s client{};
    return &client;
}

void decode(ims::Decoder decoder, ims_h handle, int id, const Variant &parameters,
            NotificationRecorder &recorder) {
    const ims_noti_cb_info_s subscription{1, NotificationRecorder::callback, &recorder};
    decoder(handle, id, parameters.get(), &subscription);
}

void expect_null_handle_is_logged(ims::Decoder decoder, const EventModule &module,
                                  std::span<const int> ids) {
    for (const int id : ids) {
        SCOPED_TRACE(id);
        NotificationRecorder recorder;
        decode(decoder, nullptr, id, parse("(ii)", "(3, 16)"), recorder);
        EXPECT_EQ(recorder.count(), 0U);
        expect_one_line(module.unit, module.decoder, "Ims Handle NULL");
    }
}

void expect_unknown_id_is_logged(ims::Decoder decoder, const EventModule &module, int id,
                                 const std::string &message) {
    NotificationRecorder recorder;
    decode(decoder, some_handle(), id, parse("(ii)", "(3, 16)"), recorder);
    EXPECT_EQ(recorder.count(), 0U);
    expect_one_warning(module.unit, module.decoder, message);
}

TEST_P(DecodedEvents, BecomeTheirRecord) {
    const EventRow &row = GetParam().event.row;
    NotificationRecorder recorder{[&](const Notified &, void *event) { row.check(event); }};
    decode(GetParam().decode, some_handle(), row.id, parse(row.type, row.value), recorder);
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.all()[0].handle, some_handle());
    EXPECT_EQ(recorder.all()[0].id, row.id);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(DecodedEvents, OfAnotherShapeAreDroppedWithOneLineEach) {
    const auto &[module, row] = GetParam().event;
    for (const Malformed &malformed : malformed_for(row.type)) {
        SCOPED_TRACE(malformed.type);
        NotificationRecorder recorder;
        decode(GetParam().decode, some_handle(), row.id, as_parameters(malformed.body), recorder);
        EXPECT_EQ(recorder.count(), 0U);
        expect_one_line(module.unit, module.decoder);
    }
}

// What was unpacked for nobody is released, which the leak check watches.
TEST_P(DecodedEvents, WithoutACallbackLeaveNothingBehind) {
    const EventRow &row = GetParam().event.row;
    const ims_noti_cb_info_s nobody{1, nullptr, nullptr};
    GetParam().decode(some_handle(), row.id, parse(row.type, row.value).get(), &nobody);
    EXPECT_TRUE(take_log().empty());
}

} // namespace test
