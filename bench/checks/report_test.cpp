#include <gtest/gtest.h>

#include <initializer_list>
#include <sstream>
#include <string>
#include <vector>

#include "report.h"

namespace {

namespace report = vorlite::bench::report;

struct Entry {
    std::string run_name;
    std::string aggregate;  // "median", "mean", or "" for a single iteration run
    double cpu;
    double real;
    std::string unit;
    double pixels;
    std::string label;
    bool error = false;
    double box_pixels = 0.0;  // the work-box counter, when the benchmark sets one
};

std::string json(const std::vector<Entry>& entries) {
    std::ostringstream out;
    out << R"({"context": {"date": "today", "num_cpus": 2, "photo": "coffee.png", "opencv": "4.6.0, threads 1",)"
        << R"( "document": "bench/five.json"}, "benchmarks": [)";
    for (size_t i = 0; i < entries.size(); ++i) {
        const Entry& e = entries[i];
        out << (i ? "," : "") << R"({"name": ")" << e.run_name << "_" << e.aggregate << R"(", "run_name": ")"
            << e.run_name << R"(", "run_type": ")" << (e.aggregate.empty() ? "iteration" : "aggregate")
            << R"(", "repetitions": 5, "aggregate_name": ")" << e.aggregate << R"(", "real_time": )" << e.real
            << R"(, "cpu_time": )" << e.cpu << R"(, "time_unit": ")" << e.unit << R"(", "pixels": )" << e.pixels
            << R"(, "label": ")" << e.label << "\"" << (e.error ? R"(, "error_occurred": true)" : "");
        if (e.box_pixels > 0.0) out << R"(, "box_pixels": )" << e.box_pixels;
        out << "}";
    }
    out << "]}";
    return out.str();
}

report::Run parsed(const std::vector<Entry>& entries) {
    report::Run run;
    std::string error;
    EXPECT_TRUE(report::read_run(json(entries), run, error)) << error;
    return run;
}

// The first line of text that holds every one of parts.
std::string line_with(const std::string& text, std::initializer_list<std::string> parts) {
    std::istringstream lines(text);
    for (std::string line; std::getline(lines, line);) {
        bool all = true;
        for (const std::string& part : parts) all = all && line.find(part) != std::string::npos;
        if (all) return line;
    }
    return "";
}

TEST(BenchReport, ReadsMediansPerPixelInAnyTimeUnit) {
    const report::Run run = parsed({
        {"lut/ours/12MP/min_time:0.300/real_time", "median", 24.0, 30.0, "ms", 12e6, "ours"},
        {"lut/ours/12MP/min_time:0.300/real_time", "mean", 99.0, 99.0, "ms", 12e6, "ours"},
        {"lut/ours/12MP/min_time:0.300/real_time", "", 98.0, 98.0, "ms", 12e6, "ours"},
        {"lut/opencv/1MP/min_time:0.200/real_time", "median", 1500.0, 3000.0, "us", 1e6, "peer"},
        {"lut/vips/1MP/min_time:0.200/real_time", "median", 1.0, 1.0, "ms", 1e6, "failed", true},
    });
    ASSERT_EQ(run.medians.size(), 2u);
    const report::Median& ours = run.medians.at("lut/ours/12MP");
    EXPECT_DOUBLE_EQ(ours.cpu_ns_per_pixel, 2.0);
    EXPECT_DOUBLE_EQ(ours.wall_ns_per_pixel, 2.5);
    EXPECT_EQ(ours.label, "ours");
    EXPECT_DOUBLE_EQ(run.medians.at("lut/opencv/1MP").cpu_ns_per_pixel, 1.5);
    EXPECT_EQ(run.repetitions, 5);
    EXPECT_EQ(run.context.at("photo"), "coffee.png");
    EXPECT_EQ(run.context.count("num_cpus"), 0u);
}

