#include "program.h"

#include <gmock/gmock.h>

#include <fstream>
#include <iterator>

using namespace zel_test;
using ::testing::HasSubstr;
using ::testing::StartsWith;

namespace {

constexpr const char *kMark = "\xEF\xBB\xBF";
constexpr const char *kDocument = "/opt/system/zel-default/output/customer-phone.xml";
constexpr const char *kCustomer = "/opt/system/zel/mps/ZEL/Customer/XFV/customer.xml";

struct ZelExport : ZelCommand {
    void make_phone(const std::string &elements) {
        set_string("db/zel/salescode", "XFV");
        set_string("db/zel/country_iso", "GB");
        write(kCustomer, kMark + ("<CustomerData>\n" + elements) + "</CustomerData>\n");
    }
    static std::string content_of(const std::string &path) {
        std::ifstream file{path, std::ios::binary};
        return {std::istreambuf_iterator<char>{file}, {}};
    }
};

} // namespace

TEST_F(ZelExport, PrintsTheLibrarysDocument) {
    make_phone("");
    const Outcome outcome = run_zel({"export"});
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    EXPECT_EQ(outcome.out, read(kDocument));
    EXPECT_THAT(outcome.out,
                StartsWith(std::string{kMark} + "<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n<CustomerData>\n"
                                                "  <GeneralInfo>\n    <SalesCode>XFV</SalesCode>\n"
                                                "    <CountryISO>GB</CountryISO>\n  </GeneralInfo>\n"));
    EXPECT_EQ(json_of({"export"}), (nlohmann::json{{"document", outcome.out}, {"warnings", nlohmann::json::array()}}));
}

