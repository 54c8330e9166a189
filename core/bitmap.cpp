// Bitmap records: building, freeing, copying and reading one pixel.
#include <cstdlib>
#include <cstring>

#include "core_internal.h"

namespace {

// A bitmap holds fewer than 0x40000000 pixels, so its byte size fits in 32 bits.
constexpr std::uint32_t k_pixel_limit = 0x40000000u;

}  // namespace

extern "C" {

VOR_API int VorBitmapBuild(VorBitmap* bitmap, uint32_t width, uint32_t height) {
    bitmap->width = width;
    bitmap->height = height;
    if (width != 0 && (height > 0xFFFFFFFFu / width || width * height >= k_pixel_limit)) {
        bitmap->data = nullptr;
        return 0;
    }
    bitmap->data = static_cast<uint8_t*>(std::calloc(static_cast<std::size_t>(width) * height, 4));
    return bitmap->data != nullptr;
}

VOR_API void VorBitmapFree(VorBitmap* bitmap) {
    if (bitmap->data != nullptr) {
        std::free(bitmap->data);
        bitmap->data = nullptr;
    }
}

VOR_API int VorBitmapCopy(VorBitmap* dst, const VorBitmap* src) {
    if (dst->data == nullptr) return 0;
    if (src->data == nullptr || dst == src) return 0;
    if (dst->width != src->width) return 0;
    if (dst->height != src->height) return 0;
    const uint32_t width = src->width;
    const uint32_t height = src->height;
    if (height != 0 && (width > 0xFFFFFFFFu / height || width * height > 0x3FFFFFFFu)) return 0;
    std::memcpy(dst->data, src->data, vorlite::core::byte_count(*src));
    return 1;
}

VOR_API void VorBitmapGetColorAtPoint(const VorBitmap* bitmap, VorPoint p, VorColor* out) {
    // Callers pass a point inside the bitmap, so both coordinates are
    // non-negative and small; the clamped conversion only keeps a stray
    // NaN from being undefined.
    const auto x = vorlite::core::truncate_clamped<uint32_t>(p.x);
    const auto y = vorlite::core::truncate_clamped<uint32_t>(p.y);
    const std::size_t index = static_cast<std::size_t>(y) * bitmap->width + x;
    std::memcpy(out, bitmap->data + index * 4, 4);
}

}  // extern "C"
