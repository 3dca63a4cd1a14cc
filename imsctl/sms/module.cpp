// SPDX-License-Identifier: Apache-2.0
#include "imsctl/sms/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kSmsVerbGroups[] = {
    {"sms", "short messages"},
};

} // namespace

Module sms_module() {
    return {kSmsVerbGroups, {sms_verbs()}, {sms_events()}};
}

} // namespace imsctl
