#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace {

struct Pixels {
    VorBitmap bitmap{};
    std::vector<uint8_t> before;
    Pixels() {
        VorBitmapBuild(&bitmap, 5, 3);
        for (uint32_t i = 0; i < 60; ++i) bitmap.data[i] = static_cast<uint8_t>(37 * i + 11);
        before.assign(bitmap.data, bitmap.data + 60);
    }
    ~Pixels() { VorBitmapFree(&bitmap); }
    bool unchanged() const { return std::memcmp(bitmap.data, before.data(), 60) == 0; }
};

VLPLRunOptions defaults() {
    VLPLRunOptions o;
    VorEffectInitParams(&o);
    return o;
}

int run(const char* json, Pixels* pixels) {
    VLPLEffectDocument* doc = VLPLLoadEffect(json);
    if (doc == nullptr) return -1;
    const VLPLRunOptions o = defaults();
    const int result = VLPLRunEffect(doc, &pixels->bitmap, &o);
    VLPLUnloadEffect(&doc);
    EXPECT_EQ(doc, nullptr);
    return result;
}

TEST(EffectLoad, RequiresTheEnvelope) {
    struct Case {
        const char* json;
        bool loads;
    };
    const Case cases[] = {
        {R"({"identifier": "x", "processors": []})", true},
        {R"({"processors": [], "identifier": ""})", true},
        {R"({"identifier": 3, "processors": []})", false},
        {R"({"identifier": "x", "processors": {}})", false},
        {R"({"identifier": "x"})", false},
        {R"(["identifier", "processors"])", false},
        {R"({"identifier": "x", "processors": [)", false},
        {"", false},
        {"null", false},
    };
    for (const Case& c : cases) {
        VLPLEffectDocument* doc = VLPLLoadEffect(c.json);
        EXPECT_EQ(doc != nullptr, c.loads) << c.json;
        VLPLUnloadEffect(&doc);
    }
    EXPECT_EQ(VLPLLoadEffect(nullptr), nullptr);
    VLPLUnloadEffect(nullptr);
    VLPLEffectDocument* none = nullptr;
    VLPLUnloadEffect(&none);
}

TEST(EffectLoad, AbsurdNestingIsRejectedBeforeParsing) {
    std::string deep = R"({"identifier": "x", "processors": [], "deep": )";
    deep += std::string(100000, '[') + std::string(100000, ']') + "}";
    EXPECT_EQ(VLPLLoadEffect(deep.c_str()), nullptr);

    // Brackets inside strings, escaped quotes included, are not nesting.
    std::string quoted = R"({"identifier": "a\"[[[", "processors": [], "s": ")";
    quoted += std::string(100000, '{') + "\"}";
    VLPLEffectDocument* doc = VLPLLoadEffect(quoted.c_str());
    EXPECT_NE(doc, nullptr);
    VLPLUnloadEffect(&doc);

    std::string moderate = R"({"identifier": "x", "processors": [], "n": )";
    moderate += std::string(100, '[') + std::string(100, ']') + "}";
    doc = VLPLLoadEffect(moderate.c_str());
    EXPECT_NE(doc, nullptr);
    VLPLUnloadEffect(&doc);
}

TEST(EffectRun, EmptyAndOriginalLeaveThePixels) {
    Pixels p;
    EXPECT_EQ(run(R"({"identifier": "x", "processors": []})", &p), 1);
    EXPECT_EQ(run(R"({"identifier": "x", "processors": [
        {"name": "original", "parameters": {}},
        {"name": "original", "parameters": {"ignored": [1, 2]}}]})", &p), 1);
    EXPECT_TRUE(p.unchanged());
}

TEST(EffectRun, ProcessorShapeFailuresEndTheRun) {
    const char* failing[] = {
        R"({"identifier": "x", "processors": [{"name": "original"}]})",
        R"({"identifier": "x", "processors": [{"name": "original", "parameters": []}]})",
        R"({"identifier": "x", "processors": [{"name": "Original", "parameters": {}}]})",
        R"({"identifier": "x", "processors": [{"name": 1, "parameters": {}}]})",
        R"({"identifier": "x", "processors": ["original"]})",
        R"({"identifier": "x", "processors": [null]})",
    };
    for (const char* json : failing) {
        Pixels p;
        EXPECT_EQ(run(json, &p), 0) << json;
        EXPECT_TRUE(p.unchanged());
    }
}

TEST(EffectRun, FailureKeepsTheWorkOfEarlierProcessors) {
    const char* two = R"({"name": "noise", "parameters": {"intensity": 0.3}},
                         {"name": "gamma", "parameters": {"value": 1.4}})";
    Pixels expected, actual;
    ASSERT_EQ(run((std::string(R"({"identifier": "x", "processors": [)") + two + "]}").c_str(), &expected), 1);
    EXPECT_FALSE(expected.unchanged());
    EXPECT_EQ(run((std::string(R"({"identifier": "x", "processors": [)") + two +
                   R"(, {"name": "sepia", "parameters": {}}, {"name": "original", "parameters": {}}]})")
                      .c_str(),
                  &actual),
              0);
    EXPECT_EQ(std::memcmp(actual.bitmap.data, expected.bitmap.data, 60), 0);
}

TEST(EffectRun, NullArgumentsFail) {
    Pixels p;
    VLPLEffectDocument* doc = VLPLLoadEffect(R"({"identifier": "x", "processors": []})");
    ASSERT_NE(doc, nullptr);
    const VLPLRunOptions o = defaults();
    EXPECT_EQ(VLPLRunEffect(nullptr, &p.bitmap, &o), 0);
    EXPECT_EQ(VLPLRunEffect(doc, nullptr, &o), 0);
    EXPECT_EQ(VLPLRunEffect(doc, &p.bitmap, nullptr), 0);
    EXPECT_EQ(VLPLRunEffect(doc, &p.bitmap, &o), 1);
    // A document runs any number of times.
    EXPECT_EQ(VLPLRunEffect(doc, &p.bitmap, &o), 1);
    VLPLUnloadEffect(&doc);
    EXPECT_EQ(VLPLRunProcessor(nullptr, &p.bitmap, &o), 0);
}

}  // namespace
