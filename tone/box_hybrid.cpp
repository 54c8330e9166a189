// The box-hybrid filter: a separable Gaussian approximated by 2r + 1
// adjacent boxes of b pixels, each box read from a per-line prefix sum, so a
// pixel costs 2r + 2 taps however wide the blur. A positive amount turns the
// blur of each pass into a mild unsharp mask, a negative one returns it.
//
// Box sums are differences of prefix sums, so all line arithmetic is done
// modulo 2^32: sums of long lines and the linear extension far past either
// end may wrap, but the weighted result, a few thousand times a channel
// value, is exact once read back as a signed 32-bit number.
//
// That prefix-sum form is the reference, here. The passes themselves run
// in an equivalent running-sum form, vectorised, with the vertical pass
// streamed down the rows (tone/box_hybrid_fast.cpp); it stores the same
// bytes, and the reference takes over wherever it does not apply.
#include <math.h>

#include <cstddef>
#include <cstring>

#include "core/core_internal.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::core::clamp_byte;
using vorlite::core::truncate_clamped;
using vorlite::tone::BoxHybridKernel;
using vorlite::tone::BoxHybridShape;
using vorlite::tone::k_box_hybrid_rounding;
using vorlite::tone::k_box_hybrid_weight_one;

// Lines filtered together: `lanes` lines of `length` pixels side by side.
// Pixel p of lane k lies at first + p * step + k * lane_step. The column
// pass takes a band of adjacent columns at once, so that each row of the
// band is read and written as one run of bytes rather than pixel by pixel
// a row apart.
struct Lines {
    std::uint8_t* first;
    std::size_t step;
    std::size_t lane_step;
    std::uint32_t length;
    std::uint32_t lanes;
};

// Columns per band of the vertical pass: one 64-byte run of each row.
constexpr std::uint32_t k_band_columns = 16;

// The integral lines of every lane, interleaved: the entry of lane k at
// position p is sums + (p * lanes + k) * 4, holding red, green, blue.
void build_integral_lines(const Lines& lines, std::uint32_t* sums) {
    if (lines.lanes == 1) {
        // A single line keeps its running sums in registers.
        std::uint32_t r = 0, g = 0, b = 0;
        const std::uint8_t* px = lines.first;
        for (std::uint32_t p = 0; p < lines.length; ++p, px += lines.step, sums += 4) {
            sums[0] = r += px[0];
            sums[1] = g += px[1];
            sums[2] = b += px[2];
        }
        return;
    }
    const std::size_t stride = 4 * static_cast<std::size_t>(lines.lanes);
    for (std::uint32_t k = 0; k < lines.lanes; ++k) {
        const std::uint8_t* px = lines.first + k * lines.lane_step;
        for (int c = 0; c < 3; ++c) sums[4 * k + c] = px[c];
    }
    for (std::uint32_t p = 1; p < lines.length; ++p) {
        const std::uint8_t* row = lines.first + p * lines.step;
        std::uint32_t* out = sums + p * stride;
        const std::uint32_t* before = out - stride;
        for (std::uint32_t k = 0; k < lines.lanes; ++k) {
            const std::uint8_t* px = row + k * lines.lane_step;
            for (int c = 0; c < 3; ++c) out[4 * k + c] = before[4 * k + c] + px[c];
        }
    }
}

struct Pass {
    bool sharpen;
    std::int32_t taps;   // 2r + 2 prefix-sum reads per channel
    std::int64_t box;    // b, the distance between two reads
    std::int64_t reach;  // b r + m + 1, how far the first read lies before x
    const std::uint32_t* diff;
};

// Prefix sums at any position p of the interleaved integral lines, each
// line extended by copies of its first and last pixels: the slope past the
// end is the last pixel. A one-pixel line has no entry before its last;
// the empty sum 0 stands in, so its pixel repeats on both sides as any edge
// pixel does.
class Extended {
public:
    Extended(const std::uint32_t* sums, std::size_t stride, std::uint32_t length)
        : sums_(sums), stride_(stride), last_(static_cast<std::int64_t>(length) - 1) {
        const std::uint32_t* last_entry = sums + (length - 1) * stride;
        const std::uint32_t* before_last = length > 1 ? last_entry - stride : nullptr;
        for (std::size_t i = 0; i < stride; ++i) {
            slope_[i] = last_entry[i] - (before_last != nullptr ? before_last[i] : 0u);
        }
    }

    // Word i (lane * 4 + channel) of the entry at position p.
    std::uint32_t at(std::int64_t p, std::size_t i) const {
        if (p < 0) return static_cast<std::uint32_t>(p + 1) * sums_[i];
        if (p > last_) {
            return sums_[last_ * stride_ + i] + static_cast<std::uint32_t>(p - last_) * slope_[i];
        }
        return sums_[p * stride_ + i];
    }

private:
    const std::uint32_t* sums_;
    std::size_t stride_;
    std::int64_t last_;
    std::uint32_t slope_[4 * k_band_columns];
};

