// SPDX-License-Identifier: Apache-2.0
#include "imsctl/registration/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kRegistrationVerbGroups[] = {
    {"registration", "registration with the network"},
};

} // namespace

Module registration_module() {
    return {kRegistrationVerbGroups,
            {registration_verbs(), login_verbs()},
            {registration_events(), login_events()}};
}

} // namespace imsctl
