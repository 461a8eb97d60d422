#include "service-phone.h"

namespace {

constexpr const char *kCsaFile = "/csa/zel/zel-active-customer.inf";
constexpr const char *kProductCode = "/csa/imei/prodcode.dat";

class SetActiveCustomer : public zel_test::ServicePhone {
  protected:
    void expect_operator(int operator_id, int country, int region, int sim) {
        EXPECT_EQ(get_int("db/zel/operator"), operator_id);
        EXPECT_EQ(get_int("db/zel/operator_country"), country);
        EXPECT_EQ(get_int("db/zel/operator_region"), region);
        EXPECT_EQ(get_int("db/zel/operator_sim"), sim);
    }
};

} // namespace

TEST_F(SetActiveCustomer, StoresTheCodeEverywhere) {
    write(kProductCode, "SM-Q7N0ZK.BTU");
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_EQ(get_string("db/zel/salescode"), "XFV");
    EXPECT_EQ(read(kCsaFile), "XFV");
    EXPECT_EQ(read(kProductCode), "SM-Q7N0ZK.XFV");
    expect_operator(1, 25, 0, 0);
    EXPECT_EQ(run_log(), "[SetActCustomerName/Success] zel dir in csa created.\n"
                         "[SetActCustomerName/Success] Active customer('XFV') set into csa.\n"
                         "[SetActCustomerName/Success] Product code changed('BTU'->'XFV') into csa.\n");
}

TEST_F(SetActiveCustomer, TheFolderIsMadeOnce) {
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_EQ(call("stat", {{"path", "/csa/zel"}}).at("mode"), "0755");
    zel_svc_config_set_active_customer_name("BTU");
    EXPECT_TRUE(logged("[SetActCustomerName] zel dir in csa existed."));
    EXPECT_EQ(read(kCsaFile), "BTU");
}

TEST_F(SetActiveCustomer, TheFileInCsaHasItsAttributes) {
    zel_svc_config_set_active_customer_name("XFV");
    const nlohmann::json status = call("stat", {{"path", kCsaFile}});
    EXPECT_EQ(status.at("mode"), "0644");
    EXPECT_EQ(status.at("owner"), 200);
    EXPECT_EQ(status.at("group"), 5000);
    EXPECT_EQ(status.at("label"), "zel-manager");
}

TEST_F(SetActiveCustomer, AShorterCodeLeavesNothingOfALongerOne) {
    zel_svc_config_set_active_customer_name("LONGCODE");
    EXPECT_EQ(read(kCsaFile), "LONGCODE");
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_EQ(read(kCsaFile), "XFV");
}

TEST_F(SetActiveCustomer, AnUnknownCodeSetsAllOperatorKeysTo0) {
    zel_svc_config_set_active_customer_name("FTM");
    expect_operator(3, 10, 0, 0);
    zel_svc_config_set_active_customer_name("ZZZ");
    expect_operator(0, 0, 0, 0);
}

TEST_F(SetActiveCustomer, EveryOperatorKeyIsTriedWhateverFails) {
    fail("vconf_set_int", "db/zel/operator");
    fail("vconf_set_int", "db/zel/operator_region");
    zel_svc_config_set_active_customer_name("TDC");
    EXPECT_EQ(get_int("db/zel/operator"), std::nullopt);
    EXPECT_EQ(get_int("db/zel/operator_country"), 7);
    EXPECT_EQ(get_int("db/zel/operator_region"), std::nullopt);
    EXPECT_EQ(get_int("db/zel/operator_sim"), 0);
}

TEST_F(SetActiveCustomer, ARefusedKeyStopsNothing) {
    fail("vconf_set_str", "db/zel/salescode");
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_EQ(get_string("db/zel/salescode"), std::nullopt);
    EXPECT_EQ(read(kCsaFile), "XFV");
    expect_operator(1, 25, 0, 0);
}

TEST_F(SetActiveCustomer, AFolderThatCannotBeMadeIsLogged) {
    fail("zel_platform_open_parent", "/csa/zel");
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_EQ(run_log(), "[SetActCustomerName/Error!!] zel dir in csa not created.\n"
                         "[SetActCustomerName/Error!!] Active customer in csa not opened.\n"
                         "[SetActCustomerName] Product code in csa not existed.\n");
    EXPECT_EQ(get_string("db/zel/salescode"), "XFV");
    expect_operator(1, 25, 0, 0);
}

TEST_F(SetActiveCustomer, AFileThatCannotBeOpenedIsLogged) {
    fail("zel_platform_open", kCsaFile);
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_TRUE(logged("[SetActCustomerName/Error!!] Active customer in csa not opened."));
    EXPECT_FALSE(exists(kCsaFile));
}

TEST_F(SetActiveCustomer, AProductCodeOfTheCodeIsLeft) {
    write(kProductCode, "XFV");
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_TRUE(logged("[SetActCustomerName] Product code already changed('XFV') into csa."));
    EXPECT_EQ(read(kProductCode), "XFV");
}

TEST_F(SetActiveCustomer, OfALongCodeTheProductCodeTakesTheFirstThreeEachTime) {
    write(kProductCode, "model-BTU");
    zel_svc_config_set_active_customer_name("XFVX");
    EXPECT_EQ(read(kProductCode), "model-XFV");
    EXPECT_TRUE(logged("[SetActCustomerName/Success] Product code changed('BTU'->'XFVX') into csa."));
    zel_svc_config_set_active_customer_name("XFVX");
    EXPECT_TRUE(logged("[SetActCustomerName/Success] Product code changed('XFV'->'XFVX') into csa."));
}

