// Which of the customer's operators a SIM belongs to.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-text.h"
#include "zel-svc-sim-auto-setting-operators.h"

#include <algorithm>

namespace {

enum class Match {
    None,
    Plain,    // the network's MCC and MNC, and nothing else to go by
    Decisive, // what tells this operator from others in the same network
};

template <std::size_t N> std::string_view text_of(const char (&field)[N]) { return zel_svc_text_view(field, N); }

Match decided(bool matches) { return matches ? Match::Decisive : Match::None; }

char lower(char letter) { return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter; }

bool equal_but_for_case(std::string_view one, std::string_view other) {
    return std::equal(one.begin(), one.end(), other.begin(), other.end(),
                      [](char a, char b) { return lower(a) == lower(b); });
}

// The first thing that an entry asks for decides; what stands behind it is not looked at.
Match match(const ZelSvcSimOperator &entry, const ZelSvcSimInfo &sim) {
    const std::string_view mccmnc = text_of(sim.mccmnc);
    if (mccmnc.empty() || text_of(entry.mccmnc) != mccmnc) return Match::None;
    const std::string_view subset = text_of(entry.subset_code);
    if (!subset.empty()) return decided(text_of(sim.msin).substr(0, subset.size()) == subset);
    const std::string_view gid = text_of(entry.gid);
    if (!gid.empty()) return decided(text_of(sim.gid) == gid);
    const std::string_view sp_name = text_of(entry.sp_name);
    if (!sp_name.empty()) return decided(equal_but_for_case(text_of(sim.spn), sp_name));
    return Match::Plain;
}

std::int32_t find_matches(const ZelSvcSimInfo &sim, ZelSvcSimOperator *list) {
    std::int32_t plain = 0;
    for (const ZelSvcSimOperator &entry : zel_svc_sim_operators(ZelSvcOperatorsOf::ActiveCustomer)) {
        const Match found = match(entry, sim);
        if (found == Match::Decisive) {
            list[0] = entry;
            return 1;
        }
        if (found == Match::Plain) list[plain++] = entry;
    }
    return plain;
}

} // namespace

void zel_svc_sim_auto_setting_get_operator_list_by_sim(const ZelSvcSimInfo *info, ZelSvcSimOperator *list,
                                                       int32_t *count) {
    if (!info || !list || !count) return;
    *count = 0;
    *count = zel_svc_guarded_or(0, [=] { return find_matches(*info, list); });
}
