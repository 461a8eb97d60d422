#include "zel-svc-element-act-ims.h"

#include "base/zel-svc-log.h"
#include "handler/zel-svc-applies.h"
#include "handler/zel-svc-record.h"

namespace {

struct ImsEntry {
    FixedText<40> network_name;
    FixedText<200> enable_ims;
    FixedText<200> enable_volte;
    FixedText<200> enable_voice_over_wifi;
    FixedText<200> enable_video_call;
    FixedText<200> enable_volte_indicator;
    FixedText<200> voice_domain_preference;
    FixedText<200> emergency_call_domain;
    FixedText<200> srvcc_version;
    FixedText<200> ss_domain_preference;
    FixedText<200> ss_ps_control_preference;
    FixedText<200> ss_cs_fallback;
    FixedText<200> ussd_domain_preference;
    FixedText<200> smsoip_domain;
    FixedText<200> enable_sms_over_ip;
    FixedText<200> enable_rcs;
    FixedText<200> joyn;
    FixedText<200> enable_rcs_chat;
};

constexpr Word kTruths[] = {{"false", 0}, {"true", 1}};

// Each value's name in the system log, and where it is recorded. A text that is neither "false" nor "true" is
// kept for the warning that names it.
constexpr FieldRules boolean_as(std::string_view name, const char *section, const char *key) {
    return {.accepts = words(kTruths),
            .others = FieldOthers::Kept,
            .record = {.key = key, .form = FieldForm::Word, .section = section},
            .report = {.label = name}};
}
constexpr FieldRules text_as(std::string_view name, const char *section, const char *key) {
    return {.record = {.key = key, .form = FieldForm::TextIfGiven, .section = section}, .report = {.label = name}};
}
constexpr FieldRules number_as(std::string_view name, const char *section, const char *key) {
    return {.record = {.key = key, .form = FieldForm::NumberIfGiven, .section = section}, .report = {.label = name}};
}

// In the order in which they are written and logged. The network name chooses the entry and is not recorded.
// clang-format off
constexpr Field<ImsEntry> kFields[] = {
    field<&ImsEntry::network_name>            (ZEL_SVC_ELEMENT_SETTING_NETWORK_NAME),
    field<&ImsEntry::enable_ims>              (ZEL_SVC_ELEMENT_ENABLE_IMS,                    boolean_as("EnableIMS",                      "attr",   "enable_ims")),
    field<&ImsEntry::enable_volte>            (ZEL_SVC_ELEMENT_ENABLE_VOLTE,                  boolean_as("EnableVoLTE",                    "volte",  "enable_volte")),
    field<&ImsEntry::enable_voice_over_wifi>  (ZEL_SVC_ELEMENT_ENABLE_VOICE_OVER_WIFI,        boolean_as("EnableVoiceoverWIFI",            "volte",  "enable_vowifi")),
    field<&ImsEntry::enable_video_call>       (ZEL_SVC_ELEMENT_ENABLE_VIDEO_CALL,             boolean_as("EnableVideocall",                "volte",  "enable_video_call")),
    field<&ImsEntry::enable_volte_indicator>  (ZEL_SVC_ELEMENT_ENABLE_VOLTE_INDICATOR,        boolean_as("EnableVoLTEindicator",           "volte",  "enable_indicator")),
    field<&ImsEntry::voice_domain_preference> (ZEL_SVC_ELEMENT_VOICE_DOMAIN_PREFERENCE_EUTRAN,text_as(   "Voice_Domain_Preference_EUTRAN", "volte",  "voice_domain_preference")),
    field<&ImsEntry::emergency_call_domain>   (ZEL_SVC_ELEMENT_EMREGENCY_CALL_DOMAIN,         text_as(   "Emregencycall_Domain",           "volte",  "emergency_call_domain")),
    field<&ImsEntry::srvcc_version>           (ZEL_SVC_ELEMENT_SRVCC_VERSION,                 number_as( "SRVCCversion",                   "volte",  "srvcc_version")),
    field<&ImsEntry::ss_domain_preference>    (ZEL_SVC_ELEMENT_SS_DOMAIN_PREFERENCE,          text_as(   "SS_Domain_Preference",           "volte",  "ss_domain_preference")),
    field<&ImsEntry::ss_ps_control_preference>(ZEL_SVC_ELEMENT_SS_PS_CONTROL_PREFERENCE,      text_as(   "SS_PS_Control_Preference",       "volte",  "ss_ps_control_preference")),
    field<&ImsEntry::ss_cs_fallback>          (ZEL_SVC_ELEMENT_SS_CSFB_WITH_IMS_ERROR,        boolean_as("SS_CSFBwithIMSerror",            "volte",  "ss_cs_fallback")),
    field<&ImsEntry::ussd_domain_preference>  (ZEL_SVC_ELEMENT_USSD_DOMAIN_PREFERENCE,        text_as(   "USSD_Domain_Preference",         "volte",  "ussd_domain_preference")),
    field<&ImsEntry::smsoip_domain>           (ZEL_SVC_ELEMENT_SMSOIP_DOMAIN,                 text_as(   "SMSoIP_Domain",                  "smsoip", "smsoip_domain")),
    field<&ImsEntry::enable_sms_over_ip>      (ZEL_SVC_ELEMENT_ENABLE_SMS_OVER_IP,            boolean_as("EnableSMSoverIP",                "smsoip", "enable_smsoip")),
    field<&ImsEntry::enable_rcs>              (ZEL_SVC_ELEMENT_ENABLE_RCS,                    boolean_as("EnableRCS",                      "rcs",    "enable_rcs")),
    field<&ImsEntry::joyn>                    (ZEL_SVC_ELEMENT_JOYN,                          text_as(   "Joyn",                           "rcs",    "joyn")),
    field<&ImsEntry::enable_rcs_chat>         (ZEL_SVC_ELEMENT_ENABLE_RCS_CHAT,               boolean_as("EnableRCSchat",                  "rcs",    "enable_rcs_chat")),
};
// clang-format on

constexpr std::string_view kDefault = "default";

OpenRecord<ImsEntry> gpZelSvcElementActImsInfoTemp;
// Operator install: what is saved at the end when no entry was the operator's.
std::unique_ptr<ImsEntry> gpZelSvcElementActImsInfoDefaultForAutoSim;
bool gOperatorFound = false;

// A value that was not written is logged only where it should have been one of two words.
void log_value(const Field<ImsEntry> &field, bool written, const char *text) {
    const char *name = field.rules.report.label.data();
    const FieldRecord &record = field.rules.record;
    if (!written) {
        if (record.form == FieldForm::Word) ZEL_SVC_LOG("<Warning>[IMS/%s] Spec='%s' unknown, skip.", name, text);
        return;
    }
    if (record.form == FieldForm::TextIfGiven)
        ZEL_SVC_LOG("[IMS/%s] %s/%s='%s' set.", name, record.section, record.key, text);
    else
        ZEL_SVC_LOG("[IMS/%s] %s/%s=%d set.", name, record.section, record.key,
                    zel_svc_field_number(field.rules, text).value_or(0));
}

void __zel_svc_element_act_ims_save_ini(ImsEntry &entry) {
    for (const Field<ImsEntry> &field : kFields) {
        if (!field.rules.record.key) continue;
        const FieldText text = field.of(entry);
        log_value(field, zel_svc_field_save(ZEL_SVC_DATA_IMS, nullptr, field.rules, 0, text.view()), text.bytes);
    }
}

void begin_entries() {
    gOperatorFound = false;
    if (!gpZelSvcElementActImsInfoDefaultForAutoSim) return;
    ZEL_SVC_LOG("<WARN>[Mem] free(gpZelSvcElementActImsInfoDefaultForAutoSim) call.");
    gpZelSvcElementActImsInfoDefaultForAutoSim.reset();
}

void open_entry() {
    if (gpZelSvcElementActImsInfoTemp) ZEL_SVC_LOG("<WARN>[Mem] free(gpZelSvcElementActImsInfoTemp) call.");
    gpZelSvcElementActImsInfoTemp.open();
}

// The entries of operators wait for the SIM card.
void take_for_pre_configuration(ImsEntry &entry) {
    if (entry.network_name != kDefault) return;
    ZEL_SVC_LOG("[PreConfig] IMS setting / NetworkName='default' information found.");
    __zel_svc_element_act_ims_save_ini(entry);
}

void keep_default(std::unique_ptr<ImsEntry> entry) {
    ZEL_SVC_LOG("[AutoSIM] IMS setting / NetworkName='default' information found.");
    if (gpZelSvcElementActImsInfoDefaultForAutoSim)
        ZEL_SVC_LOG("<WARN>[Mem] free(gpZelSvcElementActImsInfoDefaultForAutoSim) call.");
    gpZelSvcElementActImsInfoDefaultForAutoSim = std::move(entry);
}

void take_for_operator(std::unique_ptr<ImsEntry> entry) {
    if (entry->network_name == kDefault) return keep_default(std::move(entry));
    if (!zel_svc_is_current_operators(entry->network_name.view())) return;
    ZEL_SVC_LOG("[AutoSIM] IMS setting / NetworkName='%s' information found.", entry->network_name.c_str());
    __zel_svc_element_act_ims_save_ini(*entry);
    gOperatorFound = true;
}

void end_entry(ZelSvcParseMode mode) {
    auto entry = gpZelSvcElementActImsInfoTemp.take();
    if (!entry) return;
    if (mode == ZEL_SVC_PARSE_MODE_FULL) take_for_pre_configuration(*entry);
    if (mode == ZEL_SVC_PARSE_MODE_OPERATOR) take_for_operator(std::move(entry));
}

// The operator's own entry wins wherever it stands, so only now is it known that there is none.
void end_entries() {
    const auto entry = std::move(gpZelSvcElementActImsInfoDefaultForAutoSim);
    if (!entry || gOperatorFound) return;
    ZEL_SVC_LOG("[AutoSIM] IMS setting / Operator not found. NetworkName='default' information existed and saved.");
    __zel_svc_element_act_ims_save_ini(*entry);
}

} // namespace

void zel_svc_element_act_ims_start(Occurrence &occurrence) {
    if (!occurrence.installs()) return;
    if (occurrence.element == ZEL_SVC_ELEMENT_IMS_SETTING && occurrence.mode == ZEL_SVC_PARSE_MODE_OPERATOR)
        begin_entries();
    if (occurrence.element == ZEL_SVC_ELEMENT_IMS_SETTING_SETTING) open_entry();
}

void zel_svc_element_act_ims_value(Occurrence &occurrence) {
    if (occurrence.installs()) gpZelSvcElementActImsInfoTemp.copy(kFields, occurrence);
}

void zel_svc_element_act_ims_end(Occurrence &occurrence) {
    if (!occurrence.installs()) return;
    if (occurrence.element == ZEL_SVC_ELEMENT_IMS_SETTING_SETTING) end_entry(occurrence.mode);
    if (occurrence.element == ZEL_SVC_ELEMENT_IMS_SETTING && occurrence.mode == ZEL_SVC_PARSE_MODE_OPERATOR)
        end_entries();
}
