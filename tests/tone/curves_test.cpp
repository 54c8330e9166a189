#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// One pixel per level: red = level, green = 255 - level, blue = level,
// alpha a distinctive pattern, so a curve can be read back per level.
struct Ramp {
    std::vector<uint8_t> bytes = std::vector<uint8_t>(256 * 4);
    VorBitmap bitmap{bytes.data(), 16, 16};
    Ramp() {
        for (int i = 0; i < 256; ++i) {
            bytes[4 * i] = static_cast<uint8_t>(i);
            bytes[4 * i + 1] = static_cast<uint8_t>(255 - i);
            bytes[4 * i + 2] = static_cast<uint8_t>(i);
            bytes[4 * i + 3] = static_cast<uint8_t>(i * 13 + 5);
        }
    }
    // The curve as seen through all three channels, which must agree.
    std::array<int, 256> curve() const {
        std::array<int, 256> out{};
        for (int i = 0; i < 256; ++i) {
            out[i] = bytes[4 * i];
            EXPECT_EQ(bytes[4 * (255 - i) + 1], out[i]) << "green at level " << i;
            EXPECT_EQ(bytes[4 * i + 2], out[i]) << "blue at level " << i;
            EXPECT_EQ(bytes[4 * i + 3], static_cast<uint8_t>(i * 13 + 5)) << "alpha";
        }
        return out;
    }
};

std::array<int, 256> contrast(float c) {
    Ramp r;
    VorBitmapContrastCurve(&r.bitmap, c);
    return r.curve();
}

std::array<int, 256> gamma(float g) {
    Ramp r;
    VorBitmapGamma(&r.bitmap, g);
    return r.curve();
}

TEST(ContrastCurve, UpperHalfSitsOneLevelLowAndEndsAt254) {
    const auto unit = contrast(1.0f);
    for (int i = 0; i < 256; ++i) EXPECT_EQ(unit[i], i <= 127 ? i : i - 1) << i;
    const auto flat = contrast(0.0f);  // stands for 1e-8
    for (int i = 1; i <= 254; ++i) EXPECT_EQ(flat[i], 127) << i;
    const auto steep = contrast(2.0f);
    EXPECT_EQ(steep[64], 32);    // (64/127)^2 * 127 + 0.5 = 32.75
    EXPECT_EQ(steep[191], 216);  // (1 + (63/127)^0.5) * 127 + 0.5 = 216.95
    for (float c : {0.0f, -0.0f, 0.3f, 1.0f, 2.0f, 7.5f, 40.0f}) {
        const auto curve = contrast(c);
        EXPECT_EQ(curve[0], 0) << c;
        EXPECT_EQ(curve[255], 254) << c;
        for (int i = 1; i < 256; ++i) ASSERT_LE(curve[i - 1], curve[i]) << c << " " << i;
    }
}

TEST(GammaCurve, SpecialExponents) {
    const auto unit = gamma(1.0f);
    for (int i = 0; i < 256; ++i) EXPECT_EQ(unit[i], i);
    for (int level : gamma(0.0f)) EXPECT_EQ(level, 255);

    struct Case {
        float g;
        int level, expected;
    };
    const Case cases[] = {
        {2.0f, 128, 64},    // 64.25 + 0.5
        {0.5f, 64, 128},    // 127.75 + 0.5
        {-1.0f, 0, 255},    // an infinite power clamps to white
        {-1.0f, 128, 255},  // 508 clamps
    };
    for (const Case& c : cases) EXPECT_EQ(gamma(c.g)[c.level], c.expected) << c.g << " " << c.level;
}

struct Json {
    yajl_val tree;
    explicit Json(const char* text) {
        char error[64];
        tree = yajl_tree_parse(text, error, sizeof error);
        EXPECT_NE(tree, nullptr) << text;
    }
    ~Json() { yajl_tree_free(tree); }
};

using Adapter = int (*)(const yajl_val, VorBitmap*, const VLPLRunOptions*);
using Curve = void (*)(VorBitmap*, float);

struct Processor {
    const char* name;
    Adapter adapter;
    Curve curve;
};

const Processor kProcessors[] = {
    {"contrast", VLPLRunContrastProcessor, VorBitmapContrastCurve},
    {"gamma", VLPLRunGammaProcessor, VorBitmapGamma},
};

VLPLRunOptions at_strength(double strength) {
    VLPLRunOptions o;
    VorEffectInitParams(&o);
    o.strength = strength;
    return o;
}

TEST(CurveProcessors, StrengthPullsTheExponentTowardOne) {
    Json j(R"({"value": 3})");
    for (const Processor& p : kProcessors) {
        for (const auto& [strength, exponent] : {std::pair{1.0, 3.0f}, std::pair{0.5, 2.0f},
                                                 std::pair{0.0, 1.0f}, std::pair{1.5, 4.0f}}) {
            // Strength 0 gives exponent 1: the identity for gamma, the
            // one-level drop of the upper half for contrast.
            Ramp got, expected;
            const VLPLRunOptions o = at_strength(strength);
            ASSERT_EQ(p.adapter(j.tree, &got.bitmap, &o), 1);
            p.curve(&expected.bitmap, exponent);
            EXPECT_EQ(got.bytes, expected.bytes) << p.name << " " << strength;
        }
    }
}

TEST(CurveProcessors, OnlyAMissingOrNonNumericValueFails) {
    const char* cases[] = {R"({})", R"({"value": "2"})", R"({"value": null})",
                           R"({"value": [2]})", R"({"Value": 2})", R"([2])"};
    const char* extremes[] = {R"({"value": 1e999})", R"({"value": -1e999})", R"({"value": -5})"};
    const VLPLRunOptions o = at_strength(1.0);
    for (const Processor& p : kProcessors) {
        for (const char* text : cases) {
            Json j(text);
            Ramp r;
            const std::vector<uint8_t> before = r.bytes;
            EXPECT_EQ(p.adapter(j.tree, &r.bitmap, &o), 0) << p.name << " " << text;
            EXPECT_EQ(r.bytes, before);
        }
        Ramp r;
        EXPECT_EQ(p.adapter(nullptr, &r.bitmap, &o), 0);
        // Infinite or negative exponents saturate without undefined conversions.
        for (const char* text : extremes) {
            Json j(text);
            EXPECT_EQ(p.adapter(j.tree, &r.bitmap, &o), 1) << p.name << " " << text;
        }
    }
}

}  // namespace
