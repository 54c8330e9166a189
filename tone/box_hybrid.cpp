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
// That prefix-sum form is kept as the reference. The passes themselves run
// in an equivalent running-sum form, vectorised, with the vertical pass
// streamed down the rows; it stores the same bytes.
#include <math.h>

#include <cstddef>
#include <cstring>

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

#include "core/core_internal.h"
#include "core/simd.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::core::clamp_byte;
using vorlite::core::truncate_clamped;
using vorlite::tone::BoxHybridShape;

// Weights are fixed point with 4096 for one; 2048 rounds the weighted sum.
constexpr std::int32_t kWeightOne = 4096;
constexpr std::uint32_t kRounding = 2048;
// r never exceeds 4, so the difference kernel has at most ten entries.
constexpr std::size_t kMaxTaps = 10;

// A working block held in a VorArray slot, released on every return.
class ArraySlot {
public:
    ArraySlot() = default;
    ArraySlot(const ArraySlot&) = delete;
    ArraySlot& operator=(const ArraySlot&) = delete;
    ~ArraySlot() { VorArrayFree(&slot_); }
    // count x words 32-bit words.
    bool build(std::uint32_t count, std::uint32_t words) {
        return VorArrayBuild2(&slot_, count, words, sizeof(std::uint32_t)) != 0;
    }
    template <typename T>
    T* as() const {
        return static_cast<T*>(slot_);
    }

private:
    void* slot_ = nullptr;
};

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
constexpr std::uint32_t kBandColumns = 16;

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

// Difference kernel d: d_0 = -k_0, d_j = k_(j-1) - k_j, d_(2r+1) = k_(2r).
// Weighting prefix sums by d equals weighting each box sum by k.
void difference_kernel(const std::int32_t* weights, std::int32_t radius, std::uint32_t* diff) {
    const std::int32_t taps = 2 * radius + 1;
    diff[0] = 0u - static_cast<std::uint32_t>(weights[0]);
    for (std::int32_t j = 1; j < taps; ++j) {
        diff[j] = static_cast<std::uint32_t>(weights[j - 1]) - static_cast<std::uint32_t>(weights[j]);
    }
    diff[taps] = static_cast<std::uint32_t>(weights[taps - 1]);
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
    std::uint32_t slope_[4 * kBandColumns];
};

