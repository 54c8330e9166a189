// The box-hybrid filter's fast form: a running sum instead of prefix sums,
// in vector lanes, with the vertical pass streamed down the rows right
// behind the horizontal one. It stores the bytes of the reference form in
// tone/box_hybrid.cpp.
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
#include <cstddef>
#include <cstdint>
#include <cstring>

#include "core/core_internal.h"
#include "core/simd.h"
#include "tone/tone_internal.h"

#if VORLITE_VECTOR_LANES
namespace vorlite::tone {
namespace {

using core::WorkingArray;
using core::simd::i32x4;
using core::simd::u32x4;
using core::simd::u8x16;
using core::simd::u8x4;

// The blur divides the weighted sum by 4096 as a shift by 12.
static_assert(k_box_hybrid_weight_one == 1 << 12);

// One RGBA pixel, a channel per 32-bit lane.
inline u32x4 pixel_lanes(const std::uint8_t* p) {
    return __builtin_convertvector(core::simd::load<u8x4>(p), u32x4);
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
            const i32x4 v = reinterpret_cast<i32x4>(pixel_lanes(original + 4 * i));
            const i32x4 t = 3 * v - blur + 1;
            values[i] = (t + reinterpret_cast<i32x4>(reinterpret_cast<u32x4>(t) >> 31)) >> 1;
        } else {
            values[i] = blur;
        }
    }
    const u8x16 colour = core::simd::narrow_clamped(values[0], values[1], values[2], values[3]);
    const u8x16 before = core::simd::load<u8x16>(original);
    const u8x16 alpha = {0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255};
    core::simd::store(out, (colour & ~alpha) | (before & alpha));
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
    // Taps j and j + 1 weighted together.
    core::simd::WeightPair pairs[k_box_hybrid_max_taps / 2];
};

// The difference kernel packed for the fast form; false when a weight does
// not fit the 16-bit multiply-add.
bool prepare_fast_pass(const BoxHybridShape& shape, FastPass* pass) {
    const BoxHybridKernel diff = box_hybrid_difference_kernel(shape);
    const std::int32_t taps = 2 * shape.radius + 2;
    for (std::int32_t j = 0; j < taps; ++j) {
        const auto d = static_cast<std::int32_t>(diff[j]);
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
        const auto first = static_cast<std::int16_t>(static_cast<std::int32_t>(diff[j]));
        const auto second = static_cast<std::int16_t>(static_cast<std::int32_t>(diff[j + 1]));
        pass->pairs[j / 2] = core::simd::weight_pair(first, second);
    }
    return true;
}

// The fast form pads and warms up over the kernel's whole span; it is kept
// for lines the span does not dwarf, where that stays a bounded overhead.
bool span_fits(const FastPass& pass, std::uint32_t length) {
    return (pass.taps - 1) * pass.box <= 16 * static_cast<std::int64_t>(length) + 256;
}

inline u32x4 start_sum(const std::uint8_t* first_pixel, const FastPass& pass) {
    return k_box_hybrid_rounding + pixel_lanes(first_pixel) * pass.start_weight;
}