TEST_F(SetActiveCustomer, OfAShortCodeTheProductCodeTakesNothing) {
    write(kProductCode, "model-BTU");
    zel_svc_config_set_active_customer_name("XF");
    EXPECT_EQ(read(kProductCode), "model-BTU");
    EXPECT_TRUE(logged("[SetActCustomerName/Error!!] Product code in csa error."));
}

TEST_F(SetActiveCustomer, AProductCodeThatBeginsWithZeroIsLeft) {
    const std::string blank("model-\0TU", 9);
    write(kProductCode, blank);
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_EQ(read(kProductCode), blank);
    EXPECT_TRUE(logged("[SetActCustomerName/Error!!] Product code in csa error."));
}

TEST_F(SetActiveCustomer, AProductCodeOfFewerThanThreeBytesSaysNothing) {
    write(kProductCode, "AB");
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_EQ(read(kProductCode), "AB");
    EXPECT_EQ(run_log(), "[SetActCustomerName/Success] zel dir in csa created.\n"
                         "[SetActCustomerName/Success] Active customer('XFV') set into csa.\n");
}

TEST_F(SetActiveCustomer, AProductCodeThatCannotBeOpenedForWritingIsLogged) {
    write(kProductCode, "model-BTU");
    fail("zel_platform_open", kProductCode, 2, 1);
    zel_svc_config_set_active_customer_name("XFV");
    EXPECT_TRUE(logged("[SetActCustomerName/Error!!] Product code in csa not opened."));
    EXPECT_EQ(read(kProductCode), "model-BTU");
}

TEST_F(SetActiveCustomer, NullDoesNothing) {
    zel_svc_config_set_active_customer_name(nullptr);
    EXPECT_EQ(get_string("db/zel/salescode"), std::nullopt);
    EXPECT_EQ(get_int("db/zel/operator"), std::nullopt);
    EXPECT_EQ(run_log(), "");
}

class ActiveCustomer : public zel_test::ServicePhone {
  protected:
    int ask(int size = 10) {
        name_ = "unchanged";
        char buffer[10] = "unchanged";
        const int result = zel_svc_config_get_active_customer_name(buffer, size);
        name_ = buffer;
        return result;
    }
    std::string name_;
};

TEST_F(ActiveCustomer, IsTheSalesCodeKey) {
    set_string("db/zel/salescode", "XFV");
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(name_, "XFV");
    EXPECT_EQ(zel_svc_config_chk_active_customer_exist(), 1);
    EXPECT_EQ(run_log(), "");
}

TEST_F(ActiveCustomer, AMissingKeyIsLoggedAndClearsTheBuffer) {
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(name_, "");
    EXPECT_EQ(run_log(), "[GetActCustomerName/Error!!] Get active customer name.\n");
    EXPECT_EQ(zel_svc_config_chk_active_customer_exist(), 0);
}

TEST_F(ActiveCustomer, AKeyOfAnotherTypeCannotBeRead) {
    set_int("db/zel/salescode", 5);
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(run_log(), "[GetActCustomerName/Error!!] Get active customer name.\n");
}

TEST_F(ActiveCustomer, TheDefaultAndTheEmptyCodeAreNone) {
    for (const char *code : {"DEF", ""}) {
        set_string("db/zel/salescode", code);
        EXPECT_EQ(ask(), 0) << code;
        EXPECT_EQ(name_, "") << code;
    }
    EXPECT_EQ(run_log(), "");
    set_string("db/zel/salescode", "DEFX");
    EXPECT_EQ(ask(), 1);
}

TEST_F(ActiveCustomer, TheNameIsCutToTheBuffer) {
    set_string("db/zel/salescode", "LONGCODE");
    EXPECT_EQ(ask(5), 1);
    EXPECT_EQ(name_, "LONG");
    EXPECT_EQ(ask(0), 1);
    EXPECT_EQ(name_, "unchanged");
    EXPECT_EQ(ask(-1), 1);
    EXPECT_EQ(name_, "unchanged");
    EXPECT_EQ(zel_svc_config_get_active_customer_name(nullptr, 10), 1);
}

class ActiveCustomerInCsa : public zel_test::ServicePhone {
  protected:
    int ask(int size = 10) {
        char buffer[10] = "unchanged";
        const int result = zel_svc_config_get_active_customer_name_from_csa(buffer, size);
        name_ = buffer;
        return result;
    }
    std::string name_;
};

TEST_F(ActiveCustomerInCsa, IsTheFirstThreeBytesOfTheFile) {
    write(kCsaFile, "XFVX");
    EXPECT_EQ(ask(), 1);
    EXPECT_EQ(name_, "XFV");
    EXPECT_EQ(ask(3), 1);
    EXPECT_EQ(name_, "XF");
    EXPECT_EQ(run_log(), "");
}

TEST_F(ActiveCustomerInCsa, AMissingFileIsLogged) {
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(name_, "");
    EXPECT_EQ(run_log(), "[GetActCustomerName/Warning] Active customer in csa not opened.\n");
}

TEST_F(ActiveCustomerInCsa, AFileOfFewerThanThreeBytesIsLogged) {
    write(kCsaFile, "XF");
    EXPECT_EQ(ask(), 0);
    EXPECT_EQ(name_, "");
    EXPECT_EQ(run_log(), "[GetActCustomerName/Warning] Active customer in csa is empty.\n");
}

TEST_F(ActiveCustomerInCsa, WithoutABufferItIsNotAnswered) {
    write(kCsaFile, "XFV");
    EXPECT_EQ(zel_svc_config_get_active_customer_name_from_csa(nullptr, 10), 0);
    EXPECT_EQ(ask(0), 0);
    EXPECT_EQ(name_, "unchanged");
}
