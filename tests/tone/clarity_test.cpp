#include <gtest/gtest.h>

#include <tuple>
#include <vector>

#include "zentra_vorlite.h"

namespace {

using Pixels = std::vector<uint8_t>;

Pixels grey(size_t n, uint8_t level, uint8_t a) {
    Pixels px(4 * n, level);
    for (size_t i = 3; i < px.size(); i += 4) px[i] = a;
    return px;
}

void blur(Pixels& px, uint32_t w, uint32_t h, int (*f)(int)) {
    uint8_t t[256];
    for (int i = 0; i < 256; ++i) t[i] = static_cast<uint8_t>(f(i) > 255 ? 255 : f(i));
    VorHistMap m;
    VorHistMapSet(&m, t, t, t);
    VorBitmap b{px.data(), w, h};
    VorBlurHistMap(&b, &m);
}

TEST(LineSmooth, KeepsConstantsAndSpreadsAnImpulseAsAGaussian) {
    std::vector<float> flat(256, 1.0f), impulse(256, 0.0f);
    impulse[128] = 1.0f;
    VorLineSmooth1D(flat.data(), 256, 15);
    VorLineSmooth1D(impulse.data(), 256, 15);
    EXPECT_EQ(flat, std::vector<float>(256, 1.0f));
    EXPECT_NEAR(impulse[128], 1.0 / (15 * 2.5066283), 2e-6);    // 1 / (sigma sqrt(2 pi))
    EXPECT_NEAR(impulse[143] / impulse[128], 0.6065307, 1e-5);  // exp(-1/2) one sigma away
}

TEST(BlurHistMap, UniformImagesTakeTheMappedLevel) {
    const std::tuple<uint8_t, int (*)(int), uint8_t> cases[] = {
        {100, [](int i) { return i + 100; }, 199}, {255, [](int i) { return i; }, 254}, {0, [](int) { return 255; }, 0}};
    for (const auto& [level, f, out] : cases) {
        Pixels px = grey(50 * 40, level, 42);
        blur(px, 50, 40, f);
        EXPECT_EQ(px, grey(50 * 40, out, 255)) << int(level);
    }
}

TEST(BlurHistMap, AmplifiesDetailOnceTheBoxGrows) {
    // One pixel on black keeps its own box while width plus height stays below 67.
    const std::tuple<uint32_t, Pixels, int (*)(int), Pixels> cases[] = {
        {33, {100, 100, 100, 0}, [](int i) { return i; }, {99, 99, 99, 255}},
        {34, {100, 100, 100, 0}, [](int i) { return i; }, {125, 125, 125, 255}},
        {33, {200, 100, 50, 0}, [](int i) { return 2 * i; }, {255, 178, 106, 255}}};
    for (const auto& [w, pixel, f, out] : cases) {
        Pixels px = grey(w * 33, 0, 42);
        const auto centre = px.begin() + 4 * (16 * w + w / 2);
        std::copy(pixel.begin(), pixel.end(), centre);
        blur(px, w, 33, f);
        EXPECT_EQ(Pixels(centre, centre + 4), out) << w;
        EXPECT_EQ(Pixels(centre - 4, centre), (Pixels{0, 0, 0, 255}));
    }
}

TEST(Clarity, LiftsADarkImageButKeepsBlack) {
    Pixels a = grey(60 * 45, 0, 42), black = a;
    for (size_t i = 0; i < 60 * 45; ++i) a[4 * i] = a[4 * i + 2] = i * 7 % 64, a[4 * i + 1] = i * 7 % 64 + 10;
    VorBitmap ba{a.data(), 60, 45}, bk{black.data(), 60, 45};
    VorEnhanceClarity(&ba, nullptr);
    VorLocalContrastEnhance(&bk);
    EXPECT_EQ(black, grey(60 * 45, 0, 255));
    long before = 0, after = 0;
    for (size_t i = 0; i < 60 * 45; ++i) before += i * 7 % 64 + 10, after += a[4 * i + 1];
    EXPECT_GT(after, before + before / 5);  // all mass below level 74: lifted
}

}  // namespace
