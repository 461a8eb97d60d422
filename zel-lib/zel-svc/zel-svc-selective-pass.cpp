#include "zel-svc-selective-pass.h"

#include "base/zel-svc-guard.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-spec-file.h"

namespace {

// The sub set code is not read again: the networks are only resolved here, and it decides nothing there.
constexpr ZelSvcElementRange kNetworkInfo[] = {
    {ZEL_SVC_ELEMENT_GENERAL_INFO, ZEL_SVC_ELEMENT_GENERAL_INFO},
    {ZEL_SVC_ELEMENT_NETWORK_INFO, ZEL_SVC_ELEMENT_SP_CODE},
    {ZEL_SVC_ELEMENT_SP_NAME, ZEL_SVC_ELEMENT_SP_NAME},
};

// A profile's Protocol is applied by the full install only.
constexpr ZelSvcElementRange kConnections[] = {
    {ZEL_SVC_ELEMENT_CONNECTIONS, ZEL_SVC_ELEMENT_TRAFFIC_CLASS},
    {ZEL_SVC_ELEMENT_PROFILE_URL, ZEL_SVC_ELEMENT_DNS_IP_ADDR},
};

constexpr ZelSvcElementRange kBookmark[] = {{ZEL_SVC_ELEMENT_NB_BOOKMARK, ZEL_SVC_ELEMENT_BOOKMARK_URL}};
constexpr ZelSvcElementRange kVoiceMail[] = {{ZEL_SVC_ELEMENT_VOICEMAIL, ZEL_SVC_ELEMENT_VOICEMAIL_TEL_NUM}};
constexpr ZelSvcElementRange kEmailAccount[] = {{ZEL_SVC_ELEMENT_ACCOUNT, ZEL_SVC_ELEMENT_POP_BEFORE_SMTP}};
constexpr ZelSvcElementRange kWbAmr[] = {{ZEL_SVC_ELEMENT_NB_WB_AMR, ZEL_SVC_ELEMENT_WB_AMR_CODEC}};
constexpr ZelSvcElementRange kFastDormancy[] = {
    {ZEL_SVC_ELEMENT_NB_FAST_DORMANCY, ZEL_SVC_ELEMENT_FAST_DORMANCY_VERSION}};
constexpr ZelSvcElementRange kMaxPdp[] = {{ZEL_SVC_ELEMENT_NB_MAX_PDP, ZEL_SVC_ELEMENT_MAX_PDP_3G}};

// The counters NbSetting, VoLTE and RCS stay out: their settings are read as children of Setting.
constexpr ZelSvcElementRange kIms[] = {
    {ZEL_SVC_ELEMENT_IMS_SETTING, ZEL_SVC_ELEMENT_IMS_SETTING},
    {ZEL_SVC_ELEMENT_IMS_SETTING_SETTING, ZEL_SVC_ELEMENT_ENABLE_IMS},
    {ZEL_SVC_ELEMENT_ENABLE_VOLTE, ZEL_SVC_ELEMENT_ENABLE_SMS_OVER_IP},
    {ZEL_SVC_ELEMENT_ENABLE_RCS, ZEL_SVC_ELEMENT_ENABLE_RCS_CHAT},
};

constexpr ZelSvcElementRange kAutoFlags[] = {{ZEL_SVC_ELEMENT_NETWORK, ZEL_SVC_ELEMENT_AUTO_MAX_PDP}};

// clang-format off
constexpr std::array<ZelSvcSelectivePass, ZEL_SVC_PASS_COUNT> kPasses{{
    {.auto_flag = ZEL_SVC_AUTO_NEVER,         .elements = kNetworkInfo,  .group = ZEL_SVC_PASS_NO_GROUP},
    {.auto_flag = ZEL_SVC_AUTO_PROFILE,       .elements = kConnections,  .group = ZEL_SVC_DATA_CONNECTION},
    {.auto_flag = ZEL_SVC_AUTO_BOOKMARK,      .elements = kBookmark,     .group = ZEL_SVC_DATA_BOOKMARK},
    {.auto_flag = ZEL_SVC_AUTO_VOICEMAIL,     .elements = kVoiceMail,    .group = ZEL_SVC_DATA_VOICE_MAIL},
    {.auto_flag = ZEL_SVC_AUTO_EMAIL_ACCOUNT, .elements = kEmailAccount, .group = ZEL_SVC_DATA_EMAIL_ACCOUNT},
    {.auto_flag = ZEL_SVC_AUTO_WB_AMR,        .elements = kWbAmr,        .group = ZEL_SVC_DATA_WB_AMR},
    {.auto_flag = ZEL_SVC_AUTO_FAST_DORMANCY, .elements = kFastDormancy, .group = ZEL_SVC_DATA_FAST_DORMANCY},
    {.auto_flag = ZEL_SVC_AUTO_MAX_PDP,       .elements = kMaxPdp,       .group = ZEL_SVC_DATA_MAX_PDP},
    {.auto_flag = ZEL_SVC_AUTO_NEVER,         .elements = kIms,          .group = ZEL_SVC_DATA_IMS},
}};
// clang-format on

constexpr int element_count(std::span<const ZelSvcElementRange> ranges) {
    int count = 0;
    for (const ZelSvcElementRange &range : ranges)
        count += range.last - range.first + 1;
    return count;
}

constexpr bool every_pass_fits_the_enabled_list() {
    for (const ZelSvcSelectivePass &pass : kPasses)
        if (element_count(pass.elements) > ZEL_SVC_ELEMENT_MAX_ENABLED) return false;
    return true;
}
static_assert(every_pass_fits_the_enabled_list(), "an element beyond the list would silently stay disabled");

bool flag_allows(ZelSvcAutoFlag flag, int wanted) {
    return flag == ZEL_SVC_AUTO_NEVER || gbZelSvcNetworkAutoFlags[static_cast<std::size_t>(flag)] == wanted;
}

} // namespace

