#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

constexpr const char *kName = "db/private/zel/bin_name";
constexpr const char *kVersion = "db/private/zel/bin_version";
constexpr const char *kCode = "db/zel/bincode";
constexpr const char *kFullVersion = "db/zel/bin_full_version";

std::string leaf(const std::string &tag, const std::string &text) { return "<" + tag + ">" + text + "</" + tag + ">"; }
std::string set_of(const std::string &children) { return "<CustomerDataSet>" + children + "</CustomerDataSet>"; }
std::string customer(const std::string &path) { return R"(<CustomerData src=")" + path + R"("></CustomerData>)"; }

std::string_view text_of(const char *field, std::size_t size) { return {field, strnlen(field, size)}; }

} // namespace

class PackageHeader : public BenchPhone {
  protected:
    void TearDown() override {
        zel_svc_collected_customers() = {};
        BenchPhone::TearDown();
    }

    static std::vector<std::pair<std::string, std::string>> customers(std::size_t count) {
        std::vector<std::pair<std::string, std::string>> list;
        for (std::size_t i = 0; i < count; ++i) {
            const ZelSvcCustomer &entry = zel_svc_collected_customers().entries.at(i);
            list.emplace_back(text_of(entry.name, sizeof entry.name), text_of(entry.path, sizeof entry.path));
        }
        return list;
    }
};

TEST_F(PackageHeader, NameAndVersionAreStoredInFullAndHeaderMode) {
    for (const auto mode : {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_HEADER}) {
        const std::string suffix = std::to_string(mode);
        install_spec(set_of(leaf("ZELName", "ABC123XYZ" + suffix) + leaf("ZELVersion", "V" + suffix)), mode);
        EXPECT_EQ(get_string(kName), "ABC123XYZ" + suffix);
        EXPECT_EQ(get_string(kVersion), "V" + suffix);
        EXPECT_EQ(get_string(kCode), "YZ" + suffix);
        EXPECT_EQ(get_string(kFullVersion), "ABC123XYZ" + suffix + "V" + suffix);
    }
}

TEST_F(PackageHeader, CodeIsTheEndOfTheName) {
    install_spec(leaf("ZELName", "ABC123XYZ"));
    EXPECT_EQ(get_string(kCode), "XYZ");
    install_spec(leaf("ZELName", "XYZ"));
    EXPECT_EQ(get_string(kCode), "XYZ");
    install_spec(leaf("ZELName", "YZ"));
    EXPECT_EQ(get_string(kCode), "YZ");
}

TEST_F(PackageHeader, RefusedNameDoesNotKeepTheCodeOut) {
    fail("vconf_set_str", kName);
    install_spec(leaf("ZELName", "ABC123XYZ"));
    EXPECT_EQ(get_string(kName), std::nullopt);
    EXPECT_EQ(get_string(kCode), "XYZ");
}

TEST_F(PackageHeader, OtherModesAndActionsStoreNothing) {
    const std::string header = set_of(leaf("ZELName", "ABC123XYZ") + leaf("ZELVersion", "V1"));
    for (const auto mode :
         {ZEL_SVC_PARSE_MODE_PARTIAL, ZEL_SVC_PARSE_MODE_CUSTOMER_LIST, ZEL_SVC_PARSE_MODE_SECURITY_LOCK,
          ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_OPERATOR})
        install_spec(header, mode);
    EXPECT_THAT(verify_spec(header, ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    for (const char *key : {kName, kVersion, kCode, kFullVersion})
        EXPECT_EQ(get_string(key), std::nullopt) << key;
    EXPECT_EQ(run_log(), "");
}

TEST_F(PackageHeader, ExportSaysNothing) {
    set_string(kName, "ABC123XYZ");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_ZEL_NAME), "");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_CUSTOMER), "");
}

TEST_F(PackageHeader, FullVersionIsLogged) {
    install_spec(set_of(leaf("ZELName", "ABC123XYZ") + leaf("ZELVersion", "V100%s")));
    EXPECT_EQ(get_string(kFullVersion), "ABC123XYZV100%s");
    EXPECT_EQ(run_log(), "[Header/Success] Binary version('ABC123XYZV100%s') set.\n");
}

TEST_F(PackageHeader, RefusedFullVersionIsLogged) {
    fail("vconf_set_str", kFullVersion);
    install_spec(set_of(leaf("ZELName", "ABC123XYZ") + leaf("ZELVersion", "V100")));
    EXPECT_EQ(run_log(), "[Header/Error] Binary version('ABC123XYZV100') not set.\n");
}

