// SPDX-License-Identifier: Apache-2.0
// A full settings record, and its dictionary as GDBus hands it to an application.
#pragma once

#include "bench/settings_record.hpp"

#include "bench/owned.hpp"

#include <string>
#include <vector>

namespace bench {

class SettingsSample {
  public:
    SettingsSample();

    const Settings &record() const { return record_; }
    GVariant *dictionary() const { return dictionary_.get(); }
    // Whether a record that was read holds the same.
    bool equals(const Settings &read) const;

  private:
    void fill();

    std::vector<std::string> texts_;
    Settings record_{};
    Variant dictionary_;
};

// The bytes of the message that brings the service this body.
std::string message_bytes(GVariant *body);

} // namespace bench
