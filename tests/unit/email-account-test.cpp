#include "operator-items.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::IsEmpty;

namespace {

std::string element(const std::string &tag, const std::string &content) {
    return "<" + tag + ">" + content + "</" + tag + ">";
}
std::string account(const std::string &children) { return element("Account", children); }
std::string account_of(const std::string &network, const std::string &name) {
    return account(element("NetworkName", network) + element("AccountName", name));
}

std::optional<std::string> recorded(const LoadedGroup &group, const std::string &key) {
    return group.text("email_account", key.c_str());
}

// A field of the account: where it stands, an accepted text and its entry in the first account.
struct ExpectedField {
    const char *parent; // of the account when null
    const char *tag;
    const char *text;
    const char *key;
    const char *recorded;
    const char *unset; // what an account without it records
    std::vector<const char *> refused = {};

    [[nodiscard]] std::string spec(const std::string &value) const {
        const std::string leaf = element(tag, value);
        return parent ? element(parent, leaf) : leaf;
    }
    friend void PrintTo(const ExpectedField &field, std::ostream *out) { *out << field.key; }
};

const std::vector<const char *> kNoSwitch{"On", "OFF", "on ", "off ", "1", "yes", "offf"};
const std::vector<const char *> kNoSecurity{"SSL", "ssl ", "on", "none", "tls+TrustAllCerts", "ssl+tls"};

const ExpectedField kExpectedFields[] = {
    {nullptr, "AccountName", "Mail of One", "name_1", "Mail of One", ""},
    {nullptr, "EmailAddr", "me@one.example", "email_addr_1", "me@one.example", ""},
    {nullptr, "UserId", "me", "user_id_1", "me", ""},
    {nullptr, "Password", "secret", "pwd_1", "secret", ""},
    {"Incoming", "MailboxType", "pop3", "incom_mail_type_1", "pop3", "", {"POP3", "pop3 ", "imap", "imap4x"}},
    {"Incoming", "MailboxType", "imap4", "incom_mail_type_1", "imap4", ""},
    {"Incoming", "ServAddr", "in.one.example", "incom_server_addr_1", "in.one.example", ""},
    {"Incoming", "Port", "0995", "incom_port_1", "0995", ""},
    {"Incoming", "Secure", "ssl", "incom_secure_conn_1", "ssl", "", kNoSecurity},
    {"Incoming", "Secure", "tls", "incom_secure_conn_1", "tls", ""},
    {"Incoming", "Secure", "off", "incom_secure_conn_1", "off", ""},
    {"Incoming", "Secure", "ssl+trustallcerts", "incom_secure_conn_1", "ssl+trustallcerts", ""},
    {"Incoming", "Secure", "tls+trustallcerts", "incom_secure_conn_1", "tls+trustallcerts", ""},
    {"Incoming", "Apop", "on", "incom_apop_login_1", "1", "0", kNoSwitch},
    {"Incoming", "Apop", "off", "incom_apop_login_1", "0", "0"},
    {"Incoming", "ImapFetchOpt", "new", "incom_imap4_opt_1", "new", "", {"New", "new ", "old"}},
    {"Incoming", "ImapFetchOpt", "all", "incom_imap4_opt_1", "all", ""},
    {"Outgoing", "ServAddr", "out.one.example", "outgo_server_addr_1", "out.one.example", ""},
    {"Outgoing", "Port", "465", "outgo_port_1", "465", ""},
    {"Outgoing", "SmtpAuth", "on", "outgo_smtp_auth_1", "1", "0", kNoSwitch},
    {"Outgoing", "SmtpAuth", "off", "outgo_smtp_auth_1", "0", "0"},
    {"Outgoing", "Secure", "ssl", "outgo_secure_conn_1", "ssl", "", kNoSecurity},
    {"Outgoing", "Secure", "tls", "outgo_secure_conn_1", "tls", ""},
    {"Outgoing", "Secure", "off", "outgo_secure_conn_1", "off", ""},
    {"Outgoing", "Secure", "ssl+trustallcerts", "outgo_secure_conn_1", "ssl+trustallcerts", ""},
    {"Outgoing", "Secure", "tls+trustallcerts", "outgo_secure_conn_1", "tls+trustallcerts", ""},
    {"Outgoing", "SameIdPwd", "on", "outgo_same_id_pwd_1", "1", "0", kNoSwitch},
    {"Outgoing", "SameIdPwd", "off", "outgo_same_id_pwd_1", "0", "0"},
    {"Outgoing", "PopBeforeSmtp", "on", "outgo_pop_before_smtp_1", "1", "0", kNoSwitch},
    {"Outgoing", "PopBeforeSmtp", "off", "outgo_pop_before_smtp_1", "0", "0"},
};

} // namespace

class EmailAccountField : public BenchPhone, public testing::WithParamInterface<ExpectedField> {};

TEST_P(EmailAccountField, AcceptedTextIsRecordedAndAlone) {
    const ExpectedField &field = GetParam();
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec(account(field.spec(field.text)));
    EXPECT_EQ(recorded(group, field.key), field.recorded);
    for (const ExpectedField &other : kExpectedFields)
        if (std::string_view{other.key} != field.key) {
            EXPECT_EQ(recorded(group, other.key), other.unset) << other.key;
        }
}

