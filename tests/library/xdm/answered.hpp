// SPDX-License-Identifier: Apache-2.0
// A document as the service would answer it, made from one as it was sent.
#pragma once

#include "tests/support/variant.hpp"

namespace test {

// What a member's "type" is in an answer, where a flag was sent.
inline constexpr int kAnsweredType = 5;

// The same "a{sv}" under the keys of the other direction.
Variant answered(GVariant *sent_document);

} // namespace test
