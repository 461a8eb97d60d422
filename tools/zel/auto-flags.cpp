#include "auto-flags.h"

#include "package-check.h"

#include <spec/zel-svc-element-stack.h>
#include <spec/zel-svc-spec-file.h>

namespace zel_command {
namespace {

constexpr std::array<const char *, ZEL_SVC_AUTO_FLAG_COUNT> kNames{
    "AutoProfile", "AutoVoicemail", "AutoEmailAccount", "AutoBookmark", "AutoLink",
    "AutoSyncML",  "AutoFOTA",      "AutoFastDormancy", "AutoWbAmr",    "AutoMaxPDP"};

} // namespace

std::string customer_file_path(const std::string &customer) {
    const std::string format = ZEL_SVC_SPEC_CUSTOMER_FORMAT;
    const std::size_t place = format.find("%s");
    return format.substr(0, place) + internal_name_of(customer) + format.substr(place + 2);
}

// An empty list of elements would mean all of them. In header mode the end of `Network` sets no key.
bool read_auto_flags(const std::string &path) {
    zel_svc_element_clear_enabled();
    for (int id = ZEL_SVC_ELEMENT_NETWORK; id <= ZEL_SVC_ELEMENT_AUTO_MAX_PDP; ++id)
        zel_svc_element_enable(static_cast<ZelSvcElementId>(id));
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_HEADER;
    gbZelSvcNetworkAutoFlags.fill(0);
    const bool read = zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_VERIFY, path.c_str(), 0) == 1;
    zel_svc_element_clear_enabled();
    return read;
}

std::array<AutoFlag, 10> auto_flags() {
    std::array<AutoFlag, 10> result{};
    for (std::size_t i = 0; i < result.size(); ++i)
        result[i] = {kNames[i], gbZelSvcNetworkAutoFlags[i] == 1};
    return result;
}

} // namespace zel_command
