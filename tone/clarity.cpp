// Local contrast ("clarity"): a global lifting curve derived from the
// green histogram is applied not pixel by pixel but through box means of
// grey levels, so each pixel takes on the brightness change of its
// neighbourhood while keeping, slightly amplified, its own detail.
#include <algorithm>
#include <array>

#include "core/core_internal.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::core::clamp_byte;

// Box radius: about 0.75 % of width plus height, the first product in
// double and truncated, the rest in float and rounded.
int box_radius(std::uint32_t width, std::uint32_t height) {
    const double sum = static_cast<double>(static_cast<std::uint64_t>(width) + height);
    const int coarse = static_cast<int>(sum * 0.075);
    return static_cast<int>(static_cast<float>(coarse) * 0.1f + 0.5f);
}

// One channel after the local change: 0.4 of it added, 0.6 of it applied as
// the ratio of mapped to original mean, in fixed point over 4096. Over a
// black neighbourhood the additive part is divided by 2^24 instead, which
// all but drops it: that keeps black regions black and is deliberate.
int transfer(int channel, int detail, int mean_original, int mean_mapped) {
    const int e = channel + detail;
    const int delta = mean_mapped - mean_original;
    if (mean_original != 0) {
        return (1639 * (e + delta)) / 4096 + (2457 * ((mean_mapped * e) / mean_original)) / 4096;
    }
    return (1639 * (e + delta)) / 16777216 + (2457 * (mean_mapped * e)) / 4096;
}

// The per-pixel pass over the two grey integral images. Box means are at
// most 255 for every bitmap size allowed: the largest box (about 16.4
// million pixels, for a 4044 x 265514 bitmap) totals below 2^32, so its sum
// is exact even where the table entries have wrapped.
//
// The plain form divides twice a pixel by the box area and three times by
// the original mean; it stays as the reference of the streamed pass below.
void apply_local_means_reference(VorBitmap* bitmap, const std::uint32_t* original,
                                 const std::uint32_t* mapped, int radius) {
    const std::uint32_t width = bitmap->width;
    const int last_x = static_cast<int>(width) - 1;
    const int last_y = static_cast<int>(bitmap->height) - 1;
    std::uint8_t* p = bitmap->data;
    for (int y = 0; y <= last_y; ++y) {
        const auto y0 = static_cast<std::uint32_t>(y - radius < 0 ? 0 : y - radius);
        const auto y1 = static_cast<std::uint32_t>(y + radius > last_y ? last_y : y + radius);
        for (int x = 0; x <= last_x; ++x, p += 4) {
            const auto x0 = static_cast<std::uint32_t>(x - radius < 0 ? 0 : x - radius);
            const auto x1 = static_cast<std::uint32_t>(x + radius > last_x ? last_x : x + radius);
            const std::uint32_t area = (x1 - x0 + 1) * (y1 - y0 + 1);
            const auto mean_o = static_cast<int>(
                vorlite::tone::box_sum(original, width, x0, y0, x1, y1) / area);
            const auto mean_m = static_cast<int>(
                vorlite::tone::box_sum(mapped, width, x0, y0, x1, y1) / area);
            // Luminance 0.2, 0.7, 0.1 over 40960 with a rounding bias; the
            // detail is 0.3 of the pixel's deviation from its neighbourhood.
            const int luminance = (8192 * p[0] + 28672 * p[1] + 4096 * p[2] + 2048) / 40960;
            const int detail = (1228 * (luminance - mean_o)) / 4096;
            p[0] = clamp_byte(transfer(p[0], detail, mean_o, mean_m));
            p[1] = clamp_byte(transfer(p[1], detail, mean_o, mean_m));
            p[2] = clamp_byte(transfer(p[2], detail, mean_o, mean_m));
            p[3] = 255;
        }
    }
}

}  // namespace

