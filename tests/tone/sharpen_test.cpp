#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstring>
#include <vector>

#include "core/simd.h"
#include "tone/tone_internal.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::tone::BoxHybridShape;

// Bytes leaning toward 0 and 255, alpha distinctive.
struct Image {
    uint32_t width, height;
    std::vector<uint8_t> bytes;
    VorBitmap bitmap;
    Image(uint32_t w, uint32_t h) : width(w), height(h), bytes(size_t{w} * h * 4), bitmap{bytes.data(), w, h} {
        uint32_t s = w * 31 + h;
        for (size_t i = 0; i < bytes.size(); ++i) {
            s = s * 1103515245u + 12345u;
            const uint32_t r = s >> 24;
            bytes[i] = i % 4 == 3 ? static_cast<uint8_t>(i * 7 + 3) : r < 48 ? 0 : r > 208 ? 255 : static_cast<uint8_t>(r);
        }
    }
    Image(const Image& o) : width(o.width), height(o.height), bytes(o.bytes), bitmap{bytes.data(), width, height} {}
    uint8_t& at(uint32_t x, uint32_t y, int c) { return bytes[(size_t{y} * width + x) * 4 + c]; }
};

TEST(ErrorFunction, ChebyshevErfcFollowsTheTrueCurve) {
    for (float z : {0.0f, 0.3f, 1.0f, 2.0f, 4.5f}) {
        const double expected = std::erfc(static_cast<double>(z));
        EXPECT_NEAR(VorMathErfccheb(z), expected, 4e-7 * expected) << z;
        EXPECT_NEAR(VorMathErf(-z), -std::erf(static_cast<double>(z)), 1e-6) << z;
    }
    EXPECT_EQ(VorMathErfccheb(-0.5f), 0.0f);
    EXPECT_EQ(VorMathErfccheb(INFINITY), 0.0f);
}

BoxHybridShape shape_of(uint32_t w, uint32_t h, float amount) {
    BoxHybridShape shape{};
    EXPECT_TRUE(vorlite::tone::box_hybrid_shape(w, h, amount, &shape)) << amount;
    return shape;
}

TEST(BoxHybridShape, BoxesWidenOnceTheKernelReachesFiveSteps) {
    const struct {
        float amount;
        bool sharpen;
        int32_t r, b, m;
    } cases[] = {
        {106.0f, true, 4, 1, 0},    // n = 4, the last single-pixel box
        {107.0f, true, 2, 3, 1},    // n = 5, boxes of 3
        {-420.0f, false, 4, 5, 2},  // n = 16, boxes of 5
    };
    for (const auto& c : cases) {
        const BoxHybridShape s = shape_of(600, 400, c.amount);
        EXPECT_EQ((std::vector<int>{s.sharpen, s.radius, s.box, s.half_box}), (std::vector<int>{c.sharpen, c.r, c.b, c.m}))
            << c.amount;
    }
    for (float amount : {1e9f, -1e30f, INFINITY}) EXPECT_LE(shape_of(4000, 3000, amount).radius, 4);  // taps stay few
    // A 200-pixel square blurs with five taps: normal masses over unit cells, scaled to 4096, truncated.
    const BoxHybridShape s = shape_of(200, 200, -100.0f);
    ASSERT_EQ(s.radius, 2);
    ASSERT_EQ(s.box, 1);
    int32_t k[5];
    vorlite::tone::box_hybrid_weights(s, k);
    EXPECT_EQ((std::vector<int32_t>(k, k + 5)), (std::vector<int32_t>{251, 1002, 1588, 1002, 251}));
}

