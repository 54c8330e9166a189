// One loaded effect document run on eight threads at once, each over its
// own bitmap: the library keeps no state between calls and shares only
// tables built once, so every thread's bytes must equal a serial run's.
// Built and run under ThreadSanitizer in CI.
#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

#include "zentra_vorlite.h"

namespace {

std::vector<uint8_t> photo(uint32_t w, uint32_t h, uint32_t seed) {
    std::vector<uint8_t> bytes(std::size_t{w} * h * 4);
    uint32_t s = seed;
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        s = s * 1103515245u + 12345u;
        bytes[i] = i % 4 == 3 ? 255 : static_cast<uint8_t>((i / 4 % w) * 200 / w + (s >> 27));
    }
    return bytes;
}

std::string slurp(const std::string& path) {
    std::ifstream in(path);
    std::stringstream text;
    text << in.rdbuf();
    return text.str();
}

TEST(Threads, OneDocumentOnEightThreadsGivesTheSerialBytes) {
    constexpr uint32_t w = 160, h = 120;
    for (const char* look : {"warm-crisp-grain.json", "cream-print.json", "light-leak.json"}) {
        const std::string text = slurp(std::string(VORLITE_EFFECTS_DIR) + "/" + look);
        VLPLEffectDocument* document = VLPLLoadEffect(text.c_str());
        ASSERT_NE(document, nullptr) << look;
        VLPLRunOptions options;
        VorEffectInitParams(&options);
        options.seed = 5;
        std::vector<std::vector<uint8_t>> serial(8), parallel(8);
        for (uint32_t t = 0; t < 8; ++t) {
            serial[t] = parallel[t] = photo(w, h, t);
            VorBitmap bitmap{serial[t].data(), w, h};
            ASSERT_EQ(VLPLRunEffect(document, &bitmap, &options), 1) << look;
        }
        std::vector<std::thread> threads;
        for (uint32_t t = 0; t < 8; ++t) {
            threads.emplace_back([&, t] {
                VorBitmap bitmap{parallel[t].data(), w, h};
                VLPLRunEffect(document, &bitmap, &options);
            });
        }
        for (std::thread& thread : threads) thread.join();
        for (uint32_t t = 0; t < 8; ++t) EXPECT_EQ(parallel[t], serial[t]) << look << " thread " << t;
        VLPLUnloadEffect(&document);
    }
}

}  // namespace
