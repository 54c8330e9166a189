// batch: one loaded document, a pool of workers, a progress report.
#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <atomic>
#include <cstdio>
#include <mutex>
#include <new>
#include <system_error>
#include <thread>
#include <vector>

#include "commands.h"
#include "effect.h"
#include "image.h"

namespace vorlite::cli {
namespace {

namespace fs = std::filesystem;

std::vector<fs::path> photos_in(const fs::path& folder) {
    std::error_code ec;
    if (!fs::is_directory(folder, ec)) throw Failure(folder.string() + ": not a folder");
    std::vector<fs::path> photos;
    for (fs::directory_iterator it(folder, ec), end; !ec && it != end; it.increment(ec)) {
        std::error_code type_error;
        if (it->is_regular_file(type_error) && format_for_path(it->path())) photos.push_back(it->path());
    }
    if (ec) throw Failure(folder.string() + ": cannot list: " + ec.message());
    std::sort(photos.begin(), photos.end());
    return photos;
}

// On a terminal one redrawn bar; otherwise one line per photo, for logs.
// Error lines go to standard error either way.
class Progress {
public:
    Progress(std::size_t total, bool terminal) : total_(total), terminal_(terminal) {}

    void written(const fs::path& input, const fs::path& output) {
        std::lock_guard lock(mutex_);
        ++finished_;
        if (terminal_) {
            draw(input);
        } else {
            std::printf("%s -> %s\n", input.string().c_str(), output.string().c_str());
            std::fflush(stdout);
        }
    }

    void failed(const std::string& line) {
        std::lock_guard lock(mutex_);
        ++finished_;
        ++failures_;
        clear_bar();
        std::fprintf(stderr, "vorlite: %s\n", line.c_str());
        std::fflush(stderr);
        if (terminal_) draw({});
    }

    std::size_t failures() const { return failures_; }

    void summary(const fs::path& output_dir) {
        clear_bar();
        std::printf("batch: %zu of %zu photo%s written to %s", total_ - failures_, total_, total_ == 1 ? "" : "s",
                    output_dir.string().c_str());
        if (failures_ > 0) std::printf(", %zu failed", failures_);
        std::printf("\n");
        std::fflush(stdout);
    }

private:
    void clear_bar() {
        if (!terminal_) return;
        std::fputs("\r\033[K", stdout);
        std::fflush(stdout);
    }

    void draw(const fs::path& latest) {
        winsize size{};
        const int columns = ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col > 20 ? size.ws_col : 80;
        const int bar = std::min(30, columns / 3);
        const int filled = static_cast<int>(bar * finished_ / std::max<std::size_t>(total_, 1));
        std::string line = "[";
        line.append(static_cast<std::size_t>(filled), '#');
        line.append(static_cast<std::size_t>(bar - filled), '.');
        line += "] " + std::to_string(finished_) + "/" + std::to_string(total_) + " ";
        line += latest.filename().string();
        line.resize(std::min(line.size(), static_cast<std::size_t>(columns - 1)));
        std::printf("\r%s\033[K", line.c_str());
        std::fflush(stdout);
    }

    std::mutex mutex_;
    std::size_t total_;
    std::size_t finished_ = 0;
    std::size_t failures_ = 0;
    bool terminal_;
};

}  // namespace

int run_batch(const BatchArgs& args) {
    std::error_code ec;
    if (fs::exists(args.output_dir, ec) && fs::equivalent(args.input_dir, args.output_dir, ec)) {
        throw UsageError(args.output_dir.string() + ": the output folder is the input folder");
    }
    const VLPLRunOptions options = args.run.options();
    const Effect effect = Effect::load(args.effect, options);
    const std::vector<fs::path> photos = photos_in(args.input_dir);
    if (photos.empty()) throw Failure(args.input_dir.string() + ": no PNG or JPEG photos in this folder");
    fs::create_directories(args.output_dir, ec);
    if (ec) throw Failure(args.output_dir.string() + ": cannot create the folder: " + ec.message());

    Progress progress(photos.size(), isatty(STDOUT_FILENO) == 1);
    std::atomic<std::size_t> next{0};
    // Every worker shares the one loaded document: running only reads it.
    auto work = [&] {
        for (std::size_t i; (i = next.fetch_add(1)) < photos.size();) {
            const fs::path& input = photos[i];
            const fs::path output = args.output_dir / input.filename();
            try {
                Image image = read_image(input);
                effect.run(image, options, input);
                write_image(image, output, args.quality);
                progress.written(input, output);
            } catch (const std::bad_alloc&) {
                progress.failed(input.string() + ": out of memory");
            } catch (const std::exception& error) {
                progress.failed(error.what());
            }
        }
    };
    const std::size_t workers = std::min<std::size_t>(std::max(args.jobs, 1u), photos.size());
    std::vector<std::thread> pool;
    for (std::size_t w = 1; w < workers; ++w) {
        try {
            pool.emplace_back(work);
        } catch (const std::system_error&) {
            break;  // fewer threads than asked for still finish the batch
        }
    }
    work();
    for (std::thread& thread : pool) thread.join();
    progress.summary(args.output_dir);
    return progress.failures() == 0 ? 0 : 1;
}

}  // namespace vorlite::cli