inline void store(std::uint8_t* px, const std::uint32_t acc[3], bool sharpen) {
    for (int c = 0; c < 3; ++c) {
        const std::int32_t blur = static_cast<std::int32_t>(acc[c]) / k_box_hybrid_weight_one;
        const std::int32_t out = sharpen ? (3 * px[c] - blur + 1) / 2 : blur;
        px[c] = clamp_byte(out);
    }
}

// Filters the lines in place, position by position across the lanes, from
// their integral lines, which still hold the sums of the unfiltered pixels.
void filter_lines(const Lines& lines, const std::uint32_t* sums, const Pass& pass) {
    const std::size_t stride = 4 * static_cast<std::size_t>(lines.lanes);
    const std::int64_t n = lines.length;
    const std::int64_t span = (pass.taps - 1) * pass.box;
    // Positions x whose reads x - reach .. x - reach + span all fall inside.
    const std::int64_t inner_begin = pass.reach;
    const std::int64_t inner_end = n - span + pass.reach;  // exclusive
    const Extended extended(sums, stride, lines.length);
    const std::ptrdiff_t tap_stride = static_cast<std::ptrdiff_t>(stride) * pass.box;
    for (std::int64_t x = 0; x < n; ++x) {
        std::uint8_t* row = lines.first + x * lines.step;
        const std::int64_t start = x - pass.reach;
        const bool inside = x >= inner_begin && x < inner_end;
        for (std::uint32_t k = 0; k < lines.lanes; ++k) {
            std::uint32_t acc[3] = {k_box_hybrid_rounding, k_box_hybrid_rounding, k_box_hybrid_rounding};
            if (inside) {
                const std::uint32_t* first = sums + start * static_cast<std::ptrdiff_t>(stride) + 4 * k;
                for (std::int32_t j = 0; j < pass.taps; ++j) {
                    const std::uint32_t* read = first + j * tap_stride;
                    acc[0] += pass.diff[j] * read[0];
                    acc[1] += pass.diff[j] * read[1];
                    acc[2] += pass.diff[j] * read[2];
                }
            } else {
                for (std::int32_t j = 0; j < pass.taps; ++j) {
                    const std::int64_t p = start + j * pass.box;
                    for (int c = 0; c < 3; ++c) acc[c] += pass.diff[j] * extended.at(p, 4 * k + c);
                }
            }
            store(row + k * lines.lane_step, acc, pass.sharpen);
        }
    }
}

// One pass over `count` lines of `length` pixels, taken `lanes` at a time:
// line i starts i * line_step bytes in and its pixels lie `step` bytes apart.
// This is the reference form of the filter, read straight off the integral
// lines; the fast form must store the same bytes.
void run_reference_pass(VorBitmap* bitmap, float amount, std::uint32_t count, std::size_t line_step,
                        std::uint32_t length, std::size_t step, std::uint32_t lanes) {
    BoxHybridShape shape;
    if (!vorlite::tone::box_hybrid_shape(bitmap->width, bitmap->height, amount, &shape)) return;
    if (count == 0 || length == 0) return;

    const BoxHybridKernel kernel = vorlite::tone::box_hybrid_difference_kernel(shape);
    const Pass pass{shape.sharpen, 2 * shape.radius + 2, shape.box,
                    static_cast<std::int64_t>(shape.box) * shape.radius + shape.half_box + 1, kernel.data()};

    if (lanes > count) lanes = count;
    vorlite::core::WorkingArray<std::uint32_t> sums;
    if (!sums.build(length, 4 * lanes)) return;
    std::uint32_t* line_sums = sums.get();
    for (std::uint32_t i = 0; i < count; i += lanes) {
        const Lines band{bitmap->data + i * line_step, step, line_step, length,
                         count - i < lanes ? count - i : lanes};
        build_integral_lines(band, line_sums);
        filter_lines(band, line_sums, pass);
    }
}

// One pass: the fast form where it applies, else the reference form.
void run_pass(VorBitmap* bitmap, float amount, bool columns) {
    BoxHybridShape shape;
    if (!vorlite::tone::box_hybrid_shape(bitmap->width, bitmap->height, amount, &shape)) return;
    if (bitmap->width == 0 || bitmap->height == 0) return;
    if (!vorlite::tone::box_hybrid_pass_fast(bitmap, shape, columns)) {
        vorlite::tone::box_hybrid_pass_reference(bitmap, amount, columns);
    }
}

void store_row(std::uint8_t* row, std::uint8_t* filtered, std::uint32_t width) {
    std::memcpy(row, filtered, std::size_t{4} * width);
}

}  // namespace