TEST(BenchReport, RejectsTextThatIsNotABenchmarkReport) {
    report::Run run;
    std::string error;
    EXPECT_FALSE(report::read_run(R"({"benchmarks": []})", run, error));
    EXPECT_FALSE(report::read_run("not json", run, error));
    EXPECT_FALSE(error.empty());
}

TEST(BenchReport, JudgesEachGoalByTheRatioOfCpuMedians) {
    report::Inputs inputs;
    inputs.single = parsed({
        {"lut/ours/12MP", "median", 12.0, 50.0, "ms", 12e6, "ours"},
        {"lut/opencv/12MP", "median", 30.0, 30.0, "ms", 12e6, "peer"},
        {"lut/memcpy/12MP", "median", 3.0, 3.0, "ms", 12e6, "floor"},
        {"sharpen/ours/1MP", "median", 9.0, 9.0, "ms", 1e6, "ours"},
        {"sharpen/opencv/1MP", "median", 10.0, 10.0, "ms", 1e6, "peer"},
    });
    inputs.multi = parsed({{"lut/opencv/12MP", "median", 30.0, 8.4, "ms", 12e6, "peer"}});
    const std::string text = report::render(inputs);

    const std::string opencv = line_with(text, {"cv::LUT", "12MP"});
    EXPECT_NE(opencv.find("| 0.40 | <= 0.50 | yes | 0.70 |"), std::string::npos) << opencv;
    const std::string floor = line_with(text, {"memcpy", "12MP"});
    EXPECT_NE(floor.find("| 4.00 | <= 2.00 | **no** |"), std::string::npos) << floor;
    const std::string vips = line_with(text, {"vips_maplut", "12MP"});
    EXPECT_NE(vips.find("| n/a | - | - | n/a |"), std::string::npos) << vips;
    const std::string unmeasured = line_with(text, {"cv::transform", "12MP"});
    EXPECT_NE(unmeasured.find("| n/a | <= 0.60 | n/a |"), std::string::npos) << unmeasured;
    // The sharpening goal holds on the large photo only.
    const std::string small_sharpen = line_with(text, {"unsharp mask", "1MP"});
    EXPECT_NE(small_sharpen.find("| 0.90 | - | - |"), std::string::npos) << small_sharpen;
}

TEST(BenchReport, FlagsGrowthWithSizeAndWithAmount) {
    report::Inputs inputs;
    inputs.single = parsed({
        {"clarity/ours/1MP", "median", 2.0, 2.0, "ms", 1e6, "VorEnhanceClarity"},
        {"clarity/ours/12MP", "median", 36.0, 36.0, "ms", 12e6, "VorEnhanceClarity"},
        {"noise/ours/1MP", "median", 2.0, 2.0, "ms", 1e6, "grain"},
        {"noise/ours/12MP", "median", 30.0, 30.0, "ms", 12e6, "grain"},
        {"sharpen_a50/ours/12MP", "median", 100.0, 100.0, "ms", 12e6, "amount 50"},
        {"sharpen_a400/ours/12MP", "median", 120.0, 120.0, "ms", 12e6, "amount 400"},
        {"lut/memcpy/1MP", "median", 1.0, 1.0, "ms", 1e6, "memcpy"},
        {"lut/memcpy/12MP", "median", 24.0, 24.0, "ms", 12e6, "memcpy"},
        {"autocolors/ours/1MP", "median", 2.0, 2.0, "ms", 1e6, "VorAutoColors"},
        {"autocolors/ours/12MP", "median", 36.0, 36.0, "ms", 12e6, "VorAutoColors"},
    });
    const std::string text = report::render(inputs);

    // Without a cold run the warm growth is judged, and shown as a share of
    // memcpy's (2.00 here).
    EXPECT_NE(line_with(text, {"VorEnhanceClarity: per pixel"}).find("| 1.50 | n/a | <= 1.30 | **no** | 0.75 |"),
              std::string::npos);
    EXPECT_NE(line_with(text, {"grain: per pixel"}).find("| 1.25 | n/a | <= 1.30 | yes |"), std::string::npos);
    EXPECT_NE(line_with(text, {"amount 400 over amount 50"}).find("| 1.20 | - | <= 1.50 | yes |"), std::string::npos);

    // With one, the cold growth is judged; an operation missing from it is not.
    inputs.cold = parsed({
        {"clarity/ours/1MP", "median", 3.0, 3.0, "ms", 1e6, "VorEnhanceClarity"},
        {"clarity/ours/12MP", "median", 36.0, 36.0, "ms", 12e6, "VorEnhanceClarity"},
    });
    const std::string cold = report::render(inputs);
    EXPECT_NE(line_with(cold, {"VorEnhanceClarity: per pixel"}).find("| 1.50 | 1.00 | <= 1.30 | yes | 0.75 |"),
              std::string::npos);
    EXPECT_NE(line_with(cold, {"grain: per pixel"}).find("| 1.25 | n/a | <= 1.30 | n/a |"), std::string::npos);
    // Clarity is judged against memcpy on the large photo; an operation
    // without a peer has a row of its own; the sharpening amounts belong to
    // the growth check.
    EXPECT_NE(line_with(text, {"| VorEnhanceClarity |", "12MP"}).find("| <= 30.00 |"), std::string::npos);
    EXPECT_NE(line_with(text, {"| VorAutoColors |"}).find("| 2.00 | 3.00 | 36.0 |"), std::string::npos);
    EXPECT_EQ(line_with(text, {"| amount 400 |"}), "");
}

