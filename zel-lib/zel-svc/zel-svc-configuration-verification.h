#pragma once
// The parts of a verification, in the order in which it has them. Each adds its lines to one list.

#include "base/zel-svc-internal-customer.h"
#include "base/zel-svc-text.h"
#include "zel-svc.h"

#include <span>
#include <string_view>

// A caller's list of ZEL_SVC_MAX_RESULTS entries and its count. What comes when it is full is lost.
class ZelSvcResultList {
  public:
    ZelSvcResultList(ZelSvcVerificationResult *results, std::int32_t *count) : results_(results), count_(count) {
        *count_ = 0;
    }

    // Adds a line, cut to an entry's width.
    void add(std::string_view text, bool passed);

    [[nodiscard]] bool is_full() const { return *count_ >= ZEL_SVC_MAX_RESULTS; }
    [[nodiscard]] std::span<const ZelSvcVerificationResult> entries() const {
        return {results_, static_cast<std::size_t>(*count_)};
    }

  private:
    ZelSvcVerificationResult *results_;
    std::int32_t *count_;
};

// Media folders now, against what they were after the install.
void zel_svc_config_verify_media(ZelSvcResultList &list);

// What the package tool reported of the applications.
void zel_svc_config_verify_applications(ZelSvcResultList &list);

// The customer's file, against the phone. Returns how many of its lines failed, those included for which the
// list has no room.
int zel_svc_config_verify_spec(std::string_view customer, ZelSvcResultList &list);

// Who was verified, as the report's head tells.
struct ZelSvcVerifiedPhone {
    FixedText<20> package_version;
    ZelSvcCurrentCustomer customer;
};

inline constexpr const char *ZEL_SVC_REPORT_PATH = "/opt/system/zel-default/output/zel-verification-report.log";

// Writes the report afresh; false when it cannot be opened. Only the lines of the customer's file decide
// whether the result is OK: a phone whose media or applications changed in use is still its customer's.
bool zel_svc_config_write_report(const ZelSvcVerifiedPhone &phone, const ZelSvcResultList &list, int failed);
