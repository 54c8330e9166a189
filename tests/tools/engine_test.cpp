#include <gtest/gtest.h>

#include <cstring>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::rgba;
using vorlite::test::TestBitmap;

struct Tool {
    VorToolDrawParams params;
    VorToolDrawState state;
    explicit Tool(int32_t kind) {
        VorToolDrawParamsInit(&params);
        VorToolDrawStateInit(&state);
        params.kind = kind;
        state.kind = kind;
    }
};

VorToolStroke stroke_of(std::vector<VorPoint>& points, double radius, int32_t mode, bool finished) {
    VorToolStroke stroke;
    VorToolStrokeInit(&stroke);
    stroke.points = points.data();
    stroke.count = static_cast<uint32_t>(points.size());
    stroke.radius = radius;
    stroke.mode = mode;
    stroke.finished = finished ? 1 : 0;
    return stroke;
}

TEST(ToolRecords, DefaultsAndTheStateKindLeftToTheHost) {
    VorToolDrawParams params;
    std::memset(&params, 0x5A, sizeof params);
    VorToolDrawParamsInit(&params);
    EXPECT_EQ(params.kind, 0);
    EXPECT_EQ(rgba(params.color), (std::array<int, 4>{255, 255, 255, 255}));
    EXPECT_EQ(params.strength, 1.0);
    EXPECT_EQ(params.skipFullTool + params.redOverlay, 0);
    VorToolDrawState state;
    state.kind = 77;
    VorToolDrawStateInit(&state);
    EXPECT_EQ(state.kind, 77);
    VorToolDrawStateDestroy(&state);
}

TEST(ToolInit, MaskStartsOpaqueOnlyForTheDesaturateBrushAndSkipKeepsACopy) {
    for (const int32_t kind : {1, 3, 12}) {
        TestBitmap image(9, 7), full(9, 7, VorColor{0, 0, 0, 0}), mask(9, 7);
        Tool tool(kind);
        tool.params.skipFullTool = 1;
        VorToolInit(image.get(), full.get(), mask.get(), &tool.params, &tool.state);
        EXPECT_TRUE(full == image) << kind;
        for (const uint8_t byte : mask.bytes) ASSERT_EQ(byte, kind == 1 ? 255 : 0) << kind;
    }
}

TEST(ToolFullImage, TintsWriteTheirColourAndBlendEachTime) {
    TestBitmap image(8, 8);
    Tool tool(7);
    VorToolApplyFullTool(image.get(), &tool.params);
    VorToolApplyFullTool(image.get(), &tool.params);
    EXPECT_EQ(rgba(tool.params.color), (std::array<int, 4>{190, 110, 62, 255}));
    TestBitmap expected(8, 8);
    const VorColor tint{190, 110, 62, 255};
    VorBitmapBlendWithColor(expected.get(), &tint, VOR_BLEND_MULTIPLY, 0.26f);
    VorBitmapBlendWithColor(expected.get(), &tint, VOR_BLEND_MULTIPLY, 0.26f);
    EXPECT_TRUE(image == expected);
}

TEST(ToolFullImage, RedOverlayAndThePaintKindThatLeavesTheImage) {
    TestBitmap image(5, 4);
    Tool tool(3);
    tool.params.redOverlay = 1;
    VorToolApplyFullTool(image.get(), &tool.params);
    for (std::size_t i = 0; i < 20; ++i) EXPECT_EQ(rgba(image.pixel(i)), (std::array<int, 4>{255, 0, 0, image.pixel(i).a}));
    EXPECT_TRUE(image.alpha_kept());
    TestBitmap untouched(5, 4);
    Tool paint(12);
    paint.params.redOverlay = 1;
    VorToolApplyFullTool(untouched.get(), &paint.params);
    Tool unknown(13);
    VorToolApplyFullTool(untouched.get(), &unknown.params);
    EXPECT_TRUE(untouched.unchanged());
}

TEST(ToolStrokes, OnePointIsOneDabAndLeavesTheRectangle) {
    TestBitmap image(40, 20), mask(40, 20, VorColor{0, 0, 0, 0});
    Tool tool(12);
    tool.state.color = VorColor{200, 10, 10, 255};
    std::vector<VorPoint> points{{10, 10}};
    const VorToolStroke stroke = stroke_of(points, 3.0, 1, false);
    VorPoint low{-7, -7}, high{-7, -7};
    VorToolDrawStrokeOutRect(image.get(), mask.get(), &stroke, &tool.params, &tool.state, &low, &high);
    EXPECT_EQ(low.x + low.y + high.x + high.y, -28.0f);
    EXPECT_EQ(rgba(mask.pixel(10 * 40 + 10)), (std::array<int, 4>{200, 10, 10, 255}));
    EXPECT_EQ(mask.at(20, 10, 3), 0);
}

