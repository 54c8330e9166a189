#include <gtest/gtest.h>

#include <tuple>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// A w x h grey image with alpha 42; pixel i's channel c is at [4 * i + c].
struct Image {
    std::vector<uint8_t> px;
    VorBitmap view;
    Image(uint32_t w, uint32_t h, uint8_t level) : px(4 * w * h, level), view{nullptr, w, h} {
        for (size_t i = 3; i < px.size(); i += 4) px[i] = 42;
    }
    VorBitmap* bitmap() { return view.data = px.data(), &view; }
    void set(size_t i, uint8_t r, uint8_t g, uint8_t b) { px[4 * i] = r, px[4 * i + 1] = g, px[4 * i + 2] = b; }
    std::vector<uint8_t> at(size_t i) const { return {&px[4 * i], &px[4 * i + 4]}; }
};

std::vector<uint8_t> opaque_grey(size_t pixels, uint8_t level) {
    std::vector<uint8_t> px(4 * pixels, level);
    for (size_t i = 3; i < px.size(); i += 4) px[i] = 255;
    return px;
}

VorHistMap curve_map(int (*f)(int)) {
    uint8_t t[256];
    for (int i = 0; i < 256; ++i) t[i] = static_cast<uint8_t>(f(i) > 255 ? 255 : f(i));
    VorHistMap m;
    VorHistMapSet(&m, t, t, t);
    return m;
}

int identity(int i) { return i; }
int lift(int i) { return i + 100; }
int doubling(int i) { return 2 * i; }
int white(int) { return 255; }

TEST(LineSmooth, KeepsConstantsAndSpreadsAnImpulseAsAGaussian) {
    std::vector<float> flat(256, 1.0f), impulse(256, 0.0f);
    impulse[128] = 1.0f;
    VorLineSmooth1D(flat.data(), 256, 15);
    VorLineSmooth1D(impulse.data(), 256, 15);
    EXPECT_EQ(flat, std::vector<float>(256, 1.0f));  // weights and numerator sum alike
    EXPECT_NEAR(impulse[128], 1.0 / (15 * 2.5066283), 2e-6);  // 1 / (sigma sqrt(2 pi))
    EXPECT_NEAR(impulse[143] / impulse[128], 0.6065307, 1e-5);  // exp(-1/2) one sigma away
    float single = 3.5f;
    VorLineSmooth1D(&single, 1, 15);
    EXPECT_EQ(single, 3.5f);
}

TEST(BlurHistMap, UniformImagesTakeTheMappedLevel) {
    // Mapped level m over an original c: 1639 (c + m - c) / 4096 +
    // 2457 (m c / c) / 4096; a black box divides the first term by 2^24.
    const std::tuple<uint8_t, int (*)(int), uint8_t> cases[] = {
        {100, lift, 199}, {255, identity, 254}, {0, identity, 0}, {0, white, 0}};
    for (const auto& [level, f, out] : cases) {
        Image img(50, 40, level);
        const VorHistMap map = curve_map(f);
        VorBlurHistMap(img.bitmap(), &map);
        EXPECT_EQ(img.px, opaque_grey(50 * 40, out)) << int(level);
    }
}

TEST(BlurHistMap, AmplifiesDetailOnceTheBoxGrows) {
    // One pixel on black: its own box below a width plus height of 67,
    // then a radius-1 box (mean grey 100 / 9 in a square, 100 / 3 on a line).
    struct Case {
        uint32_t w, h;
        std::vector<uint8_t> pixel;
        int (*f)(int);
        std::vector<uint8_t> out;
    };
    const Case cases[] = {{33, 33, {100, 100, 100}, identity, {99, 99, 99, 255}},
                          {34, 33, {100, 100, 100}, identity, {125, 125, 125, 255}},
                          {66, 1, {100, 100, 100}, identity, {119, 119, 119, 255}},
                          {33, 33, {200, 100, 50}, identity, {199, 99, 49, 255}},
                          {33, 33, {200, 100, 50}, doubling, {255, 178, 106, 255}}};
    for (const Case& c : cases) {
        Image img(c.w, c.h, 0);
        const size_t centre = (c.h / 2) * c.w + c.w / 2;
        img.set(centre, c.pixel[0], c.pixel[1], c.pixel[2]);
        const VorHistMap map = curve_map(c.f);
        VorBlurHistMap(img.bitmap(), &map);
        EXPECT_EQ(img.at(centre), c.out) << c.w << "x" << c.h << " " << int(c.pixel[0]);
        EXPECT_EQ(img.at(centre - 1), (std::vector<uint8_t>{0, 0, 0, 255}));
    }
}

TEST(Clarity, BlackStaysBlackAndOpaque) {
    Image img(40, 30, 0), empty(0, 0, 0);
    VorLocalContrastEnhance(img.bitmap());
    VorLocalContrastEnhance(empty.bitmap());
    EXPECT_EQ(img.px, opaque_grey(40 * 30, 0));
}

TEST(Clarity, EntryPointsAgreeAndLiftADarkImage) {
    Image a(60, 45, 0);
    for (size_t i = 0; i < 60 * 45; ++i) a.set(i, i * 7 % 64, i * 7 % 64 + 10, i * 7 % 64);
    Image b = a, c = a;
    VorLocalContrastEnhance(a.bitmap());
    VorLocalContrastEnhanceProcessor(b.bitmap());
    VorEnhanceClarity(c.bitmap(), &a);
    EXPECT_EQ(a.px, b.px);
    EXPECT_EQ(a.px, c.px);
    long before = 0, after = 0;
    for (size_t i = 0; i < 60 * 45; ++i) before += i * 7 % 64 + 10, after += a.px[4 * i + 1];
    EXPECT_GT(after, before + before / 5);  // levels below 74 hold all the mass: lifted
}

}  // namespace
