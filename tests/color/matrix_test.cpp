#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <string>
#include <vector>

#include <yajl/yajl_tree.h>

#include "color/color_internal.h"
#include "zentra_vorlite.h"

namespace {

// Every level 0..255 in each channel (rotated per channel), alpha 42.
std::vector<uint8_t> ramp_pixels() {
    std::vector<uint8_t> bytes(256 * 4);
    for (int v = 0; v < 256; ++v) {
        bytes[v * 4 + 0] = static_cast<uint8_t>(v);
        bytes[v * 4 + 1] = static_cast<uint8_t>(v * 7 + 3);
        bytes[v * 4 + 2] = static_cast<uint8_t>(255 - v);
        bytes[v * 4 + 3] = 42;
    }
    return bytes;
}

VorColor transform_colour(const VorColorMatrix& m, VorColor c) {
    VorBitmap bitmap{reinterpret_cast<uint8_t*>(&c), 1, 1};
    VorBitmapColorMatrixTransform(&bitmap, &m);
    return c;
}

TEST(ColorMatrix, WorkedColours) {
    VorColorMatrix grey = VorColorMatrixIdentity, flat = VorColorMatrixIdentity;
    VorColorMatrixAdjSaturation(&grey, 0.0f);
    VorColorMatrixBrightnessContrast(&flat, 1.0f, 0.0f);
    const VorColor red = transform_colour(grey, VorColor{255, 0, 0, 42});
    const VorColor mid = transform_colour(flat, VorColor{3, 250, 77, 9});
    EXPECT_EQ((std::vector<int>{red.r, red.g, red.b, red.a}), (std::vector<int>{54, 54, 54, 42}));  // 54.315
    EXPECT_EQ((std::vector<int>{mid.r, mid.g, mid.b, mid.a}), (std::vector<int>{128, 128, 128, 9}));
    VorColorMatrix m = grey;
    VorColorMatrixContrast(&m, 0.0f);
    EXPECT_EQ(std::memcmp(&m, &grey, sizeof m), 0);
}

// The newest builder acts on the colour first; M x M may share a record.
TEST(ColorMatrix, BuildersComposeOnTheRight) {
    VorColorMatrix m = VorColorMatrixIdentity;
    VorColorMatrixBrightness(&m, 2.0f);
    VorColorMatrixContrast(&m, 1.0f);  // x -> 2x - 128, then doubled
    EXPECT_EQ(transform_colour(m, VorColor{100, 64, 70, 0}).r, 144);
    VorColorMatrix c = VorColorMatrixIdentity;
    VorColorMatrixContrast(&c, 1.0f);
    VorColorMatrixMultiply(&c, &c);  // 2(2x - 128) - 128
    EXPECT_EQ(c.m[0], 4.0f);
    EXPECT_EQ(c.m[11], -384.0f);
}

// Both the table path and the per-pixel path round half up and clamp.
TEST(ColorMatrix, RoundingBoundaries) {
    const float cases[][2] = {{254.6f, 255}, {254.5f, 255}, {-0.6f, 0}, {-0.5f, 0}, {127.5f, 128}, {127.49f, 127}};
    for (const auto& c : cases) {
        for (bool cross : {false, true}) {
            VorColorMatrix m = VorColorMatrixIdentity;
            m.m[3] = c[0];
            if (cross) m.m[1] = 1.0f;  // green is 0, so the term adds nothing
            EXPECT_EQ(transform_colour(m, VorColor{0, 0, 0, 5}).r, c[1]) << c[0] << " cross " << cross;
        }
    }
}

TEST(ColorMatrix, DiagonalFastPathEqualsPerPixelPath) {
    // (red gain, red offset, green gain, green offset, blue gain, blue offset)
    const float diagonals[][6] = {{0.5f, 0.25f, 1.7f, -30.5f, 2.0f, -128.0f},
                                  {-1.0f, 255.0f, 0.1f, 99.9f, 3.3f, 0.5f},
                                  {1.0039216f, -0.5f, 0.999f, 0.5f, 4.0f, -255.5f}};
    for (const auto& g : diagonals) {
        const VorColorMatrix m = {{g[0], 0, 0, g[1], 0, g[2], 0, g[3], 0, 0, g[4], g[5]}};
        std::vector<uint8_t> fast = ramp_pixels(), general = fast;
        VorBitmap a{fast.data(), 16, 16}, b{general.data(), 16, 16};
        VorBitmapColorMatrixTransform(&a, &m);
        vorlite::color::color_matrix_per_pixel(&b, m);
        EXPECT_EQ(fast, general) << g[0] << " " << g[1];
    }
}

// Pixels transformed by m, optionally through the blend with the original.
std::vector<uint8_t> with_matrix(const VorColorMatrix& m, bool blended = false, uint32_t mode = 0,
                                 float opacity = 1.0f) {
    std::vector<uint8_t> bytes = ramp_pixels();
    VorBitmap bitmap{bytes.data(), 256, 1};
    if (blended) {
        VorBitmapColorMatrixTransformAndBlendWithOriginal(&bitmap, &m, mode, opacity);
    } else {
        VorBitmapColorMatrixTransform(&bitmap, &m);
    }
    return bytes;
}

TEST(ColorMatrix, BlendWithOriginal) {
    const VorColorMatrix swap = {{0, 1, 0, 0, 1, 0, 0, 0, 0, 0, 1, 0}};  // red and green exchanged
    EXPECT_EQ(with_matrix(swap, true, VOR_BLEND_NORMAL, 0.0f), ramp_pixels());
    EXPECT_EQ(with_matrix(swap, true, VOR_BLEND_NORMAL, 1.0f), with_matrix(swap));
    // Without cross terms the matrix takes full effect whatever the opacity.
    VorColorMatrix brighter;
    VorColorMatrixSetIdentity(&brighter);
    VorColorMatrixBrightness(&brighter, 1.5f);
    EXPECT_EQ(with_matrix(brighter, true, VOR_BLEND_MULTIPLY, 0.0f), with_matrix(brighter));
}

TEST(ColorMatrixProcessor, FoldsOperationsUnderStrengthOrFailsUntouched) {
    VorColorMatrix half_saturated = VorColorMatrixIdentity, steeper = VorColorMatrixIdentity;
    VorColorMatrixAdjSaturation(&half_saturated, 0.5f);
    VorColorMatrixBrightness(&steeper, 1.2f);
    VorColorMatrixContrast(&steeper, 1.0f);
    const VorColorMatrix swap = {{0, 1, 0, 0, 1, 0, 0, 0, 0, 0, 1, 10}};
    const VorColorMatrix half_swap = {{0.5f, 0.5f, 0, 0, 0.5f, 0.5f, 0, 0, 0, 0, 1, 5}};
    const struct {
        const char* operations;
        double strength;
        const VorColorMatrix* expected;  // null: the processor fails, pixels untouched
    } cases[] = {
        {R"([{"operation": "saturation", "value": 0}])", 0.5, &half_saturated},
        {R"([{"operation": "brightness", "value": 1.2}, {"operation": "contrast", "value": 2}])", 1, &steeper},
        {R"([])", 1, &VorColorMatrixIdentity},
        {R"([{"operation": "brightness", "value": 3},
             {"operation": "hardSet", "entries": [0,1,0,0, 1,0,0,0, 0,0,1,10]}])", 1, &swap},
        {R"([{"operation": "hardSet", "gain": 2, "entries": [0,0.5,0,0, 0.5,0,0,0, 0,0,0.5,5]}])", 0.5, &half_swap},
        {R"([{"operation": "hardSet", "entries": [9,9,9,9, 9,9,9,9, 9,9,9,9]}])", 0, &VorColorMatrixIdentity},
        {R"({"operation": "brightness", "value": 2})", 1, nullptr},
        {R"([{"value": 2}])", 1, nullptr},
        {R"([7])", 1, nullptr},
        {R"([{"operation": "brightness"}])", 1, nullptr},
        {R"([{"operation": "contrast", "value": "2"}])", 1, nullptr},
        {R"([{"operation": "brightness", "value": 2}, {"operation": "Saturation", "value": 1}])", 1, nullptr},
        {R"([{"operation": "hardSet", "entries": [1,0,0,0, 0,1,0,0, 0,0,1]}])", 1, nullptr},
        {R"([{"operation": "hardSet"}])", 1, nullptr},
        {R"([{"operation": "hardSet", "entries": [1,0,0,0, 0,1,0,0, 0,0,1,"0"]}])", 1, nullptr},
        {nullptr, 1, nullptr},  // no "operations" at all
    };
    for (const auto& c : cases) {
        const std::string json = c.operations ? std::string(R"({"operations": )") + c.operations + "}" : "{}";
        yajl_val parameters = yajl_tree_parse(json.c_str(), nullptr, 0);
        VLPLRunOptions options;
        VorEffectInitParams(&options);
        options.strength = c.strength;
        std::vector<uint8_t> bytes = ramp_pixels();
        VorBitmap bitmap{bytes.data(), 256, 1};
        EXPECT_EQ(VLPLRunColorMatrixTransformProcessor(parameters, &bitmap, &options), c.expected ? 1 : 0) << json;
        EXPECT_EQ(bytes, c.expected ? with_matrix(*c.expected) : ramp_pixels()) << json;
        yajl_tree_free(parameters);
    }
    // Parameters that are no object fail; non-finite amounts apply without a crash.
    std::vector<uint8_t> bytes = ramp_pixels();
    VorBitmap bitmap{bytes.data(), 256, 1};
    const VLPLRunOptions huge{0, 1e300, 1, 1.0};
    yajl_val array = yajl_tree_parse("[]", nullptr, 0);
    yajl_val wild = yajl_tree_parse(R"({"operations": [{"operation": "saturation", "value": 1e999},
        {"operation": "hardSet", "gain": -1e999, "entries": [1,1,1,1, 1,1,1,1, 1,1,1,1e999]}]})", nullptr, 0);
    EXPECT_EQ(VLPLRunColorMatrixTransformProcessor(array, &bitmap, &huge), 0);
    EXPECT_EQ(VLPLRunColorMatrixTransformProcessor(wild, &bitmap, &huge), 1);
    yajl_tree_free(array);
    yajl_tree_free(wild);
}

}  // namespace