namespace vorlite::tone {

// n / d as a multiply and a shift. With m = ceil(2^k / d), m d = 2^k + e for
// some 0 <= e < d, so n m / 2^k = n / d + n e / (d 2^k). Writing n = q d + r
// with r <= d - 1, the floor stays q while r + n e / 2^k < d, which holds for
// every n with n e < 2^k, and so for every n with n (d - 1) < 2^k.
ExactDivider::ExactDivider(std::uint32_t divisor, unsigned shift)
    : multiplier(((std::uint64_t{1} << shift) + divisor - 1) / divisor), shift(shift) {}

namespace {

using vorlite::core::WorkingArray;

// Box sums reach 255 x area: exact below 2^40 while 255 area (area - 1)
// stays below 2^40, that is for every area up to 65,535 (a box radius up to
// 127, pictures up to about 17,000 pixels wide plus high). The products stay
// below 2^24 x 2^40.
constexpr unsigned k_area_shift = 40;
bool area_divides_fast(std::uint32_t area) {
    return area <= 65535u;
}

// The ratio of means: |mean_m x e| is at most 255 x 331 < 2^17 (e is a level
// plus a detail of at most 1228 x 255 / 4096, that is 76, either way), so
// with a shift of 32 the condition is 2^17 x 254 < 2^32, true for every
// divisor 1..255; the products stay below 2^49.
constexpr unsigned k_mean_shift = 32;

const std::array<ExactDivider, 256>& mean_dividers() {
    static const std::array<ExactDivider, 256> dividers = [] {
        std::array<ExactDivider, 256> d{};
        for (std::uint32_t i = 1; i < 256; ++i) d[i] = ExactDivider(i, k_mean_shift);
        return d;
    }();
    return dividers;
}

// C's division truncates toward zero: divide the magnitude.
inline int divide_toward_zero(int n, const ExactDivider& d) {
    const int sign = n >> 31;  // 0 or -1: the magnitude and the sign without a branch
    const auto magnitude = static_cast<std::uint32_t>((n ^ sign) - sign);
    return (static_cast<int>(d.divide(magnitude)) ^ sign) - sign;
}

inline int transfer_fast(int channel, int detail, int mean_original, int mean_mapped, const ExactDivider& by_mean) {
    const int e = channel + detail;
    const int delta = mean_mapped - mean_original;
    return (1639 * (e + delta)) / 4096 + (2457 * divide_toward_zero(mean_mapped * e, by_mean)) / 4096;
}

// One pixel given its two box sums and the divider of its box's area.
template <typename DivideArea>
inline void local_pixel(std::uint8_t* p, std::uint32_t sum_o, std::uint32_t sum_m, DivideArea divide_area,
                        const std::array<ExactDivider, 256>& by_mean) {
    const auto mean_o = static_cast<int>(divide_area(sum_o));
    const auto mean_m = static_cast<int>(divide_area(sum_m));
    const int luminance = (8192 * p[0] + 28672 * p[1] + 4096 * p[2] + 2048) / 40960;
    const int detail = (1228 * (luminance - mean_o)) / 4096;
    if (mean_o != 0) {
        const ExactDivider& d = by_mean[static_cast<std::size_t>(mean_o)];
        p[0] = clamp_byte(transfer_fast(p[0], detail, mean_o, mean_m, d));
        p[1] = clamp_byte(transfer_fast(p[1], detail, mean_o, mean_m, d));
        p[2] = clamp_byte(transfer_fast(p[2], detail, mean_o, mean_m, d));
    } else {
        p[0] = clamp_byte(transfer(p[0], detail, 0, mean_m));
        p[1] = clamp_byte(transfer(p[1], detail, 0, mean_m));
        p[2] = clamp_byte(transfer(p[2], detail, 0, mean_m));
    }
    p[3] = 255;
}

// A row's box sums from the integral rows at its box's last row (below)
// and just above its first (above, null for a box from the top).
struct BoxRows {
    const std::uint32_t* below;
    const std::uint32_t* above;
    std::uint32_t sum(std::uint32_t x0, std::uint32_t x1) const {
        std::uint32_t v = below[x1];
        if (x0 > 0) v -= below[x0 - 1];
        if (above != nullptr) {
            v -= above[x1];
            if (x0 > 0) v += above[x0 - 1];
        }
        return v;
    }
};

// One row of the pass in three spans: the columns whose box the left or
// right edge cuts, divided by their own area, and between them the columns
// whose box is whole, all of one area, divided by a multiply.
void local_means_row(std::uint8_t* row, std::uint32_t width, int radius, std::uint32_t box_rows,
                     const BoxRows& original, const BoxRows& mapped) {
    const auto& by_mean = mean_dividers();
    const int last_x = static_cast<int>(width) - 1;
    const int inner_first = std::min(radius, last_x + 1);
    const int inner_end = std::max(inner_first, last_x + 1 - radius);
    const auto cut = [&](int x) {
        const auto x0 = static_cast<std::uint32_t>(x - radius < 0 ? 0 : x - radius);
        const auto x1 = static_cast<std::uint32_t>(x + radius > last_x ? last_x : x + radius);
        const std::uint32_t area = (x1 - x0 + 1) * box_rows;
        local_pixel(row + std::size_t{4} * static_cast<std::uint32_t>(x), original.sum(x0, x1), mapped.sum(x0, x1),
                    [area](std::uint32_t n) { return n / area; }, by_mean);
    };
    for (int x = 0; x < inner_first; ++x) cut(x);
    const std::uint32_t area = static_cast<std::uint32_t>(2 * radius + 1) * box_rows;
    if (inner_first < inner_end && area_divides_fast(area)) {
        const ExactDivider by_area(area, k_area_shift);
        const auto divide = [&by_area](std::uint32_t n) { return by_area.divide(n); };
        for (int x = inner_first; x < inner_end; ++x) {
            const auto x0 = static_cast<std::uint32_t>(x - radius);
            const auto x1 = static_cast<std::uint32_t>(x + radius);
            local_pixel(row + std::size_t{4} * static_cast<std::uint32_t>(x), original.sum(x0, x1),
                        mapped.sum(x0, x1), divide, by_mean);
        }
    } else {
        for (int x = inner_first; x < inner_end; ++x) cut(x);
    }
    for (int x = inner_end; x <= last_x; ++x) cut(x);
}

// The two grey integral images a few rows at a time: a pass over row y
// reads only the integral rows y + r and y - r - 1, so a ring of 2r + 2
// rows of each serves the whole pass, built just ahead of it from rows the
// pass has not yet written. No copy of the bitmap and no full-size table.
class IntegralRings {
public:
    IntegralRings(const VorBitmap& bitmap, const VorHistMap& map, int radius)
        : bitmap_(bitmap), map_(map),
          rows_(static_cast<std::uint32_t>(
              std::min<std::uint64_t>(bitmap.height, 2 * static_cast<std::uint64_t>(radius) + 2))) {}

