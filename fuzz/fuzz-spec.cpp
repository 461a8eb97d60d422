// Any bytes as a spec file, through the dispatcher to the handlers. The first two bytes choose action, mode
// and filter. Without a phone every platform call of a handler fails.

#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-parse-context.h"
#include "spec/zel-svc-spec-file.h"
#include "spec/zel-svc-verification.h"

#include <array>
#include <cstdlib>

extern "C" int LLVMFuzzerInitialize(int * /*count*/, char *** /*arguments*/) {
    // "/" is never a phone's root: no file of this machine can be reached.
    return setenv("ZEL_ROOT", "/", 1);
}

extern "C" int LLVMFuzzerTestOneInput(const unsigned char *bytes, std::size_t size) {
    constexpr std::array<ZelSvcParseMode, 7> kModes = {
        ZEL_SVC_PARSE_MODE_FULL,          ZEL_SVC_PARSE_MODE_PARTIAL,       ZEL_SVC_PARSE_MODE_CUSTOMER_LIST,
        ZEL_SVC_PARSE_MODE_SECURITY_LOCK, ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_OPERATOR,
        ZEL_SVC_PARSE_MODE_HEADER};
    if (size < 2) return 0;
    geZelSvcParseMode = kModes[bytes[0] % kModes.size()];
    geZelSvcParseAction = bytes[0] % 2 != 0 ? ZEL_SVC_PARSE_ACTION_VERIFY : ZEL_SVC_PARSE_ACTION_INSTALL;
    zel_svc_verification_clear_results();
    zel_svc_element_clear_enabled();
    if (bytes[1] >= 128) zel_svc_element_set_stop(static_cast<ZelSvcElementId>(bytes[1]));
    for (unsigned char row = 0; row < bytes[1] % 50; ++row)
        zel_svc_element_enable(static_cast<ZelSvcElementId>(bytes[1] + row));
    zel_svc_spec_parse_buffer(reinterpret_cast<const char *>(bytes + 2), static_cast<std::int32_t>(size - 2));
    return 0;
}
