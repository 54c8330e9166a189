// Caller-held element blocks: zero-filled on build, overflow-checked in
// 32-bit arithmetic so a block never exceeds 4 GiB - 1 on any target.
#include <cstdlib>
#include <cstring>

#include "core_internal.h"

namespace {

bool product_overflows(uint32_t a, uint32_t b) { return b != 0 && a > 0xFFFFFFFFu / b; }

bool block_overflows(uint32_t countA, uint32_t countB, uint32_t elementSize) {
    return product_overflows(countA, countB) || product_overflows(countA * countB, elementSize);
}

int allocate_into(void** slot, std::size_t bytes) {
    *slot = std::calloc(bytes, 1);
    return *slot != nullptr;
}

}  // namespace

extern "C" {

VOR_API int VorArrayBuild(void** slot, uint32_t count, uint32_t elementSize) {
    if (product_overflows(count, elementSize)) {
        *slot = nullptr;
        return 0;
    }
    return allocate_into(slot, static_cast<std::size_t>(count) * elementSize);
}

VOR_API int VorArrayBuild2(void** slot, uint32_t countA, uint32_t countB, uint32_t elementSize) {
    if (block_overflows(countA, countB, elementSize)) {
        *slot = nullptr;
        return 0;
    }
    return allocate_into(slot, static_cast<std::size_t>(countA) * countB * elementSize);
}

VOR_API int VorArrayCopy2(void* dst, const void* src, uint32_t countA, uint32_t countB,
                          uint32_t elementSize) {
    if (block_overflows(countA, countB, elementSize)) return 0;
    const std::size_t bytes = static_cast<std::size_t>(countA) * countB * elementSize;
    if (bytes != 0) std::memcpy(dst, src, bytes);
    return 1;
}

VOR_API void VorArrayFree(void** slot) {
    if (*slot != nullptr) {
        std::free(*slot);
        *slot = nullptr;
    }
}

}  // extern "C"
