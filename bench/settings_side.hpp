// SPDX-License-Identifier: Apache-2.0
// A settings record and its dictionary, moved in three ways: by the library, naively with GDBus
// alone, and as little as GDBus lets anybody do.
#pragma once

#include "bench/client.hpp"

#include <array>

namespace bench {

using Settings = ims_global_settings_s;

struct Answer {
    bool is_here = false;
    int result = 1;
};

struct SettingsSide {
    const char *name;
    // Whether reading fills the record; the least that can be done does not.
    bool fills;
    void (*read)(GVariant *dictionary, Settings &settings);
    // The body of the message.
    Variant (*write)(const Settings &settings);
    // Asks the peer for the set, waits, reads the dictionary, and says whether that went well.
    bool (*get)(const Client &client, Settings &settings);
    // Sends the record; the answer arrives later.
    void (*update)(const Client &client, const Settings &settings, Answer &answer);
};

extern const SettingsSide kSettingsLibrary;
// Format strings and one comparison of keys after the other, as is quickly written.
extern const SettingsSide kSettingsNaive;
// Reading: the walk over the dictionary. Writing: a body that was made before.
extern const SettingsSide kSettingsFloor;

inline const std::array<const SettingsSide *, 3> kSettingsSides{&kSettingsLibrary, &kSettingsNaive,
                                                                &kSettingsFloor};

} // namespace bench
