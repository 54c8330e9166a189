// vorlite_bench: the library against OpenCV and libvips on a scaled-up
// sample photo. Besides Google Benchmark's own flags it takes
//   --photo=PATH          the sample photo (PNG or any format OpenCV reads)
//   --document=PATH       a candidate effect document; repeatable, the first
//                         with exactly five processors that runs is used
//   --peer-threads=all    run the peers on every core (default: one thread)
//   --write-photo=PATH    write the 12-megapixel sample as PNG and exit
//   --evict-caches        push each fresh copy out of the core's own caches
//                         before timing the library on it
#include <benchmark/benchmark.h>
#include <cstdio>
#include <cstring>
#include <opencv2/core/version.hpp>
#include <opencv2/imgcodecs.hpp>
#include <opencv2/imgproc.hpp>
#include <string>
#include <vector>
#include <vips/version.h>

#include "peers.h"
#include "photo.h"
#include "runner.h"
#include "suite.h"

namespace {

struct Options {
    std::string photo;
    std::vector<std::string> documents;
    bool all_cores = false;
    bool evict_caches = false;
    std::string write_photo;
};

bool take(const char* arg, const char* flag, std::string& value) {
    const size_t n = std::strlen(flag);
    if (std::strncmp(arg, flag, n) != 0) return false;
    value = arg + n;
    return true;
}

// Removes this program's own flags from argv, leaving Google Benchmark's.
bool parse(int& argc, char** argv, Options& options) {
    int kept = 1;
    for (int i = 1; i < argc; ++i) {
        std::string value;
        if (take(argv[i], "--photo=", value)) {
            options.photo = value;
        } else if (take(argv[i], "--document=", value)) {
            options.documents.push_back(value);
        } else if (take(argv[i], "--peer-threads=", value)) {
            if (value != "1" && value != "all") {
                std::fprintf(stderr, "vorlite_bench: --peer-threads takes 1 or all, not '%s'\n", value.c_str());
                return false;
            }
            options.all_cores = value == "all";
        } else if (std::strcmp(argv[i], "--evict-caches") == 0) {
            options.evict_caches = true;
        } else if (take(argv[i], "--write-photo=", value)) {
            options.write_photo = value;
        } else {
            argv[kept++] = argv[i];
        }
    }
    argc = kept;
    argv[argc] = nullptr;
    if (options.photo.empty()) {
        std::fprintf(stderr, "vorlite_bench: --photo=PATH is required\n");
        return false;
    }
    return true;
}

int write_large_photo(const std::string& path) {
    const cv::Mat& rgba = vorlite::bench::sample(vorlite::bench::kLarge);
    cv::Mat bgr;
    cv::cvtColor(rgba, bgr, cv::COLOR_RGBA2BGR);
    if (!cv::imwrite(path, bgr)) {
        std::fprintf(stderr, "vorlite_bench: cannot write '%s'\n", path.c_str());
        return 1;
    }
    return 0;
}

}  // namespace

int main(int argc, char** argv) {
    using namespace vorlite::bench;
    Options options;
    if (!parse(argc, argv, options)) return 2;
    set_photo_path(options.photo);
    if (load_photo(options.photo, 64, 48).empty()) {
        std::fprintf(stderr, "vorlite_bench: cannot read the sample photo '%s'\n", options.photo.c_str());
        return 1;
    }
    if (!options.write_photo.empty()) return write_large_photo(options.write_photo);
    if (!start_vips(argv[0])) {
        std::fprintf(stderr, "vorlite_bench: libvips did not start\n");
        return 1;
    }
    set_peer_threads(options.all_cores);
    set_evict_private_caches(options.evict_caches);

    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
    add_pairs();
    add_solo();
    add_generated();
    add_tools();
    add_legacy();
    const std::string document = add_document(options.documents);
    if (document.empty() && !options.documents.empty()) {
        std::fprintf(stderr, "vorlite_bench: no candidate document has five processors that run\n");
    }
    benchmark::AddCustomContext("photo", options.photo);
    benchmark::AddCustomContext("document", document);
    benchmark::AddCustomContext("opencv", std::string(CV_VERSION) + ", threads " + std::to_string(opencv_threads()));
    benchmark::AddCustomContext("libvips", std::string(VIPS_VERSION) + ", threads " + std::to_string(vips_threads()));
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