namespace vorlite::tone {

bool box_hybrid_shape(std::uint32_t width, std::uint32_t height, float amount,
                      BoxHybridShape* shape) {
    const float scaled = static_cast<float>(width + height) * amount * 2.5e-5f;
    double s = scaled;
    shape->sharpen = !(s < 0.0);
    if (s < 0.0) s = -s;
    // A NaN amount has no meaningful blur either; it is left alone as 0 is.
    if (s == 0.0 || s != s) return false;

    const std::int32_t n = truncate_clamped<std::int32_t>(::floor(s * 1.5) + 1.0);
    if (n < 5) {
        shape->radius = n;
        shape->box = 1;
        shape->half_box = 0;
    } else {
        const std::int32_t m =
            truncate_clamped<std::int32_t>(::floor((n * 0.25 - 1.0) * 0.5) + 1.0);
        shape->half_box = m;
        shape->box = 2 * m + 1;
        shape->radius = truncate_clamped<std::int32_t>(
            ::floor(static_cast<double>(n) / static_cast<double>(shape->box)) + 1.0);
    }
    shape->sigma = static_cast<float>(s / static_cast<double>(shape->box));
    return true;
}

void box_hybrid_pass_reference(VorBitmap* bitmap, float amount, bool columns) {
    const std::size_t row_bytes = static_cast<std::size_t>(bitmap->width) * 4;
    if (columns) {
        run_reference_pass(bitmap, amount, bitmap->width, 4, bitmap->height, row_bytes, k_band_columns);
    } else {
        run_reference_pass(bitmap, amount, bitmap->height, row_bytes, bitmap->width, 4, 1);
    }
}

void box_hybrid_weights(const BoxHybridShape& shape, std::int32_t* weights) {
    const std::int32_t taps = 2 * shape.radius + 1;
    float w[k_box_hybrid_max_taps];
    for (std::int32_t i = 0; i < taps; ++i) {
        const double x = static_cast<double>(i - shape.radius);
        w[i] = VorMathNormalCDF(static_cast<float>(x + 0.5), shape.sigma) -
               VorMathNormalCDF(static_cast<float>(x - 0.5), shape.sigma);
    }
    // Each weight covers b pixels, so the weights times b sum to one.
    const float box = static_cast<float>(shape.box);
    float total = 0.0f;
    for (std::int32_t i = 0; i < taps; ++i) total += w[i] * box;
    const float scale = static_cast<float>(k_box_hybrid_weight_one) / total;
    for (std::int32_t i = 0; i < taps; ++i) weights[i] = truncate_clamped<std::int32_t>(w[i] * scale);
}

// Weighting prefix sums by d equals weighting each box sum by k: the sum of
// box i is the difference of two prefix sums b pixels apart.
BoxHybridKernel box_hybrid_difference_kernel(const BoxHybridShape& shape) {
    std::int32_t k[k_box_hybrid_max_taps];
    box_hybrid_weights(shape, k);
    const std::int32_t taps = 2 * shape.radius + 1;
    BoxHybridKernel d{};
    d[0] = 0u - static_cast<std::uint32_t>(k[0]);
    for (std::int32_t j = 1; j < taps; ++j) {
        d[j] = static_cast<std::uint32_t>(k[j - 1]) - static_cast<std::uint32_t>(k[j]);
    }
    d[taps] = static_cast<std::uint32_t>(k[taps - 1]);
    return d;
}

}  // namespace vorlite::tone

extern "C" {

VOR_API void VorBuildIntegralLineX(const VorBitmap* bitmap, uint32_t y, uint32_t* line) {
    if (bitmap->width < 1) return;
    const std::size_t row_bytes = static_cast<std::size_t>(bitmap->width) * 4;
    build_integral_lines({bitmap->data + y * row_bytes, 4, 0, bitmap->width, 1}, line);
}

VOR_API void VorBuildIntegralLineY(const VorBitmap* bitmap, uint32_t x, uint32_t* line) {
    if (bitmap->height < 1) return;
    const std::size_t row_bytes = static_cast<std::size_t>(bitmap->width) * 4;
    build_integral_lines({bitmap->data + static_cast<std::size_t>(x) * 4, row_bytes, 0, bitmap->height, 1},
                         line);
}

VOR_API void VorBoxHybridSharpenX(VorBitmap* bitmap, float amount) { run_pass(bitmap, amount, false); }

VOR_API void VorBoxHybridSharpenY(VorBitmap* bitmap, float amount) { run_pass(bitmap, amount, true); }

VOR_API void VorConvolutionEffectBoxHybridSharpen(VorBitmap* bitmap, float amount) {
    // The Y pass filters the X pass's result, so each pass sharpens on its
    // own: two one-dimensional unsharp masks, not one two-dimensional one.
    if (vorlite::tone::box_hybrid_two_passes(bitmap, amount, store_row) ==
        vorlite::tone::TwoPasses::done) {
        return;
    }
    VorBoxHybridSharpenX(bitmap, amount);
    VorBoxHybridSharpenY(bitmap, amount);
}

}  // extern "C"