TEST(ToolStrokes, AFinishedTwoPointStrokeEndsAtTheMidpointAndReportsItsPaddedBox) {
    TestBitmap image(40, 20), mask(40, 20, VorColor{0, 0, 0, 0});
    Tool tool(12);
    std::vector<VorPoint> points{{10, 10}, {30, 10}};
    VorToolStroke stroke = stroke_of(points, 2.5, 1, true);
    VorPoint low{}, high{};
    VorToolDrawStrokeOutRect(image.get(), mask.get(), &stroke, &tool.params, &tool.state, &low, &high);
    EXPECT_EQ(mask.at(20, 10, 3), 255);
    EXPECT_EQ(mask.at(29, 10, 3), 0) << "never past the midpoint";
    // Dabs up to x = 20 padded by ceil(2 * 2.5) = 5.
    EXPECT_EQ(high.x, 25.0f);
    EXPECT_EQ(high.y, 15.0f);
    EXPECT_EQ(low.y, 5.0f);
    EXPECT_LT(low.x, 10.0f);
    // The host then advances nextIndex: nothing more is drawn.
    stroke.nextIndex = 2;
    const TestBitmap before = mask;
    VorToolDrawStroke(image.get(), mask.get(), &stroke, &tool.params, &tool.state);
    EXPECT_TRUE(mask == before);
}

TEST(ToolStrokes, ShapeKindsIgnoreTheBrush) {
    for (const int32_t kind : {2, 7, 8, 9, 10, 11, 0, 99}) {
        TestBitmap image(20, 20), mask(20, 20, VorColor{0, 0, 0, 0});
        Tool tool(kind);
        std::vector<VorPoint> points{{5, 5}, {15, 5}, {15, 15}};
        const VorToolStroke stroke = stroke_of(points, 4.0, 1, true);
        VorToolDrawStroke(image.get(), mask.get(), &stroke, &tool.params, &tool.state);
        EXPECT_TRUE(mask.unchanged()) << kind;
    }
}

TEST(ToolStrokes, ColourAwareDesaturateSamplesTheFirstTouchOrTheFixedColour) {
    TestBitmap image(10, 10);
    Tool tool(1);
    std::vector<VorPoint> points{{3, 4}};
    VorToolStroke stroke = stroke_of(points, 2.0, 3, false);
    VorToolFirstDownProcessing(image.get(), &stroke, &tool.params, &tool.state);
    EXPECT_EQ(rgba(tool.state.color), rgba(image.pixel(4 * 10 + 3)));
    stroke.useFixedColor = 1;
    stroke.fixedColor = VorColor{1, 2, 3, 4};
    VorToolFirstDownProcessing(image.get(), &stroke, &tool.params, &tool.state);
    EXPECT_EQ(rgba(tool.state.color), (std::array<int, 4>{1, 2, 3, 4}));
    stroke.mode = 1;
    tool.state.color = VorColor{9, 9, 9, 9};
    VorToolFirstDownProcessing(image.get(), &stroke, &tool.params, &tool.state);
    EXPECT_EQ(tool.state.color.r, 9);
}

