#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kSalesCode = "db/zel/salescode";
constexpr const char *kCountry = "db/zel/country_iso";

std::string sales_code(const std::string &text) { return "<SalesCode>" + text + "</SalesCode>"; }
std::string country(const std::string &text) { return "<CountryISO>" + text + "</CountryISO>"; }
std::string general_info(const std::string &children) { return "<GeneralInfo>" + children + "</GeneralInfo>"; }

} // namespace

class GeneralInfo : public BenchPhone {};

TEST_F(GeneralInfo, BeginsACustomer) {
    zel_svc_set_sales_code("OLD");
    zel_svc_network_table_append({.sales_code = "OLD", .network_id = 7});
    install_spec(general_info(""));
    EXPECT_EQ(zel_svc_sales_code(), "");
    EXPECT_TRUE(zel_svc_network_table().empty());
}

TEST_F(GeneralInfo, VerificationAndExportKeepTheCustomer) {
    zel_svc_set_sales_code("OLD");
    zel_svc_network_table_append({.sales_code = "OLD", .network_id = 7});
    verify_spec(general_info(""));
    export_start(ZEL_SVC_ELEMENT_GENERAL_INFO);
    export_end(ZEL_SVC_ELEMENT_GENERAL_INFO);
    EXPECT_EQ(zel_svc_sales_code(), "OLD");
    EXPECT_EQ(zel_svc_network_table().size(), 1U);
}

TEST_F(GeneralInfo, SalesCodeIsKeptForTheNetworks) {
    install_spec(general_info(sales_code("XFV")));
    EXPECT_EQ(zel_svc_sales_code(), "XFV");
    install_spec(general_info(sales_code("ABCDEFGHIJ")), ZEL_SVC_PARSE_MODE_OPERATOR_LIST);
    EXPECT_EQ(zel_svc_sales_code(), "ABCDEFGHI");
    EXPECT_EQ(get_string(kSalesCode), std::nullopt);
}

TEST_F(GeneralInfo, SalesCodeIsComparedWithTheActiveCustomer) {
    set_string(kSalesCode, "XFV");
    EXPECT_THAT(
        verify_spec(sales_code("XFV") + sales_code("XFX")),
        ElementsAre(passed("[SalesCode] Spec='XFV',Phone='XFV'"), failed("[SalesCode] Spec='XFX',Phone='XFV'")));
}

TEST_F(GeneralInfo, SalesCodeIsComparedWithTheInternalCustomer) {
    set_string(kSalesCode, "CHT");
    EXPECT_THAT(verify_spec(sales_code("TFG") + sales_code("CHT")),
                ElementsAre(passed("[SalesCode] Spec='TFG',Phone='TFG(active:CHT)'"),
                            failed("[SalesCode] Spec='CHT',Phone='TFG(active:CHT)'")));
}

TEST_F(GeneralInfo, SalesCodeIsComparedWithNothingWithoutAnActiveCustomer) {
    EXPECT_THAT(verify_spec(sales_code("XFV")), ElementsAre(failed("[SalesCode] Spec='XFV',Phone=''")));
    set_string(kSalesCode, "DEF");
    EXPECT_THAT(verify_spec(sales_code("DEF")), ElementsAre(failed("[SalesCode] Spec='DEF',Phone=''")));
}

TEST_F(GeneralInfo, CustomersFolderIsExported) {
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_SALES_CODE), "");
    set_string(kSalesCode, "XFV");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_SALES_CODE), "XFV");
    set_string(kSalesCode, "VMT");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_SALES_CODE), "TFG");
}

TEST_F(GeneralInfo, CountryIsStored) {
    install_spec(general_info(country("FR")));
    EXPECT_EQ(get_string(kCountry), "FR");
    install_spec(country("DE"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(get_string(kCountry), "DE");
}

TEST_F(GeneralInfo, CountryIsCompared) {
    set_string(kCountry, "FR");
    EXPECT_THAT(verify_spec(country("FR") + country("fr")),
                ElementsAre(passed("[CountryISO] Spec='FR',Phone='FR'"), failed("[CountryISO] Spec='fr',Phone='FR'")));
}

TEST_F(GeneralInfo, UnreadableCountryAddsNoLine) {
    EXPECT_THAT(verify_spec(country("FR")), IsEmpty());
    set_int(kCountry, 33);
    EXPECT_THAT(verify_spec(country("FR")), IsEmpty());
}

TEST_F(GeneralInfo, CountryIsExportedWhenReadable) {
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_COUNTRY_ISO), "");
    set_string(kCountry, "FR");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_COUNTRY_ISO), "FR");
}

} // namespace zel_test
