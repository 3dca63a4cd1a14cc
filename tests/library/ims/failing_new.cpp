// SPDX-License-Identifier: Apache-2.0
// Stands in front of the C++ library's allocation functions for the whole executable. A unit of its
// own, so that no caller sees through them.
#include <cstdlib>
#include <new>

bool out_of_memory = false;

[[gnu::visibility("default")]] void *operator new(std::size_t size,
                                                  const std::nothrow_t &) noexcept {
    return out_of_memory ? nullptr : std::malloc(size);
}
[[gnu::visibility("default")]] void *operator new(std::size_t size) {
    if (void *memory = std::malloc(size))
        return memory;
    throw std::bad_alloc{};
}
[[gnu::visibility("default")]] void operator delete(void *memory) noexcept {
    std::free(memory);
}
[[gnu::visibility("default")]] void operator delete(void *memory, std::size_t) noexcept {
    std::free(memory);
}
[[gnu::visibility("default")]] void operator delete(void *memory, const std::nothrow_t &) noexcept {
    std::free(memory);
}