TEST(BenchReport, GeneratedEffectsAgainstMemcpyAndFlaresAgainstTheirBoxes) {
    report::Inputs inputs;
    inputs.single = parsed({
        {"vignette/memcpy/1MP", "median", 0.5, 0.5, "ms", 1e6, "memcpy"},
        {"vignette/memcpy/12MP", "median", 12.0, 12.0, "ms", 12e6, "memcpy"},
        {"flare10/ours/1MP", "median", 2.0, 2.0, "ms", 1e6, "stripe2"},
        {"flare10/ours/12MP", "median", 24.0, 24.0, "ms", 12e6, "stripe2", false, 6e6},
        {"flare10_half/ours/12MP", "median", 12.0, 12.0, "ms", 12e6, "stripe2, half", false, 3e6},
        {"flare2/ours/12MP", "median", 40.0, 40.0, "ms", 12e6, "gaussianThing2", false, 4e6},
        {"flare2_half/ours/12MP", "median", 20.0, 20.0, "ms", 12e6, "gaussianThing2, half", false, 1e6},
        {"flare5/ours/12MP", "median", 60.0, 60.0, "ms", 12e6, "angleGaussian", false, 12e6},
        {"flare5_half/ours/12MP", "median", 30.0, 30.0, "ms", 12e6, "angleGaussian, half", false, 12e6},
        {"border_rough/ours/12MP", "median", 36.0, 36.0, "ms", 12e6, "rough frame"},
        {"vignette/ours/12MP", "median", 30.0, 30.0, "ms", 12e6, "vignette"},
    });
    const std::string text = report::render(inputs);

    // Families in their order, numbers by value; ratios over memcpy of each size.
    const size_t vignette = text.find("| vignette |");
    const size_t rough = text.find("| rough frame |");
    const size_t second = text.find("| gaussianThing2 |");
    const size_t tenth = text.find("| stripe2 |");
    ASSERT_NE(vignette, std::string::npos);
    EXPECT_LT(vignette, rough);
    EXPECT_LT(rough, second);
    EXPECT_LT(second, tenth);
    EXPECT_NE(line_with(text, {"| vignette |"}).find("| n/a | 2.50 | 30.0 | n/a | 2.50 | n/a |"), std::string::npos);
    EXPECT_NE(line_with(text, {"| stripe2 |"}).find("| 2.00 | 2.00 | 24.0 | 4.00 | 2.00 | 1.00 |"),
              std::string::npos);
    // Not listed again among the operations without a peer.
    EXPECT_EQ(text.find("| rough frame |"), text.rfind("| rough frame |"));

    // Per box pixel: half the box at half the time holds, a quarter of the
    // box at half the time does not; a whole-image box is not judged.
    EXPECT_NE(line_with(text, {"| stripe2 |", "%"}).find("| 50.0 % | 4.00 | 25.0 % | 4.00 | 1.00 | <= 1.30 | yes |"),
              std::string::npos);
    EXPECT_NE(line_with(text, {"| gaussianThing2 |", "%"}).find("| 10.00 | 8.3 % | 20.00 | 2.00 | <= 1.30 | **no** |"),
              std::string::npos);
    EXPECT_NE(line_with(text, {"| angleGaussian |", "%"}).find("| 100.0 % | 5.00 | 100.0 % | 2.50 | 0.50 | - | - |"),
              std::string::npos);
}

