// Internal helpers of the colour folder shared with other folders.
#ifndef VORLITE_COLOR_INTERNAL_H
#define VORLITE_COLOR_INTERNAL_H

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::color {

// Colour spaces: the three constant tables, built once on first use
// (thread-safe) with the same maths library as the per-pixel code.
using LinearTable = std::array<float, 256>;     // linear light x 100 per sRGB level
using CbrtTable = std::array<float, 1024>;      // (i/1023)^(1/3)
using EncodingTable = std::array<float, 1024>;  // sRGB encoding of i/1023, 0..1
const LinearTable& linear_table();
const CbrtTable& cbrt_table();
const EncodingTable& encoding_table();

// VorColorRGB2LABDoublesWithCbrtMapping on n pixels, into three arrays.
void lab_doubles_of_pixels(const std::uint8_t* pixels, std::size_t n, double* L, double* a, double* b);

// VorColorLAB2RGBScaled on n packed L*a*b* pixels in place, four at a
// time where the lanes allow (lanes = true), or one by one: the reference.
void lab_to_rgb_pixels(std::uint8_t* pixels, std::size_t n, double scale_l, double scale_a, double scale_b,
                       bool lanes);

// Blend modes: the result of blending src over each opaque grey v = 0..255
// with VorColorBlend, stored per channel. Applying red[R], green[G],
// blue[B] to a pixel is the whole-bitmap form of a one-colour blend.
void blend_grey_maps(const VorColor& src, std::uint32_t mode, float opacity, std::uint8_t red[256],
                     std::uint8_t green[256], std::uint8_t blue[256]);

// One channel of every mode but the colour mode depends on that channel's
// destination and source levels alone: row[b] is the channel of
// VorColorBlend over destination level b from the given source level.
// Returns false, leaving row alone, for the colour mode.
bool blend_channel_row(std::uint32_t mode, int source_level, float opacity, std::uint8_t row[256]);

// Blend modes: every blend_channel_row of one mode (not the colour mode)
// and opacity, entry (s << 8) | b for source level s over destination
// level b. A large bitmap costs 65,536 blends this way instead of one per
// pixel; a row is filled when first asked for, so a small one costs fewer.
class ChannelPairTable {
public:
    ChannelPairTable(std::uint32_t mode, float opacity);
    ChannelPairTable(const ChannelPairTable&) = delete;
    ChannelPairTable& operator=(const ChannelPairTable&) = delete;

    // False when its 64 KiB could not be had; nothing else may be called then.
    bool valid() const { return entries_.get() != nullptr; }
    // The 256 results over each destination level from one source level.
    const std::uint8_t* row(std::uint8_t source) {
        if (!filled_[source]) fill_row(source);
        return &entries_[std::size_t{source} << 8];
    }
    // The whole table, every row filled.
    const std::uint8_t* entries();

private:
    void fill_row(std::uint8_t source);

    std::uint32_t mode_;
    float opacity_;
    std::array<bool, 256> filled_{};
    core::WorkingArray<std::uint8_t> entries_;
};

// Compositing: VorBitmapBlendBitmap split into its preparation, made once,
// and rows blended after it, each row giving the bytes the whole-bitmap
// call gives. For a caller that finishes a picture row by row and never
// holds a second copy of it. `pixels` is the size of the whole job, which
// decides whether a channel-pair table pays.
class RowBlender {
public:
    RowBlender(std::uint32_t mode, float opacity, std::size_t pixels);
    RowBlender(const RowBlender&) = delete;
    RowBlender& operator=(const RowBlender&) = delete;

    // Blends `width` source pixels over as many destination pixels; the
    // destination keeps its alpha.
    void blend(std::uint8_t* dst, const std::uint8_t* src, std::uint32_t width) const;

private:
    std::uint32_t mode_;
    float opacity_;
    const std::uint8_t* table_ = nullptr;  // null: blend pixel by pixel
    int mean_weight_ = -1;                 // the table as a weighted mean, or -1
    std::optional<ChannelPairTable> pairs_;
};

// Blend modes: the luminance of a colour on the 0..255 scale, from the
// sRGB weights, summed green, red, blue in that order (the colour mode's
// lightness and the intensity map's level both depend on the order).
inline float luminance(int r, int g, int b) {
    return (static_cast<float>(g) * 0.71516f + static_cast<float>(r) * 0.212671f) +
           static_cast<float>(b) * 0.072169f;
}

// Colour matrices: the three tone tables of a matrix without cross-channel
// terms, the same bytes as transforming each level; false, leaving map
// alone, for any other matrix.
bool diagonal_matrix_map(const VorColorMatrix& matrix, VorHistMap* map);

// Colour matrices: the general per-pixel path of VorBitmapColorMatrixTransform,
// which never takes the diagonal table shortcut; both must give the same
// bytes for a matrix without cross-channel terms.
void color_matrix_per_pixel(VorBitmap* bitmap, const VorColorMatrix& matrix);

}  // namespace vorlite::color

#endif
