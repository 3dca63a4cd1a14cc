// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/profile_choice.hpp"

#include "imsctl/output/failure.hpp"
#include "imsctl/output/values.hpp"

#include <fmt/format.h>
#include <vector>

namespace imsctl {
namespace {

// The service may have more than the library keeps.
std::string what_was_seen(std::size_t profiles) {
    if (profiles < IMS_PROFILE_LIST_CAPACITY)
        return "";
    return fmt::format("; only the first {} can be seen", IMS_PROFILE_LIST_CAPACITY);
}

} // namespace

ProfileChoice::ProfileChoice(const std::string &text) : text_(text), id_(parse_number(text)) {}

ProfileRecord &ProfileChoice::among(std::span<ProfileRecord> profiles) const {
    std::vector<ProfileRecord *> found;
    for (ProfileRecord &profile : profiles)
        if (is_meant(profile))
            found.push_back(&profile);
    constexpr const char *kHint = "try: imsctl profile list";
    if (found.empty())
        throw Failure(
            FailureKind::kProfile,
            fmt::format("there is no profile {}{}", quote(text_), what_was_seen(profiles.size())),
            kHint);
    if (found.size() > 1)
        throw Failure(FailureKind::kProfile,
                      fmt::format("there is more than one profile {}", quote(text_)), kHint);
    return *found.front();
}

bool ProfileChoice::is_meant(const ProfileRecord &profile) const {
    return id_ ? profile.id == *id_ : profile.name != nullptr && text_ == profile.name;
}

} // namespace imsctl
