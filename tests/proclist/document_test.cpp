#include <gtest/gtest.h>

#include <string>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

std::string document(const std::string& processors) { return R"({"identifier": "x", "processors": [)" + processors + "]}"; }

// Loads, runs once with the default options and unloads; -1 when loading fails.
int run_document(const std::string& json, TestBitmap& b) {
    VLPLEffectDocument* doc = VLPLLoadEffect(json.c_str());
    if (doc == nullptr) return -1;
    const VLPLRunOptions o = run_options();
    const int result = VLPLRunEffect(doc, b.get(), &o);
    VLPLUnloadEffect(&doc);
    EXPECT_EQ(doc, nullptr);
    return result;
}

TEST(EffectLoad, RequiresTheEnvelope) {
    const std::pair<const char*, bool> cases[] = {
        {R"({"identifier": "x", "processors": []})", true}, {R"({"processors": [], "identifier": ""})", true},
        {R"({"identifier": 3, "processors": []})", false},  {R"({"identifier": "x", "processors": {}})", false},
        {R"({"identifier": "x"})", false},                  {R"(["identifier", "processors"])", false},
        {R"({"identifier": "x", "processors": [)", false},  {"", false},
        {"null", false},                                    {nullptr, false},
    };
    for (const auto& [json, loads] : cases) {
        VLPLEffectDocument* doc = VLPLLoadEffect(json);
        EXPECT_EQ(doc != nullptr, loads) << json;
        VLPLUnloadEffect(&doc);
    }
    VLPLUnloadEffect(nullptr);
}

TEST(EffectLoad, AbsurdNestingIsRejectedBeforeParsing) {
    const std::pair<std::string, bool> cases[] = {
        {R"({"identifier": "x", "processors": [], "deep": )" + std::string(100000, '[') + std::string(100000, ']') + "}", false},
        {R"({"identifier": "x", "processors": [], "n": )" + std::string(100, '[') + std::string(100, ']') + "}", true},
        // Brackets inside strings, escaped quotes included, are not nesting.
        {R"({"identifier": "a\"[[[", "processors": [], "s": ")" + std::string(100000, '{') + "\"}", true},
    };
    for (const auto& [json, loads] : cases) {
        VLPLEffectDocument* doc = VLPLLoadEffect(json.c_str());
        EXPECT_EQ(doc != nullptr, loads) << json.substr(0, 50);
        VLPLUnloadEffect(&doc);
    }
}

// "original" changes nothing; a malformed processor ends the run before any pixel.
TEST(EffectRun, OriginalLeavesThePixelsAndProcessorShapeFailuresEndTheRun) {
    const std::pair<const char*, int> cases[] = {
        {"", 1}, {R"({"name": "original", "parameters": {}}, {"name": "original", "parameters": {"ignored": [1, 2]}})", 1},
        {R"({"name": "original"})", 0}, {R"({"name": "original", "parameters": []})", 0},
        {R"({"name": "Original", "parameters": {}})", 0}, {R"({"name": 1, "parameters": {}})", 0},
        {R"("original")", 0}, {"null", 0},
    };
    for (const auto& [processors, result] : cases) {
        TestBitmap b(5, 3);
        EXPECT_EQ(run_document(document(processors), b), result) << processors;
        EXPECT_TRUE(b.unchanged()) << processors;
    }
}

TEST(EffectRun, FailureKeepsTheWorkOfEarlierProcessors) {
    const std::string two = R"({"name": "noise", "parameters": {"intensity": 0.3}}, {"name": "gamma", "parameters": {"value": 1.4}})";
    TestBitmap expected(5, 3), actual(5, 3);
    ASSERT_EQ(run_document(document(two), expected), 1);
    EXPECT_FALSE(expected.unchanged());
    EXPECT_EQ(run_document(document(two + R"(, {"name": "sepia", "parameters": {}}, {"name": "original", "parameters": {}})"), actual), 0);
    EXPECT_EQ(actual.bytes, expected.bytes);
}

TEST(EffectRun, NullArgumentsFailAndADocumentRunsAgain) {
    TestBitmap b(5, 3);
    VLPLEffectDocument* doc = VLPLLoadEffect(document("").c_str());
    ASSERT_NE(doc, nullptr);
    const VLPLRunOptions o = run_options();
    EXPECT_EQ(VLPLRunEffect(nullptr, b.get(), &o), 0);
    EXPECT_EQ(VLPLRunEffect(doc, nullptr, &o), 0);
    EXPECT_EQ(VLPLRunEffect(doc, b.get(), nullptr), 0);
    EXPECT_EQ(VLPLRunEffect(doc, b.get(), &o), 1);
    EXPECT_EQ(VLPLRunEffect(doc, b.get(), &o), 1);
    VLPLUnloadEffect(&doc);
    EXPECT_EQ(VLPLRunProcessor(nullptr, b.get(), &o), 0);
}

TEST(ProcessorDispatch, EachNameReachesItsOwnAdapter) {
    std::string levels = "[";
    for (int i = 0; i < 256; ++i) levels += std::to_string(i / 2 + 64) + (i < 255 ? "," : "]");
    const std::string map = R"("histMap": {"r": )" + levels + R"(, "g": )" + levels + R"(, "b": )" + levels + "}";
    const struct {
        const char* name;
        Adapter adapter;
        std::string parameters;
    } cases[] = {
        {"histogramMapping", VLPLRunHistogramMappingProcessor, "{" + map + "}"},
        {"gamma", VLPLRunGammaProcessor, R"({"value": 1.7})"},
        {"colorMatrixTransform", VLPLRunColorMatrixTransformProcessor, R"({"operations": [{"operation": "saturation", "value": 0.3}]})"},
        {"intensityMap", VLPLRunIntensityMapProcessor, "{" + map + R"(, "alpha": 0.9})"},
        {"contrast", VLPLRunContrastProcessor, R"({"value": 1.7})"},
        {"blendWithColor", VLPLRunBlendWithColorProcessor, R"({"color": {"r": 9, "g": 200, "b": 90, "a": 255}, "alpha": 0.6})"},
        {"noise", VLPLRunNoiseProcessor, R"({"intensity": 0.3})"},
        {"sharpness", VLPLRunSharpnessProcessor, R"({"amount": 2000, "alpha": 1})"},
    };
    for (const auto& c : cases) {
        TestBitmap dispatched(23, 17), direct(23, 17);
        const Json processor(R"({"name": ")" + std::string(c.name) + R"(", "parameters": )" + c.parameters + "}");
        const VLPLRunOptions o = run_options(0.8, 5);
        EXPECT_EQ(VLPLRunProcessor(processor.value, dispatched.get(), &o), 1) << c.name;
        EXPECT_EQ(run(c.adapter, c.parameters, direct.get(), 0.8, 5), 1) << c.name;
        EXPECT_FALSE(direct.unchanged()) << c.name;
        EXPECT_EQ(dispatched.bytes, direct.bytes) << c.name;
    }
}

}  // namespace
