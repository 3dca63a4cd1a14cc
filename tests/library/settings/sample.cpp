// SPDX-License-Identifier: Apache-2.0
#include "tests/library/settings/sample.hpp"

#include <deque>
#include <string_view>

namespace test {
namespace {

std::string printed(GVariant *value) {
    gchar *text = g_variant_print(value, FALSE);
    const std::string printed{text};
    g_free(text);
    return printed;
}

// The entry that the service expects at this position of a set.
std::string written_setting(std::size_t position, Direction direction) {
    const KeyRow *row = &settings_keys()[position - 1];
    // The service takes the neighbours' values a second time in the place of these two.
    if (row->key == std::string_view{"audio_port_end"})
        row = &settings_keys()[--position - 1];
    if (row->key == std::string_view{"is_enable_srtp"})
        row = &settings_keys()[--position - 1];
    Variant value = sent_value(*row, position);
    if (row->type == 't')
        value.reset(g_variant_ref_sink(g_variant_new_int32(sample_number(position))));
    // A new set brings this number as text.
    if (direction == Direction::kAdd && row->key == std::string_view{"is_enable_emm_MCPTT"})
        value.reset(g_variant_ref_sink(
            g_variant_new_string(std::to_string(sample_number(position)).c_str())));
    return "'" + std::string{row->key} + "': <" + printed(value.get()) + ">";
}

} // namespace

std::int32_t sample_number(std::size_t position) {
    return static_cast<std::int32_t>(position) * 1001 - 70000;
}

const char *sample_text(std::size_t position) {
    static std::deque<std::string> texts;
    while (texts.size() <= position)
        texts.push_back("text " + std::to_string(texts.size()));
    return texts[position].c_str();
}

bool sample_flag(std::size_t position) {
    return position % 2 == 1;
}

void fill(void *record, std::span<const KeyRow> keys) {
    for (std::size_t at = 0; at < keys.size(); ++at) {
        const std::size_t position = at + 1;
        const std::size_t offset = keys[at].offset;
        switch (keys[at].type) {
        case 'i':
            field_at<std::int32_t>(record, offset) = sample_number(position);
            break;
        case 'b':
            field_at<bool>(record, offset) = sample_flag(position);
            break;
        case 's':
            field_at<const char *>(record, offset) = sample_text(position);
            break;
        default:
            // Its text is never written.
            field_at<ims_settings_timer_s>(record, offset) = {nullptr, sample_number(position)};
        }
    }
}

Variant sent_value(const KeyRow &row, std::size_t position) {
    switch (row.type) {
    case 'i':
        return Variant{g_variant_ref_sink(g_variant_new_int32(sample_number(position)))};
    case 'b':
        return Variant{g_variant_ref_sink(g_variant_new_boolean(sample_flag(position)))};
    case 's':
        return Variant{g_variant_ref_sink(g_variant_new_string(sample_text(position)))};
    default:
        return Variant{g_variant_ref_sink(
            g_variant_new_string(std::to_string(sample_number(position)).c_str()))};
    }
}

std::string written_settings(Direction direction) {
    std::string text = "({";
    for (std::size_t position = 1; position <= settings_keys().size(); ++position)
        text += (position == 1 ? "" : ", ") + written_setting(position, direction);
    return text + "},)";
}

std::string written_profile() {
    std::string text = "({";
    for (std::size_t position = 1; position <= profile_keys().size(); ++position) {
        const KeyRow &row = profile_keys()[position - 1];
        text += (position == 1 ? "'" : ", '") + std::string{row.key} + "': <" +
                printed(sent_value(row, position).get()) + ">";
    }
    return text + "},)";
}

} // namespace test
