// SPDX-License-Identifier: Apache-2.0
// Which profile a verb is about.
#pragma once

#include "imsctl/settings/keys.hpp"

#include <cstdint>
#include <optional>
#include <span>
#include <string>

namespace imsctl {

// An id or a name.
class ProfileChoice {
  public:
    explicit ProfileChoice(const std::string &text);

    std::optional<std::int32_t> id() const { return id_; }

    // Of all that the service told. Throws a failure when none or more than one is meant.
    ProfileRecord &among(std::span<ProfileRecord> profiles) const;

  private:
    bool is_meant(const ProfileRecord &profile) const;

    std::string text_;
    std::optional<std::int32_t> id_;
};

} // namespace imsctl