TEST(BenchReport, ListsTheDocumentStepsBeforeTheirTotal) {
    report::Inputs inputs;
    inputs.single = parsed({
        {"doc_total/ours/12MP", "median", 60.0, 60.0, "ms", 12e6, "all five"},
        {"doc_p2_noise/ours/12MP", "median", 24.0, 24.0, "ms", 12e6, "processor 2"},
        {"doc_p1_contrast/ours/12MP", "median", 12.0, 12.0, "ms", 12e6, "processor 1"},
    });
    const std::string text = report::render(inputs);
    const size_t first = text.find("| processor 1 |");
    const size_t second = text.find("| processor 2 |");
    const size_t total = text.find("| all five |");
    ASSERT_NE(total, std::string::npos);
    EXPECT_LT(first, second);
    EXPECT_LT(second, total);
    EXPECT_NE(text.find("bench/five.json"), std::string::npos);
}

TEST(BenchReport, JudgesEachToolCallOnThePreviewInMilliseconds) {
    report::Inputs inputs;
    inputs.single = parsed({
        {"tool_dab_3/ours/1080", "median", 0.25, 0.25, "ms", 1080 * 1080, "dab"},
        {"tool_preview_box/ours/1080", "median", 1.5, 1.5, "ms", 1080 * 1080, "box"},
        {"tool_init_10/ours/1080", "median", 12.0, 12.0, "ms", 1080 * 1080, "init ten"},
        {"tool_init_5/ours/1080", "median", 60.0, 60.0, "ms", 1080 * 1080, "init five"},
        {"tool_preview/ours/1080", "median", 3.0, 3.0, "ms", 1080 * 1080, "whole preview"},
        {"tool_hires_5/ours/12MP", "median", 300.0, 300.0, "ms", 12e6, "hires"},
    });
    const std::string text = report::render(inputs);
    EXPECT_EQ(line_with(text, {"| dab |"}), "| dab | 0.250 | < 1 | yes |");
    EXPECT_EQ(line_with(text, {"| box |"}), "| box | 1.5 | < 1 | **no** |");
    EXPECT_EQ(line_with(text, {"| init five |"}), "| init five | 60.0 | < 50 | **no** |");
    EXPECT_EQ(line_with(text, {"| whole preview |"}), "| whole preview | 3.0 | - | - |");
    EXPECT_LT(text.find("| init five |"), text.find("| init ten |"));
    EXPECT_NE(line_with(text, {"| hires |"}), "");
}

TEST(BenchReport, GivesTheMemoryRatioOrWhyItIsMissing) {
    report::Inputs inputs;
    inputs.single = parsed({});
    inputs.memory.note = "the tool is not built";
    EXPECT_NE(report::render(inputs).find("Not measured: the tool is not built."), std::string::npos);

    inputs.memory = {true, 151e6, 48e6, ""};
    EXPECT_NE(line_with(report::render(inputs), {"| ratio"}).find("3.15 (**no**)"), std::string::npos);
    inputs.memory.peak_bytes = 100e6;
    EXPECT_NE(line_with(report::render(inputs), {"| ratio"}).find("2.08 (yes)"), std::string::npos);
}

}  // namespace
