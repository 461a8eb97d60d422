#include "base/zel-svc-active-customer.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-guard.h"
#include "base/zel-svc-key-text.h"
#include "base/zel-svc-run-log.h"
#include "base/zel-svc-text.h"
#include "zel-svc.h"

#include <vconf.h>
#include <zel-platform.h>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <string>

namespace {

constexpr const char *kSalesCodeKey = "db/zel/salescode";
constexpr const char *kCsaFolder = "/csa/zel";
constexpr std::string_view kDefaultCustomer = "DEF"; // of a phone that was never configured
constexpr std::size_t kCodeLength = 3;               // of a code in the files of /csa
constexpr off_t kCodeInProductCode = -3;             // from the product code's end

bool create_csa_folder() {
    char name[ZEL_PLATFORM_NAME_MAX];
    const ZelSvcFd parent{zel_platform_open_parent(kCsaFolder, name)};
    return parent && mkdirat(parent.get(), name, 0755) == 0;
}

void provide_csa_folder() {
    if (zel_svc_file_open(kCsaFolder, O_RDONLY | O_DIRECTORY))
        zel_svc_run_log("[SetActCustomerName] zel dir in csa existed.\n");
    else if (create_csa_folder())
        zel_svc_run_log("[SetActCustomerName/Success] zel dir in csa created.\n");
    else
        zel_svc_run_log("[SetActCustomerName/Error!!] zel dir in csa not created.\n");
}

bool write_csa_file(std::string_view code) {
    const ZelSvcFd file = zel_svc_file_open(ZEL_SVC_ACTIVE_CUSTOMER_PATH, O_RDWR | O_CREAT | O_TRUNC, 0644);
    return file && zel_svc_file_write_all(file.get(), code);
}

void store_in_csa(const std::string &code) {
    if (!write_csa_file(code)) {
        zel_svc_run_log("[SetActCustomerName/Error!!] Active customer in csa not opened.\n");
        return;
    }
    zel_svc_file_set_output_attr(ZEL_SVC_ACTIVE_CUSTOMER_PATH, "zel-manager");
    zel_svc_run_log("[SetActCustomerName/Success] Active customer('%s') set into csa.\n", code.c_str());
}

using CodeBytes = std::array<char, kCodeLength + 1>;

bool read_code(int fd, CodeBytes &code) {
    code.fill('\0');
    return zel_svc_file_read_all(fd, code.data(), kCodeLength) == kCodeLength;
}

bool seek_product_code(int fd) { return lseek(fd, kCodeInProductCode, SEEK_END) >= 0; }

bool write_product_code(int fd, std::string_view code) {
    return seek_product_code(fd) && zel_svc_file_write_all(fd, code.substr(0, kCodeLength));
}

void tell_product_code_changed(bool changed, const CodeBytes &old, const std::string &code) {
    if (changed)
        zel_svc_run_log("[SetActCustomerName/Success] Product code changed('%s'->'%s') into csa.\n", old.data(),
                        code.c_str());
    else
        zel_svc_run_log("[SetActCustomerName/Error!!] Product code in csa not updated.\n");
}

// A code longer than the three bytes never equals them, so its first three are written each time.
void update_product_code(int fd, const std::string &code) {
    CodeBytes old;
    if (!seek_product_code(fd)) return;
    if (!read_code(fd, old))
        tell_product_code_changed(false, old, code);
    else if (std::string_view{old.data(), kCodeLength} == code)
        zel_svc_run_log("[SetActCustomerName] Product code already changed('%s') into csa.\n", code.c_str());
    else if (old[0] == '\0' || code.size() < kCodeLength)
        zel_svc_run_log("[SetActCustomerName/Error!!] Product code in csa error.\n");
    else
        tell_product_code_changed(write_product_code(fd, code), old, code);
}

void store_in_product_code(const std::string &code) {
    if (!__zel_svc_config_file_exists(ZEL_SVC_PRODUCT_CODE_PATH)) {
        zel_svc_run_log("[SetActCustomerName] Product code in csa not existed.\n");
        return;
    }
    const ZelSvcFd file = zel_svc_file_open(ZEL_SVC_PRODUCT_CODE_PATH, O_RDWR);
    if (file)
        update_product_code(file.get(), code);
    else
        zel_svc_run_log("[SetActCustomerName/Error!!] Product code in csa not opened.\n");
}

void store_operator_keys(std::string_view code) {
    const ZelSvcOperatorRow &row = zel_svc_operator_row(code);
    vconf_set_int("db/zel/operator", row.operator_id);
    vconf_set_int("db/zel/operator_country", row.country);
    vconf_set_int("db/zel/operator_region", row.region);
    vconf_set_int("db/zel/operator_sim", row.sim);
}

// The three bytes of the file in /csa; empty, with a line that says why, when they are not there.
std::string code_in_csa() {
    const ZelSvcFd file = zel_svc_file_open(ZEL_SVC_ACTIVE_CUSTOMER_PATH, O_RDONLY);
    if (!file) {
        zel_svc_run_log("[GetActCustomerName/Warning] Active customer in csa not opened.\n");
        return {};
    }
    CodeBytes code;
    if (!read_code(file.get(), code)) {
        zel_svc_run_log("[GetActCustomerName/Warning] Active customer in csa is empty.\n");
        return {};
    }
    return {code.data(), kCodeLength};
}

// Empty when there is none.
std::string active_customer() {
    const std::optional<std::string> code = zel_svc_key_text(kSalesCodeKey);
    if (!code) zel_svc_run_log("[GetActCustomerName/Error!!] Get active customer name.\n");
    return code && *code != kDefaultCustomer ? *code : std::string{};
}

} // namespace

void zel_svc_config_set_active_customer_name(const char *customer) {
    if (!customer) return;
    zel_svc_guarded([=] { vconf_set_str(kSalesCodeKey, customer); });
    zel_svc_guarded([] { provide_csa_folder(); });
    zel_svc_guarded([=] { store_in_csa(customer); });
    zel_svc_guarded([=] { store_in_product_code(customer); });
    zel_svc_guarded([=] { store_operator_keys(customer); });
}

int zel_svc_config_get_active_customer_name(char *buffer, int size) {
    return zel_svc_guarded_or(0, [=] {
        if (buffer) zel_svc_text_copy(buffer, zel_svc_buffer_size(size), {});
        const std::string code = active_customer();
        if (buffer) zel_svc_text_copy(buffer, zel_svc_buffer_size(size), code);
        return code.empty() ? 0 : 1;
    });
}

int zel_svc_config_chk_active_customer_exist() { return zel_svc_config_get_active_customer_name(nullptr, 0); }

int zel_svc_config_get_active_customer_name_from_csa(char *buffer, int size) {
    return zel_svc_guarded_or(0, [=] {
        const std::size_t room = buffer ? zel_svc_buffer_size(size) : 0;
        if (room > 0) zel_svc_text_copy(buffer, room, {});
        const std::string code = code_in_csa();
        if (room == 0 || code.empty()) return 0;
        zel_svc_text_copy(buffer, room, code);
        return 1;
    });
}
