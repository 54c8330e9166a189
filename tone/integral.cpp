// Summed-area tables of a bitmap: per channel, or of one grey level per
// pixel. Any box sum then costs four reads whatever the box size. Sums wrap
// modulo 2^32; a box sum taken from wrapped entries is still exact as long
// as the box's own total stays below 2^32. Each entry is formed as the
// running total of its row plus the entry above it, which is the same sum
// as v + S(x - 1, y) + S(x, y - 1) - S(x - 1, y - 1) modulo 2^32.
#include "core/core_internal.h"
#include "tone/tone_internal.h"

extern "C" {

VOR_API uint32_t VorBuildIntegralImage(const VorBitmap* bitmap, uint32_t* red, uint32_t* green,
                                       uint32_t* blue) {
    const std::uint32_t width = bitmap->width;
    const std::uint8_t* p = bitmap->data;
    for (std::uint32_t y = 0; y < bitmap->height; ++y) {
        const std::size_t row = static_cast<std::size_t>(y) * width;
        std::uint32_t r = 0, g = 0, b = 0;
        if (y == 0) {
            for (std::uint32_t x = 0; x < width; ++x, p += 4) {
                red[x] = r += p[0];
                green[x] = g += p[1];
                blue[x] = b += p[2];
            }
            continue;
        }
        const std::size_t above = row - width;
        for (std::uint32_t x = 0; x < width; ++x, p += 4) {
            red[row + x] = (r += p[0]) + red[above + x];
            green[row + x] = (g += p[1]) + green[above + x];
            blue[row + x] = (b += p[2]) + blue[above + x];
        }
    }
    return bitmap->height;
}

VOR_API void VorBuildIntegralImageGray(const VorBitmap* bitmap, uint32_t* sums) {
    const std::uint32_t width = bitmap->width;
    const std::uint8_t* p = bitmap->data;
    for (std::uint32_t y = 0; y < bitmap->height; ++y) {
        const std::size_t row = static_cast<std::size_t>(y) * width;
        std::uint32_t total = 0;
        if (y == 0) {
            for (std::uint32_t x = 0; x < width; ++x, p += 4) sums[x] = total += vorlite::tone::grey_level(p);
            continue;
        }
        const std::uint32_t* above = sums + row - width;
        for (std::uint32_t x = 0; x < width; ++x, p += 4) {
            total += vorlite::tone::grey_level(p);
            sums[row + x] = total + above[x];
        }
    }
}

VOR_API uint32_t VorSumBoxFromIntegralImage(const uint32_t* sums, uint32_t width, uint32_t,
                                            uint32_t x0, uint32_t y0, uint32_t x1, uint32_t y1) {
    return vorlite::tone::box_sum(sums, width, x0, y0, x1, y1);
}

}  // extern "C"