const ZelSvcSelectivePass &zel_svc_selective_pass(ZelSvcPass pass) { return kPasses[static_cast<std::size_t>(pass)]; }

void zel_svc_selective_enable(std::span<const ZelSvcElementRange> elements) {
    zel_svc_element_clear_enabled();
    for (const ZelSvcElementRange &range : elements)
        for (int id = range.first; id <= range.last; ++id)
            zel_svc_element_enable(static_cast<ZelSvcElementId>(id));
}

bool zel_svc_selective_parse(std::span<const ZelSvcElementRange> elements, ZelSvcParseMode mode, const char *path,
                             ZelSvcParseAction action) {
    zel_svc_selective_enable(elements);
    geZelSvcParseMode = mode;
    return zel_svc_spec_parse_file(action, path, 0) == 1;
}

void zel_svc_selective_pass_run(ZelSvcPass id, const ZelSvcPassSequence &sequence, int lap) {
    const ZelSvcSelectivePass &pass = zel_svc_selective_pass(id);
    if (!flag_allows(pass.auto_flag, sequence.wanted_flag)) return;
    const bool has_group = pass.group != ZEL_SVC_PASS_NO_GROUP;
    zel_svc_time_lap_begin(lap);
    zel_svc_guarded([&] {
        if (has_group) zel_svc_data_load(pass.group, sequence.variant, 1);
        zel_svc_selective_parse(pass.elements, sequence.mode, sequence.path.c_str());
    });
    zel_svc_guarded([&] {
        if (has_group) zel_svc_data_dump(pass.group, sequence.variant);
    });
    if (has_group) zel_svc_data_free(pass.group);
    __zel_svc_config_time_lap_end(lap);
}

bool zel_svc_selective_pass_read_auto_flags(const std::string &path, ZelSvcParseAction action) {
    return zel_svc_guarded_or(
        false, [&] { return zel_svc_selective_parse(kAutoFlags, ZEL_SVC_PARSE_MODE_HEADER, path.c_str(), action); });
}
