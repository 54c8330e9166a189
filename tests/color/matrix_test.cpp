#include <gtest/gtest.h>

#include <cstring>
#include <limits>
#include <string>
#include <vector>

#include "color/color_internal.h"
#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

// Every level 0..255 in each channel (rotated per channel), alpha 42, optionally
// transformed by m or blended back over the original.
std::vector<uint8_t> ramp(const VorColorMatrix* m = nullptr, bool blended = false, uint32_t mode = 0,
                          float opacity = 1.0f) {
    std::vector<uint8_t> b(256 * 4);
    for (int v = 0; v < 256; ++v) b[v * 4] = v, b[v * 4 + 1] = v * 7 + 3, b[v * 4 + 2] = 255 - v, b[v * 4 + 3] = 42;
    VorBitmap bitmap{b.data(), 256, 1};
    if (m && blended) VorBitmapColorMatrixTransformAndBlendWithOriginal(&bitmap, m, mode, opacity);
    if (m && !blended) VorBitmapColorMatrixTransform(&bitmap, m);
    return b;
}

VorColor transform_colour(const VorColorMatrix& m, VorColor c) {
    VorBitmap bitmap{reinterpret_cast<uint8_t*>(&c), 1, 1};
    VorBitmapColorMatrixTransform(&bitmap, &m);
    return c;
}

// The newest builder acts on the colour first; M x M may share a record.
TEST(ColorMatrix, WorkedColoursAndRightComposition) {
    VorColorMatrix grey = VorColorMatrixIdentity, flat = VorColorMatrixIdentity, m = VorColorMatrixIdentity;
    VorColorMatrixAdjSaturation(&grey, 0.0f);
    VorColorMatrixBrightnessContrast(&flat, 1.0f, 0.0f);
    const VorColor red = transform_colour(grey, {255, 0, 0, 42}), mid = transform_colour(flat, {3, 250, 77, 9});
    EXPECT_EQ(rgba(red), rgba({54, 54, 54, 42}));
    EXPECT_EQ(rgba(mid), rgba({128, 128, 128, 9}));
    VorColorMatrix unchanged = grey;
    VorColorMatrixContrast(&unchanged, 0.0f);
    EXPECT_EQ(std::memcmp(&unchanged, &grey, sizeof grey), 0);
    VorColorMatrixBrightness(&m, 2.0f);
    VorColorMatrixContrast(&m, 1.0f);  // x -> 2x - 128, then doubled
    EXPECT_EQ(transform_colour(m, {100, 64, 70, 0}).r, 144);
    VorColorMatrixMultiply(&m, &m);  // (4x - 256) applied twice
    EXPECT_TRUE(m.m[0] == 16.0f && m.m[5] == 16.0f && m.m[11] == -1280.0f);
}

// Both the table path and the per-pixel path round half up and clamp, and they agree on diagonal matrices.
TEST(ColorMatrix, FastAndGeneralPathsRoundHalfUpAndAgree) {
    const float cases[][2] = {{254.5f, 255}, {-0.5f, 0}, {127.5f, 128}, {127.49f, 127}};
    for (const auto& c : cases) {
        for (bool cross : {false, true}) {
            VorColorMatrix m = VorColorMatrixIdentity;
            m.m[3] = c[0];
            if (cross) m.m[1] = 1.0f;  // green is 0, so the term adds nothing
            EXPECT_EQ(transform_colour(m, VorColor{0, 0, 0, 5}).r, c[1]) << c[0] << " cross " << cross;
        }
    }
    for (const VorColorMatrix& m : {VorColorMatrix{{0.5f, 0, 0, 0.25f, 0, 1.7f, 0, -30.5f, 0, 0, 2.0f, -128.0f}},
                                    VorColorMatrix{{-1.0f, 0, 0, 255.0f, 0, 0.1f, 0, 99.9f, 0, 0, 3.3f, 0.5f}}}) {
        std::vector<uint8_t> general = ramp();
        VorBitmap bitmap{general.data(), 256, 1};
        vorlite::color::color_matrix_per_pixel(&bitmap, m);
        EXPECT_EQ(ramp(&m), general) << m.m[0];
    }
}

