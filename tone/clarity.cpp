// Local contrast ("clarity"): a global lifting curve derived from the
// green histogram is applied not pixel by pixel but through box means of
// grey levels, so each pixel takes on the brightness change of its
// neighbourhood while keeping, slightly amplified, its own detail.
#include <algorithm>
#include <array>

#if defined(__x86_64__) && defined(__GNUC__)
#include <immintrin.h>
#endif

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

#if defined(__x86_64__) && defined(__GNUC__)
// The whole-box columns eight at a time on processors with 256-bit integer
// lanes, picked at run time: the same integer steps as local_pixel.
//  - A mean is sum x m >> k with m = ceil(2^k / area), k = 31 + floor(log2
//    area): m fits 32 bits, and with sums of at most 255 x area the
//    multiply divides exactly while 255 area < 2^30.
//  - The ratio of means divides |mean_m x e| < 2^17 by mean_o with
//    m = ceil(2^31 / mean_o): exact while |n| (mean_o - 1) < 2^31.
//  - (8192 r + 28672 g + 4096 b + 2048) / 40960 is (4r + 14g + 2b + 1) / 20,
//    and for numerators up to 5101 that is (v x 3277) >> 16.
//  - Signed division by 2^s toward zero adds 2^s - 1 to negative values
//    before the arithmetic shift.
#define VORLITE_AVX2_FN __attribute__((target("avx2")))

struct Avx2Divisors {
    std::uint32_t ratio[256];
};

const Avx2Divisors& avx2_divisors() {
    static const Avx2Divisors d = [] {
        Avx2Divisors t{};
        for (std::uint32_t i = 1; i < 256; ++i) t.ratio[i] = static_cast<std::uint32_t>(((std::uint64_t{1} << 31) + i - 1) / i);
        return t;
    }();
    return d;
}

VORLITE_AVX2_FN inline __m256i divide_by_shift(__m256i v, int s) {
    const __m256i bias = _mm256_and_si256(_mm256_srai_epi32(v, 31), _mm256_set1_epi32((1 << s) - 1));
    return _mm256_srai_epi32(_mm256_add_epi32(v, bias), s);
}

// (v x m) >> k for unsigned 32-bit v and m, lane by lane.
VORLITE_AVX2_FN inline __m256i multiply_shift(__m256i v, __m256i m, __m128i k) {
    const __m256i even = _mm256_srl_epi64(_mm256_mul_epu32(v, m), k);
    const __m256i odd = _mm256_srl_epi64(_mm256_mul_epu32(_mm256_srli_epi64(v, 32), _mm256_srli_epi64(m, 32)), k);
    return _mm256_blend_epi32(even, _mm256_slli_epi64(odd, 32), 0xAA);
}

VORLITE_AVX2_FN inline __m256i load8(const std::uint32_t* p) {
    return _mm256_loadu_si256(reinterpret_cast<const __m256i*>(p));
}

// Eight box sums from the integral rows below and above the boxes.
VORLITE_AVX2_FN inline __m256i box8(const std::uint32_t* below, const std::uint32_t* above, int x0m1, int x1) {
    __m256i v = _mm256_sub_epi32(load8(below + x1), load8(below + x0m1));
    if (above != nullptr) v = _mm256_add_epi32(_mm256_sub_epi32(v, load8(above + x1)), load8(above + x0m1));
    return v;
}

// transfer() on eight channel values.
struct Local8 {
    __m256i detail, delta, mean_m, ratio_m, black;
};

VORLITE_AVX2_FN inline __m256i transfer8(__m256i c, const Local8& l) {
    const __m256i e = _mm256_add_epi32(c, l.detail);
    const __m256i additive = _mm256_mullo_epi32(_mm256_set1_epi32(1639), _mm256_add_epi32(e, l.delta));
    const __m256i product = _mm256_mullo_epi32(l.mean_m, e);
    // mean_o != 0: the ratio, dividing the magnitude.
    const __m256i sign = _mm256_srai_epi32(product, 31);
    const __m256i magnitude = _mm256_sub_epi32(_mm256_xor_si256(product, sign), sign);
    const __m256i quotient =
        _mm256_sub_epi32(_mm256_xor_si256(multiply_shift(magnitude, l.ratio_m, _mm_cvtsi32_si128(31)), sign), sign);
    const __m256i lit = _mm256_add_epi32(divide_by_shift(additive, 12),
                                         divide_by_shift(_mm256_mullo_epi32(_mm256_set1_epi32(2457), quotient), 12));
    // mean_o == 0: the additive part over 2^24, the product undivided.
    const __m256i dark = _mm256_add_epi32(divide_by_shift(additive, 24),
                                          divide_by_shift(_mm256_mullo_epi32(_mm256_set1_epi32(2457), product), 12));
    const __m256i out = _mm256_blendv_epi8(lit, dark, l.black);
    return _mm256_min_epi32(_mm256_max_epi32(out, _mm256_setzero_si256()), _mm256_set1_epi32(255));
}

