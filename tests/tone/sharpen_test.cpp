#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <vector>

#include "tone/tone_internal.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::tone::BoxHybridShape;

// Bytes leaning toward 0 and 255, alpha distinctive; or one flat grey.
struct Image {
    uint32_t width, height;
    std::vector<uint8_t> bytes;
    VorBitmap bitmap;
    Image(uint32_t w, uint32_t h, int grey = -1) : width(w), height(h), bytes(size_t{w} * h * 4), bitmap{bytes.data(), w, h} {
        uint32_t s = w * 31 + h;
        for (size_t i = 0; i < bytes.size(); ++i) {
            s = s * 1103515245u + 12345u;
            const uint32_t r = s >> 24;
            const uint8_t noise = r < 48 ? 0 : r > 208 ? 255 : static_cast<uint8_t>(r);
            bytes[i] = i % 4 == 3 ? static_cast<uint8_t>(i * 7 + 3) : grey < 0 ? noise : static_cast<uint8_t>(grey);
        }
    }
    Image(const Image& o) : width(o.width), height(o.height), bytes(o.bytes), bitmap{bytes.data(), width, height} {}
    uint8_t& at(uint32_t x, uint32_t y, int c) { return bytes[(size_t{y} * width + x) * 4 + c]; }
};

struct Json {
    yajl_val value;
    explicit Json(const char* text) : value(yajl_tree_parse(text, nullptr, 0)) {}
    ~Json() { yajl_tree_free(value); }
};

