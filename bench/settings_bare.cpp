// SPDX-License-Identifier: Apache-2.0
// The two sides that do without the library. They take the names of the keys from its table.
#include "bench/protocol.hpp"
#include "bench/settings_record.hpp"
#include "bench/settings_side.hpp"

#include <cstdlib>
#include <cstring>

namespace bench {
namespace {

constexpr int kTimeoutMs = 60000;

void store(GVariant *value, const FieldRow &row, Settings &settings) {
    switch (row.kind) {
    case FieldKind::kInt32:
        at<std::int32_t>(settings, row) = g_variant_get_int32(value);
        break;
    case FieldKind::kBoolean:
        at<bool>(settings, row) = g_variant_get_boolean(value) != FALSE;
        break;
    case FieldKind::kTextAndNumber:
        at<ims_settings_timer_s>(settings, row) = {g_variant_dup_string(value, nullptr),
                                                   std::atoi(g_variant_get_string(value, nullptr))};
        break;
    default:
        at<char *>(settings, row) = g_variant_dup_string(value, nullptr);
    }
}

void read_naively(GVariant *dictionary, Settings &settings) {
    GVariantIter entries;
    g_variant_iter_init(&entries, dictionary);
    char *key = nullptr;
    GVariant *value = nullptr;
    while (g_variant_iter_loop(&entries, "{sv}", &key, &value)) {
        for (std::size_t row = 0; row < ims::kSettingsFields.size(); ++row) {
            if (std::strcmp(key, ims::kSettingsFields[row].key.data()) == 0) {
                store(value, ims::kSettingsFields[row], settings);
                break;
            }
        }
    }
}

Variant write_naively(const Settings &settings) {
    GVariantBuilder entries;
    g_variant_builder_init(&entries, G_VARIANT_TYPE_VARDICT);
    for (const ims::WriteStep &step : ims::kSettingsUpdate) {
        const FieldRow &row = ims::kSettingsFields[step.row];
        g_variant_builder_add(&entries, "{sv}", row.key.data(), value_of(settings, row));
    }
    return Variant{g_variant_ref_sink(g_variant_new("(a{sv})", &entries))};
}

void walk(GVariant *dictionary, Settings &) {
    const gsize count = g_variant_n_children(dictionary);
    for (gsize at = 0; at < count; ++at) {
        const Variant entry{g_variant_get_child_value(dictionary, at)};
        const Variant key{g_variant_get_child_value(entry.get(), 0)};
        const Variant boxed{g_variant_get_child_value(entry.get(), 1)};
        const Variant value{g_variant_get_child_value(boxed.get(), 0)};
    }
}

Variant made_before(const Settings &settings) {
    static const Variant body = write_naively(settings);
    return Variant{g_variant_ref(body.get())};
}

template <auto Read>
bool get(const Client &client, Settings &settings) {
    const Variant reply{g_dbus_connection_call_sync(
        client.connection(), kServiceName, kObjectPath, kSettingsInterface, kGetSettingsMethod,
        g_variant_new("(s)", kSettingsName), nullptr, G_DBUS_CALL_FLAGS_NONE, kTimeoutMs, nullptr,
        nullptr)};
    if (!reply)
        return false;
    gint32 result = 1;
    GVariant *dictionary = nullptr;
    g_variant_get(reply.get(), "(i@a{sv})", &result, &dictionary);
    const Variant owner{dictionary};
    if (result == 0)
        Read(dictionary, settings);
    return result == 0;
}

void on_reply(GObject *source, GAsyncResult *outcome, gpointer answer) {
    const Variant reply{g_dbus_connection_call_finish(G_DBUS_CONNECTION(source), outcome, nullptr)};
    gint32 result = 1;
    if (reply)
        g_variant_get(reply.get(), "(i)", &result);
    *static_cast<Answer *>(answer) = {true, result};
}

template <auto Write>
void update(const Client &client, const Settings &settings, Answer &answer) {
    const Variant body = Write(settings);
    g_dbus_connection_call(client.connection(), kServiceName, kObjectPath, kSettingsInterface,
                           kUpdateSettingsMethod, body.get(), nullptr, G_DBUS_CALL_FLAGS_NONE,
                           kTimeoutMs, nullptr, on_reply, &answer);
}

} // namespace

const SettingsSide kSettingsNaive{
    "naive", true, read_naively, write_naively, get<read_naively>, update<write_naively>};
const SettingsSide kSettingsFloor{"floor",     false,     walk,
                                  made_before, get<walk>, update<made_before>};

} // namespace bench
