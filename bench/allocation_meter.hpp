// SPDX-License-Identifier: Apache-2.0
// Counts what a process has allocated. Linking it replaces the C library's allocation functions.
#pragma once

#include <cstdint>

namespace bench {

// Bytes of the heap that are in use now, the allocator's own header of each block included.
std::int64_t heap_in_use();

} // namespace bench
