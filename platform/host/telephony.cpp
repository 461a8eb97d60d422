#include "call.h"
#include "modem.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <telephony.h>

// A connection knows its modem's name: faults and the journal tell the modems apart by it.
struct tel_handle {
    std::string name;
};

namespace zel_host {
namespace {

constexpr int kNoModem = -2; // the telephony service's error numbers here
constexpr int kNoCard = -3;

template <std::size_t N> void put(char (&field)[N], const std::string &text) {
    std::memset(field, 0, N);
    std::memcpy(field, text.c_str(), std::min(text.size(), N - 1));
}

std::optional<Modem> modem_named(Phone &phone, const char *name) {
    if (name == nullptr) return find_modem(phone, 1);
    for (Modem &modem : modems(phone))
        if (modem.name == name) return std::move(modem);
    return std::nullopt;
}

char **names_of(const std::vector<Modem> &all) {
    auto **names = static_cast<char **>(std::calloc(all.size() + 1, sizeof(char *)));
    for (std::size_t i = 0; names != nullptr && i < all.size(); ++i)
        names[i] = ::strdup(all[i].name.c_str());
    return names;
}

tel_handle *connect(Phone &phone, const char *name) {
    const std::optional<Modem> modem = modem_named(phone, name);
    return modem ? new tel_handle{modem->name} : nullptr;
}

int read_imsi(Phone &phone, const char *name, tel_sim_imsi *imsi) {
    const std::optional<Modem> modem = name == nullptr ? std::nullopt : modem_named(phone, name);
    if (!modem || imsi == nullptr) return kNoModem;
    if (!modem->card) return kNoCard;
    if (modem->card->result != 0) return modem->card->result;
    put(imsi->mcc, modem->card->mcc);
    put(imsi->mnc, modem->card->mnc);
    put(imsi->msin, modem->card->msin);
    return 0;
}

const char *name_of(const tel_handle *handle) { return handle == nullptr ? nullptr : handle->name.c_str(); }

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT char **tel_get_cp_name_list(void) {
    return answer<function("tel_get_cp_name_list")>([](Phone &phone) { return names_of(modems(phone)); });
}

ZEL_HOST_EXPORT struct tel_handle *tel_init(const char *cp_name) {
    return answer<function("tel_init")>([&](Phone &phone) { return connect(phone, cp_name); }, cp_name);
}

ZEL_HOST_EXPORT int tel_get_sim_imsi(struct tel_handle *handle, struct tel_sim_imsi *imsi) {
    const char *name = name_of(handle);
    return answer<function("tel_get_sim_imsi")>([&](Phone &phone) { return read_imsi(phone, name, imsi); }, name);
}

ZEL_HOST_EXPORT int tel_deinit(struct tel_handle *handle) {
    const char *name = name_of(handle);
    const int result = answer<function("tel_deinit")>([&](Phone &) { return handle == nullptr ? kNoModem : 0; }, name);
    // Freed also when the call is told to fail: its caller has no second way to give the connection back.
    delete handle;
    return result;
}