// The bitmap transform of a cross-channel matrix runs four pixels per step
// and the last one to three from a padded block; it must store the bytes of
// the general per-pixel path, including where the rounding rule meets
// infinities, NaN and sums beyond the byte range.
TEST(ColorMatrix, CrossChannelLanesMatchGeneralPathAtEveryWidthAndExtreme) {
    constexpr float inf = std::numeric_limits<float>::infinity(), nan = std::numeric_limits<float>::quiet_NaN();
    constexpr float tiny = std::numeric_limits<float>::denorm_min(), big = std::numeric_limits<float>::max();
    const VorColorMatrix matrices[] = {
        {{0.393f, 0.769f, 0.189f, 0, 0.349f, 0.686f, 0.168f, 0, 0.272f, 0.534f, 0.131f, 0}},  // sepia, overflows
        {{0.5f, 0.5f, 0, 0.5f, 0, 0.5f, 0.5f, -0.5f, 0.5f, 0, 0.5f, 254.5f}},               // halves: rounding ties
        {{-1, 1, -1, 255, 1, -1, 1, -0.5f, 0.25f, -0.75f, 1.5f, 0}},                          // below -0.5 and back
        {{0.7f, 0.1f, 0.2f, 0.3f, 0.1f, 0.7f, 0.2f, 0.3f, 0.1f, 0.7f, 0.2f, 0.3f}},  // the sum order shows in the bytes
        {{1, 0x1p-24f, 0, 0x1.fffffep-2f, 0, 1, -0x1p-24f, 0x1.000002p-1f, tiny, 0, 1, -tiny}},       // a hair off the ties
        {{inf, 1, 0, 0, 1, -inf, 0, 0, 0, 1, 1, inf}},      // inf x 0 is NaN, +inf saturates
        {{nan, 1, 0, 0, 0, 1, nan, 0, 0, 0, 1, nan}},       // NaN stores 0
        {{big, big, big, 0, -big, -big, 0, 0, big, -big, 0, 0}},  // sums overflow to infinities and NaN
        {{1e30f, -1e30f, 0, 0, 1e-30f, 1, 1e-30f, -1e-30f, 0, 1e-38f, 1, 0.5f}},  // huge cancels, tiny vanish
    };
    // The lanes (through the public entry) and the general path on copies of the same bytes.
    auto agree = [](const VorColorMatrix& m, TestBitmap lanes) {
        TestBitmap general = lanes;
        VorBitmapColorMatrixTransform(lanes.get(), &m);
        vorlite::color::color_matrix_per_pixel(general.get(), m);
        return lanes == general;
    };
    // Every (red, green) pair with blue running through its levels: a sum
    // taken in another order rounds differently somewhere here.
    TestBitmap pairs(65537, 1);
    for (std::size_t i = 0; i < 65537; ++i) pairs.bytes[i * 4] = i, pairs.bytes[i * 4 + 1] = i >> 8, pairs.bytes[i * 4 + 2] = i * 37;
    for (const VorColorMatrix& m : matrices) {
        for (uint32_t width : {1u, 2u, 3u, 4u, 5u, 7u, 8u, 13u, 61u}) {
            for (uint32_t height : {1u, 3u}) {
                EXPECT_TRUE(agree(m, TestBitmap(width, height))) << m.m[0] << ", " << width << " x " << height;
            }
        }
        EXPECT_TRUE(agree(m, pairs)) << "matrix starting " << m.m[0];
    }
}

TEST(ColorMatrix, BlendWithOriginal) {
    const VorColorMatrix swap = {{0, 1, 0, 0, 1, 0, 0, 0, 0, 0, 1, 0}};  // red and green exchanged
    EXPECT_EQ(ramp(&swap, true, VOR_BLEND_NORMAL, 0.0f), ramp());
    EXPECT_EQ(ramp(&swap, true, VOR_BLEND_NORMAL, 1.0f), ramp(&swap));
    // Without cross terms the matrix takes full effect whatever the opacity.
    const VorColorMatrix brighter = {{1.5f, 0, 0, 0, 0, 1.5f, 0, 0, 0, 0, 1.5f, 0}};
    EXPECT_EQ(ramp(&brighter, true, VOR_BLEND_MULTIPLY, 0.0f), ramp(&brighter));
}

TEST(ColorMatrixProcessor, FoldsOperationsUnderStrengthOrFailsUntouched) {
    VorColorMatrix half_saturated = VorColorMatrixIdentity, steeper = VorColorMatrixIdentity;
    VorColorMatrixAdjSaturation(&half_saturated, 0.5f);
    VorColorMatrixBrightness(&steeper, 1.2f);
    VorColorMatrixContrast(&steeper, 1.0f);
    const VorColorMatrix half_swap = {{0.5f, 0.5f, 0, 0, 0.5f, 0.5f, 0, 0, 0, 0, 1, 5}}, unchecked{};
    const std::string swap = R"({"operation": "hardSet", "gain": 2, "entries": [0,0.5,0,0, 0.5,0,0,0, 0,0,0.5,5]})";
    auto doc = [](const std::string& operations) { return R"({"operations": )" + operations + "}"; };
    const struct { std::string json; double strength; const VorColorMatrix* expected; } cases[] = {  // null: fails
        {doc(R"([{"operation": "saturation", "value": 0}])"), 0.5, &half_saturated},
        {doc(R"([{"operation": "brightness", "value": 1.2}, {"operation": "contrast", "value": 2}])"), 1, &steeper},
        {doc(R"([{"operation": "brightness", "value": 3}, )" + swap + "]"), 0.5, &half_swap},  // replaces so far
        {doc("[" + swap + "]"), 0, &VorColorMatrixIdentity}, {doc("[]"), 1, &VorColorMatrixIdentity},
        {doc(R"([{"operation": "saturation", "value": 1e999}, {"operation": "hardSet", "gain": -1e999,
             "entries": [1,1,1,1, 1,1,1,1, 1,1,1,1e999]}])"), 1e300, &unchecked},  // non-finite: no crash
        {"[]", 1, nullptr}, {"{}", 1, nullptr}, {doc(R"({"operation": "brightness", "value": 2})"), 1, nullptr},
        {doc(R"([{"value": 2}])"), 1, nullptr}, {doc(R"([{"operation": "contrast", "value": "2"}])"), 1, nullptr},
        {doc(R"([{"operation": "brightness", "value": 2}, {"operation": "Saturation", "value": 1}])"), 1, nullptr},
        {doc(R"([{"operation": "hardSet", "entries": [1,0,0,0, 0,1,0,0, 0,0,1]}])"), 1, nullptr},
    };
    for (const auto& c : cases) {
        std::vector<uint8_t> bytes = ramp();
        VorBitmap bitmap{bytes.data(), 256, 1};
        EXPECT_EQ(run(VLPLRunColorMatrixTransformProcessor, c.json, &bitmap, c.strength), c.expected ? 1 : 0) << c.json;
        EXPECT_TRUE(c.expected == &unchecked || bytes == (c.expected ? ramp(c.expected) : ramp())) << c.json;
    }
}

}  // namespace