// The columns x .. end - 1 (every one with x - radius - 1 >= 0) of a row,
// eight at a time; returns the first column left for the one-by-one steps.
VORLITE_AVX2_FN int whole_boxes_avx2(std::uint8_t* row, int x, int end, int radius, std::uint32_t area,
                                 const std::uint32_t* o_below, const std::uint32_t* o_above,
                                 const std::uint32_t* m_below, const std::uint32_t* m_above) {
    const Avx2Divisors& divisors = avx2_divisors();
    int log2_area = 0;
    while ((area >> (log2_area + 1)) != 0) ++log2_area;
    const int shift = 31 + log2_area;
    const __m256i area_m = _mm256_set1_epi32(static_cast<int>(((std::uint64_t{1} << shift) + area - 1) / area));
    const __m128i area_k = _mm_cvtsi32_si128(shift);
    const __m256i byte = _mm256_set1_epi32(255);
    for (; x + 8 <= end; x += 8) {
        const int x0m1 = x - radius - 1, x1 = x + radius;
        const __m256i mean_o = multiply_shift(box8(o_below, o_above, x0m1, x1), area_m, area_k);
        const __m256i mean_m = multiply_shift(box8(m_below, m_above, x0m1, x1), area_m, area_k);
        std::uint8_t* p = row + std::size_t{4} * static_cast<std::uint32_t>(x);
        const __m256i pixels = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(p));
        const __m256i r = _mm256_and_si256(pixels, byte);
        const __m256i g = _mm256_and_si256(_mm256_srli_epi32(pixels, 8), byte);
        const __m256i b = _mm256_and_si256(_mm256_srli_epi32(pixels, 16), byte);
        const __m256i v = _mm256_add_epi32(
            _mm256_add_epi32(_mm256_slli_epi32(r, 2), _mm256_mullo_epi32(g, _mm256_set1_epi32(14))),
            _mm256_add_epi32(_mm256_slli_epi32(b, 1), _mm256_set1_epi32(1)));
        const __m256i luminance = _mm256_srli_epi32(_mm256_mullo_epi32(v, _mm256_set1_epi32(3277)), 16);
        Local8 l;
        l.detail =
            divide_by_shift(_mm256_mullo_epi32(_mm256_set1_epi32(1228), _mm256_sub_epi32(luminance, mean_o)), 12);
        l.delta = _mm256_sub_epi32(mean_m, mean_o);
        l.mean_m = mean_m;
        l.ratio_m = _mm256_i32gather_epi32(reinterpret_cast<const int*>(divisors.ratio), mean_o, 4);
        l.black = _mm256_cmpeq_epi32(mean_o, _mm256_setzero_si256());
        const __m256i out =
            _mm256_or_si256(_mm256_or_si256(transfer8(r, l), _mm256_slli_epi32(transfer8(g, l), 8)),
                            _mm256_or_si256(_mm256_slli_epi32(transfer8(b, l), 16),
                                            _mm256_set1_epi32(static_cast<int>(0xFF000000u))));
        _mm256_storeu_si256(reinterpret_cast<__m256i*>(p), out);
    }
    return x;
}

// grey_level of eight pixels and of the same pixels through the map (its
// levels widened to 32 bits so they can be gathered): the same double sum
// and float rounding lane by lane. Returns the first pixel left over.
VORLITE_AVX2_FN inline __m256i grey8(__m256i r, __m256i g, __m256i b) {
    const __m128 low = _mm256_cvtpd_ps(_mm256_add_pd(
        _mm256_add_pd(_mm256_mul_pd(_mm256_cvtepi32_pd(_mm256_castsi256_si128(r)), _mm256_set1_pd(0.2)),
                      _mm256_mul_pd(_mm256_cvtepi32_pd(_mm256_castsi256_si128(g)), _mm256_set1_pd(0.7))),
        _mm256_mul_pd(_mm256_cvtepi32_pd(_mm256_castsi256_si128(b)), _mm256_set1_pd(0.1))));
    const __m128 high = _mm256_cvtpd_ps(_mm256_add_pd(
        _mm256_add_pd(_mm256_mul_pd(_mm256_cvtepi32_pd(_mm256_extracti128_si256(r, 1)), _mm256_set1_pd(0.2)),
                      _mm256_mul_pd(_mm256_cvtepi32_pd(_mm256_extracti128_si256(g, 1)), _mm256_set1_pd(0.7))),
        _mm256_mul_pd(_mm256_cvtepi32_pd(_mm256_extracti128_si256(b, 1)), _mm256_set1_pd(0.1))));
    const __m256 rounded = _mm256_add_ps(_mm256_set_m128(high, low), _mm256_set1_ps(0.5f));
    return _mm256_cvttps_epi32(rounded);
}