inline void store(std::uint8_t* px, const std::uint32_t acc[3], bool sharpen) {
    for (int c = 0; c < 3; ++c) {
        const std::int32_t blur = static_cast<std::int32_t>(acc[c]) / kWeightOne;
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
            std::uint32_t acc[3] = {kRounding, kRounding, kRounding};
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
// lines; the fast form below must store the same bytes.
void run_reference_pass(VorBitmap* bitmap, float amount, std::uint32_t count, std::size_t line_step,
                        std::uint32_t length, std::size_t step, std::uint32_t lanes) {
    BoxHybridShape shape;
    if (!vorlite::tone::box_hybrid_shape(bitmap->width, bitmap->height, amount, &shape)) return;
    if (count == 0 || length == 0) return;

    const std::uint32_t taps = static_cast<std::uint32_t>(2 * shape.radius + 2);
    ArraySlot kernel;
    if (!kernel.build(taps, 1)) return;
    std::int32_t weights[kMaxTaps];
    vorlite::tone::box_hybrid_weights(shape, weights);
    difference_kernel(weights, shape.radius, kernel.as<std::uint32_t>());
    const Pass pass{shape.sharpen, static_cast<std::int32_t>(taps), shape.box,
                    static_cast<std::int64_t>(shape.box) * shape.radius + shape.half_box + 1,
                    kernel.as<std::uint32_t>()};

    if (lanes > count) lanes = count;
    ArraySlot sums;
    if (!sums.build(length, 4 * lanes)) return;
    std::uint32_t* line_sums = sums.as<std::uint32_t>();
    for (std::uint32_t i = 0; i < count; i += lanes) {
        const Lines band{bitmap->data + i * line_step, step, line_step, length,
                         count - i < lanes ? count - i : lanes};
        build_integral_lines(band, line_sums);
        filter_lines(band, line_sums, pass);
    }
}

// ---------------------------------------------------------------------------
// The fast form: a running sum instead of prefix sums.
//
// With E the extended prefix sum of a line, E(p) - E(p - 1) is the pixel at
// p clamped into the line, so moving from x - 1 to x changes the weighted sum
// by sum_j d_j * v(clamp(x - reach + j b)). The sum is therefore carried
// along the line and updated from 2r + 2 pixels per step, never from sums
// that grow with the line. Modulo 2^32 this is the same number as the
// reference's, so the stored bytes agree.
//
// Each step is vectorised over four RGBA pixels side by side (sixteen 32-bit
// lanes, alpha computed and dropped): neighbouring pixels of a row in the
// vertical pass, or four consecutive steps of a row in the horizontal pass,
// whose running sum then adds the four updates one after another. Two taps
// go together through one 16 x 16 -> 32-bit multiply-add, which is exact as
// long as every d_j fits in 16 signed bits (a byte times such a weight, and
// the sum of two, stay within 32 bits).

using vorlite::core::simd::i32x4;
using vorlite::core::simd::u32x4;
using vorlite::core::simd::u8x16;
using vorlite::core::simd::u8x4;

// Two difference weights applied together, as 32-bit two's complement for
// the generic lanes and packed as 16-bit halves for the multiply-add.
struct TapPair {
    std::uint32_t first;
    std::uint32_t second;
    std::uint32_t packed;  // first in the low half, second in the high half
};

inline u32x4 load_pixel(const std::uint8_t* p) {
    u8x4 bytes;
    std::memcpy(&bytes, p, 4);
    return __builtin_convertvector(bytes, u32x4);
}

// Adds first * a + second * b to the four pixel sums, a and b being four
// RGBA pixels (16 bytes) each.
inline void add_tap_pair(u32x4 sums[4], const std::uint8_t* a, const std::uint8_t* b,
                         const TapPair& w) {
#if defined(__SSE2__)
    const __m128i zero = _mm_setzero_si128();
    const __m128i va = _mm_loadu_si128(reinterpret_cast<const __m128i*>(a));
    const __m128i vb = _mm_loadu_si128(reinterpret_cast<const __m128i*>(b));
    const __m128i a_lo = _mm_unpacklo_epi8(va, zero);
    const __m128i a_hi = _mm_unpackhi_epi8(va, zero);
    const __m128i b_lo = _mm_unpacklo_epi8(vb, zero);
    const __m128i b_hi = _mm_unpackhi_epi8(vb, zero);
    const __m128i weights = _mm_set1_epi32(static_cast<int>(w.packed));
    sums[0] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpacklo_epi16(a_lo, b_lo), weights));
    sums[1] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpackhi_epi16(a_lo, b_lo), weights));
    sums[2] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpacklo_epi16(a_hi, b_hi), weights));
    sums[3] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpackhi_epi16(a_hi, b_hi), weights));
#else
    for (int i = 0; i < 4; ++i) {
        sums[i] += load_pixel(a + 4 * i) * w.first + load_pixel(b + 4 * i) * w.second;
    }
#endif
}

// Clamps sixteen lanes to 0..255 and narrows them to bytes.
inline u8x16 pack_clamped(const i32x4 v[4]) {
#if defined(__SSE2__)
    // Signed saturation to 16 bits, then unsigned saturation to 8: a clamp.
    const __m128i low = _mm_packs_epi32(reinterpret_cast<__m128i>(v[0]), reinterpret_cast<__m128i>(v[1]));
    const __m128i high = _mm_packs_epi32(reinterpret_cast<__m128i>(v[2]), reinterpret_cast<__m128i>(v[3]));
    return reinterpret_cast<u8x16>(_mm_packus_epi16(low, high));
#else
    std::uint8_t bytes[16];
    for (int i = 0; i < 4; ++i) {
        const i32x4 zero = {0, 0, 0, 0};
        const i32x4 top = {255, 255, 255, 255};
        i32x4 c = v[i] < zero ? zero : v[i];
        c = c > top ? top : c;
        const u8x4 narrow = __builtin_convertvector(c, u8x4);
        std::memcpy(bytes + 4 * i, &narrow, 4);
    }
    u8x16 packed;
    std::memcpy(&packed, bytes, 16);
    return packed;
#endif
}

