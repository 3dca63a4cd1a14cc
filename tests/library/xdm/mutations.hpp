// SPDX-License-Identifier: Apache-2.0
// A document with one of its values changed, at any depth.
#pragma once

#include "tests/support/variant.hpp"

#include <functional>

namespace test {

// What becomes of the entry of a dictionary: adds what is to stand there to the builder.
using Change = std::function<void(GVariantBuilder *dictionary, const char *key, GVariant *content)>;

// How many entries there are in the document's dictionaries, all depths together.
std::size_t entries_in(GVariant *document);

// The document with one of them changed.
Variant with_changed_entry(GVariant *document, std::size_t number, const Change &change);

} // namespace test
