#include "sim-cards.h"

#include "commands.h"
#include "failure.h"
#include "imsi.h"

#include <base/zel-svc-text.h>
#include <zel-svc-sim-auto-setting-log.h>

namespace zel_command {
namespace {

[[noreturn]] void refuse(const std::string &why) { throw Failure{kUsage, why, "See 'zel sim --help'."}; }

int slot_count(const Invocation &invocation) {
    return invocation.phone.call("status").at("sim_states").get<std::vector<int>>().size() > 1 ? 2 : 1;
}

void check_digits(const std::string &mccmnc, const std::string &msin) {
    if (!is_mccmnc(mccmnc)) refuse("--mccmnc takes the SIM's MCC and MNC: five or six digits, such as 21405");
    if (!is_digits(msin) || mccmnc.size() + msin.size() > kImsiDigits)
        refuse("--msin takes digits, with those of --mccmnc at most 15");
}

// Puts in what the bench phone's verb for it takes.
Json insertion(const Invocation &invocation, const ZelSvcSimInfo &card) {
    const std::string mccmnc = field_text(card.mccmnc);
    return {{"slot", chosen_slot(invocation)},
            {"mcc", mccmnc.substr(0, kMccDigits)},
            {"mnc", mccmnc.substr(kMccDigits)},
            {"msin", field_text(card.msin)},
            {"gid", invocation.value("gid")},
            {"spn", invocation.value("spn")},
            {"result", invocation.has("unreadable") ? -1 : 0}};
}

int show(const Invocation &invocation, const Json &slot, const std::string &text) {
    if (!invocation.json) {
        print_line("SIM " + slot.at("slot").dump() + ": " + text);
        return kDone;
    }
    Json answer = slot;
    if (answer.contains("msin")) answer["msin"] = shown_msin(bytes_of(slot, "msin"), invocation.reveal);
    print_json(answer);
    return kDone;
}

} // namespace

int chosen_slot(const Invocation &invocation) {
    if (!invocation.has("slot")) return 1;
    const std::string slot = invocation.value("slot");
    const int slots = slot_count(invocation);
    if (slot == "1" || (slot == "2" && slots == 2)) return slot == "2" ? 2 : 1;
    refuse("--slot is 1" + std::string{slots == 2 ? " or 2" : ": this phone has no other slot"});
}

std::vector<int> chosen_slots(const Invocation &invocation) {
    if (invocation.has("slot")) return {chosen_slot(invocation)};
    return slot_count(invocation) == 2 ? std::vector<int>{1, 2} : std::vector<int>{1};
}

std::string shown_msin(std::string_view msin, bool reveal) {
    if (reveal || msin.empty()) return std::string{msin};
    return zel_svc_sim_msin_shown(msin) + "***";
}

std::string shown_first_digits(std::string_view code, bool reveal) {
    return code == zel_svc_sim_msin_shown(code) ? std::string{code} : shown_msin(code, reveal);
}

ZelSvcSimInfo described_card(const Invocation &invocation) {
    ZelSvcSimInfo card{};
    const std::string mccmnc = invocation.value("mccmnc");
    const std::string msin = invocation.value("msin");
    check_digits(mccmnc, msin);
    zel_svc_text_copy(card.mccmnc, sizeof card.mccmnc, mccmnc);
    zel_svc_text_copy(card.msin, sizeof card.msin, msin);
    zel_svc_text_copy(card.gid, sizeof card.gid, invocation.value("gid"));
    zel_svc_text_copy(card.spn, sizeof card.spn, invocation.value("spn"));
    return card;
}

Json card_json(const ZelSvcSimInfo &card, bool reveal) {
    Json result = Json::object();
    put_text(result, "mccmnc", field_text(card.mccmnc));
    put_text(result, "msin", shown_msin(field_text(card.msin), reveal));
    put_text(result, "gid", field_text(card.gid));
    put_text(result, "spn", field_text(card.spn));
    return result;
}

std::string card_text(const Json &card) {
    constexpr std::pair<const char *, const char *> kParts[] = {{"msin", "MSIN"}, {"gid", "GID"}, {"spn", "SPN"}};
    std::string text = bytes_of(card, "mccmnc");
    for (const auto &[name, label] : kParts) {
        const std::string part = bytes_of(card, name);
        if (!part.empty()) text += std::string{", "} + label + " " + part;
    }
    return text;
}

std::string card_text(const ZelSvcSimInfo &card, bool reveal) { return card_text(card_json(card, reveal)); }

int sim_insert(Invocation &invocation) {
    const ZelSvcSimInfo card = described_card(invocation);
    const Json slot = invocation.phone.call("sim-insert", insertion(invocation, card));
    const std::string state = invocation.has("unreadable") ? "an unreadable card" : card_text(card, invocation.reveal);
    return show(invocation, slot, state);
}

int sim_remove(Invocation &invocation) {
    const Json slot = invocation.phone.call("sim-remove", {{"slot", chosen_slot(invocation)}});
    return show(invocation, slot, "no card");
}

} // namespace zel_command