// The pass as a plain convolution: box i of b pixels, box r centred on x,
// pixels outside the line replaced by the edge pixel.
std::vector<int> reference_line(const std::vector<int>& v, const BoxHybridShape& s) {
    std::vector<int32_t> k(2 * s.radius + 1);
    vorlite::tone::box_hybrid_weights(s, k.data());
    const int64_t n = static_cast<int64_t>(v.size());
    std::vector<int> out(v.size());
    for (int64_t x = 0; x < n; ++x) {
        int64_t acc = 2048;
        for (int32_t i = 0; i <= 2 * s.radius; ++i) {
            const int64_t first = x - s.half_box + (i - s.radius) * int64_t{s.box};
            for (int64_t q = first; q < first + s.box; ++q) acc += k[i] * v[std::clamp<int64_t>(q, 0, n - 1)];
        }
        const int64_t blur = acc / 4096;
        out[x] = static_cast<int>(std::clamp<int64_t>(s.sharpen ? (3 * v[x] - blur + 1) / 2 : blur, 0, 255));
    }
    return out;
}

TEST(BoxHybridPass, RowsMatchAClampedBoxConvolutionAndColumnsTheTransposedRows) {
    // Single-pixel and wide boxes, reads reaching past both ends, one-pixel rows.
    const struct {
        uint32_t width, height;
        float amount;
    } cases[] = {{37, 3, 300.0f}, {200, 5, -9000.0f}, {13, 2, 40000.0f}, {1, 9, -30000.0f}};
    for (const auto& c : cases) {
        Image image(c.width, c.height);
        const Image before = image;
        const BoxHybridShape s = shape_of(c.width, c.height, c.amount);
        VorBoxHybridSharpenX(&image.bitmap, c.amount);
        for (uint32_t y = 0; y < c.height; ++y) {
            for (int ch = 0; ch < 4; ++ch) {
                std::vector<int> row(c.width);
                for (uint32_t x = 0; x < c.width; ++x) row[x] = before.bytes[(size_t{y} * c.width + x) * 4 + ch];
                const std::vector<int> expected = ch == 3 ? row : reference_line(row, s);
                for (uint32_t x = 0; x < c.width; ++x) ASSERT_EQ(image.at(x, y, ch), expected[x]) << c.amount;
            }
        }
    }
    Image image(23, 41), transposed(41, 23);  // one band of 16 columns and one of 7
    for (uint32_t i = 0; i < 23 * 41 * 4; ++i) transposed.at(i / 4 / 23, i / 4 % 23, i % 4) = image.at(i / 4 % 23, i / 4 / 23, i % 4);
    VorBoxHybridSharpenY(&image.bitmap, -4000.0f);
    VorBoxHybridSharpenX(&transposed.bitmap, -4000.0f);
    for (uint32_t i = 0; i < 23 * 41 * 4; ++i) {
        ASSERT_EQ(transposed.at(i / 4 / 23, i / 4 % 23, i % 4), image.at(i / 4 % 23, i / 4 / 23, i % 4)) << i;
    }
}