// Four output pixels from their weighted sums: blur = sum / 4096 truncating
// toward zero, and when sharpening (3 v - blur + 1) / 2, also truncating;
// red, green and blue clamped, alpha copied from the original.
inline void store_quad(std::uint8_t* out, const std::uint8_t* original, const u32x4 sums[4],
                       bool sharpen) {
    i32x4 values[4];
    for (int i = 0; i < 4; ++i) {
        const i32x4 signed_sum = reinterpret_cast<i32x4>(sums[i]);
        const u32x4 toward_zero = reinterpret_cast<u32x4>(signed_sum >> 31) & 4095u;
        const i32x4 blur = reinterpret_cast<i32x4>(sums[i] + toward_zero) >> 12;
        if (sharpen) {
            const i32x4 v = reinterpret_cast<i32x4>(load_pixel(original + 4 * i));
            const i32x4 t = 3 * v - blur + 1;
            values[i] = (t + reinterpret_cast<i32x4>(reinterpret_cast<u32x4>(t) >> 31)) >> 1;
        } else {
            values[i] = blur;
        }
    }
    const u8x16 colour = pack_clamped(values);
    u8x16 before;
    std::memcpy(&before, original, 16);
    const u8x16 alpha = {0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255};
    const u8x16 result = (colour & ~alpha) | (before & alpha);
    std::memcpy(out, &result, 16);
}

struct FastPass {
    bool sharpen;
    std::int32_t taps;
    std::int64_t box;
    std::int64_t reach;
    // Steps taken before position 0, a multiple of four, starting where
    // every read still falls before the line.
    std::int64_t warm;
    // At position -warm - 1 every read is the first pixel repeated, so the
    // weighted sum is the first pixel times sum_j d_j (p_j + 1).
    std::uint32_t start_weight;
    TapPair pairs[kMaxTaps / 2];
};

// Packs the difference kernel for the fast form; false when a weight does
// not fit the 16-bit multiply-add.
bool prepare_fast_pass(const BoxHybridShape& shape, const std::uint32_t* diff, FastPass* pass) {
    const std::int32_t taps = 2 * shape.radius + 2;
    for (std::int32_t j = 0; j < taps; ++j) {
        const std::int32_t d = static_cast<std::int32_t>(diff[j]);
        if (d < -32768 || d > 32767) return false;
    }
    const std::int64_t span = static_cast<std::int64_t>(taps - 1) * shape.box;
    pass->sharpen = shape.sharpen;
    pass->taps = taps;
    pass->box = shape.box;
    pass->reach = static_cast<std::int64_t>(shape.box) * shape.radius + shape.half_box + 1;
    pass->warm = (span - pass->reach + 3) / 4 * 4;
    const std::int64_t first_read = -pass->warm - 1 - pass->reach;
    std::uint32_t weight = 0;
    for (std::int32_t j = 0; j < taps; ++j) {
        weight += diff[j] * static_cast<std::uint32_t>(first_read + j * static_cast<std::int64_t>(shape.box) + 1);
    }
    pass->start_weight = weight;
    for (std::int32_t j = 0; j < taps; j += 2) {
        TapPair& pair = pass->pairs[j / 2];
        pair.first = diff[j];
        pair.second = diff[j + 1];
        pair.packed = (diff[j] & 0xFFFFu) | (diff[j + 1] << 16);
    }
    return true;
}

// The fast form pads and warms up over the kernel's whole span; it is kept
// for lines the span does not dwarf, where that stays a bounded overhead.
bool span_fits(const FastPass& pass, std::uint32_t length) {
    return (pass.taps - 1) * pass.box <= 16 * static_cast<std::int64_t>(length) + 256;
}

enum class FastKernel { ready, unsuitable, no_memory };

