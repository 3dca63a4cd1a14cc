// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/result.hpp"
#include "sim/group/tree.hpp"

// Between the dictionaries of documents and those of the bus.
namespace sim::wire {

// Of an "a{sv}", and of an "aa{sv}". Values may be wrapped in any number of variants. Refused when
// there is more in them than a document can need.
Answer<GroupDictionary> read_dictionary(GVariant *dictionary);
Answer<GroupDictionaries> read_dictionaries(GVariant *list);

Variant write_dictionary(const GroupDictionary &dictionary);

} // namespace sim::wire