VORLITE_AVX2_FN std::uint32_t grey_rows_avx2(const std::uint8_t* p, std::uint32_t n, const std::uint32_t (*map)[256],
                                             std::uint32_t* original, std::uint32_t* mapped) {
    const __m256i byte = _mm256_set1_epi32(255);
    std::uint32_t x = 0;
    for (; x + 8 <= n; x += 8) {
        const __m256i pixels = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(p + std::size_t{4} * x));
        const __m256i r = _mm256_and_si256(pixels, byte);
        const __m256i g = _mm256_and_si256(_mm256_srli_epi32(pixels, 8), byte);
        const __m256i b = _mm256_and_si256(_mm256_srli_epi32(pixels, 16), byte);
        _mm256_storeu_si256(reinterpret_cast<__m256i*>(original + x), grey8(r, g, b));
        // The mapped pixels by plain lookups: cheaper than gathers here.
        alignas(32) std::uint32_t through[8];
        for (int i = 0; i < 8; ++i) {
            const std::uint8_t* q = p + std::size_t{4} * (x + i);
            through[i] = map[0][q[0]] | map[1][q[1]] << 8 | map[2][q[2]] << 16;
        }
        const __m256i mapped_pixels = _mm256_load_si256(reinterpret_cast<const __m256i*>(through));
        const __m256i mr = _mm256_and_si256(mapped_pixels, byte);
        const __m256i mg = _mm256_and_si256(_mm256_srli_epi32(mapped_pixels, 8), byte);
        const __m256i mb = _mm256_srli_epi32(mapped_pixels, 16);
        _mm256_storeu_si256(reinterpret_cast<__m256i*>(mapped + x), grey8(mr, mg, mb));
    }
    return x;
}

bool has_avx2() {
    static const bool yes = __builtin_cpu_supports("avx2");
    return yes;
}
#endif

// One row of the pass in three spans: the columns whose box the left or
// right edge cuts, divided by their own area, and between them the columns
// whose box is whole, all of one area, divided by a multiply.
void local_means_row(std::uint8_t* row, std::uint32_t width, int radius, std::uint32_t box_rows,
                     const BoxRows& original, const BoxRows& mapped, [[maybe_unused]] bool lanes) {
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
        int x = inner_first;
#if defined(__x86_64__) && defined(__GNUC__)
        if (lanes && has_avx2()) {
            // The columns before the eight-wide start and after its last
            // group take the one-by-one steps below.
            const int first = std::max(x, radius + 1);
            for (; x < first && x < inner_end; ++x) {
                const auto x0 = static_cast<std::uint32_t>(x - radius);
                const auto x1 = static_cast<std::uint32_t>(x + radius);
                local_pixel(row + std::size_t{4} * static_cast<std::uint32_t>(x), original.sum(x0, x1),
                            mapped.sum(x0, x1), divide, by_mean);
            }
            if (x < inner_end) {
                x = whole_boxes_avx2(row, x, inner_end, radius, area, original.below, original.above, mapped.below,
                                     mapped.above);
            }
        }
#endif
        for (; x < inner_end; ++x) {
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
    IntegralRings(const VorBitmap& bitmap, const VorHistMap& map, int radius, bool lanes)
        : bitmap_(bitmap), map_(map), lanes_(lanes),
          rows_(static_cast<std::uint32_t>(
              std::min<std::uint64_t>(bitmap.height, 2 * static_cast<std::uint64_t>(radius) + 2))) {}

    bool build() {
        if (!original_.build(rows_, bitmap_.width) || !mapped_.build(rows_, bitmap_.width)) return false;
#if defined(__x86_64__) && defined(__GNUC__)
        if (lanes_) {
            if (!original_grey_.build(bitmap_.width) || !mapped_grey_.build(bitmap_.width)) return false;
            for (int c = 0; c < 3; ++c) {
                for (int i = 0; i < 256; ++i) wide_map_[c][i] = map_.map[c][i];
            }
        }
#endif
        return true;
    }

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
        // The grey levels eight at a time first where the lanes allow, then
        // the running totals.
        std::uint32_t laned = 0;
#if defined(__x86_64__) && defined(__GNUC__)
        if (lanes_) laned = grey_rows_avx2(p, width, wide_map_, original_grey_.get(), mapped_grey_.get());
#endif
        std::uint32_t original_total = 0, mapped_total = 0;
        for (std::uint32_t x = 0; x < width; ++x, p += 4) {
            if (x < laned) {
                original_total += original_grey_[x];
                mapped_total += mapped_grey_[x];
            } else {
                const std::uint8_t through_map[3] = {map_.map[0][p[0]], map_.map[1][p[1]], map_.map[2][p[2]]};
                original_total += grey_level(p);
                mapped_total += grey_level(through_map);
            }
            original[x] = original_total + (original_above != nullptr ? original_above[x] : 0);
            mapped[x] = mapped_total + (mapped_above != nullptr ? mapped_above[x] : 0);
        }
    }

    const VorBitmap& bitmap_;
    const VorHistMap& map_;
    [[maybe_unused]] bool lanes_;  // read by the 256-bit lanes only
    std::uint32_t rows_;
    [[maybe_unused]] std::uint32_t wide_map_[3][256] = {};
    WorkingArray<std::uint32_t> original_grey_;
    WorkingArray<std::uint32_t> mapped_grey_;
    std::int64_t built_ = -1;
    WorkingArray<std::uint32_t> original_;
    WorkingArray<std::uint32_t> mapped_;
};

