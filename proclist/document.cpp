// Loading, unloading and running effect documents. The handle is the
// parsed yajl tree itself; running only reads it.
#include <yajl/yajl_tree.h>

#include "proclist_internal.h"

namespace {

using vorlite::proclist::member;

// yajl releases its tree recursively, one stack frame per level, so an
// absurdly nested document could exhaust the stack of whoever unloads it.
// No effect needs more than a handful of levels.
constexpr int k_max_nesting = 256;

bool nesting_within_limit(const char* text) {
    int depth = 0;
    bool in_string = false;
    for (const char* p = text; *p != '\0'; ++p) {
        const char c = *p;
        if (in_string) {
            if (c == '\\' && p[1] != '\0') {
                ++p;
            } else if (c == '"') {
                in_string = false;
            }
        } else if (c == '"') {
            in_string = true;
        } else if (c == '[' || c == '{') {
            if (++depth > k_max_nesting) return false;
        } else if (c == ']' || c == '}') {
            --depth;
        }
    }
    return true;
}

bool has_envelope(yajl_val tree) {
    return member(tree, "identifier", yajl_t_string) != nullptr &&
           member(tree, "processors", yajl_t_array) != nullptr;
}

yajl_val tree_of(const VLPLEffectDocument* document) {
    return reinterpret_cast<yajl_val>(const_cast<VLPLEffectDocument*>(document));
}

}  // namespace

extern "C" {

VOR_API VLPLEffectDocument* VLPLLoadEffect(const char* json) {
    if (json == nullptr || !nesting_within_limit(json)) return nullptr;
    char error[8];
    const yajl_val tree = yajl_tree_parse(json, error, sizeof error);
    if (tree == nullptr) return nullptr;
    // Deliberately not released: a failed load keeps the loader's long-standing
    // behaviour, which hosts were built against. The fuzz target suppresses
    // exactly this leak and no other.
    if (!has_envelope(tree)) return nullptr;
    return reinterpret_cast<VLPLEffectDocument*>(tree);
}

VOR_API void VLPLUnloadEffect(VLPLEffectDocument** document) {
    if (document == nullptr) return;
    yajl_tree_free(tree_of(*document));
    *document = nullptr;
}

VOR_API int VLPLRunEffect(const VLPLEffectDocument* document, VorBitmap* bitmap,
                          const VLPLRunOptions* options) {
    if (document == nullptr || bitmap == nullptr) return 0;
    if (options == nullptr) return 0;
    const yajl_val tree = tree_of(document);
    if (member(tree, "identifier", yajl_t_string) == nullptr) return 0;
    const yajl_val processors = member(tree, "processors", yajl_t_array);
    if (processors == nullptr) return 0;

    VorBitmapBeginGLEffectIfEnabled(bitmap);
    const size_t count = YAJL_GET_ARRAY(processors)->len;
    const yajl_val* elements = YAJL_GET_ARRAY(processors)->values;
    for (size_t i = 0; i < count; ++i) {
        // No rollback and no closing hook on failure: the accelerated path
        // discards its state when a run is abandoned.
        if (!VLPLRunProcessor(elements[i], bitmap, options)) return 0;
    }
    VorBitmapEndGLEffectIfEnabled(bitmap);
    return 1;
}

}  // extern "C"
