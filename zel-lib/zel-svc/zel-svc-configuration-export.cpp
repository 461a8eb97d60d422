// The phone's settings, written out as a customer's file.

#include "base/zel-svc-file-replace.h"
#include "base/zel-svc-file.h"
#include "base/zel-svc-free.h"
#include "base/zel-svc-guard.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-encode.h"
#include "spec/zel-svc-parse-context.h"
#include "zel-svc-configuration-recorded-groups.h"
#include "zel-svc.h"

namespace {

constexpr const char *kDocumentPath = "/opt/system/zel-default/output/customer-phone.xml";

// Null when memory ran out.
ZelSvcOwnedText phone_as_document() {
    const ZelSvcRecordedGroups groups;
    if (!groups.is_whole()) return {};
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_HEADER;
    char *document = nullptr;
    zel_svc_spec_encode_xml(&document);
    return ZelSvcOwnedText{document};
}

bool write_document() {
    const ZelSvcOwnedText document = phone_as_document();
    if (!document || !zel_svc_file_replace(kDocumentPath, document.get())) return false;
    zel_svc_file_set_output_attr(kDocumentPath, "*");
    return true;
}

} // namespace

int zel_svc_config_encoding_xml() {
    return zel_svc_guarded_or(0, [] { return write_document() ? 1 : 0; });
}
