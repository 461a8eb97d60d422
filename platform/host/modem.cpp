#include "modem.h"

#include "keys.h"
#include "record.h"

#include <array>

namespace zel_host {
namespace {

constexpr const char *kCountKey = "memory/telephony/sim_slot_count";
constexpr std::array<const char *, kMostModems> kStateKeys{"memory/telephony/sim_slot", "memory/telephony/sim_slot2"};

Modem read(const Query &query) {
    Modem modem{.slot = static_cast<int>(query.integer(0)),
                .name = query.text(1),
                .state = static_cast<int>(query.integer(2)),
                .card = {}};
    if (query.null(3)) return modem;
    modem.card = Card{.mcc = query.text(3),
                      .mnc = query.text(4),
                      .msin = query.text(5),
                      .gid = query.text(6),
                      .spn = query.text(7),
                      .result = static_cast<int>(query.integer(8))};
    return modem;
}

void announce_state(Phone &phone, int slot, int state) {
    set_key(phone, kStateKeys.at(static_cast<std::size_t>(slot - 1)), KeyType::Integer, state);
}

} // namespace

void make_modems(Phone &phone) {
    for (int slot = 1; slot <= kMostModems; ++slot)
        store_modem(phone, {.slot = slot, .name = "modem" + std::to_string(slot), .state = 0, .card = {}});
}

int slot_count(Phone &phone) { return static_cast<int>(recorded_number(phone, "slots", 1)); }

std::vector<Modem> modems(Phone &phone) {
    const int slots = slot_count(phone);
    std::vector<Modem> result;
    Query query = phone.store().query(
        "SELECT slot, name, state, mcc, mnc, msin, gid, spn, result FROM modem WHERE slot <= ? ORDER BY slot");
    query.bind(slots);
    while (query.row())
        result.push_back(read(query));
    return result;
}

std::optional<Modem> find_modem(Phone &phone, int slot) {
    for (Modem &modem : modems(phone))
        if (modem.slot == slot) return std::move(modem);
    return std::nullopt;
}

void store_modem(Phone &phone, const Modem &modem) {
    Query query =
        phone.store().query("INSERT OR REPLACE INTO modem (slot, name, state, mcc, mnc, msin, gid, spn, result) "
                            "VALUES (?, ?, ?, ?, ?, ?, ?, ?, ?)");
    query.bind(modem.slot).bind(modem.name).bind(modem.state);
    if (modem.card) {
        query.bind(modem.card->mcc).bind(modem.card->mnc).bind(modem.card->msin);
        query.bind(modem.card->gid).bind(modem.card->spn).bind(modem.card->result).run();
        return;
    }
    query.bind_null().bind_null().bind_null().bind_null().bind_null().bind_null().run();
}

// The telephony side tells a first slot's state also on a phone that has none.
void announce_slots(Phone &phone) {
    set_key(phone, kCountKey, KeyType::Integer, slot_count(phone));
    announce_state(phone, 1, 0);
    for (const Modem &modem : modems(phone))
        announce_slot(phone, modem);
}

void announce_slot(Phone &phone, const Modem &modem) { announce_state(phone, modem.slot, modem.state); }

} // namespace zel_host
