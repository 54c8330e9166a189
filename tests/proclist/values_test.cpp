#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

TEST(ColorDecoder, AcceptsIntegersInRangeAndRejectsTheRestUntouched) {
    const struct {
        const char* json;
        VorColor expected;  // {9, 9, 9, 9}: rejected, out left as it was
    } cases[] = {
        {R"({"r": 1, "g": 2, "b": 3, "a": 255})", {1, 2, 3, 255}},
        {R"({"a": 0, "b": 7, "g": 0, "r": 0, "x": "extra"})", {0, 0, 7, 0}},
        {R"({"r": 1, "g": 2, "b": 3, "a": 256})", {9, 9, 9, 9}},
        {R"({"r": -1, "g": 2, "b": 3, "a": 4})", {9, 9, 9, 9}},
        {R"({"r": 1, "g": 2, "b": 3})", {9, 9, 9, 9}},
        {R"({"r": 1, "g": "2", "b": 3, "a": 4})", {9, 9, 9, 9}},
        {R"({"r": 1.5, "g": 2, "b": 3, "a": 4})", {9, 9, 9, 9}},  // fractions are out of integer range
        {R"({"r": 1e2, "g": 2, "b": 3, "a": 4})", {9, 9, 9, 9}},
        {R"({"r": 99999999999999999999, "g": 2, "b": 3, "a": 4})", {9, 9, 9, 9}},
        {R"({"r": -99999999999999999999, "g": 2, "b": 3, "a": 4})", {9, 9, 9, 9}},
        {R"([1, 2, 3, 4])", {9, 9, 9, 9}},
    };
    for (const auto& c : cases) {
        const Json j(c.json);
        ASSERT_NE(j.value, nullptr) << c.json;
        VorColor out{9, 9, 9, 9};
        EXPECT_EQ(VLPLColorFromColorVal(j.value, &out), c.expected.r == 9 ? 0 : 1) << c.json;
        EXPECT_EQ(std::memcmp(&out, &c.expected, 4), 0) << c.json;
    }
    VorColor out{};
    EXPECT_EQ(VLPLColorFromColorVal(nullptr, &out), 0);
}

TEST(BlendModeDecoder, UnknownOrMissingMeansNormalAndNeverFails) {
    const std::pair<const char*, int> cases[] = {
        {R"("normal")", 0}, {R"("overlay")", 1},  {R"("color")", 2},     {R"("screen")", 3},
        {R"("darken")", 4}, {R"("multiply")", 5}, {R"("Multiply")", 0},  {R"("softLight")", 0},
        {R"("")", 0},       {"5", 0},             {R"({"mode": "screen"})", 0}, {nullptr, 0},
    };
    for (const auto& [json, expected] : cases) {
        const Json j(json ? json : "");
        int mode = -1;
        EXPECT_EQ(VLPLBlendModeFromBlendModeVal(j.value, &mode), 1) << json;
        EXPECT_EQ(mode, expected) << json;
    }
}

TEST(BlendAroundIdentity, WeighsIdentityAndValueSeparatelyInSinglePrecision) {
    const float cases[][4] = {
        {2.0f, 1.0f, 0.5f, 1.5f},
        {2.0f, 1.0f, 0.0f, 1.0f},
        {0.3f, 1.0f, 1.0f, 0.3f},
        {2.0f, 1.0f, 2.0f, 3.0f},  // strength extrapolates
        // Where (1 - s) x identity + s x value, summed last, differs in the last
        // bit from identity + s x (value - identity), from a double-precision
        // sum and from a fused multiply-add.
        {0.647f, 1.0f, 0.109f, 0x1.ec4ccp-1f},
        {1.88f, 2.1f, 0.48f, 0x1.fe90fcp+0f},
        {0.23f, 0.86f, 0.64f, 0x1.d3c364p-2f},
    };
    for (const auto& c : cases) EXPECT_EQ(VLPLBlendAroundIdentity(c[0], c[1], c[2]), c[3]) << c[0] << " " << c[1] << " " << c[2];
}

// Blending with a colour, the intensity map and sharpening lay their result
// over the picture with one shared reading of "alpha" and "blendMode".
TEST(LayeringKeys, AlphaIsRequiredAndAnyModeButAKnownNameIsNormal) {
    std::string levels = "[";
    for (int i = 0; i < 256; ++i) levels += std::to_string(255 - i) + (i < 255 ? "," : "]");
    const std::pair<Adapter, std::string> adapters[] = {
        {VLPLRunBlendWithColorProcessor, R"("color": {"r": 200, "g": 40, "b": 90, "a": 255})"},
        {VLPLRunIntensityMapProcessor, R"("histMap": {"r": )" + levels + R"(, "g": )" + levels + R"(, "b": )" + levels + "}"},
        {VLPLRunSharpnessProcessor, R"("amount": 2000)"},
    };
    for (const auto& [adapter, keys] : adapters) {
        const auto after = [&, &keys = keys, adapter = adapter](const std::string& more, int result) {
            TestBitmap b(23, 17);
            EXPECT_EQ(run(adapter, "{" + keys + more + "}", b.get(), 0.9), result) << keys.substr(0, 12) << more;
            return b;
        };
        EXPECT_TRUE(after("", 0).unchanged());
        EXPECT_TRUE(after(R"(, "alpha": "0.7", "blendMode": "multiply")", 0).unchanged());
        const TestBitmap normal = after(R"(, "alpha": 0.7, "blendMode": "normal")", 1);
        EXPECT_FALSE(normal.unchanged()) << keys.substr(0, 12);
        for (const char* mode : {"", R"(, "blendMode": 5)", R"(, "blendMode": {"m": 5})", R"(, "blendMode": "Multiply")"})
            EXPECT_EQ(after(std::string(R"(, "alpha": 0.7)") + mode, 1).bytes, normal.bytes) << keys.substr(0, 12) << mode;
        EXPECT_NE(after(R"(, "alpha": 0.7, "blendMode": "multiply")", 1).bytes, normal.bytes) << keys.substr(0, 12);
    }
}

}  // namespace
