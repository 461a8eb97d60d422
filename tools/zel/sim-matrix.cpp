#include "sim-matrix.h"

#include "field-text.h"
#include "imsi.h"

#include <base/zel-svc-text.h>
#include <zel-svc-sim-auto-setting-match.h>

#include <algorithm>

namespace zel_command {
namespace {

using Asks = ZelSvcSimAsks;

class Matrix {
  public:
    explicit Matrix(std::span<const ZelSvcSimOperator> entries) : entries_(entries) {}

    [[nodiscard]] std::vector<Reached> all() const {
        std::vector<Reached> result;
        for (std::size_t number = 0; number < entries_.size(); ++number)
            result.push_back(of(number));
        for (std::size_t number = 0; number < entries_.size(); ++number)
            result[number].but_for = takers(number, result);
        return result;
    }

  private:
    [[nodiscard]] bool same_network(std::size_t one, std::size_t other) const {
        return field_text(entries_[one].mccmnc) == field_text(entries_[other].mccmnc);
    }
    // An entry that asks for nothing is looked at behind all that ask for something.
    [[nodiscard]] bool goes_before(std::size_t one, std::size_t other) const {
        if (one == other || !same_network(one, other) || zel_svc_sim_asks(entries_[one]) == Asks::Nothing) return false;
        return one < other || zel_svc_sim_asks(entries_[other]) == Asks::Nothing;
    }
    // First digits of MSINs that entries before this one take.
    [[nodiscard]] std::vector<std::string> taken_before(std::size_t number) const {
        std::vector<std::string> taken;
        for (std::size_t other = 0; other < entries_.size(); ++other)
            if (goes_before(other, number) && zel_svc_sim_asks(entries_[other]) == Asks::Msin)
                taken.push_back(field_text(entries_[other].subset_code));
        return taken;
    }
    [[nodiscard]] std::string why_no_sim(std::size_t number) const;
    [[nodiscard]] ZelSvcSimInfo likeliest_sim(std::size_t number) const;
    [[nodiscard]] Reached of(std::size_t number) const;
    [[nodiscard]] bool takes_some(std::size_t other, std::size_t number) const;
    [[nodiscard]] std::vector<std::size_t> takers(std::size_t number, const std::vector<Reached> &all) const;

    std::span<const ZelSvcSimOperator> entries_;
};

// What keeps every SIM from an entry, whatever the other entries are.
std::string Matrix::why_no_sim(std::size_t number) const {
    const ZelSvcSimOperator &entry = entries_[number];
    const std::string mccmnc = field_text(entry.mccmnc);
    if (!is_mccmnc(mccmnc)) return "no SIM has the MCC+MNC '" + mccmnc + "': it is not five or six digits";
    const std::string subset = field_text(entry.subset_code);
    if (!is_digits(subset)) return "no MSIN begins with '" + subset + "': it is not digits";
    return {};
}

ZelSvcSimInfo Matrix::likeliest_sim(std::size_t number) const {
    const ZelSvcSimOperator &entry = entries_[number];
    const std::string mccmnc = field_text(entry.mccmnc);
    const std::string msin =
        free_msin(field_text(entry.subset_code), taken_before(number), kImsiDigits - mccmnc.size());
    ZelSvcSimInfo sim{};
    zel_svc_text_copy(sim.mccmnc, sizeof sim.mccmnc, mccmnc);
    // Where others take every MSIN, any will do to see who gets it.
    zel_svc_text_copy(sim.msin, sizeof sim.msin,
                      msin.empty() ? free_msin(field_text(entry.subset_code), {}, kImsiDigits - mccmnc.size()) : msin);
    if (zel_svc_sim_asks(entry) == Asks::Gid) zel_svc_text_copy(sim.gid, sizeof sim.gid, field_text(entry.gid));
    if (zel_svc_sim_asks(entry) == Asks::SpName) zel_svc_text_copy(sim.spn, sizeof sim.spn, field_text(entry.sp_name));
    return sim;
}

Reached Matrix::of(std::size_t number) const {
    Reached result;
    result.why = why_no_sim(number);
    if (!result.why.empty()) return result;
    const ZelSvcSimInfo sim = likeliest_sim(number);
    const ZelSvcSimMatch match = zel_svc_sim_match(entries_, sim);
    if (std::find(match.chosen.begin(), match.chosen.end(), number) == match.chosen.end()) {
        result.instead = match.chosen;
        result.why = zel_svc_sim_asks(entries_[number]) == Asks::Nothing
                         ? "entries that ask for first digits of the MSIN take every SIM"
                         : "entries before it take every SIM that it asks for";
        return result;
    }
    result.reach = match.chosen.size() > 1 ? Reach::Asked : Reach::Alone;
    if (result.reach == Reach::Asked) result.asked = match.chosen;
    if (sim.gid[0] != '\0' || sim.spn[0] != '\0') result.reach = Reach::Caller;
    return result;
}

// Whether some SIM that has what both ask for goes to the other one.
bool Matrix::takes_some(std::size_t other, std::size_t number) const {
    if (!goes_before(other, number)) return false;
    const Asks asks = zel_svc_sim_asks(entries_[number]);
    if (asks != zel_svc_sim_asks(entries_[other])) return true;
    return asks == Asks::Msin &&
           field_text(entries_[other].subset_code).starts_with(field_text(entries_[number].subset_code));
}

std::vector<std::size_t> Matrix::takers(std::size_t number, const std::vector<Reached> &all) const {
    std::vector<std::size_t> result;
    if (all[number].reach == Reach::Nothing) return result;
    for (std::size_t other = 0; other < entries_.size(); ++other)
        if (all[other].reach != Reach::Nothing && takes_some(other, number)) result.push_back(other);
    return result;
}

} // namespace

std::string free_msin(const std::string &prefix, std::span<const std::string> taken, std::size_t digits) {
    if (prefix.size() > digits) return {};
    const auto begins_with = [&](const std::string &text) { return prefix.starts_with(text); };
    if (std::any_of(taken.begin(), taken.end(), begins_with)) return {};
    const auto goes_on = [&](const std::string &text) { return text.size() <= digits && text.starts_with(prefix); };
    if (std::none_of(taken.begin(), taken.end(), goes_on)) return prefix + std::string(digits - prefix.size(), '0');
    for (char digit = '0'; digit <= '9'; ++digit)
        if (std::string found = free_msin(prefix + digit, taken, digits); !found.empty()) return found;
    return {};
}

std::vector<Reached> reached(std::span<const ZelSvcSimOperator> entries) { return Matrix{entries}.all(); }

} // namespace zel_command
