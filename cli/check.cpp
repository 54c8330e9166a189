// Checking effect documents against the library.
#include "check.h"

#include <algorithm>
#include <cctype>
#include <cstdio>
#include <cstring>

#include <yajl/yajl_parse.h>

namespace vorlite::cli {
namespace {

constexpr std::size_t kDescriptionLimit = 160;
constexpr std::size_t kArrayItemsShown = 4;
constexpr uint32_t kProbeSize = 16;

std::string kind_of(const yajl_val value) {
    if (value == nullptr) return "missing";
    if (YAJL_IS_STRING(value)) return "a string";
    if (YAJL_IS_NUMBER(value)) return "a number";
    if (YAJL_IS_OBJECT(value)) return "an object";
    if (YAJL_IS_ARRAY(value)) return "an array";
    if (YAJL_IS_TRUE(value)) return "true";
    if (YAJL_IS_FALSE(value)) return "false";
    return "null";
}

// The member of an object, of whatever type, or null.
yajl_val member(const yajl_val object, const char* key) {
    if (!YAJL_IS_OBJECT(object)) return nullptr;
    for (std::size_t i = 0; i < object->u.object.len; ++i) {
        if (std::strcmp(object->u.object.keys[i], key) == 0) return object->u.object.values[i];
    }
    return nullptr;
}

// "has no \"key\" string" or "\"key\" is a number, not a string".
std::string wrong_member(const yajl_val object, const char* key, const char* wanted) {
    const yajl_val value = member(object, key);
    if (value == nullptr) return std::string("has no \"") + key + "\" " + wanted;
    return std::string("\"") + key + "\" is " + kind_of(value) + ", not " +
           (wanted[0] == 'a' || wanted[0] == 'o' ? "an " : "a ") + wanted;
}

void append_quoted(std::string& out, const char* text) {
    out += '"';
    for (const char* p = text; *p != '\0'; ++p) {
        const unsigned char c = static_cast<unsigned char>(*p);
        if (c == '"' || c == '\\') {
            out += '\\';
            out += static_cast<char>(c);
        } else if (c == '\n') {
            out += "\\n";
        } else if (c == '\t') {
            out += "\\t";
        } else if (c < 0x20) {
            char escaped[8];
            std::snprintf(escaped, sizeof escaped, "\\u%04x", c);
            out += escaped;
        } else {
            out += static_cast<char>(c);
        }
    }
    out += '"';
}

void append_json(std::string& out, const yajl_val value) {
    if (out.size() > kDescriptionLimit) return;
    if (YAJL_IS_STRING(value)) {
        append_quoted(out, value->u.string);
    } else if (YAJL_IS_NUMBER(value)) {
        out += value->u.number.r;  // the number exactly as the document wrote it
    } else if (YAJL_IS_OBJECT(value)) {
        out += '{';
        for (std::size_t i = 0; i < value->u.object.len; ++i) {
            if (i > 0) out += ", ";
            append_quoted(out, value->u.object.keys[i]);
            out += ": ";
            append_json(out, value->u.object.values[i]);
        }
        out += '}';
    } else if (YAJL_IS_ARRAY(value)) {
        const std::size_t count = value->u.array.len;
        const std::size_t shown = count > kArrayItemsShown + 1 ? kArrayItemsShown : count;
        out += '[';
        for (std::size_t i = 0; i < shown; ++i) {
            if (i > 0) out += ", ";
            append_json(out, value->u.array.values[i]);
        }
        if (shown < count) out += ", ... " + std::to_string(count) + " items";
        out += ']';
    } else {
        out += kind_of(value);
    }
}

// A small photo-like bitmap on which the processors of a document are tried.
std::vector<uint8_t> probe_pixels() {
    std::vector<uint8_t> pixels(std::size_t{4} * kProbeSize * kProbeSize);
    for (uint32_t i = 0; i < kProbeSize * kProbeSize; ++i) {
        pixels[4 * i + 0] = static_cast<uint8_t>(i);
        pixels[4 * i + 1] = static_cast<uint8_t>(255 - i);
        pixels[4 * i + 2] = static_cast<uint8_t>(i * 7);
        pixels[4 * i + 3] = 255;
    }
    return pixels;
}

}  // namespace

VLPLRunOptions run_options(uint32_t seed, double strength, bool borders) {
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    options.seed = seed;
    options.strength = strength;
    options.bordersEnabled = borders ? 1 : 0;
    return options;
}

std::optional<std::string> json_syntax_error(std::string_view text) {
    yajl_handle parser = yajl_alloc(nullptr, nullptr, nullptr);
    yajl_config(parser, yajl_allow_comments, 1);
    const auto* bytes = reinterpret_cast<const unsigned char*>(text.data());
    yajl_status status = yajl_parse(parser, bytes, text.size());
    // yajl counts the bytes up to and including the one it stopped at; at the
    // end of the text nothing more was consumed.
    std::size_t offset = text.size();
    if (status == yajl_status_ok) {
        status = yajl_complete_parse(parser);
    } else {
        const std::size_t consumed = yajl_get_bytes_consumed(parser);
        offset = consumed > 0 ? consumed - 1 : 0;
    }
    if (status == yajl_status_ok) {
        yajl_free(parser);
        return std::nullopt;
    }
    unsigned char* raw = yajl_get_error(parser, 0, bytes, text.size());
    std::string reason = reinterpret_cast<const char*>(raw);
    yajl_free_error(parser, raw);
    yajl_free(parser);
    while (!reason.empty() && (std::isspace(static_cast<unsigned char>(reason.back())) || reason.back() == '.')) {
        reason.pop_back();
    }
    offset = std::min(offset, text.size());
    const std::size_t newline = offset == 0 ? std::string_view::npos : text.rfind('\n', offset - 1);
    const std::size_t line_start = newline == std::string_view::npos ? 0 : newline + 1;
    const auto line = 1 + std::count(text.begin(), text.begin() + static_cast<std::ptrdiff_t>(offset), '\n');
    const std::size_t column = offset - line_start + 1;
    return "line " + std::to_string(line) + ", column " + std::to_string(column) + ": invalid JSON (" + reason + ")";
}

std::string describe_json(const yajl_val value) {
    std::string out;
    append_json(out, value);
    if (out.size() > kDescriptionLimit) {
        out.resize(kDescriptionLimit - 3);
        out += "...";
    }
    return out;
}

std::optional<std::string> envelope_error(const yajl_val root) {
    if (!YAJL_IS_OBJECT(root)) return "the document is " + kind_of(root) + ", not a JSON object";
    if (!YAJL_IS_STRING(member(root, "identifier"))) return wrong_member(root, "identifier", "string");
    if (!YAJL_IS_ARRAY(member(root, "processors"))) return wrong_member(root, "processors", "array");
    return std::nullopt;
}

std::optional<std::string> processor_error(const yajl_val root, VorBitmap* bitmap,
                                           const VLPLRunOptions& options) {
    const yajl_val processors = member(root, "processors");
    for (std::size_t i = 0; i < processors->u.array.len; ++i) {
        const yajl_val processor = processors->u.array.values[i];
        if (VLPLRunProcessor(processor, bitmap, &options)) continue;
        const std::string where = "processor " + std::to_string(i + 1);
        if (!YAJL_IS_OBJECT(processor)) return where + " is " + kind_of(processor) + ", not an object";
        const yajl_val name = member(processor, "name");
        if (!YAJL_IS_STRING(name)) return where + ": " + wrong_member(processor, "name", "string");
        const std::string named = where + " (" + describe_json(name) + ")";
        const yajl_val parameters = member(processor, "parameters");
        if (!YAJL_IS_OBJECT(parameters)) return named + ": " + wrong_member(processor, "parameters", "object");
        const bool known = std::find(kProcessorNames.begin(), kProcessorNames.end(),
                                     std::string_view(name->u.string)) != kProcessorNames.end();
        if (!known) return named + ": unknown processor (vorlite info lists them)";
        return named + ": rejected its parameters " + describe_json(parameters);
    }
    return std::nullopt;
}

Verdict check_effect(std::string_view text, const VLPLRunOptions& options) {
    // The library reads the document as a C string: it ends at a NUL byte.
    text = text.substr(0, std::min(text.size(), text.find('\0')));
    if (auto error = json_syntax_error(text)) return {error, {}};
    const std::string terminated(text);
    JsonTree tree(yajl_tree_parse(terminated.c_str(), nullptr, 0));
    if (!tree) return {"the JSON parser rejected the document", {}};
    if (auto error = envelope_error(tree.get())) return {error, {}};
    std::vector<uint8_t> pixels = probe_pixels();
    VorBitmap probe{pixels.data(), kProbeSize, kProbeSize};
    if (auto error = processor_error(tree.get(), &probe, options)) return {error, {}};
    Verdict verdict;
    const yajl_val processors = member(tree.get(), "processors");
    for (std::size_t i = 0; i < processors->u.array.len; ++i) {
        verdict.names.emplace_back(member(processors->u.array.values[i], "name")->u.string);
    }
    return verdict;
}

}  // namespace vorlite::cli
