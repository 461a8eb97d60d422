// The package's header, applied.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-run-log.h"
#include "spec/zel-svc-parse-context.h"
#include "spec/zel-svc-spec-file.h"
#include "zel-svc.h"

void zel_svc_config_install_header() {
    zel_svc_guarded([] { zel_svc_run_log("[Config/Start] Install header.\n"); });
    // A header that holds networks resolves them in the first SIM's database, whatever an earlier run left set.
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_FULL;
    zel_svc_guarded([] { zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, ZEL_SVC_SPEC_HEADER_PATH, 1); });
    zel_svc_guarded([] { zel_svc_run_log("[Config/Ended] Install header.\n"); });
}
