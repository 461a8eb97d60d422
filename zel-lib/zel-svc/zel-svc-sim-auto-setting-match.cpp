#include "zel-svc-sim-auto-setting-match.h"

#include "base/zel-svc-guard.h"
#include "base/zel-svc-text.h"
#include "zel-svc-sim-auto-setting-operators.h"

#include <algorithm>

namespace {

using Verdict = ZelSvcSimVerdict;

template <std::size_t N> std::string_view text_of(const char (&field)[N]) { return zel_svc_text_view(field, N); }

bool equal_but_for_case(std::string_view one, std::string_view other) {
    return std::equal(one.begin(), one.end(), other.begin(), other.end(),
                      [](char a, char b) { return zel_svc_text_lower(a) == zel_svc_text_lower(b); });
}

// The first thing that an entry asks for decides; what stands behind it is not looked at.
Verdict verdict_on(const ZelSvcSimOperator &entry, const ZelSvcSimInfo &sim) {
    const std::string_view mccmnc = text_of(sim.mccmnc);
    if (mccmnc.empty() || text_of(entry.mccmnc) != mccmnc) return Verdict::OtherNetwork;
    switch (zel_svc_sim_asks(entry)) {
    case ZelSvcSimAsks::Msin:
        return text_of(sim.msin).starts_with(text_of(entry.subset_code)) ? Verdict::Decisive : Verdict::OtherMsin;
    case ZelSvcSimAsks::Gid:
        return text_of(sim.gid) == text_of(entry.gid) ? Verdict::Decisive : Verdict::OtherGid;
    case ZelSvcSimAsks::SpName:
        return equal_but_for_case(text_of(sim.spn), text_of(entry.sp_name)) ? Verdict::Decisive : Verdict::OtherSpName;
    case ZelSvcSimAsks::Nothing:
        break;
    }
    return Verdict::Plain;
}

std::vector<std::size_t> choice(const std::vector<Verdict> &verdicts) {
    std::vector<std::size_t> plain;
    for (std::size_t number = 0; number < verdicts.size(); ++number) {
        if (verdicts[number] == Verdict::Decisive) return {number};
        if (verdicts[number] == Verdict::Plain) plain.push_back(number);
    }
    return plain;
}

std::int32_t copy_matches(const ZelSvcSimInfo &sim, ZelSvcSimOperator *list) {
    const std::span<const ZelSvcSimOperator> operators = zel_svc_sim_operators(ZelSvcOperatorsOf::ActiveCustomer);
    const ZelSvcSimMatch match = zel_svc_sim_match(operators, sim);
    std::transform(match.chosen.begin(), match.chosen.end(), list,
                   [operators](std::size_t number) { return operators[number]; });
    return static_cast<std::int32_t>(match.chosen.size());
}

} // namespace

ZelSvcSimAsks zel_svc_sim_asks(const ZelSvcSimOperator &entry) {
    if (entry.subset_code[0] != '\0') return ZelSvcSimAsks::Msin;
    if (entry.gid[0] != '\0') return ZelSvcSimAsks::Gid;
    return entry.sp_name[0] != '\0' ? ZelSvcSimAsks::SpName : ZelSvcSimAsks::Nothing;
}

ZelSvcSimMatch zel_svc_sim_match(std::span<const ZelSvcSimOperator> operators, const ZelSvcSimInfo &sim) {
    std::vector<Verdict> verdicts;
    for (const ZelSvcSimOperator &entry : operators)
        verdicts.push_back(verdict_on(entry, sim));
    std::vector<std::size_t> chosen = choice(verdicts);
    return {std::move(verdicts), std::move(chosen)};
}

void zel_svc_sim_auto_setting_get_operator_list_by_sim(const ZelSvcSimInfo *info, ZelSvcSimOperator *list,
                                                       int32_t *count) {
    if (!info || !list || !count) return;
    *count = 0;
    *count = zel_svc_guarded_or(0, [=] { return copy_matches(*info, list); });
}