// The difference kernel, built in its working array, packed for the fast form.
FastKernel fast_kernel(const BoxHybridShape& shape, FastPass* pass) {
    const std::uint32_t taps = static_cast<std::uint32_t>(2 * shape.radius + 2);
    ArraySlot kernel;
    if (!kernel.build(taps, 1)) return FastKernel::no_memory;
    std::int32_t weights[kMaxTaps];
    vorlite::tone::box_hybrid_weights(shape, weights);
    difference_kernel(weights, shape.radius, kernel.as<std::uint32_t>());
    return prepare_fast_pass(shape, kernel.as<std::uint32_t>(), pass) ? FastKernel::ready
                                                                      : FastKernel::unsuitable;
}

inline u32x4 start_sum(const std::uint8_t* first_pixel, const FastPass& pass) {
    return kRounding + load_pixel(first_pixel) * pass.start_weight;
}

// The weighted-sum updates of four adjacent pixels from the 2r + 2 reads,
// each read being four pixels (16 bytes).
inline void step_updates(const std::uint8_t* const* reads, const FastPass& pass, u32x4 updates[4]) {
    for (int i = 0; i < 4; ++i) updates[i] = u32x4{0, 0, 0, 0};
    for (std::int32_t j = 0; j < pass.taps; j += 2) {
        add_tap_pair(updates, reads[j], reads[j + 1], pass.pairs[j / 2]);
    }
}

// Pixels of padding a row needs before and after it so that every read of
// the horizontal pass falls inside: the warm-up reads start warm + reach
// pixels before the row, the last group of four reads up to span - reach + 3
// pixels past it.
std::size_t padding_before(const FastPass& pass) { return static_cast<std::size_t>(pass.warm + pass.reach); }
std::size_t padding_after(const FastPass& pass) {
    return static_cast<std::size_t>((pass.taps - 1) * pass.box - pass.reach + 4);
}

// Horizontal pass over one row from `source` into `dest`, which may be the
// same row: `padded` receives a copy of the row with its first and last
// pixels repeated on either side, and every read is taken from it.
void filter_row(const std::uint8_t* source, std::uint8_t* dest, std::uint32_t width, const FastPass& pass,
                std::uint8_t* padded) {
    const std::size_t before = padding_before(pass);
    const std::size_t after = padding_after(pass);
    for (std::size_t i = 0; i < before; ++i) std::memcpy(padded + 4 * i, source, 4);
    std::uint8_t* origin = padded + 4 * before;
    std::memcpy(origin, source, std::size_t{4} * width);
    const std::uint8_t* last = source + std::size_t{4} * (width - 1);
    for (std::size_t i = 0; i < after; ++i) std::memcpy(origin + 4 * (width + i), last, 4);

    const std::ptrdiff_t tap_bytes = 4 * static_cast<std::ptrdiff_t>(pass.box);
    u32x4 sum = start_sum(source, pass);
    const std::uint8_t* reads[kMaxTaps];
    for (std::int64_t x = -pass.warm; x < width; x += 4) {
        reads[0] = origin + 4 * (x - pass.reach);
        for (std::int32_t j = 1; j < pass.taps; ++j) reads[j] = reads[j - 1] + tap_bytes;
        u32x4 sums[4];
        step_updates(reads, pass, sums);
        for (int i = 0; i < 4; ++i) sums[i] = sum += sums[i];
        if (x < 0) continue;
        if (x + 4 <= width) {
            store_quad(dest + 4 * x, origin + 4 * x, sums, pass.sharpen);
        } else {
            std::uint8_t tail[16];
            store_quad(tail, origin + 4 * x, sums, pass.sharpen);
            std::memcpy(dest + 4 * x, tail, static_cast<std::size_t>(width - x) * 4);
        }
    }
}

std::uint32_t padded_row_pixels(std::uint32_t width, const FastPass& pass) {
    return static_cast<std::uint32_t>(padding_before(pass) + width + padding_after(pass));
}

void run_fast_rows(VorBitmap* bitmap, const FastPass& pass) {
    ArraySlot padded;
    if (!padded.build(padded_row_pixels(bitmap->width, pass), 1)) return;
    const std::size_t row_bytes = std::size_t{4} * bitmap->width;
    for (std::uint32_t y = 0; y < bitmap->height; ++y) {
        std::uint8_t* row = bitmap->data + y * row_bytes;
        filter_row(row, row, bitmap->width, pass, padded.as<std::uint8_t>());
    }
}