TEST(ErrorFunction, ChebyshevErfcFollowsTheTrueCurve) {
    // A mistyped coefficient shows up as an error far above float precision.
    for (float z : {0.0f, 0.05f, 0.3f, 0.7071f, 1.0f, 1.5f, 2.0f, 3.0f, 4.5f, 6.0f}) {
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

// The pass written as a plain convolution: box i of b pixels, box r centred
// on x, pixels outside the line replaced by the edge pixel.
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

TEST(BoxHybridShape, BoxesWidenOnceTheKernelReachesFiveSteps) {
    const struct {
        float amount;
        bool sharpen;
        int32_t r, b, m;
    } cases[] = {
        {100.0f, true, 4, 1, 0},    // s = 2.5: n = 4
        {106.0f, true, 4, 1, 0},    // s = 2.65: n = 4, the last single-pixel box
        {107.0f, true, 2, 3, 1},    // s = 2.675: n = 5, boxes of 3
        {-420.0f, false, 4, 5, 2},  // s = 10.5: n = 16, boxes of 5
    };
    for (const auto& c : cases) {
        const BoxHybridShape s = shape_of(600, 400, c.amount);
        EXPECT_EQ(s.sharpen, c.sharpen) << c.amount;
        EXPECT_EQ(s.radius, c.r) << c.amount;
        EXPECT_EQ(s.box, c.b) << c.amount;
        EXPECT_EQ(s.half_box, c.m) << c.amount;
    }
    // However large the amount, the boxes widen and the taps stay few.
    for (float amount : {1e9f, -1e30f, INFINITY}) EXPECT_LE(shape_of(4000, 3000, amount).radius, 4);
}

TEST(BoxHybridShape, TwoHundredSquareBlurIsFiveTaps) {
    const BoxHybridShape s = shape_of(200, 200, -100.0f);  // s = 1
    ASSERT_EQ(s.radius, 2);
    ASSERT_EQ(s.box, 1);
    int32_t k[5];
    vorlite::tone::box_hybrid_weights(s, k);
    // Normal masses over unit cells, scaled to 4096 and truncated.
    const int32_t expected[5] = {251, 1002, 1588, 1002, 251};
    for (int i = 0; i < 5; ++i) EXPECT_EQ(k[i], expected[i]) << i;
}

TEST(BoxHybridPass, RowsMatchAClampedBoxConvolution) {
    // Single-pixel and wide boxes, reads reaching past both ends, one-pixel rows.
    const struct {
        uint32_t width, height;
        float amount;
    } cases[] = {{37, 3, 300.0f},   {37, 3, -300.0f},   {200, 5, 1500.0f}, {200, 5, -9000.0f},
                 {13, 2, 40000.0f}, {1, 9, -30000.0f}, {64, 64, 12.0f},   {5, 90, -2500.0f}};
    for (const auto& c : cases) {
        Image image(c.width, c.height);
        Image before = image;
        const BoxHybridShape s = shape_of(c.width, c.height, c.amount);
        VorBoxHybridSharpenX(&image.bitmap, c.amount);
        for (uint32_t y = 0; y < c.height; ++y) {
            for (int ch = 0; ch < 4; ++ch) {
                std::vector<int> row(c.width);
                for (uint32_t x = 0; x < c.width; ++x) row[x] = before.at(x, y, ch);
                const std::vector<int> expected = ch == 3 ? row : reference_line(row, s);
                for (uint32_t x = 0; x < c.width; ++x) {
                    ASSERT_EQ(image.at(x, y, ch), expected[x]) << c.amount << " at " << x << "," << y << "/" << ch;
                }
            }
        }
    }
}

TEST(BoxHybridPass, ColumnPassIsTheRowPassOfTheTransposedBitmap) {
    for (float amount : {250.0f, -4000.0f}) {
        Image image(23, 41);  // one band of 16 columns and one of 7
        Image transposed(41, 23);
        for (uint32_t y = 0; y < 41; ++y) {
            for (uint32_t x = 0; x < 23; ++x) {
                for (int c = 0; c < 4; ++c) transposed.at(y, x, c) = image.at(x, y, c);
            }
        }
        VorBoxHybridSharpenY(&image.bitmap, amount);
        VorBoxHybridSharpenX(&transposed.bitmap, amount);
        for (uint32_t y = 0; y < 41; ++y) {
            for (uint32_t x = 0; x < 23; ++x) {
                for (int c = 0; c < 4; ++c) ASSERT_EQ(transposed.at(y, x, c), image.at(x, y, c)) << amount;
            }
        }
    }
}

TEST(BoxHybridPass, FlatImageStaysFlat) {
    const uint32_t sizes[][2] = {{1, 1}, {1, 17}, {17, 1}, {200, 200}};
    for (const auto& size : sizes) {
        for (float amount : {-100.0f, -3000.0f, 250.0f, 5000.0f}) {
            const bool single_pixel_boxes = shape_of(size[0], size[1], amount).box == 1;
            for (int grey : {0, 1, 128, 255}) {
                Image image(size[0], size[1], grey);
                int level = grey;
                for (auto pass : {VorBoxHybridSharpenX, VorBoxHybridSharpenY}) {
                    pass(&image.bitmap, amount);
                    const int v = image.bytes[0];
                    for (size_t i = 0; i < image.bytes.size(); ++i) ASSERT_TRUE(i % 4 == 3 || image.bytes[i] == v) << i;
                    // Truncated single-pixel weights lose under one level:
                    // a blur gives v or v - 1, sharpening v or v + 1.
                    const int moved = amount < 0 ? std::max(level - 1, 0) : std::min(level + 1, 255);
                    EXPECT_TRUE(!single_pixel_boxes || v == level || v == moved) << level << " -> " << v;
                    level = v;
                }
            }
        }
    }
}

TEST(BoxHybridPass, ZeroOrUndefinedAmountLeavesBitmapAlone) {
    Image image(19, 11);
    const std::vector<uint8_t> before = image.bytes;
    for (float amount : {0.0f, -0.0f, NAN}) VorConvolutionEffectBoxHybridSharpen(&image.bitmap, amount);
    EXPECT_EQ(image.bytes, before);
    // Absurd amounts still filter with a handful of taps and keep alpha.
    for (float amount : {1e30f, -INFINITY}) {
        VorConvolutionEffectBoxHybridSharpen(&image.bitmap, amount);
        for (size_t i = 3; i < before.size(); i += 4) ASSERT_EQ(image.bytes[i], before[i]) << amount;
    }
}

TEST(IntegralLine, RunningSumsAlongRowAndDownColumn) {
    Image image(3, 2);
    std::vector<uint32_t> line(12);
    VorBuildIntegralLineX(&image.bitmap, 1, line.data());
    EXPECT_EQ(line[8 + 1], 0u + image.at(0, 1, 1) + image.at(1, 1, 1) + image.at(2, 1, 1));
    VorBuildIntegralLineY(&image.bitmap, 2, line.data());
    EXPECT_EQ(line[4 + 2], 0u + image.at(2, 0, 2) + image.at(2, 1, 2));
}

TEST(SharpenEntryPoints, AllRunTheSameTwoPasses) {
    const Image original(61, 47);
    for (float amount : {120.0f, -300.0f}) {
        Image expected = original;
        VorConvolutionEffectBoxHybridSharpen(&expected.bitmap, amount);
        for (auto entry : {VorSharpness, VorConvolutionEffectKipSharpen, VorConvolutionProcessorKipSharpen}) {
            Image image = original;
            entry(&image.bitmap, amount);
            EXPECT_EQ(image.bytes, expected.bytes) << amount;
        }
        Image tool = original;
        VorToolSharpness(&tool.bitmap, nullptr, amount);
        EXPECT_EQ(tool.bytes, expected.bytes) << amount;
        // A normal blend at full opacity puts the filtered copy in place.
        Image blended = original;
        VorConvolutionProcessorSharpenAndBlendWithOriginal(&blended.bitmap, amount, 1.0f, VOR_BLEND_NORMAL);
        EXPECT_EQ(blended.bytes, expected.bytes) << amount;
    }
    Image antialiased = original;
    Image light_blur = original;
    VorConvolutionAntialiasGL(&antialiased.bitmap);
    VorConvolutionEffectBoxHybridSharpen(&light_blur.bitmap, -5.0f);
    EXPECT_EQ(antialiased.bytes, light_blur.bytes);
}

TEST(SoftFocus, HalfTheBlurPlusSixTenthsOfTheOriginal) {
    Image image(40, 30);
    const Image original = image;
    Image blurred = image;
    VorConvolutionEffectBoxHybridSharpen(&blurred.bitmap, -100.0f);
    EXPECT_EQ(VorConvolutionEffectSoftFocus(&image.bitmap), 1);
    for (size_t i = 0; i < image.bytes.size(); ++i) {
        const float sum = 0.6f * original.bytes[i] + 0.5f * blurred.bytes[i];
        const int expected = i % 4 == 3 ? original.bytes[i] : sum >= 255.0f ? 255 : static_cast<int>(sum);
        ASSERT_EQ(image.bytes[i], expected) << i;
    }
}

TEST(SharpnessProcessor, StrengthScalesOnlyTheOpacity) {
    const struct {
        const char* json;
        double strength;
        float amount, opacity;
        uint32_t mode;
    } cases[] = {
        {R"({"amount": 150, "alpha": 0.8})", 0.5, 150.0f, 0.4f, VOR_BLEND_NORMAL},
        {R"({"amount": -250.5, "alpha": 1, "blendMode": "multiply"})", 1.0, -250.5f, 1.0f, VOR_BLEND_MULTIPLY},
        {R"({"amount": 90, "alpha": 0.7, "blendMode": "screen"})", 0.9, 90.0f, 0.63f, VOR_BLEND_SCREEN},
    };
    const Image original(50, 37);
    for (const auto& c : cases) {
        Json params(c.json);
        VLPLRunOptions options;
        VorEffectInitParams(&options);
        options.strength = c.strength;
        Image image = original;
        Image expected = original;
        EXPECT_EQ(VLPLRunSharpnessProcessor(params.value, &image.bitmap, &options), 1) << c.json;
        VorConvolutionProcessorSharpenAndBlendWithOriginal(&expected.bitmap, c.amount, c.opacity, c.mode);
        EXPECT_EQ(image.bytes, expected.bytes) << c.json;
        EXPECT_NE(image.bytes, original.bytes) << c.json;
    }
}

TEST(SharpnessProcessor, FailsUntouchedOnMissingKeysAndSurvivesAbsurdNumbers) {
    const struct {
        const char* json;
        int result;
    } cases[] = {
        {R"({"alpha": 1})", 0},
        {R"({"amount": 100, "alpha": null})", 0},
        {R"({"amount": "100", "alpha": 1})", 0},
        {R"([100, 1])", 0},
        {R"({"amount": 1e999, "alpha": 1})", 1},
        {R"({"amount": -1e300, "alpha": 1e999})", 1},
    };
    const Image original(17, 5);
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    for (const auto& c : cases) {
        Json params(c.json);
        Image image = original;
        EXPECT_EQ(VLPLRunSharpnessProcessor(params.value, &image.bitmap, &options), c.result) << c.json;
        for (size_t i = 0; i < image.bytes.size(); ++i) {
            const bool kept = c.result == 0 || i % 4 == 3;
            ASSERT_TRUE(!kept || image.bytes[i] == original.bytes[i]) << c.json;
        }
    }
}

}  // namespace