void blur_hist_map_streamed(VorBitmap* bitmap, const VorHistMap& map, int radius, bool lanes) {
    const std::uint32_t width = bitmap->width;
    const int last_y = static_cast<int>(bitmap->height) - 1;
    bool avx2 = false;
#if defined(__x86_64__) && defined(__GNUC__)
    avx2 = lanes && has_avx2();
#endif
    IntegralRings rings(*bitmap, map, radius, avx2);
    if (!rings.build()) return;
    for (int y = 0; y <= last_y; ++y) {
        const auto y0 = static_cast<std::uint32_t>(y - radius < 0 ? 0 : y - radius);
        const auto y1 = static_cast<std::uint32_t>(y + radius > last_y ? last_y : y + radius);
        BoxRows original{nullptr, nullptr}, mapped{nullptr, nullptr};
        if (y0 > 0) rings.rows_at(y0 - 1, &original.above, &mapped.above);
        rings.rows_at(y1, &original.below, &mapped.below);
        local_means_row(bitmap->data + static_cast<std::size_t>(y) * width * 4, width, radius, y1 - y0 + 1,
                        original, mapped, lanes);
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

void blur_hist_map(VorBitmap* bitmap, const VorHistMap* map, int radius, bool reference, bool lanes) {
    if (reference) {
        blur_hist_map_reference(bitmap, *map, radius);
    } else {
        blur_hist_map_streamed(bitmap, *map, radius, lanes);
    }
}

}  // namespace vorlite::tone

namespace {

// The green channel's counts, into four tables in turn so that runs of one
// level do not wait on their own increments.
void count_green(const VorBitmap& bitmap, std::uint32_t counts[256]) {
    std::uint32_t partial[4][256] = {};
    const std::size_t n = vorlite::core::pixel_count(bitmap);
    const std::uint8_t* p = bitmap.data;
    std::size_t i = 0;
    for (; i + 4 <= n; i += 4, p += 16) {
        ++partial[0][p[1]];
        ++partial[1][p[5]];
        ++partial[2][p[9]];
        ++partial[3][p[13]];
    }
    for (; i < n; ++i, p += 4) ++partial[0][p[1]];
    for (int level = 0; level < 256; ++level) {
        counts[level] = partial[0][level] + partial[1][level] + partial[2][level] + partial[3][level];
    }
}

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
    // The analysis holds a histogram and a distribution, but the curve
    // reads the green counts alone: only those are counted.
    vorlite::core::WorkingArray<VorHistogram> histogram;
    vorlite::core::WorkingArray<VorCDF> distribution;
    if (!histogram.build(1) || !distribution.build(1)) return;
    count_green(*bitmap, histogram.get()->count[1]);

    // Green stands in for brightness on purpose.
    float gains[256];
    green_gains(*histogram.get(), bitmap->width * bitmap->height, gains);
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
