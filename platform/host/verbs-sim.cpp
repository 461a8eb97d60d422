#include "modem.h"
#include "text.h"
#include "verb.h"

namespace zel_host {
namespace {

// What the telephony client's record holds.
constexpr std::size_t kMostMccDigits = 3;
constexpr std::size_t kMostMncDigits = 3;
constexpr std::size_t kMostMsinDigits = 10;

Modem wanted_modem(Phone &phone, const Json &arguments) {
    const std::int64_t slot = number_of(arguments, "slot");
    if (slot < 1 || slot > kMostModems) throw WrongArguments("a slot is 1 or 2");
    std::optional<Modem> modem = find_modem(phone, static_cast<int>(slot));
    if (modem) return std::move(*modem);
    throw VerbFailed("the phone has " + std::to_string(slot_count(phone)) + " SIM slot(s), so no slot " +
                     std::to_string(slot));
}

std::string bounded(const Json &arguments, const char *name, std::size_t most) {
    std::string text = text_of(arguments, name);
    if (text.size() <= most) return text;
    throw WrongArguments(std::string(name) + " has at most " + std::to_string(most) + " digits");
}

Json shown(const Modem &modem) {
    Json result{{"slot", modem.slot}, {"state", modem.state}, {"card", modem.card.has_value()}};
    put_text(result, "modem", modem.name);
    if (!modem.card) return result;
    put_text(result, "mcc", modem.card->mcc);
    put_text(result, "mnc", modem.card->mnc);
    put_text(result, "msin", modem.card->msin);
    put_text(result, "gid", modem.card->gid);
    put_text(result, "spn", modem.card->spn);
    result["read_result"] = modem.card->result;
    return result;
}

Json keep(Phone &phone, const Modem &modem) {
    Transaction transaction(phone.store());
    store_modem(phone, modem);
    announce_slot(phone, modem);
    transaction.commit();
    return shown(modem);
}

Json sim(Phone &phone, const Json &arguments) {
    Modem modem = wanted_modem(phone, arguments);
    modem.state = static_cast<int>(number_of(arguments, "state", modem.state));
    modem.name = text_of(arguments, "modem", modem.name);
    return arguments.size() == 1 ? shown(modem) : keep(phone, modem);
}

Json insert(Phone &phone, const Json &arguments) {
    Modem modem = wanted_modem(phone, arguments);
    modem.state = kInserted;
    modem.card = Card{.mcc = bounded(arguments, "mcc", kMostMccDigits),
                      .mnc = bounded(arguments, "mnc", kMostMncDigits),
                      .msin = bounded(arguments, "msin", kMostMsinDigits),
                      .gid = text_of(arguments, "gid"),
                      .spn = text_of(arguments, "spn"),
                      .result = static_cast<int>(number_of(arguments, "result"))};
    return keep(phone, modem);
}

Json remove(Phone &phone, const Json &arguments) {
    Modem modem = wanted_modem(phone, arguments);
    modem.state = 0;
    modem.card.reset();
    return keep(phone, modem);
}

constexpr Argument kSlot = {.name = "slot", .type = ArgumentType::Integer, .required = true, .help = "Slot: 1 or 2"};
constexpr Argument kSimArguments[] = {
    kSlot,
    {.name = "state", .type = ArgumentType::Integer, .help = "State that the slot tells: 1 in use, 0 none, or other"},
    {.name = "modem", .help = "Name of the slot's modem"},
};
constexpr Argument kInsertArguments[] = {
    kSlot,
    {.name = "mcc", .required = true, .help = "Mobile country code, three digits"},
    {.name = "mnc", .required = true, .help = "Mobile network code, two or three digits"},
    {.name = "msin", .required = true, .help = "Subscriber number, the rest of the IMSI, at most ten digits"},
    {.name = "gid", .help = "Group identifier on the card"},
    {.name = "spn", .help = "Service provider name on the card"},
    {.name = "result", .type = ArgumentType::Integer, .help = "Of reading the IMSI: 0 (the default), or an error"},
};
constexpr Argument kRemoveArguments[] = {kSlot};

constexpr Verb kVerbs[] = {
    {.name = "sim", .help = "Show a SIM slot, or set its state or modem name", .arguments = kSimArguments, .run = sim},
    {.name = "sim-insert", .help = "Put a SIM card into a slot", .arguments = kInsertArguments, .run = insert},
    {.name = "sim-remove", .help = "Take the card out of a slot", .arguments = kRemoveArguments, .run = remove},
};

} // namespace

std::span<const Verb> sim_verbs() { return kVerbs; }

} // namespace zel_host