TEST(ToolPreview, MixDividesBy256AndClampsItsBox) {
    TestBitmap image(1, 1, VorColor{100, 0, 255, 1}), full(1, 1, VorColor{200, 255, 0, 2});
    TestBitmap mask(1, 1, VorColor{0, 0, 0, 128}), out(1, 1, VorColor{7, 7, 7, 42});
    VorToolRenderPreview(out.get(), image.get(), full.get(), mask.get(), nullptr);
    // (127 * 100 + 128 * 200 + 127) >> 8 = 150; alpha not written.
    EXPECT_EQ(rgba(out.pixel(0)), (std::array<int, 4>{150, 127, 127, 42}));
    mask.bytes[3] = 255;
    VorToolRenderPreview(out.get(), image.get(), full.get(), mask.get(), nullptr);
    EXPECT_EQ(rgba(out.pixel(0)), (std::array<int, 4>{199, 254, 0, 42})) << "full coverage is one level low";

    TestBitmap big_image(30, 20), big_full(30, 20, VorColor{0, 0, 0, 0}), big_mask(30, 20, VorColor{0, 0, 0, 255});
    struct Box {
        int32_t x0, y0, x1, y1;
        uint32_t touched;
    };
    const Box boxes[] = {{5, 6, 9, 8, 15},         {9, 8, 5, 6, 15},   {-100, -5, 2, 0, 3},
                         {28, 18, 1 << 30, 99, 4}, {30, 0, 40, 5, 0},  {-9, -9, -1, 3, 0},
                         {INT32_MIN, INT32_MIN, INT32_MAX, INT32_MAX, 600}};
    for (const Box& b : boxes) {
        TestBitmap canvas(30, 20, VorColor{1, 1, 1, 1});
        VorToolRenderPreviewBox(canvas.get(), big_image.get(), big_full.get(), big_mask.get(), b.x0, b.y0, b.x1, b.y1,
                                nullptr);
        uint32_t touched = 0;
        for (std::size_t i = 0; i < 600; ++i) touched += canvas.pixel(i).r == 0 ? 1 : 0;
        EXPECT_EQ(touched, b.touched) << b.x0 << "," << b.y0 << " " << b.x1 << "," << b.y1;
    }
    TestBitmap wrong(29, 20);
    VorToolRenderPreview(wrong.get(), big_image.get(), big_full.get(), big_mask.get(), nullptr);
    EXPECT_TRUE(wrong.unchanged());
}

TEST(ToolPreview, EveryCoverageMixesEveryColumnAsTheRuleSays) {
    // Every coverage in a row, bytes biased to the extremes, boxes that
    // start and end at every column offset: pixels taken four at a time
    // and the rest one by one must all follow the one rule.
    constexpr uint32_t width = 263, height = 3;
    TestBitmap image(width, height), full(width, height), mask(width, height);
    uint32_t state = 12345;
    const auto next = [&state] {
        state = state * 1664525u + 1013904223u;
        const uint32_t v = state >> 24;
        return static_cast<uint8_t>(v < 32 ? 0 : v > 223 ? 255 : v);
    };
    for (uint32_t i = 0; i < width * height; ++i) {
        for (int c = 0; c < 4; ++c) {
            image.bytes[4 * i + c] = next();
            full.bytes[4 * i + c] = next();
        }
        mask.bytes[4 * i + 3] = static_cast<uint8_t>(i % 256);
    }
    for (const int32_t x0 : {0, 1, 2, 3, 5}) {
        for (const int32_t x1 : {static_cast<int32_t>(width) - 1, 200, 7, 9}) {
            TestBitmap out(width, height, VorColor{9, 9, 9, 42});
            VorToolRenderPreviewBox(out.get(), image.get(), full.get(), mask.get(), x0, 0, x1, 2, nullptr);
            for (uint32_t i = 0; i < width * height; ++i) {
                const auto x = static_cast<int32_t>(i % width);
                const uint32_t m = mask.bytes[4 * i + 3];
                for (int c = 0; c < 4; ++c) {
                    const uint32_t mixed = ((255 - m) * image.bytes[4 * i + c] + m * full.bytes[4 * i + c] + 127) >> 8;
                    const uint32_t expected = c == 3 ? 42 : x >= x0 && x <= x1 ? mixed : 9;
                    ASSERT_EQ(out.bytes[4 * i + c], expected) << "pixel " << i << " channel " << c << " box " << x0
                                                              << ".." << x1;
                }
            }
        }
    }
}

TEST(ToolHiRes, PaintStateCompositesWhateverTheParametersSayOthersBlendThroughTheMask) {
    TestBitmap photo(16, 12), mask(16, 12);
    Tool tool(3);
    tool.state.kind = 12;
    TestBitmap expected = photo;
    VorBitmapCompositePremultiplied(expected.get(), expected.get(), mask.get(), 0);
    VorToolRenderHiRes(photo.get(), mask.get(), &tool.params, &tool.state);
    EXPECT_TRUE(photo == expected);

    TestBitmap photo2(16, 12);
    Tool red(4);
    TestBitmap full = photo2;
    VorRedEye(full.get(), full.get());
    TestBitmap expected2 = photo2;
    VorBitmapBlendBitmapMask(expected2.get(), expected2.get(), full.get(), mask.get(), 0);
    VorToolRenderHiRes(photo2.get(), mask.get(), &red.params, &red.state);
    EXPECT_TRUE(photo2 == expected2);
}

}  // namespace