    bool build() { return original_.build(rows_, bitmap_.width) && mapped_.build(rows_, bitmap_.width); }

    // The integral rows of both images at row y, built up to it if needed.
    void rows_at(std::uint32_t y, const std::uint32_t** original, const std::uint32_t** mapped) {
        while (built_ < static_cast<std::int64_t>(y)) add_row(static_cast<std::uint32_t>(++built_));
        *original = slot(original_, y);
        *mapped = slot(mapped_, y);
    }

private:
    std::uint32_t* slot(const WorkingArray<std::uint32_t>& ring, std::uint32_t y) const {
        return ring.get() + static_cast<std::size_t>(y % rows_) * bitmap_.width;
    }
    // Each entry is its row's running total plus the entry above, as
    // VorBuildIntegralImageGray forms it; the mapped grey is that of the
    // pixel through the map, as VorBitmapHistogramTransform would leave it.
    void add_row(std::uint32_t y) {
        const std::uint32_t width = bitmap_.width;
        const std::uint8_t* p = bitmap_.data + static_cast<std::size_t>(y) * width * 4;
        std::uint32_t* original = slot(original_, y);
        std::uint32_t* mapped = slot(mapped_, y);
        const std::uint32_t* original_above = y > 0 ? slot(original_, y - 1) : nullptr;
        const std::uint32_t* mapped_above = y > 0 ? slot(mapped_, y - 1) : nullptr;
        std::uint32_t original_total = 0, mapped_total = 0;
        for (std::uint32_t x = 0; x < width; ++x, p += 4) {
            const std::uint8_t through_map[3] = {map_.map[0][p[0]], map_.map[1][p[1]], map_.map[2][p[2]]};
            original_total += grey_level(p);
            mapped_total += grey_level(through_map);
            original[x] = original_total + (original_above != nullptr ? original_above[x] : 0);
            mapped[x] = mapped_total + (mapped_above != nullptr ? mapped_above[x] : 0);
        }
    }

