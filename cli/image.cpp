// Format by name, orientation, side-by-side comparisons.
#include "image.h"

#include <algorithm>
#include <cctype>
#include <cerrno>
#include <cstring>
#include <fstream>
#include <iterator>

namespace vorlite::cli {

std::optional<Format> format_for_path(const std::filesystem::path& path) {
    std::string ext = path.extension().string();
    std::transform(ext.begin(), ext.end(), ext.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    if (ext == ".png") return Format::png;
    if (ext == ".jpg" || ext == ".jpeg") return Format::jpeg;
    return std::nullopt;
}

Format require_format(const std::filesystem::path& path) {
    if (auto format = format_for_path(path)) return *format;
    throw UsageError(path.string() + ": unsupported image type (use .png, .jpg or .jpeg)");
}

bool is_opaque(const Image& image) {
    for (std::size_t i = 3; i < image.rgba.size(); i += 4) {
        if (image.rgba[i] != 255) return false;
    }
    return true;
}

Image reduced(const Image& image, uint32_t width, uint32_t height) {
    const double step_x = static_cast<double>(image.width) / width;
    const double step_y = static_cast<double>(image.height) / height;
    Image out(width, height);
    for (uint32_t y = 0; y < height; ++y) {
        const auto y0 = static_cast<uint32_t>(y * step_y);
        const auto y1 = std::min(image.height, std::max(y0 + 1, static_cast<uint32_t>((y + 1) * step_y)));
        for (uint32_t x = 0; x < width; ++x) {
            const auto x0 = static_cast<uint32_t>(x * step_x);
            const auto x1 = std::min(image.width, std::max(x0 + 1, static_cast<uint32_t>((x + 1) * step_x)));
            uint64_t sum[4] = {0, 0, 0, 0};
            for (uint32_t sy = y0; sy < y1; ++sy) {
                const uint8_t* p = image.pixel(x0, sy);
                for (uint32_t sx = x0; sx < x1; ++sx, p += 4) {
                    for (int c = 0; c < 4; ++c) sum[c] += p[c];
                }
            }
            const uint64_t n = uint64_t{y1 - y0} * (x1 - x0);
            for (int c = 0; c < 4; ++c) out.pixel(x, y)[c] = static_cast<uint8_t>((sum[c] + n / 2) / n);
        }
    }
    return out;
}

namespace {

// Where an output pixel's centre falls among the source's: the lower
// source index and the weight of the next, in 1/256.
struct Tap {
    uint32_t index;
    uint32_t weight;
};

std::vector<Tap> taps(uint32_t source, uint32_t target) {
    std::vector<Tap> out(target);
    const double scale = static_cast<double>(source) / target;
    for (uint32_t i = 0; i < target; ++i) {
        const double at = std::clamp((i + 0.5) * scale - 0.5, 0.0, static_cast<double>(source - 1));
        const auto index = std::min(static_cast<uint32_t>(at), source - 1);
        const auto weight = index + 1 < source ? static_cast<uint32_t>((at - index) * 256.0 + 0.5) : 0u;
        out[i] = Tap{index, std::min(weight, 256u)};
    }
    return out;
}

}  // namespace

Image enlarged(const Image& image, uint32_t width, uint32_t height) {
    Image out(width, height);
    if (image.width == 0 || image.height == 0) return out;
    const std::vector<Tap> columns = taps(image.width, width);
    const std::vector<Tap> rows = taps(image.height, height);
    for (uint32_t y = 0; y < height; ++y) {
        const Tap row = rows[y];
        const uint32_t below = std::min(row.index + 1, image.height - 1);
        for (uint32_t x = 0; x < width; ++x) {
            const Tap column = columns[x];
            const uint32_t right = std::min(column.index + 1, image.width - 1);
            const uint8_t* a = image.pixel(column.index, row.index);
            const uint8_t* b = image.pixel(right, row.index);
            const uint8_t* c = image.pixel(column.index, below);
            const uint8_t* d = image.pixel(right, below);
            uint8_t* o = out.pixel(x, y);
            for (int k = 0; k < 4; ++k) {
                const uint32_t top = a[k] * (256 - column.weight) + b[k] * column.weight;
                const uint32_t bottom = c[k] * (256 - column.weight) + d[k] * column.weight;
                o[k] = static_cast<uint8_t>((top * (256 - row.weight) + bottom * row.weight + 32768) >> 16);
            }
        }
    }
    return out;
}

Image orient_upright(const Image& image, int exif_orientation) {
    if (exif_orientation < 2 || exif_orientation > 8) return image;
    const uint32_t w = image.width;
    const uint32_t h = image.height;
    // Orientations 5 to 8 store the picture turned by a quarter: rows of the
    // file are columns of the upright photo.
    const bool turned = exif_orientation >= 5;
    Image out(turned ? h : w, turned ? w : h);
    for (uint32_t y = 0; y < h; ++y) {
        for (uint32_t x = 0; x < w; ++x) {
            uint32_t dx = x;
            uint32_t dy = y;
            switch (exif_orientation) {
                case 2: dx = w - 1 - x; break;
                case 3: dx = w - 1 - x; dy = h - 1 - y; break;
                case 4: dy = h - 1 - y; break;
                case 5: dx = y; dy = x; break;
                case 6: dx = h - 1 - y; dy = x; break;
                case 7: dx = h - 1 - y; dy = w - 1 - x; break;
                case 8: dx = y; dy = w - 1 - x; break;
            }
            std::memcpy(out.pixel(dx, dy), image.pixel(x, y), 4);
        }
    }
    return out;
}

Image side_by_side(const Image& left, const Image& right) {
    const uint32_t gap = std::max<uint32_t>(4, std::max(left.width, right.width) / 100);
    Image out(left.width + gap + right.width, std::max(left.height, right.height));
    std::fill(out.rgba.begin(), out.rgba.end(), uint8_t{255});
    auto place = [&out](const Image& part, uint32_t x0) {
        for (uint32_t y = 0; y < part.height; ++y) {
            std::memcpy(out.pixel(x0, y), part.pixel(0, y), std::size_t{4} * part.width);
        }
    };
    place(left, 0);
    place(right, left.width + gap);
    return out;
}

std::string read_file(const std::filesystem::path& path) {
    std::ifstream in(path, std::ios::binary);
    if (!in) throw Failure(path.string() + ": cannot open: " + std::strerror(errno));
    std::error_code ec;
    if (std::filesystem::is_directory(path, ec)) throw Failure(path.string() + ": is a folder, not a file");
    // Sized once from the file's length: growing by appending would hold up
    // to twice a large photo's bytes for a moment. A device or a pipe has no
    // length and is read as it comes.
    const std::uintmax_t length = std::filesystem::file_size(path, ec);
    std::string text(ec ? 0 : static_cast<std::size_t>(length), '\0');
    in.read(text.data(), static_cast<std::streamsize>(text.size()));
    text.resize(static_cast<std::size_t>(in.gcount()));
    text.append(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
    if (in.bad()) throw Failure(path.string() + ": cannot read: " + std::strerror(errno));
    return text;
}

}  // namespace vorlite::cli