TEST_F(PackageHeader, MissingNameOrVersionIsLogged) {
    install_spec(set_of(leaf("ZELName", "ABC123XYZ")));
    EXPECT_EQ(get_string(kFullVersion), std::nullopt);
    EXPECT_EQ(run_log(), "[Header/Error] Binary version not set.\n");
}

TEST_F(PackageHeader, MissingNameAloneIsLogged) {
    install_spec(set_of(leaf("ZELVersion", "V1")));
    EXPECT_EQ(run_log(), "[Header/Error] Binary version not set.\n");
}

TEST_F(PackageHeader, EarlierNameServesALaterVersion) {
    set_string(kName, "OLD");
    install_spec(set_of(leaf("ZELVersion", "V2")), ZEL_SVC_PARSE_MODE_HEADER);
    EXPECT_EQ(get_string(kFullVersion), "OLDV2");
}

TEST_F(PackageHeader, CustomersAreCollectedInOrder) {
    install_spec(set_of(leaf("NbCustomer", "2") + customer("/Customer/XFV/customer.xml") +
                        customer("/Customer/ABCDEFGHIJKL/customer.xml")),
                 ZEL_SVC_PARSE_MODE_CUSTOMER_LIST);
    EXPECT_EQ(zel_svc_collected_customers().count, 2);
    EXPECT_THAT(customers(2), ElementsAre(std::pair{"XFV", "/Customer/XFV/customer.xml"},
                                          std::pair{"ABCDEFGHI", "/Customer/ABCDEFGHIJKL/customer.xml"}));
}

TEST_F(PackageHeader, CustomerNeedsSrcAsItsFirstAttribute) {
    install_spec(set_of(R"(<CustomerData></CustomerData>)"
                        R"(<CustomerData name="x" src="/Customer/AAA/customer.xml"></CustomerData>)"
                        R"(<CustomerData Src="/Customer/BBB/customer.xml"></CustomerData>)" +
                        customer("/Customer/CCC/customer.xml")),
                 ZEL_SVC_PARSE_MODE_CUSTOMER_LIST);
    // The entry is numbered by the elements that ended before, also by those that named no file.
    EXPECT_THAT(customers(4), ElementsAre(std::pair{"", ""}, std::pair{"", ""}, std::pair{"", ""},
                                          std::pair{"CCC", "/Customer/CCC/customer.xml"}));
}

TEST_F(PackageHeader, ShortPathHasNoCode) {
    install_spec(set_of(customer("/Customer/customer.xml") + customer("/Customer//customer.xml") + customer("x")),
                 ZEL_SVC_PARSE_MODE_CUSTOMER_LIST);
    EXPECT_THAT(customers(3), ElementsAre(std::pair{"", "/Customer/customer.xml"},
                                          std::pair{"", "/Customer//customer.xml"}, std::pair{"", "x"}));
}

TEST_F(PackageHeader, LongPathIsCutButItsCodeIsTakenFromTheWhole) {
    const std::string path = "/Customer/" + std::string(4, 'C') + std::string(300, '/') + "/customer.xml";
    install_spec(set_of(customer(path)), ZEL_SVC_PARSE_MODE_CUSTOMER_LIST);
    EXPECT_THAT(customers(1), ElementsAre(std::pair{std::string{"CCCC/////"}, path.substr(0, 255)}));
}

TEST_F(PackageHeader, CountIsBounded) {
    for (const auto &[text, count] : {std::pair{"121", 120}, std::pair{"120", 120}, std::pair{"-1", 0},
                                      std::pair{"x", 0}, std::pair{"7 of 9", 7}}) {
        install_spec(set_of(leaf("NbCustomer", text)), ZEL_SVC_PARSE_MODE_CUSTOMER_LIST);
        EXPECT_EQ(zel_svc_collected_customers().count, count) << text;
    }
}

TEST_F(PackageHeader, CustomersPastTheListAreIgnored) {
    std::string list;
    for (int i = 100; i < 221; ++i)
        list += customer("/Customer/" + std::to_string(i) + "/customer.xml");
    install_spec(set_of(list), ZEL_SVC_PARSE_MODE_CUSTOMER_LIST);
    EXPECT_EQ(customers(120).back().first, "219");
}

TEST_F(PackageHeader, CustomersAreCollectedInTheirModeOnly) {
    const std::string list = set_of(leaf("NbCustomer", "1") + customer("/Customer/XFV/customer.xml"));
    for (const auto mode : {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_HEADER, ZEL_SVC_PARSE_MODE_OPERATOR_LIST})
        install_spec(list, mode);
    verify_spec(list, ZEL_SVC_PARSE_MODE_CUSTOMER_LIST);
    EXPECT_EQ(zel_svc_collected_customers().count, 0);
    EXPECT_THAT(customers(1), ElementsAre(std::pair{"", ""}));
}

} // namespace zel_test