    const VorBitmap& bitmap_;
    const VorHistMap& map_;
    std::uint32_t rows_;
    std::int64_t built_ = -1;
    WorkingArray<std::uint32_t> original_;
    WorkingArray<std::uint32_t> mapped_;
};

void blur_hist_map_streamed(VorBitmap* bitmap, const VorHistMap& map, int radius) {
    const std::uint32_t width = bitmap->width;
    const int last_y = static_cast<int>(bitmap->height) - 1;
    IntegralRings rings(*bitmap, map, radius);
    if (!rings.build()) return;
    for (int y = 0; y <= last_y; ++y) {
        const auto y0 = static_cast<std::uint32_t>(y - radius < 0 ? 0 : y - radius);
        const auto y1 = static_cast<std::uint32_t>(y + radius > last_y ? last_y : y + radius);
        BoxRows original{nullptr, nullptr}, mapped{nullptr, nullptr};
        if (y0 > 0) rings.rows_at(y0 - 1, &original.above, &mapped.above);
        rings.rows_at(y1, &original.below, &mapped.below);
        local_means_row(bitmap->data + static_cast<std::size_t>(y) * width * 4, width, radius, y1 - y0 + 1,
                        original, mapped);
    }
}

// The pass as written: a mapped copy, both grey integral images in full,
// and the plain divisions.
void blur_hist_map_reference(VorBitmap* bitmap, const VorHistMap& map, int radius) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    vorlite::core::WorkingBitmap copy;
    if (!copy.build_copy(*bitmap)) return;
    VorBitmapHistogramTransform(copy.get(), &map);
    WorkingArray<std::uint32_t> mapped;
    if (!mapped.build(width, height)) return;
    VorBuildIntegralImageGray(copy.get(), mapped.get());
    // The mapped pixels are no longer needed: their storage, four bytes a
    // pixel, holds the integral image of the unchanged bitmap.
    auto* const original = reinterpret_cast<std::uint32_t*>(copy.get()->data);
    VorBuildIntegralImageGray(bitmap, original);
    if (height >= 1) apply_local_means_reference(bitmap, original, mapped.get(), radius);
}

}  // namespace

void blur_hist_map(VorBitmap* bitmap, const VorHistMap* map, int radius, bool reference) {
    if (reference) {
        blur_hist_map_reference(bitmap, *map, radius);
    } else {
        blur_hist_map_streamed(bitmap, *map, radius);
    }
}

}  // namespace vorlite::tone

namespace {

// Gain per level: how far the green distribution runs ahead of a uniform
// one, to the power 0.33. Gains never go below 1, so the curve only lifts
// levels that have more of the image below them than a flat histogram.
void green_gains(const VorHistogram& histogram, std::uint32_t pixels, float gains[256]) {
    const float q = 1.0f / static_cast<float>(pixels);
    std::uint32_t total = 0;
    for (int i = 0; i < 256; ++i) {
        total += histogram.count[1][i];
        const float share = static_cast<float>(total) * q;
        if (i == 0) {
            gains[i] = 1.0f;
            continue;
        }
        const float ratio = share / (static_cast<float>(i) * vorlite::core::k_inv255);
        gains[i] = ratio > 1.0f ? vorlite::core::powf(ratio, 0.33f) : 1.0f;
    }
}

}  // namespace

extern "C" {

VOR_API void VorBlurHistMap(VorBitmap* bitmap, const VorHistMap* map) {
    vorlite::tone::blur_hist_map(bitmap, map, box_radius(bitmap->width, bitmap->height), false);
}

VOR_API void VorLocalContrastEnhanceProcessor(VorBitmap* bitmap) {
    // The distribution is built as part of the analysis but the curve
    // reads the counts alone.
    vorlite::tone::ChannelStatistics statistics;
    if (!vorlite::tone::gather_channel_statistics(bitmap, &statistics)) return;

    // Green stands in for brightness on purpose.
    float gains[256];
    green_gains(*statistics.histogram.get(), bitmap->width * bitmap->height, gains);
    VorLineSmooth1D(gains, 256, 15);
    std::uint8_t curve[256];
    for (int i = 0; i < 256; ++i) {
        curve[i] = vorlite::core::store_truncated(gains[i] * static_cast<float>(i) + 0.5f);
    }
    VorHistMap map;
    VorHistMapSet(&map, curve, curve, curve);
    VorBlurHistMap(bitmap, &map);
}

VOR_API void VorLocalContrastEnhance(VorBitmap* bitmap) {
    VorBitmapBeginGLEffectIfEnabled(bitmap);
    VorLocalContrastEnhanceProcessor(bitmap);
    VorBitmapEndGLEffectIfEnabled(bitmap);
}

VOR_API void VorEnhanceClarity(VorBitmap* bitmap, const void*) {
    VorLocalContrastEnhanceProcessor(bitmap);
}

}  // extern "C"
