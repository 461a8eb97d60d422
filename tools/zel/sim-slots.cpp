// What the phone's SIM slots hold, and which operator each one brought.

#include "commands.h"
#include "failure.h"
#include "sim-cards.h"
#include "sim-operators.h"

#include <base/zel-svc-text.h>
#include <zel-svc-sim-auto-setting-slot.h>

namespace zel_command {
namespace {

constexpr const char *kFeature[] = {"off", "on", "on, and waits for the user's choice"};

std::string text_key(const Invocation &invocation, const char *key) {
    Json entry;
    return invocation.phone.try_call("vconf-get", {{"key", key}}, entry) == 0 ? bytes_of(entry, "value") : "";
}

bool is_set(const Invocation &invocation, const char *key) {
    Json entry;
    if (invocation.phone.try_call("vconf-get", {{"key", key}}, entry) != 0) return false;
    const Json &value = entry.at("value");
    return value.is_boolean() ? value.get<bool>() : value == 1;
}

// The SIM that the phone saw last time.
ZelSvcSimInfo known_sim(const Invocation &invocation, const ZelSvcSimSlot &slot) {
    ZelSvcSimInfo sim{};
    zel_svc_text_copy(sim.mccmnc, sizeof sim.mccmnc, text_key(invocation, slot.mccmnc.key));
    zel_svc_text_copy(sim.msin, sizeof sim.msin, text_key(invocation, slot.msin.key));
    return sim;
}

Json slot_json(const Invocation &invocation, int number) {
    const ZelSvcSimSlot &slot = zel_svc_sim_slot(number);
    const Json held = invocation.phone.call("sim", {{"slot", number}});
    Json result{{"slot", number}, {"state", held.at("state")}, {"modem", held.at("modem")}, {"card", held.at("card")}};
    ZelSvcSimInfo card{};
    const bool read = zel_svc_sim_auto_setting_get_sim_info(&card, number) == 1;
    result["readable"] = read;
    if (read) {
        result["sim"] = card_json(card, invocation.reveal);
        // The card has them, whether or not the phone reads them.
        put_text(result["sim"], "gid", bytes_of(held, "gid"));
        put_text(result["sim"], "spn", bytes_of(held, "spn"));
    }
    result["seen_last_time"] = card_json(known_sim(invocation, slot), invocation.reveal);
    result["seen_last_time"].erase("gid");
    result["seen_last_time"].erase("spn");
    result["changed"] = is_set(invocation, slot.changed.key);
    result["user_is_asked"] = is_set(invocation, slot.selection.key);
    return result;
}

std::string or_none(const std::string &text) { return text.empty() ? "none" : text; }

std::string card_line(const Json &slot) {
    if (!slot.at("card")) return "none";
    if (!slot.at("readable")) return "cannot be read";
    return card_text(slot.at("sim"));
}

std::string known_line(const Json &slot) { return or_none(card_text(slot.at("seen_last_time"))); }

ZelSvcSimOperator active_operator(int slot) {
    ZelSvcSimOperator entry{};
    zel_svc_sim_auto_setting_get_active_operator(&entry, slot);
    return entry;
}

Json active_json(const Invocation &invocation, int slot) {
    Json result = operator_json_of_card(active_operator(slot), 0, invocation.reveal);
    result.erase("number");
    result["slot"] = slot;
    return result;
}

std::string active_text(const Invocation &invocation, int slot) {
    const ZelSvcSimOperator entry = active_operator(slot);
    const std::string network = field_text(entry.network_name);
    if (network.empty()) return "none";
    const std::string asked = asked_text_of_card(entry, invocation.reveal);
    return network + " (" + field_text(entry.mccmnc) + (asked.empty() ? "" : ", " + asked) + ") of " +
           field_text(entry.customer_name);
}

void print_slot(const Invocation &invocation, const Json &slot) {
    const int number = slot.at("slot");
    print_line("\nSIM " + std::to_string(number));
    print_table({}, {{"  state", slot.at("state").dump()},
                     {"  modem", bytes_of(slot, "modem")},
                     {"  card", card_line(slot)},
                     {"  seen last time", known_line(slot)},
                     {"  changed", slot.at("changed") ? "yes" : "no"},
                     {"  user is asked", slot.at("user_is_asked") ? "yes" : "no"},
                     {"  operator", active_text(invocation, number)}});
}

} // namespace

int sim_info(Invocation &invocation) {
    const int feature = zel_svc_sim_auto_setting_chk_feature_enable();
    Json answer{{"feature", feature}, {"slots", Json::array()}};
    for (const int slot : chosen_slots(invocation)) {
        Json shown = slot_json(invocation, slot);
        shown["operator"] = active_json(invocation, slot);
        answer["slots"].push_back(std::move(shown));
    }
    if (invocation.json) {
        print_json(answer);
        return kDone;
    }
    print_line(std::string{"SIM auto setting is "} + kFeature[feature] + ".");
    for (const Json &slot : answer["slots"])
        print_slot(invocation, slot);
    return kDone;
}

int sim_active(Invocation &invocation) {
    Json answer = Json::array();
    std::vector<std::vector<std::string>> rows;
    for (const int slot : chosen_slots(invocation)) {
        answer.push_back(active_json(invocation, slot));
        rows.push_back({std::to_string(slot), active_text(invocation, slot)});
    }
    if (invocation.json)
        print_json(answer);
    else
        print_table({"SIM", "OPERATOR"}, rows);
    return kDone;
}

} // namespace zel_command
