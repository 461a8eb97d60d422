// A verification and an export of a bench phone, one of whose files holds any bytes. The first byte chooses it.

#include "spec/zel-svc-xml.h"
#include "support/temporary-folder.h"
#include "zel-svc.h"

#include <iniparser/iniparser.h>
#include <vconf.h>
#include <zel-host.h>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <span>
#include <string>
#include <string_view>

namespace {

namespace fs = std::filesystem;

constexpr std::string_view kMark = "\xEF\xBB\xBF";
constexpr const char *kCustomer = "/opt/system/zel/mps/ZEL/Customer/FUZ/customer.xml";
constexpr const char *kDocument = "/opt/system/zel-default/output/customer-phone.xml";
constexpr const char *kCountry = "db/zel/country_iso";

// An element for every file below, so that its bytes are compared with something.
constexpr const char *kElements =
    "<CustomerData><GeneralInfo><CountryISO>GB</CountryISO></GeneralInfo><Settings><Main><Network><NbMaxPDP>2</"
    "NbMaxPDP>"
    "<MaxPDP><MaxPDP2G>1</MaxPDP2G><MaxPDP3G>2</MaxPDP3G></MaxPDP><NbFastDormancy>1</NbFastDormancy><FastDormancy>"
    "<TimeoutValue>5</TimeoutValue></FastDormancy></Network></Main><Browser><NbQuickAccess>1</NbQuickAccess>"
    "<QuickAccess><QATitle>A</QATitle><QAURL>B</QAURL></QuickAccess></Browser><Connections><Profile><ProfileName>A"
    "</ProfileName></Profile></Connections></Settings></CustomerData>";

struct File {
    const char *path;
    std::string_view before; // stands in it while another file is chosen
};

const std::string kSpec = std::string{kMark} + kElements;

const File kFiles[] = {
    {kCustomer, kSpec},
    {"/opt/system/zel-default/app/appresult.ini",
     "[result]\ncount = 2\nresult_001 = success\ndescription_002 = op=x\n"},
    {"/opt/system/zel-default/app/applist.ini", "[zel packages]\nname_002 = a\n"},
    {"/opt/system/zel-default/output/zel-fs-status-config.ini", "[media]\nimage_size = 1\n"},
    {"/opt/system/zel-default/data/zel-default-data.ini", "[phone]\nlang_automatic = 0\n"},
    {"/opt/system/zel-default/data/zel-default-data-max-pdp.ini", "[max_pdp]\ncount = 1\nmax_pdp_2g_1 = 1\n"},
    {"/opt/system/zel-default/data/zel-default-data-fast-dormancy.ini", "[spec]\ncount = 1\ntime_out_1 = 5000\n"},
    {"/opt/system/zel-default/data/zel-default-data-quick-access.ini", "[quickaccess]\ncount = 1\ntitle_1 = A\n"},
    {"/opt/system/zel-default/data/zel-default-data-connection.ini", "[spec]\ncount = 1\nprofile_id_1 = 1\n"},
};

std::string gRoot;

void require(bool holds) {
    if (!holds) std::abort();
}

void write(const char *path, std::string_view bytes) {
    std::ofstream out{gRoot + path, std::ios::binary | std::ios::trunc};
    out.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    require(static_cast<bool>(out.flush()));
}

std::string read(const char *path) {
    std::ifstream in{gRoot + path, std::ios::binary};
    return {std::istreambuf_iterator<char>{in}, {}};
}

void verify() {
    static std::array<ZelSvcVerificationResult, ZEL_SVC_MAX_RESULTS> results;
    std::int32_t count = -1;
    require(zel_svc_config_verification(results.data(), &count) == 1);
    require(count >= 0 && count <= ZEL_SVC_MAX_RESULTS);
    for (const ZelSvcVerificationResult &result : std::span{results}.first(static_cast<std::size_t>(count))) {
        require(std::memchr(result.text, '\0', sizeof result.text) != nullptr && result.text[0] != '\0');
        require(result.passed == 0 || result.passed == 1);
    }
    std::array<char, 40> line;
    line.fill('x');
    require(zel_svc_config_verification_for_imei(line.data(), 20) >= 0);
    require(std::memchr(line.data(), '\0', 20) != nullptr && line[20] == 'x');
}

// Each broken INI file would be told on standard error.
int be_silent(const char * /*format*/, ...) { return 0; }

// Read to its end by the reader of spec files.
bool is_read(std::string_view document) {
    const ZelSvcXmlCallbacks callbacks{};
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(&callbacks, 0);
    const ZelSvcXmlResult result =
        zel_svc_xml_parse(parser, document.data(), static_cast<std::int32_t>(document.size()));
    zel_svc_xml_parser_destroy(parser);
    return result == ZEL_SVC_XML_OK;
}

void export_twice(bool holds_no_tag) {
    require(zel_svc_config_encoding_xml() == 1);
    const std::string document = read(kDocument);
    require(document.starts_with(std::string{kMark} + "<?xml ") && document.ends_with("</CustomerData>\n"));
    require(!holds_no_tag || is_read(std::string_view{document}.substr(kMark.size())));
    require(zel_svc_config_encoding_xml() == 1 && read(kDocument) == document);
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int * /*count*/, char *** /*arguments*/) {
    gRoot = zel_test::make_temporary_folder();
    char *answer = nullptr;
    require(zel_host_call(nullptr, "create", (R"({"root": ")" + gRoot + R"("})").c_str(), &answer) == 0);
    zel_host_free(answer);
    setenv("ZEL_ROOT", gRoot.c_str(), 1);
    std::atexit([] {
        std::error_code ignored;
        fs::remove_all(gRoot, ignored);
    });
    for (const File &file : kFiles) {
        fs::create_directories(fs::path{gRoot + file.path}.parent_path());
        write(file.path, file.before);
    }
    require(vconf_set_str("db/zel/salescode", "FUZ") == 0);
    iniparser_set_error_callback(be_silent);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const unsigned char *bytes, std::size_t size) {
    if (size == 0) return 0;
    const std::string_view text{reinterpret_cast<const char *>(bytes + 1), size - 1};
    const std::size_t choice = bytes[0] % (std::size(kFiles) + 1);
    const bool is_key = choice == std::size(kFiles);
    const bool is_customer = choice == 0;
    vconf_set_str(kCountry, is_key ? std::string{text}.c_str() : "GB");
    if (!is_key) write(kFiles[choice].path, is_customer ? std::string{kMark}.append(text) : std::string{text});
    verify();
    export_twice(text.find('<') == std::string_view::npos || is_customer);
    if (!is_key) write(kFiles[choice].path, kFiles[choice].before);
    return 0;
}
