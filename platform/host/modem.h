#pragma once
// The phone's modems ("CP"), one for each SIM slot, and the card in each slot.

#include "phone.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace zel_host {

inline constexpr int kMostModems = 2;
inline constexpr int kInserted = 1; // the slot state of a card that is in use

struct Card {
    std::string mcc;
    std::string mnc;
    std::string msin;
    std::string gid; // group identifier and service provider name: on the card, but not part of the IMSI
    std::string spn;
    int result = 0; // of reading its IMSI: 0, or the error number of a card that cannot be read
};

struct Modem {
    int slot = 0;
    std::string name;
    int state = 0; // what the telephony side says of the slot: kInserted, 0 for none, or any other number
    std::optional<Card> card;
};

// The modems of a new phone, their slots empty.
void make_modems(Phone &phone);

// How many SIM slots the phone has.
int slot_count(Phone &phone);
// The modems of the phone's slots, in their order.
std::vector<Modem> modems(Phone &phone);
std::optional<Modem> find_modem(Phone &phone, int slot);
void store_modem(Phone &phone, const Modem &modem);

// Sets the keys by which the telephony side tells the number of slots and the state of each.
void announce_slots(Phone &phone);
// The same for one slot, as when a card comes or goes while the phone runs.
void announce_slot(Phone &phone, const Modem &modem);

} // namespace zel_host
