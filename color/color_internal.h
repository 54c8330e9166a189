// Internal helpers of the colour folder shared with other folders.
#ifndef VORLITE_COLOR_INTERNAL_H
#define VORLITE_COLOR_INTERNAL_H

#include <array>
#include <cstdint>

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
