// SPDX-License-Identifier: Apache-2.0
#include "bench/settings_sample.hpp"

#include "bench/protocol.hpp"

#include <stdexcept>
#include <string_view>

namespace bench {
namespace {

constexpr std::size_t kRows = ims::kSettingsFields.size();

// The service sends the timers as text.
GVariant *sent(const Settings &settings, const FieldRow &row) {
    if (row.kind != FieldKind::kTextAndNumber)
        return value_of(settings, row);
    return g_variant_new_take_string(
        g_strdup_printf("%d", at<ims_settings_timer_s>(settings, row).value));
}

Variant sent(const Settings &settings) {
    GVariantBuilder entries;
    g_variant_builder_init(&entries, G_VARIANT_TYPE_VARDICT);
    for (std::size_t row = 0; row < kRows; ++row)
        g_variant_builder_add(&entries, "{sv}", ims::kSettingsFields[row].key.data(),
                              sent(settings, ims::kSettingsFields[row]));
    return ims::owned(g_variant_new("(a{sv})", &entries));
}

// The body of a message comes from its bytes in a form of its own.
Variant received(const Variant &body) {
    std::string bytes = message_bytes(body.get());
    const Message message{g_dbus_message_new_from_blob(reinterpret_cast<guchar *>(bytes.data()),
                                                       bytes.size(), G_DBUS_CAPABILITY_FLAGS_NONE,
                                                       nullptr)};
    if (!message)
        throw std::runtime_error("a message cannot be read back");
    return Variant{g_variant_get_child_value(g_dbus_message_get_body(message.get()), 0)};
}

bool is_same(const Settings &a, const Settings &b, const FieldRow &row) {
    switch (row.kind) {
    case FieldKind::kInt32:
        return at<std::int32_t>(a, row) == at<std::int32_t>(b, row);
    case FieldKind::kBoolean:
        return at<bool>(a, row) == at<bool>(b, row);
    case FieldKind::kTextAndNumber:
        return at<ims_settings_timer_s>(a, row).value == at<ims_settings_timer_s>(b, row).value;
    default:
        return std::string_view{at<const char *>(a, row)} == at<const char *>(b, row);
    }
}

} // namespace

SettingsSample::SettingsSample() {
    fill();
    dictionary_ = received(sent(record_));
}

void SettingsSample::fill() {
    texts_.reserve(kRows);
    for (std::size_t position = 0; position < kRows; ++position) {
        const FieldRow &row = ims::kSettingsFields[position];
        const auto number = static_cast<std::int32_t>(position) * 1001 - 70000;
        switch (row.kind) {
        case FieldKind::kInt32:
            at<std::int32_t>(record_, row) = number;
            break;
        case FieldKind::kBoolean:
            at<bool>(record_, row) = position % 2 == 1;
            break;
        case FieldKind::kTextAndNumber:
            at<ims_settings_timer_s>(record_, row).value = number;
            break;
        default:
            texts_.push_back("text " + std::to_string(position));
            at<const char *>(record_, row) = texts_.back().c_str();
        }
    }
}

bool SettingsSample::equals(const Settings &read) const {
    for (std::size_t row = 0; row < kRows; ++row) {
        if (!is_same(record_, read, ims::kSettingsFields[row]))
            return false;
    }
    return true;
}

std::string message_bytes(GVariant *body) {
    const Message message{g_dbus_message_new_method_call(
        kServiceName, kObjectPath, kSettingsInterface, kUpdateSettingsMethod)};
    g_dbus_message_set_serial(message.get(), 1);
    g_dbus_message_set_body(message.get(), body);
    gsize size = 0;
    const Bytes bytes{
        g_dbus_message_to_blob(message.get(), &size, G_DBUS_CAPABILITY_FLAGS_NONE, nullptr)};
    if (!bytes)
        throw std::runtime_error("a message cannot be written");
    return {reinterpret_cast<const char *>(bytes.get()), size};
}

} // namespace bench
