#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <string>
#include <vector>

#include <yajl/yajl_tree.h>

#include "zentra_vorlite.h"

static bool operator==(const VorColor& a, const VorColor& b) { return std::memcmp(&a, &b, 4) == 0; }

namespace {

// A bitmap over its own pixels: given ones, one colour, or seeded levels under alpha 42.
struct Image {
    std::vector<VorColor> px;
    VorBitmap bitmap;
    Image(uint32_t w, uint32_t h, std::vector<VorColor> p)
        : px(p), bitmap{reinterpret_cast<uint8_t*>(px.data()), w, h} {}
    Image(uint32_t w, uint32_t h, VorColor c) : Image(w, h, std::vector<VorColor>(std::size_t{w} * h, c)) {}
    Image(uint32_t w, uint32_t h, uint32_t seed) : Image(w, h, VorColor{}) {
        auto next = [&seed] { return static_cast<uint8_t>((seed = seed * 69069u + 1u) >> 24); };
        for (VorColor& p : px) p = VorColor{next(), next(), next(), 42};
    }
};

// Separate weights truncate (0.5 gives 0) and clamp (280 gives 255, -35 gives 0).
TEST(BitmapCompositing, OnlyTheCommonTopLeftAreaChanges) {
    const VorColor outside{200, 3, 10, 42}, blended{40, 8, 100, 42}, weighted{255, 0, 0, 42};
    Image src(10, 10, VorColor{40, 8, 100, 0}), dst(4, 20, outside), separate(4, 20, outside);
    VorBitmapBlendBitmap(&dst.bitmap, &src.bitmap, VOR_BLEND_NORMAL, 1.0f);
    VorBitmapBlendBitmapSeparate(&separate.bitmap, &src.bitmap, 1.5f, -0.5f);
    for (uint32_t i = 0; i < 80; ++i) {
        EXPECT_TRUE(dst.px[i] == (i < 40 ? blended : outside)) << i;
        EXPECT_TRUE(separate.px[i] == (i < 40 ? weighted : outside)) << i;
    }
}

// Large areas blend through a table of channel pairs, one colour through grey maps.
TEST(BitmapCompositing, EveryPathMatchesTheDirectBlend) {
    const VorColor colour{230, 40, 120, 90};
    const Image src(257, 256, 31u);
    for (uint32_t mode = 0; mode <= VOR_BLEND_SOFT_LIGHT; ++mode) {
        Image dst(257, 256, 32 + mode), coloured(257, 256, 32 + mode);
        std::vector<VorColor> expected = dst.px, with_colour = dst.px;
        for (std::size_t i = 0; i < expected.size(); ++i) {
            VorColorBlend(&expected[i], &src.px[i], mode, 0.61f);
            VorColorBlend(&with_colour[i], &colour, mode, 0.37f);
        }
        VorBitmapBlendBitmap(&dst.bitmap, &src.bitmap, mode, 0.61f);
        VorBitmapBlendWithColor(&coloured.bitmap, &colour, mode, 0.37f);
        EXPECT_TRUE(dst.px == expected && coloured.px == with_colour) << "mode " << mode;
    }
}

// Normal mode at opacities whose table is a plain weighted mean of the two
// levels takes a sixteen-channel path, at the others the table. Rows of
// different lengths (the common area is 257 or 259 wide, leaving one or
// three pixels after the groups of four) and a source alpha unlike the
// destination's catch a mean that strays off its row or into alpha.
TEST(BitmapCompositing, WeightedMeanAndPairTableMatchTheDirectBlend) {
    const struct {
        uint32_t src_width, dst_width, dst_height;
    } shapes[] = {{263, 257, 260}, {259, 261, 256}};
    for (const auto& shape : shapes) {
        Image src(shape.src_width, 256, 5u);
        for (VorColor& p : src.px) p.a = 201;
        for (const float opacity : {0.5f, 0.0f, 1.0f, 0.25f, 0.3f, 0.75f}) {
            Image dst(shape.dst_width, shape.dst_height, 9u);
            std::vector<VorColor> expected = dst.px;
            for (uint32_t y = 0; y < 256; ++y) {
                for (uint32_t x = 0; x < std::min(shape.src_width, shape.dst_width); ++x) {
                    VorColorBlend(&expected[y * shape.dst_width + x], &src.px[y * shape.src_width + x],
                                  VOR_BLEND_NORMAL, opacity);
                }
            }
            VorBitmapBlendBitmap(&dst.bitmap, &src.bitmap, VOR_BLEND_NORMAL, opacity);
            EXPECT_TRUE(dst.px == expected) << shape.dst_width << " wide, opacity " << opacity;
        }
    }
}

// Half a pixel right, the first column samples at -0.5, the last mixes the edge with white.
TEST(TransformedBlend, InterpolatesWithWhiteBeyondTheEdges) {
    Image src(2, 1, VorColor{0, 0, 0, 255}), dst(3, 1, VorColor{9, 9, 9, 42});
    src.px[1].r = 100;
    VorTransform shift = VorTransformIdentity;
    VorTransformPostTranslate(&shift, 0.5, 0.0);
    VorBitmapBlendBitmapTransform(&dst.bitmap, &src.bitmap, VOR_BLEND_NORMAL, 1.0f, &shift);
    EXPECT_TRUE(dst.px == (std::vector<VorColor>{{0, 0, 0, 42}, {50, 0, 0, 42}, {177, 127, 127, 42}}));
    VorTransformPostTranslate(&shift, 100.0, 0.0);
    VorBitmapBlendBitmapTransform(&dst.bitmap, &src.bitmap, VOR_BLEND_NORMAL, 0.5f, &shift);
    EXPECT_TRUE(dst.px == std::vector<VorColor>(3, VorColor{255, 255, 255, 255}));
}

// Premultiplied, 64 at alpha 128 is 127 blended at 128/255; 200.79 truncates, 398 saturates.
// Masked, a 2 x 1 mask (clear, opaque) stretched over the four columns is the opacity.
TEST(LayerComposites, OpacityIsTheOverAlphaOrTheStretchedMask) {
    Image over(4, 1, {{64, 0, 0, 128}, {200, 0, 0, 254}, {100, 0, 0, 64}, {0, 0, 0, 0}});
    Image base(4, 1, {{0, 5, 5, 3}, {0, 5, 5, 3}, {0, 5, 5, 3}, {77, 5, 5, 3}});
    Image mask(2, 1, {{255, 255, 255, 0}, {255, 255, 255, 255}});
    Image premultiplied(4, 1, VorColor{9, 9, 9, 42}), masked(4, 1, VorColor{9, 9, 9, 42});
    VorBitmapCompositePremultiplied(&premultiplied.bitmap, &base.bitmap, &over.bitmap, VOR_BLEND_NORMAL);
    VorBitmapBlendBitmapMask(&masked.bitmap, &base.bitmap, &over.bitmap, &mask.bitmap, VOR_BLEND_NORMAL);
    const int expected[2][4] = {{64, 199, 64, 77}, {0, 100, 100, 0}};
    for (int i = 0; i < 4; ++i) {
        EXPECT_TRUE(premultiplied.px[i].r == expected[0][i] && premultiplied.px[i].a == 42) << i;
        EXPECT_TRUE(masked.px[i].r == expected[1][i] && masked.px[i].a == 42) << i;
    }
}

TEST(BlendWithColorProcessor, OpacityIsStrengthTimesAlphaAndBadKeysFail) {
    const std::vector<VorColor> before = Image(6, 5, 21u).px;
    std::vector<VorColor> multiplied = before;
    const VorColor paint{255, 200, 150, 255};
    for (VorColor& p : multiplied) VorColorBlend(&p, &paint, VOR_BLEND_MULTIPLY, 0.4f);
    const std::string colour = R"("color": {"r": 255, "g": 200, "b": 150, "a": 255})";
    const struct { std::string json; double strength; const std::vector<VorColor>* after; } cases[] = {
        {"{" + colour + R"(, "blendMode": "multiply", "alpha": 0.8})", 0.5, &multiplied},
        {"{" + colour + R"(, "alpha": "1"})", 1, &before}, {R"({"color": [255, 200, 150, 255], "alpha": 1})", 1, &before},
        {R"({"color": {"r": 255, "g": 200, "b": 150, "a": 256}, "alpha": 1})", 1, &before},
        {"{" + colour + R"(, "alpha": 1e999, "blendMode": 5})", 1e300, nullptr},  // non-finite opacity: no crash
    };
    for (const auto& c : cases) {
        Image image(6, 5, 21u);
        yajl_val parameters = yajl_tree_parse(c.json.c_str(), nullptr, 0);
        const VLPLRunOptions options{0, c.strength, 1, 1.0};
        EXPECT_EQ(VLPLRunBlendWithColorProcessor(parameters, &image.bitmap, &options), c.after != &before) << c.json;
        EXPECT_TRUE(!c.after || image.px == *c.after) << c.json;
        yajl_tree_free(parameters);
    }
}

}  // namespace
