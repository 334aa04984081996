// Replaces the global operator new and delete for the benchmark program that links this
// file, so that it can read how many bytes are live. Each block carries its size in a header
// that keeps the default new alignment.
#include "support/LiveBytes.h"

#include <atomic>
#include <cstddef>
#include <cstdlib>
#include <new>

namespace {

std::atomic<std::int64_t> g_liveBytes{0};
constexpr std::size_t kHeader = __STDCPP_DEFAULT_NEW_ALIGNMENT__;

void* CountedAllocate(std::size_t size) {
    void* const block = std::malloc(size + kHeader);
    if (block == nullptr)
        throw std::bad_alloc();
    *static_cast<std::size_t*>(block) = size;
    g_liveBytes.fetch_add(static_cast<std::int64_t>(size), std::memory_order_relaxed);
    return static_cast<std::byte*>(block) + kHeader;
}

void CountedFree(void* pointer) noexcept {
    if (pointer == nullptr)
        return;
    void* const block = static_cast<std::byte*>(pointer) - kHeader;
    g_liveBytes.fetch_sub(static_cast<std::int64_t>(*static_cast<std::size_t*>(block)),
                          std::memory_order_relaxed);
    std::free(block);
}

} // namespace

namespace VizBridgeBench {

std::int64_t LiveBytes() {
    return g_liveBytes.load(std::memory_order_relaxed);
}

} // namespace VizBridgeBench

void* operator new(std::size_t size) {
    return CountedAllocate(size);
}
void* operator new[](std::size_t size) {
    return CountedAllocate(size);
}
void operator delete(void* pointer) noexcept {
    CountedFree(pointer);
}
void operator delete[](void* pointer) noexcept {
    CountedFree(pointer);
}
void operator delete(void* pointer, std::size_t) noexcept {
    CountedFree(pointer);
}
void operator delete[](void* pointer, std::size_t) noexcept {
    CountedFree(pointer);
}
// A program made with new (std::nothrow) needs these too: the standard library's nothrow
// forms call the plain ones, but a sanitizer runtime brings its own.
void* operator new(std::size_t size, std::nothrow_t const&) noexcept {
    try {
        return CountedAllocate(size);
    } catch (std::bad_alloc const&) {
        return nullptr;
    }
}
void* operator new[](std::size_t size, std::nothrow_t const&) noexcept {
    try {
        return CountedAllocate(size);
    } catch (std::bad_alloc const&) {
        return nullptr;
    }
}
void operator delete(void* pointer, std::nothrow_t const&) noexcept {
    CountedFree(pointer);
}
void operator delete[](void* pointer, std::nothrow_t const&) noexcept {
    CountedFree(pointer);
}
