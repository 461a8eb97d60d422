#include "zel-svc-element-act-email-account.h"

#include "handler/zel-svc-recorded-items.h"

namespace {

struct EmailAccount {
    FixedText<40> network_name;
    FixedText<200> account_name;
    FixedText<200> email_address;
    FixedText<200> user_id;
    FixedText<200> password;
    FixedText<200> mailbox_type;
    FixedText<200> incoming_server;
    FixedText<200> incoming_port;
    FixedText<200> incoming_security;
    FixedText<4> apop;
    FixedText<200> imap_fetch_option;
    FixedText<200> outgoing_server;
    FixedText<200> outgoing_port;
    FixedText<4> smtp_authentication;
    FixedText<200> outgoing_security;
    FixedText<4> same_id_and_password;
    FixedText<4> pop_before_smtp;
};

constexpr Word kMailboxTypes[] = {{"pop3"}, {"imap4"}};
constexpr Word kSecurities[] = {{"ssl"}, {"tls"}, {"off"}, {"ssl+trustallcerts"}, {"tls+trustallcerts"}};
constexpr Word kFetchOptions[] = {{"new"}, {"all"}};

constexpr FieldRules text_as(const char *key, Accepts accepts = any_text()) {
    return {.accepts = accepts, .record = {.key = key}};
}

// A switch that the spec says nothing about is off.
constexpr FieldRules switch_as(const char *key) {
    return {.accepts = on_off(), .record = {.key = key, .form = FieldForm::Word, .otherwise = 0}};
}

// The network name chooses the account and is not recorded.
constexpr Field<EmailAccount> kFields[] = {
    field<&EmailAccount::network_name>(ZEL_SVC_ELEMENT_ACCOUNT_NETWORK_NAME),
    field<&EmailAccount::account_name>(ZEL_SVC_ELEMENT_ACCOUNT_NAME, text_as("name_%d")),
    field<&EmailAccount::email_address>(ZEL_SVC_ELEMENT_ACCOUNT_EMAIL_ADDR, text_as("email_addr_%d")),
    field<&EmailAccount::user_id>(ZEL_SVC_ELEMENT_ACCOUNT_USER_ID, text_as("user_id_%d")),
    field<&EmailAccount::password>(ZEL_SVC_ELEMENT_ACCOUNT_PASSWORD, text_as("pwd_%d")),
    field<&EmailAccount::mailbox_type>(ZEL_SVC_ELEMENT_MAILBOX_TYPE,
                                       text_as("incom_mail_type_%d", kept_words(kMailboxTypes))),
    field<&EmailAccount::incoming_server>(ZEL_SVC_ELEMENT_INCOMING_SERV_ADDR, text_as("incom_server_addr_%d")),
    field<&EmailAccount::incoming_port>(ZEL_SVC_ELEMENT_INCOMING_PORT, text_as("incom_port_%d")),
    field<&EmailAccount::incoming_security>(ZEL_SVC_ELEMENT_INCOMING_SECURE,
                                            text_as("incom_secure_conn_%d", kept_words(kSecurities))),
    field<&EmailAccount::apop>(ZEL_SVC_ELEMENT_APOP, switch_as("incom_apop_login_%d")),
    field<&EmailAccount::imap_fetch_option>(ZEL_SVC_ELEMENT_IMAP_FETCH_OPT,
                                            text_as("incom_imap4_opt_%d", kept_words(kFetchOptions))),
    field<&EmailAccount::outgoing_server>(ZEL_SVC_ELEMENT_OUTGOING_SERV_ADDR, text_as("outgo_server_addr_%d")),
    field<&EmailAccount::outgoing_port>(ZEL_SVC_ELEMENT_OUTGOING_PORT, text_as("outgo_port_%d")),
    field<&EmailAccount::smtp_authentication>(ZEL_SVC_ELEMENT_SMTP_AUTH, switch_as("outgo_smtp_auth_%d")),
    field<&EmailAccount::outgoing_security>(ZEL_SVC_ELEMENT_OUTGOING_SECURE,
                                            text_as("outgo_secure_conn_%d", kept_words(kSecurities))),
    field<&EmailAccount::same_id_and_password>(ZEL_SVC_ELEMENT_SAME_ID_PWD, switch_as("outgo_same_id_pwd_%d")),
    field<&EmailAccount::pop_before_smtp>(ZEL_SVC_ELEMENT_POP_BEFORE_SMTP, switch_as("outgo_pop_before_smtp_%d")),
};

RecordedItems<EmailAccount> gAccounts{ZEL_SVC_ELEMENT_ACCOUNT, ZEL_SVC_AUTO_EMAIL_ACCOUNT, ZEL_SVC_DATA_EMAIL_ACCOUNT,
                                      "email_account", kFields};

} // namespace

void zel_svc_element_act_email_account_start(Occurrence &occurrence) { gAccounts.start(occurrence); }
void zel_svc_element_act_email_account_value(Occurrence &occurrence) { gAccounts.value(occurrence); }
void zel_svc_element_act_email_account_end(Occurrence &occurrence) { gAccounts.end(occurrence); }
