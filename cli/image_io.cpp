// PNG through libpng, JPEG through libjpeg-turbo, orientation through libexif.
#include <csetjmp>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <cerrno>
#include <fstream>
#include <memory>

// jpeglib.h needs size_t and FILE declared before it.
#include <jpeglib.h>
#include <jerror.h>
#include <libexif/exif-data.h>
#include <png.h>
#include <zlib.h>

#include "image.h"

namespace vorlite::cli {
namespace {

// The library's largest bitmap; anything bigger could not be processed.
constexpr uint64_t kMaxPixels = 0x3FFFFFFF;

void check_size(const std::filesystem::path& path, uint64_t width, uint64_t height) {
    if (width == 0 || height == 0) throw Failure(path.string() + ": the image has no pixels");
    if (width * height > kMaxPixels) {
        throw Failure(path.string() + ": " + std::to_string(width) + " x " + std::to_string(height) +
                      " pixels is more than one bitmap can hold");
    }
}

void write_file(const std::filesystem::path& path, const void* data, std::size_t size) {
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    if (!out) throw Failure(path.string() + ": cannot create: " + std::strerror(errno));
    out.write(static_cast<const char*>(data), static_cast<std::streamsize>(size));
    out.close();
    if (!out) {
        const int error = errno;
        std::error_code ignored;
        std::filesystem::remove(path, ignored);
        throw Failure(path.string() + ": cannot write: " + std::strerror(error));
    }
}

// ---- PNG ---------------------------------------------------------------
// Both directions stream through the file, so a photo is held once, as its
// RGBA pixels, and never also as a compressed copy in memory.

using File = std::unique_ptr<std::FILE, int (*)(std::FILE*)>;

File open_file(const std::filesystem::path& path, const char* mode) {
    return File(std::fopen(path.c_str(), mode), &std::fclose);
}

Image decode_png(const std::filesystem::path& path) {
    const File file = open_file(path, "rb");
    if (!file) throw Failure(path.string() + ": cannot open: " + std::strerror(errno));
    png_image png{};
    png.version = PNG_IMAGE_VERSION;
    if (!png_image_begin_read_from_stdio(&png, file.get())) {
        throw Failure(path.string() + ": not a readable PNG file (" + png.message + ")");
    }
    // 16-bit files without a gamma chunk hold sRGB levels like 8-bit ones,
    // not linear light.
    png.flags |= PNG_IMAGE_FLAG_16BIT_sRGB;
    png.format = PNG_FORMAT_RGBA;
    try {
        check_size(path, png.width, png.height);
        Image image(png.width, png.height);
        if (!png_image_finish_read(&png, nullptr, image.rgba.data(), 0, nullptr)) {
            throw Failure(path.string() + ": not a readable PNG file (" + png.message + ")");
        }
        return image;
    } catch (...) {
        png_image_free(&png);
        throw;
    }
}

struct PngErrors {
    std::jmp_buf jump;
    char message[200];
};

[[noreturn]] void png_fail(png_structp png, png_const_charp message) {
    auto* errors = static_cast<PngErrors*>(png_get_error_ptr(png));
    std::snprintf(errors->message, sizeof errors->message, "%s", message);
    std::longjmp(errors->jump, 1);
}

void png_quiet(png_structp, png_const_charp) {}

// libpng reports errors by a long jump back into this frame, so it holds no
// object with a destructor. An opaque photo is written as RGB: libpng drops
// the alpha byte of each row as it goes, with no RGB copy of the photo.
bool encode_png(const Image* image, std::FILE* file, bool opaque, PngErrors* errors) {
    png_structp png = png_create_write_struct(PNG_LIBPNG_VER_STRING, errors, png_fail, png_quiet);
    if (png == nullptr) {
        std::snprintf(errors->message, sizeof errors->message, "out of memory");
        return false;
    }
    png_infop info = nullptr;
    if (setjmp(errors->jump)) {
        png_destroy_write_struct(&png, &info);
        return false;
    }
    info = png_create_info_struct(png);
    if (info == nullptr) png_error(png, "out of memory");
    png_init_io(png, file);
    png_set_IHDR(png, info, image->width, image->height, 8,
                 opaque ? PNG_COLOR_TYPE_RGB : PNG_COLOR_TYPE_RGB_ALPHA, PNG_INTERLACE_NONE,
                 PNG_COMPRESSION_TYPE_DEFAULT, PNG_FILTER_TYPE_DEFAULT);
    png_set_sRGB_gAMA_and_cHRM(png, info, PNG_sRGB_INTENT_PERCEPTUAL);
    if (const std::optional<int> level = png_level()) {
        png_set_compression_level(png, *level);
    } else {
        // The Paeth predictor with run-length coding: on photographs as
        // small as zlib's level 6 with adaptive filters, or within a tenth,
        // at a fifth of the time.
        png_set_filter(png, 0, PNG_FILTER_PAETH);
        png_set_compression_strategy(png, Z_RLE);
    }
    png_write_info(png, info);
    if (opaque) png_set_filler(png, 0, PNG_FILLER_AFTER);
    for (uint32_t y = 0; y < image->height; ++y) {
        png_write_row(png, image->pixel(0, y));
    }
    png_write_end(png, info);
    png_destroy_write_struct(&png, &info);
    return true;
}

void write_png(const Image& image, const std::filesystem::path& path) {
    File file = open_file(path, "wb");
    if (!file) throw Failure(path.string() + ": cannot create: " + std::strerror(errno));
    PngErrors errors{};
    const bool encoded = encode_png(&image, file.get(), is_opaque(image), &errors);
    const int error = errno;
    const bool closed = std::fclose(file.release()) == 0;
    if (encoded && closed) return;
    std::error_code ignored;
    std::filesystem::remove(path, ignored);
    if (!encoded) throw Failure(path.string() + ": cannot write PNG (" + errors.message + ")");
    throw Failure(path.string() + ": cannot write: " + std::strerror(error));
}

// ---- JPEG --------------------------------------------------------------

struct JpegErrors {
    jpeg_error_mgr manager;
    std::jmp_buf jump;
    char message[JMSG_LENGTH_MAX];
};

[[noreturn]] void jpeg_fail(j_common_ptr info) {
    auto* errors = reinterpret_cast<JpegErrors*>(info->err);
    info->err->format_message(info, errors->message);
    std::longjmp(errors->jump, 1);
}

// Warnings stay quiet, except for a file that ends before its last scan:
// the decoder would fill the missing rows with grey and report success.
void jpeg_warn(j_common_ptr info, int level) {
    if (level < 0 && info->err->msg_code == JWRN_JPEG_EOF) jpeg_fail(info);
}

void install_errors(jpeg_error_mgr* manager, JpegErrors* errors) {
    jpeg_std_error(manager);
    manager->error_exit = jpeg_fail;
    manager->emit_message = jpeg_warn;
    errors->message[0] = '\0';
}

// The decoder reports errors by a long jump back into this frame, so it
// holds no object with a destructor; the result goes to the caller's image.
bool decode_jpeg(const std::string* file, Image* image, uint64_t* too_large, JpegErrors* errors) {
    jpeg_decompress_struct info{};
    info.err = &errors->manager;
    install_errors(&errors->manager, errors);
    if (setjmp(errors->jump)) {
        jpeg_destroy_decompress(&info);
        return false;
    }
    jpeg_create_decompress(&info);
    jpeg_mem_src(&info, reinterpret_cast<const unsigned char*>(file->data()),
                 static_cast<unsigned long>(file->size()));
    jpeg_read_header(&info, TRUE);
    if (uint64_t{info.image_width} * info.image_height > kMaxPixels) {
        too_large[0] = info.image_width;
        too_large[1] = info.image_height;
        jpeg_destroy_decompress(&info);
        return false;
    }
    info.out_color_space = JCS_EXT_RGBA;
    jpeg_start_decompress(&info);
    image->width = info.output_width;
    image->height = info.output_height;
    image->rgba.resize(std::size_t{4} * info.output_width * info.output_height);
    while (info.output_scanline < info.output_height) {
        JSAMPROW row = image->pixel(0, info.output_scanline);
        jpeg_read_scanlines(&info, &row, 1);
    }
    jpeg_finish_decompress(&info);
    jpeg_destroy_decompress(&info);
    return true;
}

bool encode_jpeg(const Image* image, int quality, unsigned char** buffer, unsigned long* size,
                 JpegErrors* errors) {
    jpeg_compress_struct info{};
    info.err = &errors->manager;
    install_errors(&errors->manager, errors);
    if (setjmp(errors->jump)) {
        jpeg_destroy_compress(&info);
        return false;
    }
    jpeg_create_compress(&info);
    jpeg_mem_dest(&info, buffer, size);
    info.image_width = image->width;
    info.image_height = image->height;
    info.input_components = 4;
    info.in_color_space = JCS_EXT_RGBA;
    jpeg_set_defaults(&info);
    jpeg_set_quality(&info, quality, TRUE);
    jpeg_start_compress(&info, TRUE);
    while (info.next_scanline < info.image_height) {
        JSAMPROW row = const_cast<uint8_t*>(image->pixel(0, info.next_scanline));
        jpeg_write_scanlines(&info, &row, 1);
    }
    jpeg_finish_compress(&info);
    jpeg_destroy_compress(&info);
    return true;
}

// The EXIF orientation tag of a JPEG, 1 (upright) when there is none.
int exif_orientation(const std::string& file) {
    ExifData* exif = exif_data_new_from_data(reinterpret_cast<const unsigned char*>(file.data()),
                                             static_cast<unsigned int>(file.size()));
    if (exif == nullptr) return 1;
    int orientation = 1;
    ExifEntry* entry = exif_content_get_entry(exif->ifd[EXIF_IFD_0], EXIF_TAG_ORIENTATION);
    if (entry != nullptr && entry->format == EXIF_FORMAT_SHORT && entry->components >= 1 &&
        entry->data != nullptr && entry->size >= 2) {
        orientation = exif_get_short(entry->data, exif_data_get_byte_order(exif));
    }
    exif_data_unref(exif);
    return orientation;
}

Image decode_jpeg_upright(const std::string& file, const std::filesystem::path& path) {
    Image image;
    JpegErrors errors;
    uint64_t too_large[2] = {0, 0};
    if (!decode_jpeg(&file, &image, too_large, &errors)) {
        if (too_large[0] != 0) check_size(path, too_large[0], too_large[1]);
        throw Failure(path.string() + ": not a readable JPEG file (" + errors.message + ")");
    }
    check_size(path, image.width, image.height);
    return orient_upright(image, exif_orientation(file));
}

// The tool's one PNG setting, chosen once from its arguments.
std::optional<int> png_level_choice;

}  // namespace

void set_png_level(std::optional<int> level) { png_level_choice = level; }

std::optional<int> png_level() { return png_level_choice; }

Image read_image(const std::filesystem::path& path) {
    if (require_format(path) == Format::png) {
        std::error_code ec;
        if (std::filesystem::is_directory(path, ec)) throw Failure(path.string() + ": is a folder, not a file");
        return decode_png(path);
    }
    return decode_jpeg_upright(read_file(path), path);
}

void write_image(const Image& image, const std::filesystem::path& path, int quality) {
    if (require_format(path) == Format::png) {
        write_png(image, path);
        return;
    }
    JpegErrors errors;
    unsigned char* buffer = nullptr;
    unsigned long size = 0;
    const bool encoded = encode_jpeg(&image, quality, &buffer, &size, &errors);
    if (!encoded) {
        std::free(buffer);
        throw Failure(path.string() + ": cannot encode JPEG (" + errors.message + ")");
    }
    try {
        write_file(path, buffer, size);
    } catch (...) {
        std::free(buffer);
        throw;
    }
    std::free(buffer);
}

}  // namespace vorlite::cli
