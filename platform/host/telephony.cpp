#include "call.h"

#include <telephony.h>

// A phone whose modems are all off: no names, no connection, no card.

using namespace zel_host;

ZEL_HOST_EXPORT char **tel_get_cp_name_list(void) {
    return answer<function("tel_get_cp_name_list")>([](Phone & /*phone*/) -> char ** { return nullptr; });
}

ZEL_HOST_EXPORT struct tel_handle *tel_init(const char *cp_name) {
    return answer<function("tel_init")>([](Phone & /*phone*/) -> tel_handle * { return nullptr; }, cp_name);
}

ZEL_HOST_EXPORT int tel_get_sim_imsi(struct tel_handle * /*handle*/, struct tel_sim_imsi * /*imsi*/) {
    return answer<function("tel_get_sim_imsi")>([](Phone & /*phone*/) { return -1; });
}

ZEL_HOST_EXPORT int tel_deinit(struct tel_handle * /*handle*/) {
    return answer<function("tel_deinit")>([](Phone & /*phone*/) { return -1; });
}