TEST(BoxHybridPass, RunningSumFormStoresTheBytesOfTheIntegralLineForm) {
    if (!VORLITE_VECTOR_LANES) GTEST_SKIP() << "without vector lanes every pass takes the integral-line form";
    // Widths around the four-pixel groups and the 16-column bands, lines
    // shorter than the kernel, one-pixel lines, boxes of 1, 3, 5 and wider.
    const struct {
        uint32_t width, height;
        float amount;
    } cases[] = {{1, 1, 100.0f},     {1, 17, -700.0f},   {17, 1, 700.0f},    {2, 3, 9000.0f},
                 {3, 29, -2500.0f},  {5, 6, 100.0f},     {131, 9, 100.0f},   {130, 7, -400.0f},
                 {257, 33, 107.0f},  {255, 61, -420.0f}, {64, 300, 250.0f},  {9, 200, -3000.0f},
                 {31, 47, 60000.0f}, {40, 30, -100.0f},  {129, 128, -5.0f},  {6, 5, -200000.0f}};
    const auto store = [](uint8_t* row, uint8_t* filtered, uint32_t width) { std::memcpy(row, filtered, 4 * width); };
    for (const auto& c : cases) {
        const BoxHybridShape shape = shape_of(c.width, c.height, c.amount);
        for (bool columns : {false, true}) {
            Image fast(c.width, c.height);
            Image reference = fast;
            ASSERT_TRUE(vorlite::tone::box_hybrid_pass_fast(&fast.bitmap, shape, columns)) << c.amount;
            vorlite::tone::box_hybrid_pass_reference(&reference.bitmap, c.amount, columns);
            ASSERT_EQ(fast.bytes, reference.bytes) << c.width << "x" << c.height << " " << c.amount << " " << columns;
        }
        // Both passes streamed together match the reference passes in turn.
        Image both(c.width, c.height);
        Image reference = both;
        ASSERT_EQ(vorlite::tone::box_hybrid_two_passes(&both.bitmap, c.amount, store), vorlite::tone::TwoPasses::done);
        vorlite::tone::box_hybrid_pass_reference(&reference.bitmap, c.amount, false);
        vorlite::tone::box_hybrid_pass_reference(&reference.bitmap, c.amount, true);
        ASSERT_EQ(both.bytes, reference.bytes) << c.width << "x" << c.height << " " << c.amount;
    }
    // A kernel far wider than the line is left to the reference form, untouched.
    Image image(7, 5);
    const std::vector<uint8_t> before = image.bytes;
    EXPECT_FALSE(vorlite::tone::box_hybrid_pass_fast(&image.bitmap, shape_of(7, 5, 1e30f), false));
    EXPECT_EQ(vorlite::tone::box_hybrid_two_passes(&image.bitmap, 1e30f, store), vorlite::tone::TwoPasses::unavailable);
    EXPECT_EQ(image.bytes, before);
}

TEST(BoxHybridPass, ZeroOrUndefinedAmountLeavesBitmapAloneAndAbsurdOnesKeepAlpha) {
    Image image(19, 11);
    const std::vector<uint8_t> before = image.bytes;
    for (float amount : {0.0f, -0.0f, NAN}) VorConvolutionEffectBoxHybridSharpen(&image.bitmap, amount);
    EXPECT_EQ(image.bytes, before);
    for (float amount : {1e30f, -INFINITY}) {
        VorConvolutionEffectBoxHybridSharpen(&image.bitmap, amount);
        for (size_t i = 3; i < before.size(); i += 4) ASSERT_EQ(image.bytes[i], before[i]) << amount;
    }
}

TEST(SharpenEntryPoints, AllRunTheSameTwoPasses) {
    const Image original(61, 47);
    Image expected = original;
    VorConvolutionEffectBoxHybridSharpen(&expected.bitmap, -300.0f);
    for (auto entry : {VorSharpness, VorConvolutionEffectKipSharpen, VorConvolutionProcessorKipSharpen}) {
        Image image = original;
        entry(&image.bitmap, -300.0f);
        EXPECT_EQ(image.bytes, expected.bytes);
    }
    Image tool = original, blended = original;
    VorToolSharpness(&tool.bitmap, nullptr, -300.0);
    EXPECT_EQ(tool.bytes, expected.bytes);
    VorConvolutionProcessorSharpenAndBlendWithOriginal(&blended.bitmap, -300.0f, 1.0f, VOR_BLEND_NORMAL);
    EXPECT_EQ(blended.bytes, expected.bytes);  // a normal blend at full opacity puts the filtered copy in place
    Image antialiased = original, light_blur = original;
    VorConvolutionAntialiasGL(&antialiased.bitmap);
    VorConvolutionEffectBoxHybridSharpen(&light_blur.bitmap, -5.0f);
    EXPECT_EQ(antialiased.bytes, light_blur.bytes);
}

