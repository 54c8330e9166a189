// Dot-matrix type, as camera date stamps and displays print it: a 5 x 7
// font drawn as round soft dots, single dots, and plain anti-aliased lines.
#include <algorithm>
#include <cmath>
#include <cstring>

#include "core/core_internal.h"
#include "legacy/legacy_internal.h"

namespace vorlite::legacy {

namespace {

struct Glyph {
    char c;
    const char* rows;  // 7 rows of 5, top to bottom: '#' a dot
};

constexpr Glyph k_font[] = {
    {' ', "..................................."},
    {'%', "##...##..#...#...#...#...#..##...##"},
    {'&', ".#...#.#..#.#...#...#.#.##..#..##.#"},
    {'~', "...........##.##.##................"},
    {'{', "..##..#....#...#.....#....#.....##."},
    {'}', ".##.....#....#.....#...#....#..##.."},
    {'^', "..#...#.#.#...#...................."},
    {'>', ".#.....#.....#.....#...#...#...#..."},
    {'<', "...#...#...#...#.....#.....#.....#."},
    {':', "......##...##.......##...##........"},
    {'-', "...............#####..............."},
    {'+', ".......#....#..#####..#....#......."},
    {'.', ".........................##...##..."},
    {'/', "....#....#...#...#...#...#....#...."},
    {'*', ".......#..#.#.#.###.#.#.#..#......."},
    {'|', "..#....#....#....#....#....#....#.."},
    {'@', ".###.#...##.###.#.##.###.#.....###."},
    {'A', ".###.#...##...#######...##...##...#"},
    {'B', "####.#...##...#####.#...##...#####."},
    {'C', ".###.#...##....#....#....#...#.###."},
    {'D', "####.#...##...##...##...##...#####."},
    {'E', "######....#....####.#....#....#####"},
    {'F', "######....#....####.#....#....#...."},
    {'G', ".###.#...##....#.####...##...#.####"},
    {'H', "#...##...##...#######...##...##...#"},
    {'I', ".###...#....#....#....#....#...###."},
    {'J', "..###...#....#....#....#.#..#..##.."},
    {'K', "#...##..#.#.#..##...#.#..#..#.#...#"},
    {'L', "#....#....#....#....#....#....#####"},
    {'M', "#...###.###.#.##.#.##...##...##...#"},
    {'N', "#...###..###..##.#.##..###..###...#"},
    {'O', ".###.#...##...##...##...##...#.###."},
    {'P', "####.#...##...#####.#....#....#...."},
    {'Q', ".###.#...##...##...##.#.##..#..##.#"},
    {'R', "####.#...##...#####.#.#..#..#.#...#"},
    {'S', ".#####....#.....###.....#....#####."},
    {'T', "#####..#....#....#....#....#....#.."},
    {'U', "#...##...##...##...##...##...#.###."},
    {'V', "#...##...##...##...##...#.#.#...#.."},
    {'W', "#...##...##...##.#.##.#.###.###...#"},
    {'X', "#...##...#.#.#...#...#.#.#...##...#"},
    {'Y', "#...##...#.#.#...#....#....#....#.."},
    {'Z', "#####....#...#...#...#...#....#####"},
    {'f', "..##..#....#...###...#....#....#..."},
    {'s', "..........####.#.....###.....#####."},
    {'0', ".###.#...##..###.#.###..##...#.###."},
    {'1', "..#...##....#....#....#....#...###."},
    {'2', ".###.#...#....#...#...#...#...#####"},
    {'3', "#####...#...#.....#.....##...#.###."},
    {'4', "...#...##..#.#.#..#.#####...#....#."},
    {'5', "######....####.....#....##...#.###."},
    {'6', "..##..#...#....####.#...##...#.###."},
    {'7', "#####....#...#...#...#....#....#..."},
    {'8', ".###.#...##...#.###.#...##...#.###."},
    {'9', ".###.#...##...#.####....#...#..##.."},
};

const Glyph* glyph_of(char c) {
    if (c >= 'a' && c <= 'z' && c != 'f' && c != 's') c = static_cast<char>(c - 'a' + 'A');
    for (const Glyph& g : k_font) {
        if (g.c == c) return &g;
    }
    return nullptr;
}

// Blends the colour over one pixel at the colour's alpha times coverage.
void cover(VorBitmap* bitmap, std::uint32_t x, std::uint32_t y, const VorColor& colour, std::uint32_t mode,
           float coverage) {
    if (!(coverage > 0.0f)) return;
    std::uint8_t* p = bitmap->data + (std::size_t{y} * bitmap->width + x) * 4;
    VorColor c = vorlite::core::load_pixel(p);
    VorColorBlend(&c, &colour, mode, coverage * static_cast<float>(colour.a) * vorlite::core::k_inv255);
    vorlite::core::store_pixel(p, c);
}

// The whole-pixel range [first, last] a shape spanning lo..hi may touch,
// clipped to 0..size-1; empty when last < first.
struct Span {
    std::int64_t first, last;
};

Span clip(float lo, float hi, std::uint32_t size) {
    if (!(lo <= hi) || size == 0) return Span{0, -1};
    const float limit = static_cast<float>(size);
    const float a = std::max(lo, -1.0f);
    const float b = std::min(hi, limit);
    if (a > b) return Span{0, -1};
    return Span{std::max<std::int64_t>(0, static_cast<std::int64_t>(std::floor(a))),
                std::min<std::int64_t>(static_cast<std::int64_t>(size) - 1, static_cast<std::int64_t>(std::ceil(b)))};
}

}  // namespace

bool glyph_dot(char c, int column, int row) {
    const Glyph* g = glyph_of(c);
    if (g == nullptr || column < 0 || column >= k_glyph_columns || row < 0 || row >= k_glyph_rows) return false;
    return g->rows[row * k_glyph_columns + column] == '#';
}

bool in_font(char c) { return glyph_of(c) != nullptr; }

}  // namespace vorlite::legacy

