#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <vector>

#include <yajl/yajl_tree.h>

#include "zentra_vorlite.h"

namespace {

// A bitmap over its own bytes: levels biased toward 0 and 255, alpha 42.
struct Image {
    std::vector<uint8_t> bytes;
    VorBitmap bitmap;
    Image(uint32_t w, uint32_t h, uint32_t seed = 1) : bytes(std::size_t{w} * h * 4), bitmap{bytes.data(), w, h} {
        for (std::size_t i = 0; i < bytes.size(); ++i) {
            seed = seed * 69069u + 1u;
            const uint32_t r = seed >> 24;
            bytes[i] = (i % 4 == 3) ? 42 : static_cast<uint8_t>(r < 32 ? 0 : r > 224 ? 255 : r);
        }
    }
    Image(const Image& o) : bytes(o.bytes), bitmap{bytes.data(), o.bitmap.width, o.bitmap.height} {}
    uint8_t* at(uint32_t x, uint32_t y) { return &bytes[(std::size_t{y} * bitmap.width + x) * 4]; }
    void fill(VorColor c) {
        for (std::size_t i = 0; i < bytes.size(); i += 4) std::memcpy(&bytes[i], &c, 4);
    }
};

// Pixel i of image blended directly with VorColorBlend by source(i).
template <typename Source>
std::vector<uint8_t> direct_blend(const Image& image, Source source, uint32_t mode, float opacity) {
    std::vector<uint8_t> out = image.bytes;
    for (std::size_t i = 0; i < out.size(); i += 4) {
        VorColor d, s = source(i);
        std::memcpy(&d, &out[i], 4);
        VorColorBlend(&d, &s, mode, opacity);
        std::memcpy(&out[i], &d, 4);
    }
    return out;
}

TEST(BitmapCompositing, OnlyTheCommonTopLeftAreaChanges) {
    Image src(10, 10), dst(4, 20, 3);
    src.fill(VorColor{9, 9, 9, 0});
    const Image before = dst;
    VorBitmapBlendBitmap(&dst.bitmap, &src.bitmap, VOR_BLEND_NORMAL, 1.0f);
    for (uint32_t i = 0; i < 80; ++i) {
        EXPECT_EQ(dst.bytes[i * 4], i < 40 ? 9 : before.bytes[i * 4]) << i;
        EXPECT_EQ(dst.bytes[i * 4 + 3], 42);
    }
}

// Small areas blend pixel by pixel, large ones through a table of channel
// pairs; both and the one-colour grey maps must equal the direct blend.
TEST(BitmapCompositing, EveryPathMatchesTheDirectBlend) {
    const VorColor colour{230, 40, 120, 90};
    for (uint32_t side : {7u, 300u}) {
        const Image src(side, side, 31);
        for (uint32_t mode = 0; mode <= VOR_BLEND_SOFT_LIGHT; ++mode) {
            Image dst(side, side, 32 + mode), coloured = dst;
            const auto expected = direct_blend(dst, [&](std::size_t i) {
                VorColor s;
                std::memcpy(&s, &src.bytes[i], 4);
                return s;
            }, mode, 0.61f);
            VorBitmapBlendBitmap(&dst.bitmap, &src.bitmap, mode, 0.61f);
            EXPECT_EQ(dst.bytes, expected) << "side " << side << " mode " << mode;
            const auto with_colour = direct_blend(coloured, [&](std::size_t) { return colour; }, mode, 0.37f);
            VorBitmapBlendWithColor(&coloured.bitmap, &colour, mode, 0.37f);
            EXPECT_EQ(coloured.bytes, with_colour) << "colour, side " << side << " mode " << mode;
        }
    }
}

TEST(BitmapCompositing, SeparateWeightsTruncateAndClamp) {
    // (dst weight, src weight, D, S) -> result: additive clamps, 3.5 truncates, negatives clamp.
    const float cases[][5] = {{1, 1, 200, 100, 255}, {0.5f, 0.5f, 3, 4, 3}, {1, -1, 10, 20, 0}};
    for (const auto& c : cases) {
        Image dst(1, 1), src(1, 1);
        dst.bytes[0] = static_cast<uint8_t>(c[2]);
        src.bytes[0] = static_cast<uint8_t>(c[3]);
        VorBitmapBlendBitmapSeparate(&dst.bitmap, &src.bitmap, c[0], c[1]);
        EXPECT_EQ(dst.bytes[0], c[4]) << c[2] << " " << c[3];
        EXPECT_EQ(dst.bytes[3], 42);
    }
}

// Half a pixel to the right: the first column samples at -0.5 with a
// negative weight, the last mixes the source edge with white; moved far
// away, everything (alpha too) turns white.
TEST(TransformedBlend, InterpolatesWithWhiteBeyondTheEdges) {
    Image src(2, 1), dst(3, 1);
    src.fill(VorColor{0, 0, 0, 255});
    src.at(1, 0)[0] = 100;
    VorTransform shift = VorTransformIdentity;
    VorTransformPostTranslate(&shift, 0.5, 0.0);
    VorBitmapBlendBitmapTransform(&dst.bitmap, &src.bitmap, VOR_BLEND_NORMAL, 1.0f, &shift);
    const uint8_t expected[12] = {0, 0, 0, 42, 50, 0, 0, 42, 177, 127, 127, 42};
    EXPECT_EQ(std::memcmp(dst.bytes.data(), expected, 12), 0);

    VorTransformPostTranslate(&shift, 100.0, 0.0);
    VorBitmapBlendBitmapTransform(&dst.bitmap, &src.bitmap, VOR_BLEND_NORMAL, 0.5f, &shift);
    for (uint8_t b : dst.bytes) EXPECT_EQ(b, 255);
}

// A 2 x 1 mask (clear, opaque) stretched over four columns.
TEST(MaskedBlend, MaskAlphaIsTheOpacityStretchedOverTheDestination) {
    Image base(4, 2), over(4, 2), mask(2, 1), dst(4, 2);
    base.fill(VorColor{0, 10, 20, 1});
    over.fill(VorColor{200, 100, 60, 2});
    mask.fill(VorColor{255, 255, 255, 0});
    mask.at(1, 0)[3] = 255;
    VorBitmapBlendBitmapMask(&dst.bitmap, &base.bitmap, &over.bitmap, &mask.bitmap, VOR_BLEND_NORMAL);
    const int expected_red[4] = {0, 100, 200, 200};
    for (uint32_t i = 0; i < 8; ++i) {
        EXPECT_EQ(dst.bytes[i * 4], expected_red[i % 4]) << i;
        EXPECT_EQ(dst.bytes[i * 4 + 3], 42);
    }
    EXPECT_EQ(dst.at(0, 1)[2], 20);  // clear mask: the base colour
}

TEST(PremultipliedComposite, OverIsUnpremultipliedBeforeBlending) {
    const struct {
        VorColor over;
        uint8_t base_red, expected_red;
    } cases[] = {
        {{64, 0, 0, 128}, 0, 64},    // 127 blended at 128/255
        {{200, 0, 0, 254}, 0, 199},  // 200.79 truncates to 200 before the blend
        {{100, 0, 0, 64}, 0, 64},    // 398 saturates to 255
        {{0, 0, 0, 0}, 77, 77},      // transparent: the base shows through
    };
    for (const auto& c : cases) {
        Image base(1, 1), over(1, 1), dst(1, 1);
        base.fill(VorColor{c.base_red, 5, 5, 3});
        over.fill(c.over);
        VorBitmapCompositePremultiplied(&dst.bitmap, &base.bitmap, &over.bitmap, VOR_BLEND_NORMAL);
        EXPECT_EQ(dst.bytes[0], c.expected_red) << int(c.over.r) << "/" << int(c.over.a);
        EXPECT_EQ(dst.bytes[3], 42);
    }
}

TEST(BlendWithColorProcessor, OpacityIsStrengthTimesAlphaAndBadKeysFail) {
    const struct {
        const char* json;
        double strength;
        int result;
    } cases[] = {
        {R"({"color": {"r": 255, "g": 200, "b": 150, "a": 255}, "blendMode": "multiply", "alpha": 0.8})", 0.5, 1},
        {R"([])", 1, 0},
        {R"({"alpha": 1})", 1, 0},
        {R"({"color": [255, 200, 150, 255], "alpha": 1})", 1, 0},
        {R"({"color": {"r": 255, "g": 200, "b": 150, "a": 255}})", 1, 0},
        {R"({"color": {"r": 255, "g": 200, "b": 150, "a": 255}, "alpha": "1"})", 1, 0},
        {R"({"color": {"r": 255, "g": 200, "b": 150, "a": 256}, "alpha": 1})", 1, 0},
        // Non-finite opacities blend without failing or crashing.
        {R"({"color": {"r": 1, "g": 2, "b": 3, "a": 4}, "alpha": 1e999, "blendMode": 5})", 1e300, 1},
    };
    const VorColor colour{255, 200, 150, 255};
    for (const auto& c : cases) {
        Image image(6, 5, 21);
        const auto expected = direct_blend(image, [&](std::size_t) { return colour; }, VOR_BLEND_MULTIPLY, 0.4f);
        const Image before = image;
        yajl_val parameters = yajl_tree_parse(c.json, nullptr, 0);
        VLPLRunOptions options;
        VorEffectInitParams(&options);
        options.strength = c.strength;
        EXPECT_EQ(VLPLRunBlendWithColorProcessor(parameters, &image.bitmap, &options), c.result) << c.json;
        if (c.strength == 0.5) {
            EXPECT_EQ(image.bytes, expected);
        }
        if (c.result == 0) {
            EXPECT_EQ(image.bytes, before.bytes) << c.json;
        }
        yajl_tree_free(parameters);
    }
}

}  // namespace