// The weighted-sum updates of four adjacent pixels from the 2r + 2 reads,
// each read being four pixels (16 bytes).
inline void step_updates(const std::uint8_t* const* reads, const FastPass& pass, u32x4 updates[4]) {
    for (int i = 0; i < 4; ++i) updates[i] = u32x4{0, 0, 0, 0};
    for (std::int32_t j = 0; j < pass.taps; j += 2) {
        core::simd::add_weighted_byte_pairs(updates, reads[j], reads[j + 1], pass.pairs[j / 2]);
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
    const std::uint8_t* reads[k_box_hybrid_max_taps];
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

// A row with its padding, one 32-bit element per pixel.
class PaddedRow {
public:
    bool build(std::uint32_t width, const FastPass& pass) {
        return pixels_.build(static_cast<std::uint32_t>(padding_before(pass) + width + padding_after(pass)));
    }
    std::uint8_t* bytes() const { return reinterpret_cast<std::uint8_t*>(pixels_.get()); }

private:
    WorkingArray<std::uint32_t> pixels_;
};

void run_fast_rows(VorBitmap* bitmap, const FastPass& pass) {
    PaddedRow padded;
    if (!padded.build(bitmap->width, pass)) return;
    const std::size_t row_bytes = std::size_t{4} * bitmap->width;
    for (std::uint32_t y = 0; y < bitmap->height; ++y) {
        std::uint8_t* row = bitmap->data + y * row_bytes;
        filter_row(row, row, bitmap->width, pass, padded.bytes());
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
               sums_.build(4 * groups_ + 1, 4) && finished_.build(4 * groups_);
    }
    std::uint32_t columns() const { return 4 * groups_; }
    std::uint8_t* slot(std::int64_t row) const {
        return reinterpret_cast<std::uint8_t*>(ring_.get()) + static_cast<std::size_t>(row % ring_rows_) * 16 * groups_;
    }
    // Vector stores need 16-byte alignment, which the allocation may lack.
    u32x4* sums() const {
        const auto at = reinterpret_cast<std::uintptr_t>(sums_.get());
        return reinterpret_cast<u32x4*>((at + 15) & ~std::uintptr_t{15});
    }
    std::uint8_t* finished() const { return reinterpret_cast<std::uint8_t*>(finished_.get()); }

private:
    std::uint32_t groups_ = 0;
    std::int64_t ring_rows_ = 0;
    // One 32-bit element per pixel; one word per lane of the sums.
    WorkingArray<std::uint32_t> ring_, sums_, finished_;
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
    const std::uint8_t* rows[k_box_hybrid_max_taps];
    const std::uint8_t* reads[k_box_hybrid_max_taps];
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

}  // namespace

bool box_hybrid_pass_fast(VorBitmap* bitmap, const BoxHybridShape& shape, bool columns) {
    FastPass pass;
    if (!prepare_fast_pass(shape, &pass) || !span_fits(pass, columns ? bitmap->height : bitmap->width)) {
        return false;
    }
    if (columns) {
        run_fast_columns(bitmap, pass);
    } else {
        run_fast_rows(bitmap, pass);
    }
    return true;
}

TwoPasses box_hybrid_two_passes(VorBitmap* bitmap, float amount, const FinishRow& finish) {
    BoxHybridShape shape;
    if (!box_hybrid_shape(bitmap->width, bitmap->height, amount, &shape)) return TwoPasses::unavailable;
    if (bitmap->width == 0 || bitmap->height == 0) return TwoPasses::unavailable;
    FastPass pass;
    if (!prepare_fast_pass(shape, &pass) || !span_fits(pass, bitmap->width) ||
        !span_fits(pass, bitmap->height)) {
        return TwoPasses::unavailable;
    }
    ColumnStream stream;
    PaddedRow padded;
    if (!stream.build(bitmap->width, bitmap->height, pass) || !padded.build(bitmap->width, pass)) {
        return TwoPasses::out_of_memory;
    }
    const std::uint32_t width = bitmap->width;
    const std::size_t row_bytes = std::size_t{4} * width;
    stream_columns(
        bitmap->height, pass, stream,
        [&](std::int64_t p, std::uint8_t* slot) {
            filter_row(bitmap->data + p * row_bytes, slot, width, pass, padded.bytes());
        },
        [&](std::int64_t y, std::uint8_t* row) { finish(bitmap->data + y * row_bytes, row, width); });
    return TwoPasses::done;
}

}  // namespace vorlite::tone
#else
namespace vorlite::tone {

// Without vector lanes every pass takes the reference form.
bool box_hybrid_pass_fast(VorBitmap*, const BoxHybridShape&, bool) { return false; }

TwoPasses box_hybrid_two_passes(VorBitmap*, float, const FinishRow&) { return TwoPasses::unavailable; }

}  // namespace vorlite::tone
#endif