TEST_F(ZelExport, WritesTheDocumentToAFile) {
    make_phone("");
    const std::string folder = make_folder();
    for (const char *option : {"-o", "--output"}) {
        const Outcome outcome = run_zel({"export", option, folder + "/a.xml"});
        EXPECT_EQ(outcome.code, 0) << outcome.err;
        EXPECT_EQ(outcome.out, "");
        EXPECT_EQ(content_of(folder + "/a.xml"), read(kDocument));
    }
    const Outcome outcome = run_zel({"export", "-o", folder + "/missing/a.xml"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err,
                HasSubstr("cannot write the document to '" + folder + "/missing/a.xml': No such file or directory\n"));
    EXPECT_EQ(run_zel({"export", "-o", "-"}).out, read(kDocument));
    EXPECT_EQ(json_of({"export", "-o", folder + "/b.xml"}), (nlohmann::json{{"warnings", nlohmann::json::array()}}));
    EXPECT_EQ(content_of(folder + "/b.xml"), read(kDocument));
    remove_folder(folder);
}

TEST_F(ZelExport, InstallableHoldsThePackagesNetworksAsTheyStandThere) {
    make_phone("<GeneralInfo>\n<NetworkInfo>\n\t<MCCMNC>00101</MCCMNC><!-- one -->\n"
               "  <NetworkName>A &amp; B</NetworkName>\n </NetworkInfo >\n<!-- <NetworkInfo>no</NetworkInfo> -->\n"
               "<Unknown><NetworkInfo a=\"1\"/></Unknown></GeneralInfo>\n");
    const std::string plain = run_zel({"export"}).out;
    const Outcome outcome = run_zel({"export", "--installable"});
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    const std::string added = "    <NetworkInfo>\n\t<MCCMNC>00101</MCCMNC><!-- one -->\n"
                              "  <NetworkName>A &amp; B</NetworkName>\n </NetworkInfo >\n"
                              "    <NetworkInfo a=\"1\"/>\n";
    std::string expected = plain;
    const std::string behind = "    <CountryISO>GB</CountryISO>\n";
    expected.insert(expected.find(behind) + behind.size(), added);
    EXPECT_EQ(outcome.out, expected);
    EXPECT_EQ(read(kDocument), plain) << "the phone's own document has none";
}

// An element ends where the phone's reader ends it, whatever its end tag and its attributes say.
TEST_F(ZelExport, InstallableTakesEachNetworkAsAWhole) {
    const std::string networks[] = {
        "<NetworkInfo><NetworkInfo><SPCode>1</SPCode></NetworkInfo><SPName>outer</SPName></NetworkInfo>",
        "<NetworkInfo><SPName>odd end</SPName></Networkinfo>", "<NetworkInfo a=\"x>y\"/>",
        "<NetworkInfo></NetworkInfo>"};
    make_phone("<GeneralInfo>" + networks[0] + "<A/>" + networks[1] + "<SalesCode>XFV</SalesCode>" + networks[2] +
               networks[3] + "</GeneralInfo>");
    std::string added;
    for (const std::string &network : networks)
        added += "    " + network + "\n";
    const Outcome outcome = run_zel({"export", "--installable"});
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_THAT(outcome.out, HasSubstr("</CountryISO>\n" + added + "  </GeneralInfo>\n"));
}

TEST_F(ZelExport, InstallableOfAFileWithoutNetworksWarns) {
    make_phone("<GPS></GPS>");
    const Outcome outcome = run_zel({"export", "--installable"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_EQ(outcome.out, read(kDocument));
    EXPECT_THAT(outcome.err, HasSubstr(std::string{kCustomer} + " states no networks"));
}

TEST_F(ZelExport, InstallableNeedsACustomerWhoseFileIsWhole) {
    EXPECT_THAT(run_zel({"export", "--installable"}).err, HasSubstr("has no active customer"));
    EXPECT_EQ(run_zel({"export"}).code, 0) << "the phone says what it says";
    set_string("db/zel/salescode", "XFV");
    Outcome outcome = run_zel({"export", "--installable"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr(std::string{"cannot read "} + kCustomer));
    write(kCustomer, "<NetworkInfo></NetworkInfo>");
    outcome = run_zel({"export", "--installable"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr("no byte-order mark"));
    make_phone("<NetworkInfo></NetworkInfo>\n<A =1></A>");
    outcome = run_zel({"export", "--installable"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr(std::string{kCustomer} + ":3:"));
    EXPECT_EQ(outcome.out, "");
}

TEST_F(ZelExport, NamesEachValueThatNoOtherReaderUnderstands) {
    make_phone("");
    set_string("db/zel/country_iso", "a<b\n</CountryIS");
    write("/opt/system/zel-default/data/zel-default-data-gps.ini", "[gps]\ngps_activation = 1\n");
    const Outcome outcome = run_zel({"export"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_EQ(outcome.err, "zel: export: CustomerData/GeneralInfo/CountryISO: the value holds '<', which stands in the "
                           "document as it is\n"
                           "zel: export: CustomerData/Settings/GPS/GPSActivation: the phone's value could not be read "
                           "('?\?')\n");
    Outcome json = run_zel({"export", "--json"});
    EXPECT_EQ(nlohmann::json::parse(json.out)["warnings"].size(), 2U);
}

// A value may look like the document around it.
TEST_F(ZelExport, IsNotDeceivedByTagsInAValue) {
    make_phone("");
    write("/opt/system/zel-default/data/zel-default-data-gps.ini", "[gps]\ngps_activation = 1\n");
    for (const char *value :
         {"a</CountryISO>\nb", "a</CountryISO>\n    <CountryISO>b", "a</CountryISO>\n<Anything>\n</Anything>\n",
          "a</CountryISO>\n  </GeneralInfo>", "</CountryISO>\n", "a</CountryISO>\n  </GeneralInfo>\n  <Settings>\n"}) {
        set_string("db/zel/country_iso", value);
        const Outcome outcome = run_zel({"export"});
        EXPECT_EQ(outcome.err, "zel: export: CustomerData/GeneralInfo/CountryISO: the value holds '<', which stands in "
                               "the document as it is\n"
                               "zel: export: CustomerData/Settings/GPS/GPSActivation: the phone's value could not be "
                               "read ('?\?')\n")
            << value;
    }
}

TEST_F(ZelExport, SaysWhenTheDocumentCannotBeWritten) {
    make_phone("");
    fail("zel_platform_open_parent", kDocument);
    const Outcome outcome = run_zel({"export"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_THAT(outcome.err, HasSubstr(std::string{"the library cannot write "} + kDocument));
    EXPECT_EQ(outcome.out, "");
}
