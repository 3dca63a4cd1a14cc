// SPDX-License-Identifier: Apache-2.0
#include "bench/allocation_meter.hpp"

#include <atomic>
#include <cerrno>
#include <cstddef>

#include <malloc.h>

extern "C" {
void *__libc_malloc(std::size_t size);
void *__libc_calloc(std::size_t count, std::size_t size);
void *__libc_realloc(void *block, std::size_t size);
void *__libc_memalign(std::size_t alignment, std::size_t size);
void __libc_free(void *block);
}

namespace {

constexpr std::int64_t kBlockHeader = sizeof(std::size_t);

std::atomic<std::int64_t> in_use{0};

std::int64_t size_of(void *block) {
    return block == nullptr ? 0
                            : static_cast<std::int64_t>(malloc_usable_size(block)) + kBlockHeader;
}

void *counted(void *block) {
    in_use += size_of(block);
    return block;
}

} // namespace

std::int64_t bench::heap_in_use() {
    return in_use;
}

#pragma GCC visibility push(default)
extern "C" {

void *malloc(std::size_t size) noexcept {
    return counted(__libc_malloc(size));
}

void *calloc(std::size_t count, std::size_t size) noexcept {
    return counted(__libc_calloc(count, size));
}

void *realloc(void *block, std::size_t size) noexcept {
    const std::int64_t before = size_of(block);
    void *moved = __libc_realloc(block, size);
    if (moved != nullptr || size == 0)
        in_use -= before;
    return counted(moved);
}

void free(void *block) noexcept {
    in_use -= size_of(block);
    __libc_free(block);
}

void *memalign(std::size_t alignment, std::size_t size) noexcept {
    return counted(__libc_memalign(alignment, size));
}

void *aligned_alloc(std::size_t alignment, std::size_t size) noexcept {
    return memalign(alignment, size);
}

int posix_memalign(void **block, std::size_t alignment, std::size_t size) noexcept {
    *block = memalign(alignment, size);
    return *block == nullptr ? ENOMEM : 0;
}

} // extern "C"
#pragma GCC visibility pop
