#include "counted-lists.h"

#include <dlfcn.h>
#include <glib.h>

namespace {

int gReleased = 0;

} // namespace

int zel_test::released_lists() { return gReleased; }

// Found before GLib's own by every library of this process.
extern "C" __attribute__((visibility("default"))) void g_list_free(GList *list) {
    static const auto real = reinterpret_cast<void (*)(GList *)>(dlsym(RTLD_NEXT, "g_list_free"));
    if (list) ++gReleased;
    real(list);
}