// Working memory of the vertical pass streamed down the rows: the rows the
// current step may still read (span + 1 of them, whole rows, so that every
// read is a run of bytes), one running sum per column, and the finished row.
// Rows are padded to whole groups of four pixels.
class ColumnStream {
public:
    bool build(std::uint32_t width, std::uint32_t height, const FastPass& pass) {
        groups_ = (width + 3) / 4;
        // Clamped reads name at most `height` distinct rows.
        ring_rows_ = (pass.taps - 1) * pass.box + 1;
        if (ring_rows_ > height) ring_rows_ = height;
        if (ring_rows_ > 0xFFFFFFFF / (4 * groups_)) return false;
        return ring_.build(static_cast<std::uint32_t>(ring_rows_), 4 * groups_) &&
               sums_.build(4 * groups_ + 1, 4) && finished_.build(4 * groups_, 1);
    }
    std::uint32_t columns() const { return 4 * groups_; }
    std::uint8_t* slot(std::int64_t row) const {
        return ring_.as<std::uint8_t>() + static_cast<std::size_t>(row % ring_rows_) * 16 * groups_;
    }
    // Vector stores need 16-byte alignment, which the allocation may lack.
    u32x4* sums() const {
        const std::uintptr_t at = reinterpret_cast<std::uintptr_t>(sums_.as<std::uint8_t>());
        return reinterpret_cast<u32x4*>((at + 15) & ~std::uintptr_t{15});
    }
    std::uint8_t* finished() const { return finished_.as<std::uint8_t>(); }

private:
    std::uint32_t groups_ = 0;
    std::int64_t ring_rows_ = 0;
    ArraySlot ring_, sums_, finished_;
};

// Vertical pass over the whole bitmap, one row step at a time. `prepare(p,
// slot)` writes row p, as this pass is to read it, into its ring slot the
// first time a step needs it; `finish(y, row)` receives the finished row y.
// Row y of the bitmap is prepared before step y and not read after it, so
// `finish` may overwrite it.
template <typename Prepare, typename Finish>
void stream_columns(std::uint32_t height, const FastPass& pass, const ColumnStream& stream,
                    Prepare prepare, Finish finish) {
    const std::int64_t last_row = static_cast<std::int64_t>(height) - 1;
    const std::int64_t span = (pass.taps - 1) * pass.box;
    const std::uint32_t columns = stream.columns();
    u32x4* sums = stream.sums();
    std::uint8_t* finished = stream.finished();

    prepare(0, stream.slot(0));
    std::int64_t prepared = 1;
    for (std::uint32_t c = 0; c < columns; ++c) sums[c] = start_sum(stream.slot(0) + 4 * c, pass);
    const std::uint8_t* rows[kMaxTaps];
    const std::uint8_t* reads[kMaxTaps];
    for (std::int64_t y = -pass.warm; y <= last_row; ++y) {
        const std::int64_t newest = y - pass.reach + span < last_row ? y - pass.reach + span : last_row;
        for (; prepared <= newest; ++prepared) prepare(prepared, stream.slot(prepared));
        for (std::int32_t j = 0; j < pass.taps; ++j) {
            const std::int64_t p = y - pass.reach + j * pass.box;
            rows[j] = stream.slot(p < 0 ? 0 : (p > last_row ? last_row : p));
        }
        const std::uint8_t* current = y >= 0 ? stream.slot(y) : nullptr;
        for (std::uint32_t c = 0; c < columns; c += 4) {
            for (std::int32_t j = 0; j < pass.taps; ++j) reads[j] = rows[j] + 4 * c;
            u32x4 updates[4];
            step_updates(reads, pass, updates);
            for (int i = 0; i < 4; ++i) sums[c + i] += updates[i];
            if (current != nullptr) store_quad(finished + 4 * c, current + 4 * c, sums + c, pass.sharpen);
        }
        if (current != nullptr) finish(y, finished);
    }
}