extern "C" {

VOR_API void VorDotMatrixDot(VorBitmap* bitmap, float x, float y, float radius, const VorColor* color,
                             uint32_t mode) {
    if (bitmap == nullptr || bitmap->data == nullptr || color == nullptr) return;
    if (!(radius > 0.0f) || !std::isfinite(x) || !std::isfinite(y) || !(radius < 1e6f)) return;
    using vorlite::legacy::clip;
    const auto rows = clip(y - radius - 1.0f, y + radius + 1.0f, bitmap->height);
    const auto columns = clip(x - radius - 1.0f, x + radius + 1.0f, bitmap->width);
    for (std::int64_t py = rows.first; py <= rows.last; ++py) {
        const float dy = static_cast<float>(py) - y;
        for (std::int64_t px = columns.first; px <= columns.last; ++px) {
            const float dx = static_cast<float>(px) - x;
            // One pixel of soft rim: full inside radius - 0.5, none beyond
            // radius + 0.5.
            const float coverage = std::clamp(radius + 0.5f - std::sqrt(dx * dx + dy * dy), 0.0f, 1.0f);
            vorlite::legacy::cover(bitmap, static_cast<std::uint32_t>(px), static_cast<std::uint32_t>(py), *color,
                                   mode, coverage);
        }
    }
}

VOR_API void VorDotMatrix(VorBitmap* bitmap, const char* text, float x, float y, float pitch,
                          const VorColor* color, uint32_t mode) {
    if (bitmap == nullptr || text == nullptr || color == nullptr || !(pitch > 0.0f) || !(pitch < 1e5f)) return;
    using namespace vorlite::legacy;
    // Round dots a little apart, as a printed date stamp's are.
    const float radius = pitch * 0.42f;
    const std::size_t length = std::strlen(text);
    for (std::size_t i = 0; i < length; ++i) {
        const float left = x + static_cast<float>(i * k_glyph_advance) * pitch;
        if (left > static_cast<float>(bitmap->width) + pitch) break;
        for (int row = 0; row < k_glyph_rows; ++row) {
            for (int column = 0; column < k_glyph_columns; ++column) {
                if (!glyph_dot(text[i], column, row)) continue;
                VorDotMatrixDot(bitmap, left + static_cast<float>(column) * pitch, y + static_cast<float>(row) * pitch,
                                radius, color, mode);
            }
        }
    }
}

VOR_API void VorDrawLine(VorBitmap* bitmap, float x0, float y0, float x1, float y1, float width,
                         const VorColor* color, uint32_t mode) {
    if (bitmap == nullptr || bitmap->data == nullptr || color == nullptr) return;
    if (!std::isfinite(x0) || !std::isfinite(y0) || !std::isfinite(x1) || !std::isfinite(y1)) return;
    if (!(width > 0.0f) || !(width < 1e6f)) return;
    using vorlite::legacy::clip;
    const float half = width * 0.5f;
    const auto rows = clip(std::min(y0, y1) - half - 1.0f, std::max(y0, y1) + half + 1.0f, bitmap->height);
    const auto columns = clip(std::min(x0, x1) - half - 1.0f, std::max(x0, x1) + half + 1.0f, bitmap->width);
    const float ex = x1 - x0;
    const float ey = y1 - y0;
    const float length2 = ex * ex + ey * ey;
    for (std::int64_t py = rows.first; py <= rows.last; ++py) {
        for (std::int64_t px = columns.first; px <= columns.last; ++px) {
            // Distance to the segment: the nearest point's parameter
            // clamped to the ends.
            const float dx = static_cast<float>(px) - x0;
            const float dy = static_cast<float>(py) - y0;
            const float t = length2 > 0.0f ? std::clamp((dx * ex + dy * ey) / length2, 0.0f, 1.0f) : 0.0f;
            const float nx = dx - t * ex;
            const float ny = dy - t * ey;
            const float coverage = std::clamp(half + 0.5f - std::sqrt(nx * nx + ny * ny), 0.0f, 1.0f);
            vorlite::legacy::cover(bitmap, static_cast<std::uint32_t>(px), static_cast<std::uint32_t>(py), *color,
                                   mode, coverage);
        }
    }
}

}  // extern "C"
