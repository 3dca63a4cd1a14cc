// SPDX-License-Identifier: Apache-2.0
#include "imsctl/ss/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kSsVerbGroups[] = {
    {"ss", "supplementary services"},
    {"ss waiting", "call waiting"},
    {"ss forwarding", "call forwarding"},
    {"ss barring", "call barring"},
};

} // namespace

Module ss_module() {
    return {kSsVerbGroups, {ss_verbs()}, {}};
}

} // namespace imsctl
