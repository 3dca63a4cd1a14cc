// SPDX-License-Identifier: Apache-2.0
// The commands: which there are, and how each is made ready to run.
#pragma once

#include "imsctl/client/invocation.hpp"
#include "imsctl/line/arguments.hpp"

#include <span>
#include <string_view>
#include <vector>

namespace imsctl {

struct Verb {
    std::string_view path;    // "call tty mode get"
    std::string_view summary; // one line
    std::string_view example; // what follows "imsctl "
    // Declares the arguments and returns what is done with them.
    Action (*prepare)(Arguments &);
};

// One table a file, NAME_verbs.cpp. A new family of verbs takes such a file, a line here and one in
// all_verbs(), and a line in kGroups for each word that other words follow. Its events go into
// NAME_events.cpp (events.hpp), its section into docs/imsctl.md.
std::span<const Verb> call_verbs();
std::span<const Verb> media_verbs();
std::span<const Verb> conference_verbs();
std::span<const Verb> access_verbs();
std::span<const Verb> registration_verbs();
std::span<const Verb> login_verbs();
std::span<const Verb> sms_verbs();
std::span<const Verb> ss_verbs();
std::span<const Verb> settings_verbs();
std::span<const Verb> profile_verbs();
std::span<const Verb> ptt_call_verbs();
std::span<const Verb> ptt_floor_verbs();
std::span<const Verb> ptt_content_verbs();
std::span<const Verb> group_verbs();
std::span<const Verb> group_set_verbs();
std::span<const Verb> vt_verbs();
std::span<const Verb> general_verbs();

std::vector<Verb> all_verbs();

// For a word that other words follow, "call tty": its line of help.
std::string_view group_summary(std::string_view path);

} // namespace imsctl
