#include "zel-svc-element-act-syncml.h"

#include "base/zel-svc-run-log.h"
#include "handler/zel-svc-phone-list.h"
#include "zel-svc-data-sync-account.h"
#include "zel-svc-sync-agent.h"

namespace {

constexpr const char *kSection = "ds";

constexpr FieldRules text_as(const char *key, std::string_view label) {
    return {.record = {.key = key}, .report = {.label = label}};
}

// Only "on" turns a service on.
constexpr FieldRules switch_as(const char *key, std::string_view label) {
    return {.accepts = on_off(),
            .others = FieldOthers::Kept,
            .record = {.key = key, .form = FieldForm::Word, .otherwise = 0},
            .report = {.label = label}};
}

using Account = DataSyncAccount;

// clang-format off
constexpr Field<Account> kFields[] = {
    field<&Account::network_name>(ZEL_SVC_ELEMENT_DATA_SYNC_NETWORK_NAME, {.fills = FieldFills::Install}),
    field<&Account::name>(ZEL_SVC_ELEMENT_DATA_SYNC_ACC_NAME, text_as("account_name_%d", "AccName")),
    field<&Account::server>(ZEL_SVC_ELEMENT_DATA_SYNC_SERV_ADDR, text_as("server_addr_%d", "ServAddr")),
    field<&Account::user_id>(ZEL_SVC_ELEMENT_DATA_SYNC_USER_ID, text_as("user_id_%d", "UserId")),
    field<&Account::password>(ZEL_SVC_ELEMENT_DATA_SYNC_PASSWORD, text_as("pwd_%d", "Password")),
    field<&Account::contacts_enabled>(ZEL_SVC_ELEMENT_CONTACT_DB_ENABLE_FLAG, switch_as("contact_db_enable_%d", "Contact_EnableFlag")),
    field<&Account::contacts_name>(ZEL_SVC_ELEMENT_CONTACT_DB_NAME, text_as("contact_db_name_%d", "Contact_DBName")),
    field<&Account::contacts_id>(ZEL_SVC_ELEMENT_CONTACT_DB_ID, text_as("contact_db_id_%d", "Contact_DBId")),
    field<&Account::contacts_password>(ZEL_SVC_ELEMENT_CONTACT_DB_PASSWORD, text_as("contact_db_pwd_%d", "Contact_DBPassword")),
    field<&Account::calendar_enabled>(ZEL_SVC_ELEMENT_CALENDAR_DB_ENABLE_FLAG, switch_as("calendar_db_enable_%d", "Calendar_EnableFlag")),
    field<&Account::calendar_name>(ZEL_SVC_ELEMENT_CALENDAR_DB_NAME, text_as("calendar_db_name_%d", "Calendar_DBName")),
    field<&Account::calendar_id>(ZEL_SVC_ELEMENT_CALENDAR_DB_ID, text_as("calendar_db_id_%d", "Calendar_DBId")),
    field<&Account::calendar_password>(ZEL_SVC_ELEMENT_CALENDAR_DB_PASSWORD, text_as("calendar_db_pwd_%d", "Calendar_DBPassword")),
};
// clang-format on

OpenRecord<Account> gAccount;
bool gReady = false; // the agent is in use
int gIndex = 0;      // in the agent's list, for verification and export

void close_agent() {
    if (gReady) sync_agent_ds_deinit();
    gReady = false;
}

void clear_agent() {
    zel_svc_run_log("[SyncML_DS/Start] Clear info.\n");
    SyncProfiles profiles;
    profiles.read();
    zel_svc_run_log("[SyncML_DS] Run get all().\n");
    for (std::size_t i = 0; i < profiles.size(); ++i)
        sync_agent_ds_delete_profile(profiles.at(i));
    profiles.release();
    zel_svc_run_log("[SyncML_DS/Ended] Clear info.\n");
}

std::string count_in_agent() {
    SyncProfiles profiles;
    return gReady && profiles.read() ? std::to_string(profiles.size()) : "??";
}

bool read_from_phone(int index, Account &account) {
    return gReady && zel_svc_data_sync_read(static_cast<std::size_t>(index), account);
}

void add(Account &account) {
    if (const char *failed = zel_svc_data_sync_add(account))
        return zel_svc_run_log("[SyncML_DS/Error] Run %s.\n", failed);
    const int number = zel_svc_record_count_up(ZEL_SVC_DATA_SYNCML_DS, kSection);
    zel_svc_record_save<Account>(ZEL_SVC_DATA_SYNCML_DS, kSection, kFields, account, number);
}

void install(const Occurrence &occurrence, Account &account) {
    if (!gReady || !zel_svc_item_applies(occurrence, ZEL_SVC_AUTO_SYNCML, account.network_name.view())) return;
    zel_svc_run_log("[SyncML_DS/Start] Set info.\n");
    add(account);
    zel_svc_run_log("[SyncML_DS/Ended] Set info.\n");
    ++gIndex;
}

void verify(const Occurrence &occurrence, Account &spec) {
    if (!zel_svc_group_applies(occurrence, ZEL_SVC_AUTO_SYNCML)) return;
    Account phone;
    const bool read = read_from_phone(gIndex, phone);
    zel_svc_phone_list_compare<Account>("SyncML_DS", ++gIndex, kFields, spec, read ? &phone : nullptr);
}

} // namespace

void zel_svc_element_act_syncml_begin_parse() {
    gAccount.close();
    close_agent();
}

void zel_svc_element_act_syncml_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_SYNCML) return;
    close_agent();
    gReady = sync_agent_ds_init() == 0;
    if (!gReady) zel_svc_run_log("[SyncML_DS/Error] sync_agent_ds_init() failed.\n");
}

void zel_svc_element_act_syncml_end(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_SYNCML) close_agent();
}

void zel_svc_element_act_data_sync_count(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_NB_DATA_SYNC) return;
    if (occurrence.installs() && gReady) clear_agent();
    gIndex = 0;
    zel_svc_phone_list_count(occurrence, ZEL_SVC_AUTO_SYNCML, "SyncML_DS", count_in_agent);
}

void zel_svc_element_act_data_sync_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_DATA_SYNC) return;
    gAccount.open();
    if (occurrence.exports() && gAccount) read_from_phone(gIndex, *gAccount);
}

void zel_svc_element_act_data_sync_value(Occurrence &occurrence) { gAccount.copy(kFields, occurrence); }

void zel_svc_element_act_data_sync_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_DATA_SYNC) return;
    const auto account = gAccount.take();
    if (occurrence.exports()) ++gIndex;
    if (!account) return;
    if (occurrence.verifies()) verify(occurrence, *account);
    if (occurrence.installs()) install(occurrence, *account);
}