TEST_P(EmailAccountField, RefusedTextLeavesTheFieldAlone) {
    const ExpectedField &field = GetParam();
    for (const char *refused : field.refused) {
        const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
        install_spec(account(field.spec(refused)));
        EXPECT_EQ(recorded(group, field.key), field.unset) << refused;
        install_spec(account(field.spec(field.text) + field.spec(refused)));
        std::string second{field.key};
        second.back() = '2';
        EXPECT_EQ(recorded(group, second), field.recorded) << refused;
    }
}

TEST_P(EmailAccountField, AbsentFieldIsRecordedAllTheSame) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec(account(GetParam().spec("")));
    EXPECT_EQ(recorded(group, GetParam().key), GetParam().unset);
    EXPECT_EQ(recorded(group, "count"), "1");
}

INSTANTIATE_TEST_SUITE_P(Every, EmailAccountField, testing::ValuesIn(kExpectedFields));

class EmailAccount : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        set_operator("One");
    }
};

TEST_F(EmailAccount, AccountsAreNumberedFromOneAcrossParses) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec("<NbAccount>7</NbAccount>" + account_of("One", "first") + account_of("Two", "second"));
    EXPECT_EQ(recorded(group, "count"), "2");
    install_spec(account_of("", "third"));
    EXPECT_EQ(recorded(group, "count"), "3");
    EXPECT_EQ(recorded(group, "name_1"), "first");
    EXPECT_EQ(recorded(group, "name_2"), "second");
    EXPECT_EQ(recorded(group, "name_3"), "third");
}

TEST_F(EmailAccount, NothingOfAnAccountGoesIntoTheNext) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec(account("<UserId>me</UserId><Incoming><Apop>on</Apop></Incoming>") + account_of("", "second"));
    EXPECT_EQ(recorded(group, "incom_apop_login_1"), "1");
    EXPECT_EQ(recorded(group, "incom_apop_login_2"), "0");
    EXPECT_EQ(recorded(group, "user_id_2"), "");
}

TEST_F(EmailAccount, NumbersAreRecordedAsNumbers) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec(account("<Outgoing><SmtpAuth>on</SmtpAuth></Outgoing>"));
    EXPECT_STREQ(zel_svc_data_get_str(ZEL_SVC_DATA_EMAIL_ACCOUNT, "email_account", "outgo_smtp_auth_1"), "1");
    EXPECT_STREQ(zel_svc_data_get_str(ZEL_SVC_DATA_EMAIL_ACCOUNT, "email_account", "incom_apop_login_1"), "0");
}

TEST_F(EmailAccount, NetworkNameIsNotRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec(account_of("One", "first"));
    EXPECT_EQ(recorded(group, "network_name_1"), std::nullopt);
    EXPECT_EQ(recorded(group, "name_1"), "first");
}

TEST_F(EmailAccount, FullInstallLeavesTheSimsAccountsOut) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    set_auto_flag(ZEL_SVC_AUTO_EMAIL_ACCOUNT, 1);
    install_spec(account_of("One", "first"));
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    EXPECT_EQ(recorded(group, "name_1"), std::nullopt);
}

TEST_F(EmailAccount, OperatorInstallTakesTheOperatorsAccountsOnly) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    set_auto_flag(ZEL_SVC_AUTO_EMAIL_ACCOUNT, 1);
    install_spec(account_of("Two", "two") + account_of("One", "one") + account_of("default", "any") +
                     account_of("", "none") + account_of("One", "another"),
                 ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(recorded(group, "count"), "2");
    EXPECT_EQ(recorded(group, "name_1"), "one");
    EXPECT_EQ(recorded(group, "name_2"), "another");
}

TEST_F(EmailAccount, OperatorInstallNeedsTheFlag) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec(account_of("One", "one"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
}

TEST_F(EmailAccount, OtherModesInstallNone) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_EMAIL_ACCOUNT, flag);
            install_spec(account_of("One", "one"), mode);
            EXPECT_EQ(recorded(group, "count"), std::nullopt) << mode;
        }
}

TEST_F(EmailAccount, LongTextsAreCut) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec(account("<AccountName>" + std::string(250, 'n') + "</AccountName>"));
    EXPECT_EQ(recorded(group, "name_1"), std::string(199, 'n'));
}

TEST_F(EmailAccount, AccountLeftOpenIsDroppedByTheNext) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec("<Account><AccountName>lost</AccountName><broken");
    install_spec("<Account><UserId>me</UserId></Account>");
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "name_1"), "");
    EXPECT_EQ(recorded(group, "user_id_1"), "me");
}

TEST_F(EmailAccount, ValuesOutsideAnAccountDoNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    install_spec("<Apop>on</Apop><MailboxType>pop3</MailboxType>" + account_of("", "one"));
    EXPECT_EQ(recorded(group, "incom_apop_login_1"), "0");
    EXPECT_EQ(recorded(group, "incom_mail_type_1"), "");
}

TEST_F(EmailAccount, VerificationAndExportDoNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL_ACCOUNT};
    EXPECT_THAT(verify_spec(account_of("One", "one")), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    install_spec(account_of("One", "one"));
    export_start(ZEL_SVC_ELEMENT_ACCOUNT);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_ACCOUNT_NAME), "");
    export_end(ZEL_SVC_ELEMENT_ACCOUNT);
    EXPECT_EQ(recorded(group, "count"), "1");
}

} // namespace zel_test
