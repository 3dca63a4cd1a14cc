// SPDX-License-Identifier: Apache-2.0
#include "imsctl/group/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kGroupVerbGroups[] = {
    {"group", "group documents of push-to-talk"},
    {"group rule", "the rules of a group"},
    {"group set", "the properties of a group"},
};

} // namespace

Module group_module() {
    return {kGroupVerbGroups, {group_verbs(), group_set_verbs()}, {}};
}

} // namespace imsctl
