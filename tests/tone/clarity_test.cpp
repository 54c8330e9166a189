#include <gtest/gtest.h>

#include <tuple>

#include "tests/test_support.h"

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

}  // namespace
