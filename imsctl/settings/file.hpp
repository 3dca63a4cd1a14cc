// SPDX-License-Identifier: Apache-2.0
// Settings sets in JSON files.
#pragma once

#include "imsctl/settings/record.hpp"

#include <string>

namespace imsctl {

// One key a line, in the record's order.
std::string settings_document(const SettingsRecord &settings);

// The keys that have a value, "name" among them. Throws an input failure that names the lines that
// are wrong, or the first of many.
Assignments<SettingsRecord> parse_settings(const std::string &document, const std::string &name);

} // namespace imsctl