TEST(SharpenAndBlend, RowsBlendedAsTheyFinishGiveTheWholeCopysBlend) {
    // The sharpened picture never exists whole: each row is blended over
    // its original as the passes finish it. It must give the bytes of
    // filtering a full copy and blending that back, in every mode, on
    // pictures small enough for per-pixel blends and large enough for the
    // channel-pair table and its weighted-mean form.
    const struct {
        uint32_t mode;
        float opacity;
    } blends[] = {{VOR_BLEND_NORMAL, 0.5f}, {VOR_BLEND_NORMAL, 0.37f}, {VOR_BLEND_MULTIPLY, 0.8f},
                  {VOR_BLEND_OVERLAY, 1.0f}, {VOR_BLEND_COLOR, 0.6f}, {VOR_BLEND_SCREEN, -0.5f}};
    const std::pair<uint32_t, uint32_t> sizes[] = {{61, 47}, {331, 227}};
    for (const auto& [w, h] : sizes) {
        const Image original(w, h);
        for (const auto& b : blends) {
            for (const float amount : {150.0f, -80.0f}) {
                Image sharpened = original, expected = original, image = original;
                vorlite::tone::box_hybrid_pass_reference(&sharpened.bitmap, amount, false);
                vorlite::tone::box_hybrid_pass_reference(&sharpened.bitmap, amount, true);
                VorBitmapBlendBitmap(&expected.bitmap, &sharpened.bitmap, b.mode, b.opacity);
                VorConvolutionProcessorSharpenAndBlendWithOriginal(&image.bitmap, amount, b.opacity, b.mode);
                EXPECT_EQ(image.bytes, expected.bytes) << w << "x" << h << " mode " << b.mode << " at " << b.opacity;
            }
        }
    }
}

TEST(SoftFocus, HalfTheBlurPlusSixTenthsOfTheOriginal) {
    const Image original(1203, 7);  // five boxes of 3 pixels, reaching past every row
    Image image = original, blurred = original;
    vorlite::tone::box_hybrid_pass_reference(&blurred.bitmap, -100.0f, false);
    vorlite::tone::box_hybrid_pass_reference(&blurred.bitmap, -100.0f, true);
    EXPECT_EQ(VorConvolutionEffectSoftFocus(&image.bitmap), 1);
    for (size_t i = 0; i < image.bytes.size(); ++i) {
        const float sum = 0.6f * original.bytes[i] + 0.5f * blurred.bytes[i];
        ASSERT_EQ(image.bytes[i], i % 4 == 3 ? original.bytes[i] : sum >= 255.0f ? 255 : static_cast<int>(sum)) << i;
    }
}

TEST(SharpnessProcessor, StrengthScalesOnlyTheOpacityAndBadKeysFailUntouched) {
    const struct {
        const char* json;
        double strength;
        int result;
        float amount, opacity;
        uint32_t mode;
    } cases[] = {
        {R"({"amount": 150, "alpha": 0.8})", 0.5, 1, 150.0f, 0.4f, VOR_BLEND_NORMAL},
        {R"({"amount": -250.5, "alpha": 1, "blendMode": "multiply"})", 1.0, 1, -250.5f, 1.0f, VOR_BLEND_MULTIPLY},
        {R"({"alpha": 1})", 1.0, 0, 0.0f, 0.0f, 0},
        {R"({"amount": "100", "alpha": 1})", 1.0, 0, 0.0f, 0.0f, 0},
        {R"([100, 1])", 1.0, 0, 0.0f, 0.0f, 0},
    };
    const Image original(50, 37);
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    for (const auto& c : cases) {
        yajl_val params = yajl_tree_parse(c.json, nullptr, 0);
        options.strength = c.strength;
        Image image = original, expected = original;
        EXPECT_EQ(VLPLRunSharpnessProcessor(params, &image.bitmap, &options), c.result) << c.json;
        if (c.result) VorConvolutionProcessorSharpenAndBlendWithOriginal(&expected.bitmap, c.amount, c.opacity, c.mode);
        EXPECT_EQ(image.bytes, expected.bytes) << c.json;
        yajl_tree_free(params);
    }
}

}  // namespace
