#include <gtest/gtest.h>

#include <tuple>
#include <vector>

#include "tests/test_support.h"
#include "tone/tone_internal.h"

namespace {

using namespace vorlite::test;

TestBitmap grey(uint32_t w, uint32_t h, uint8_t level, uint8_t alpha = kAlpha) {
    return TestBitmap(w, h, VorColor{level, level, level, alpha});
}

void blur(TestBitmap& b, int (*f)(int)) {
    uint8_t t[256];
    for (int i = 0; i < 256; ++i) t[i] = static_cast<uint8_t>(f(i) > 255 ? 255 : f(i));
    VorHistMap m;
    VorHistMapSet(&m, t, t, t);
    VorBlurHistMap(b.get(), &m);
}

TEST(BlurHistMap, UniformImagesTakeTheMappedLevel) {
    const std::tuple<uint8_t, int (*)(int), uint8_t> cases[] = {
        {100, [](int i) { return i + 100; }, 199}, {255, [](int i) { return i; }, 254}, {0, [](int) { return 255; }, 0}};
    for (const auto& [level, f, out] : cases) {
        TestBitmap b = grey(50, 40, level);
        blur(b, f);
        EXPECT_EQ(b.bytes, grey(50, 40, out, 255).bytes) << int(level);
    }
}

TEST(BlurHistMap, AmplifiesDetailOnceTheBoxGrows) {
    // One pixel on black keeps its own box while width plus height stays below 67.
    const std::tuple<uint32_t, VorColor, int (*)(int), VorColor> cases[] = {
        {33, {100, 100, 100, 0}, [](int i) { return i; }, {99, 99, 99, 255}},
        {34, {100, 100, 100, 0}, [](int i) { return i; }, {125, 125, 125, 255}},
        {33, {200, 100, 50, 0}, [](int i) { return 2 * i; }, {255, 178, 106, 255}}};
    for (const auto& [w, pixel, f, out] : cases) {
        TestBitmap b = grey(w, 33, 0);
        const size_t centre = 16 * w + w / 2;
        for (int c = 0; c < 4; ++c) b.bytes[4 * centre + c] = (&pixel.r)[c];
        blur(b, f);
        EXPECT_EQ(rgba(b.pixel(centre)), rgba(out)) << w;
        EXPECT_EQ(rgba(b.pixel(centre - 1)), rgba({0, 0, 0, 255})) << w;
    }
}

TEST(Clarity, LiftsADarkImageButKeepsBlack) {
    TestBitmap dark = grey(60, 45, 0), black = dark;
    for (size_t i = 0; i < 60 * 45; ++i) dark.bytes[4 * i] = dark.bytes[4 * i + 2] = i * 7 % 64, dark.bytes[4 * i + 1] = i * 7 % 64 + 10;
    VorEnhanceClarity(dark.get(), nullptr);
    VorLocalContrastEnhance(black.get());
    EXPECT_EQ(black.bytes, grey(60, 45, 0, 255).bytes);
    long before = 0, after = 0;
    for (size_t i = 0; i < 60 * 45; ++i) before += i * 7 % 64 + 10, after += dark.bytes[4 * i + 1];
    EXPECT_GT(after, before + before / 5);  // all mass below level 74: lifted
}

TEST(ClarityDivisions, MultiplyAndShiftEqualDivisionOverTheWholeRange) {
    // Every original mean as divisor against every numerator the ratio of
    // means can meet (|mean x level| < 2^17), and every box area the fast
    // pass accepts against the sums at, just below and at the top of each
    // multiple it can reach (255 x area at most).
    for (uint32_t d = 1; d < 256; ++d) {
        const vorlite::tone::ExactDivider by(d, 32);
        for (uint32_t n = 0; n < (1u << 17); ++n) ASSERT_EQ(by.divide(n), n / d) << n << " / " << d;
    }
    for (uint32_t area = 1; area <= 65535; ++area) {
        const vorlite::tone::ExactDivider by(area, 40);
        for (uint32_t k = 1; k <= 255; ++k) {
            const uint32_t n = k * area;
            ASSERT_EQ(by.divide(n - 1), (n - 1) / area) << n - 1 << " / " << area;
            ASSERT_EQ(by.divide(n), k) << n << " / " << area;
        }
    }
}

// The pass with its integral images streamed a few rows ahead and the
// repeated divisions as multiplies, eight columns at a time or one by one,
// stores what the pass as written stores:
// single rows and columns, a radius of 0, radii past the picture, black
// and flat pictures, a wide strip, a picture tall enough for the ring of
// integral rows to wrap many times, and boxes too large for the multiply.
TEST(ClarityDivisions, StreamedPassGivesTheReferenceBytes) {
    struct Case {
        uint32_t w, h;
        int radius;
        int fill;  // -1 random bytes biased to the extremes, else a grey level
    };
    const Case cases[] = {{1, 40, 3, -1},  {40, 1, 3, -1},  {37, 23, 0, -1}, {37, 23, 1, -1},  {37, 23, 5, -1},
                          {37, 23, 30, -1}, {61, 59, 7, -1}, {64, 48, 127, -1}, {31, 29, 4, 0}, {31, 29, 4, 200},
                          {300, 7, 12, -1}, {23, 311, 6, -1}, {300, 300, 130, -1}};
    VorHistMap map;
    for (int c = 0; c < 3; ++c) {
        for (int i = 0; i < 256; ++i) map.map[c][i] = static_cast<uint8_t>(std::min(255, i * 3 / 2 + 7 - c));
    }
    for (const Case& c : cases) {
        TestBitmap streamed = c.fill < 0 ? TestBitmap(c.w, c.h, 9) : grey(c.w, c.h, static_cast<uint8_t>(c.fill));
        TestBitmap reference = streamed, one_by_one = streamed;
        vorlite::tone::blur_hist_map(streamed.get(), &map, c.radius, false, true);
        vorlite::tone::blur_hist_map(one_by_one.get(), &map, c.radius, false, false);
        vorlite::tone::blur_hist_map(reference.get(), &map, c.radius, true);
        EXPECT_TRUE(streamed == reference) << c.w << "x" << c.h << " radius " << c.radius << " fill " << c.fill;
        EXPECT_TRUE(one_by_one == reference) << c.w << "x" << c.h << " radius " << c.radius << " fill " << c.fill;
    }
}

}  // namespace