void run_fast_columns(VorBitmap* bitmap, const FastPass& pass) {
    ColumnStream stream;
    if (!stream.build(bitmap->width, bitmap->height, pass)) return;
    const std::size_t row_bytes = std::size_t{4} * bitmap->width;
    stream_columns(
        bitmap->height, pass, stream,
        [&](std::int64_t p, std::uint8_t* slot) { std::memcpy(slot, bitmap->data + p * row_bytes, row_bytes); },
        [&](std::int64_t y, std::uint8_t* row) { std::memcpy(bitmap->data + y * row_bytes, row, row_bytes); });
}

// One pass: the fast form where it applies, else the reference form.
void run_pass(VorBitmap* bitmap, float amount, bool columns) {
    const std::uint32_t length = columns ? bitmap->height : bitmap->width;
    BoxHybridShape shape;
    if (!vorlite::tone::box_hybrid_shape(bitmap->width, bitmap->height, amount, &shape)) return;
    if (bitmap->width == 0 || bitmap->height == 0) return;
    FastPass pass;
    const FastKernel kernel = fast_kernel(shape, &pass);
    if (kernel == FastKernel::no_memory) return;
    if (kernel == FastKernel::unsuitable || !span_fits(pass, length)) {
        vorlite::tone::box_hybrid_pass_reference(bitmap, amount, columns);
    } else if (columns) {
        run_fast_columns(bitmap, pass);
    } else {
        run_fast_rows(bitmap, pass);
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
        run_reference_pass(bitmap, amount, bitmap->width, 4, bitmap->height, row_bytes, kBandColumns);
    } else {
        run_reference_pass(bitmap, amount, bitmap->height, row_bytes, bitmap->width, 4, 1);
    }
}

TwoPasses box_hybrid_two_passes(VorBitmap* bitmap, float amount, FinishRow finish) {
    BoxHybridShape shape;
    if (!box_hybrid_shape(bitmap->width, bitmap->height, amount, &shape)) return TwoPasses::unavailable;
    if (bitmap->width == 0 || bitmap->height == 0) return TwoPasses::unavailable;
    FastPass pass;
    const FastKernel kernel = fast_kernel(shape, &pass);
    if (kernel == FastKernel::no_memory) return TwoPasses::out_of_memory;
    if (kernel == FastKernel::unsuitable || !span_fits(pass, bitmap->width) ||
        !span_fits(pass, bitmap->height)) {
        return TwoPasses::unavailable;
    }
    ColumnStream stream;
    ArraySlot padded;
    if (!stream.build(bitmap->width, bitmap->height, pass) ||
        !padded.build(padded_row_pixels(bitmap->width, pass), 1)) {
        return TwoPasses::out_of_memory;
    }
    const std::uint32_t width = bitmap->width;
    const std::size_t row_bytes = std::size_t{4} * width;
    stream_columns(
        bitmap->height, pass, stream,
        [&](std::int64_t p, std::uint8_t* slot) {
            filter_row(bitmap->data + p * row_bytes, slot, width, pass, padded.as<std::uint8_t>());
        },
        [&](std::int64_t y, std::uint8_t* row) { finish(bitmap->data + y * row_bytes, row, width); });
    return TwoPasses::done;
}

void box_hybrid_weights(const BoxHybridShape& shape, std::int32_t* weights) {
    const std::int32_t taps = 2 * shape.radius + 1;
    float w[kMaxTaps];
    for (std::int32_t i = 0; i < taps; ++i) {
        const double x = static_cast<double>(i - shape.radius);
        w[i] = VorMathNormalCDF(static_cast<float>(x + 0.5), shape.sigma) -
               VorMathNormalCDF(static_cast<float>(x - 0.5), shape.sigma);
    }
    // Each weight covers b pixels, so the weights times b sum to one.
    const float box = static_cast<float>(shape.box);
    float total = 0.0f;
    for (std::int32_t i = 0; i < taps; ++i) total += w[i] * box;
    const float scale = static_cast<float>(kWeightOne) / total;
    for (std::int32_t i = 0; i < taps; ++i) weights[i] = truncate_clamped<std::int32_t>(w[i] * scale);
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
