// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string>

namespace sim {

// A value of a type that no key has.
struct ForeignValue {
    std::string type;
};

} // namespace sim
