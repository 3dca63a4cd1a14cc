// SPDX-License-Identifier: Apache-2.0
// The fields of a settings record by their rows in the library's table, and their values on the bus
// as the sides without the library make them.
#pragma once

#include "src/settings_fields.hpp"
#include "src/wire/field_at.hpp"

namespace bench {

using Settings = ims_global_settings_s;
using ims::FieldKind;
using ims::FieldRow;

template <typename T>
T &at(Settings &settings, const FieldRow &row) {
    return ims::at<T>(&settings, row.offset);
}

template <typename T>
const T &at(const Settings &settings, const FieldRow &row) {
    return ims::at<T>(&settings, row.offset);
}

// The timers go to the service as numbers.
inline GVariant *value_of(const Settings &settings, const FieldRow &row) {
    switch (row.kind) {
    case FieldKind::kInt32:
        return g_variant_new_int32(at<std::int32_t>(settings, row));
    case FieldKind::kBoolean:
        return g_variant_new_boolean(at<bool>(settings, row));
    case FieldKind::kTextAndNumber:
        return g_variant_new_int32(at<ims_settings_timer_s>(settings, row).value);
    default:
        return g_variant_new_string(at<const char *>(settings, row));
    }
}

} // namespace bench
