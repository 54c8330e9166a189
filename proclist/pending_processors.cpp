// Processors whose primitives are not part of this build yet. A document
// naming one fails to run, exactly as a document naming an unknown
// processor does; each adapter moves beside its primitive when that lands.
#include "proclist_internal.h"

#define VORLITE_PENDING_PROCESSOR(name)                                         \
    VOR_API int name(const yajl_val, VorBitmap*, const VLPLRunOptions*) { return 0; }

extern "C" {

VORLITE_PENDING_PROCESSOR(VLPLRunLegacyProcessor)

}  // extern "C"
