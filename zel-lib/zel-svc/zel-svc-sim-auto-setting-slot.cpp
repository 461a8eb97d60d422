#include "zel-svc-sim-auto-setting-slot.h"

#include <vconf.h>

ZelSvcSimNumber zel_svc_sim_number(const char *key) {
    ZelSvcSimNumber number;
    number.result = vconf_get_int(key, &number.value);
    if (number.result != 0) number.value = -1;
    return number;
}
