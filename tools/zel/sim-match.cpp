// Which operator a SIM gets, and what kept it from every other one: the library's own verdicts, in words.

#include "commands.h"
#include "failure.h"
#include "sim-cards.h"
#include "sim-operators.h"

#include <zel-svc-sim-auto-setting-match.h>

#include <algorithm>

namespace zel_command {
namespace {

using Verdict = ZelSvcSimVerdict;

struct Question {
    ZelSvcSimInfo sim{};
    CustomerOperators operators;
    ZelSvcSimMatch match;
    bool reveal = false;

    [[nodiscard]] const ZelSvcSimOperator &entry(std::size_t number) const { return operators.entries[number]; }
    [[nodiscard]] bool is_chosen(std::size_t number) const {
        return std::find(match.chosen.begin(), match.chosen.end(), number) != match.chosen.end();
    }
    // The first entry that fits by more than MCC and MNC; none: the number of entries.
    [[nodiscard]] std::size_t decisive() const {
        const auto found = std::find(match.verdicts.begin(), match.verdicts.end(), Verdict::Decisive);
        return static_cast<std::size_t>(found - match.verdicts.begin());
    }
};

// The card that the options describe, or else the one in the slot, as the library reads it.
ZelSvcSimInfo card_in_question(const Invocation &invocation) {
    if (invocation.has("mccmnc")) return described_card(invocation);
    for (const char *part : {"msin", "gid", "spn"})
        if (invocation.has(part))
            throw Failure{kUsage, std::string{"--"} + part + " needs --mccmnc: the rest of the SIM",
                          "See 'zel sim match --help'."};
    ZelSvcSimInfo card{};
    const int slot = chosen_slot(invocation);
    if (zel_svc_sim_auto_setting_get_sim_info(&card, slot) == 1) return card;
    throw Failure{kFailed, "sim match: the SIM in slot " + std::to_string(slot) + " cannot be read",
                  "Describe one with --mccmnc, or put one in with 'zel sim insert'."};
}

std::string entry_name(const Question &question, std::size_t number) {
    return field_text(question.entry(number).network_name) + " (" + std::to_string(number + 1) + ")";
}

std::string lacking(const char *what, const char *field, const std::string &wanted) {
    if (field[0] == '\0') return std::string{"asks for "} + what + " " + wanted + ", and the SIM states none";
    return std::string{"asks for "} + what + " " + wanted + ", not the SIM's";
}

// What the card has. Its MSIN is known by as many digits as the entry asks for, so they are shown as an MSIN is.
std::string decisive_reason(const Question &question, const ZelSvcSimOperator &entry) {
    const ZelSvcSimAsks asks = zel_svc_sim_asks(entry);
    if (asks == ZelSvcSimAsks::Msin)
        return "the MSIN begins with " + shown_first_digits(field_text(entry.subset_code), question.reveal);
    if (asks == ZelSvcSimAsks::Gid) return "the GID is " + field_text(entry.gid);
    return "the SPN is " + field_text(entry.sp_name);
}

std::string other_network_reason(const ZelSvcSimOperator &entry) {
    if (entry.mccmnc[0] == '\0') return "it names no MCC+MNC, so no SIM is its own";
    return "the SIM's MCC+MNC is not " + field_text(entry.mccmnc);
}

std::string plain_reason(const Question &question, std::size_t number) {
    if (!question.is_chosen(number))
        return "fits by MCC+MNC alone, but " + entry_name(question, question.decisive()) + " fits by more";
    if (question.match.chosen.size() == 1) return "fits by MCC+MNC, and nothing else is asked for";
    return "fits by MCC+MNC, as others do: the user chooses";
}

std::string reason_of(const Question &question, std::size_t number) {
    const ZelSvcSimOperator &entry = question.entry(number);
    switch (question.match.verdicts[number]) {
    case Verdict::OtherNetwork:
        return other_network_reason(entry);
    case Verdict::OtherMsin:
        return lacking("an MSIN of", question.sim.msin, field_text(entry.subset_code) + "...");
    case Verdict::OtherGid:
        return lacking("GID", question.sim.gid, field_text(entry.gid));
    case Verdict::OtherSpName:
        return lacking("SPN", question.sim.spn, field_text(entry.sp_name));
    case Verdict::Plain:
        return plain_reason(question, number);
    case Verdict::Decisive:
        if (question.is_chosen(number)) return decisive_reason(question, entry);
        return decisive_reason(question, entry) + ", but " + entry_name(question, question.decisive()) + " comes first";
    }
    return {};
}

const char *word_for(Verdict verdict) {
    switch (verdict) {
    case Verdict::OtherNetwork:
        return "other_network";
    case Verdict::OtherMsin:
        return "other_msin";
    case Verdict::OtherGid:
        return "other_gid";
    case Verdict::OtherSpName:
        return "other_sp_name";
    case Verdict::Plain:
        return "plain";
    case Verdict::Decisive:
        return "decisive";
    }
    return "";
}

const char *result_of(const Question &question) {
    if (question.match.chosen.empty()) return "none";
    return question.match.chosen.size() == 1 ? "one" : "user_chooses";
}

// An entry whose code is not the card's says nothing about the card, and is shown as the package has it.
Json entry_json(const Question &question, std::size_t number) {
    const bool fits = question.match.verdicts[number] == Verdict::Decisive;
    Json entry = operator_json_of_card(question.entry(number), number, question.reveal || !fits);
    entry["verdict"] = word_for(question.match.verdicts[number]);
    entry["chosen"] = question.is_chosen(number);
    put_text(entry, "reason", reason_of(question, number));
    return entry;
}

Json json_of(const Question &question) {
    Json answer = Json::object();
    put_text(answer, "customer", question.operators.customer);
    answer["sim"] = card_json(question.sim, question.reveal);
    answer["result"] = result_of(question);
    answer["chosen"] = Json::array();
    for (const std::size_t number : question.match.chosen)
        answer["chosen"].push_back(number + 1);
    Json entries = Json::array();
    for (std::size_t number = 0; number < question.operators.entries.size(); ++number)
        entries.push_back(entry_json(question, number));
    answer["entries"] = std::move(entries);
    return answer;
}

std::string headline(const Question &question) {
    const std::vector<std::size_t> &chosen = question.match.chosen;
    if (chosen.empty()) return "No operator of " + question.operators.customer + " fits: nothing is installed.";
    if (chosen.size() == 1) return "Gets " + entry_name(question, chosen.front()) + ".";
    std::string text = "The user is asked:";
    for (const std::size_t number : chosen)
        text += (number == chosen.front() ? " " : ", ") + entry_name(question, number);
    return text + ".";
}

// Entries of the SIM's own network are what an operator engineer asks about, so they come first.
void print_entries(const Question &question, bool of_sims_network) {
    std::vector<std::vector<std::string>> rows;
    for (std::size_t number = 0; number < question.operators.entries.size(); ++number) {
        const ZelSvcSimOperator &entry = question.entry(number);
        const bool same = question.match.verdicts[number] != Verdict::OtherNetwork;
        if (same != of_sims_network) continue;
        rows.push_back({question.is_chosen(number) ? "->" : "", std::to_string(number + 1), field_text(entry.mccmnc),
                        field_text(entry.network_name), reason_of(question, number)});
    }
    if (rows.empty()) return;
    print_line("");
    print_table({"", "#", "MCC+MNC", "NETWORK", of_sims_network ? "VERDICT" : "PASSED OVER"}, rows);
}

} // namespace

int sim_match(Invocation &invocation) {
    Question question;
    question.reveal = invocation.reveal;
    question.sim = card_in_question(invocation);
    question.operators = operators_of(invocation, invocation.value("customer"));
    question.match = zel_svc_sim_match(question.operators.entries, question.sim);
    if (invocation.json) {
        print_json(json_of(question));
        return kDone;
    }
    print_line("SIM " + card_text(question.sim, question.reveal) + " on a phone of " + question.operators.customer);
    print_line(headline(question));
    print_entries(question, true);
    print_entries(question, false);
    return kDone;
}

} // namespace zel_command
