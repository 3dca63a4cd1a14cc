// SPDX-License-Identifier: Apache-2.0
// What is measured with a full settings record: reading and writing it in process, and whole round
// trips.
#pragma once

#include "bench/settings_sample.hpp"
#include "bench/settings_side.hpp"

#include <string_view>

namespace bench {

// The peer serves the sample. Ends with an exception unless each side reads the whole record and
// all write the same message.
class SettingsScene {
  public:
    explicit SettingsScene(const Client &client);

    const Client &client() const { return client_; }
    const SettingsSample &sample() const { return sample_; }

  private:
    void check(const SettingsSide &side) const;

    const Client &client_;
    SettingsSample sample_;
};

struct SettingsWork {
    std::string_view name;
    // Does the work once and says whether it went well.
    bool (*run)(const SettingsScene &scene, const SettingsSide &side);
};

// "read": a received dictionary to a record. "write": a record to the bytes of a message. "get" and
// "update": the same, over the bus and back.
extern const std::array<SettingsWork, 4> kSettingsWorks;

} // namespace bench
