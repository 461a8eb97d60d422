#include "sim-phone.h"

#include "support/lines.h"

namespace zel_test {

namespace {

std::string leaf(const std::string &tag, const std::string &text) { return text.empty() ? "" : element(tag, text); }

std::string network_info(const Network &network) {
    return element("NetworkInfo", leaf("NetworkName", network.name) + leaf("MCCMNC", network.mccmnc) +
                                      leaf("SPCode", network.sp_code) + leaf("SubsetCode", network.subset_code) +
                                      leaf("SPName", network.sp_name));
}

} // namespace

std::string element(const std::string &tag, const std::string &text) {
    return "<" + tag + ">" + text + "</" + tag + ">\n";
}

void SimPhone::SetUp() {
    ServicePhone::SetUp();
    set_string("db/zel/salescode", "TST");
    set_int("db/private/zel/sim_auto_enable", 1);
}

void SimPhone::write_networks(const std::string &customer, const std::string &sales_code,
                              const std::vector<Network> &networks, const std::string &settings) {
    std::string general = leaf("SalesCode", sales_code);
    for (const Network &network : networks)
        general += network_info(network);
    write_customer(customer, element("GeneralInfo", general) + settings);
}

void SimPhone::insert(int slot, const std::string &mcc, const std::string &mnc, const std::string &msin, int result) {
    call("sim-insert", {{"slot", slot}, {"mcc", mcc}, {"mnc", mnc}, {"msin", msin}, {"result", result}});
}

std::vector<std::string> SimPhone::messages() {
    std::vector<std::string> texts;
    for (const std::string &message : system_log()) {
        const std::size_t end = message.find(") > ");
        texts.push_back(end == std::string::npos ? "no prefix: " + message : message.substr(end + 4));
    }
    return texts;
}

std::vector<std::string> SimPhone::lines_in(const std::string &phone_path) {
    return exists(phone_path) ? lines_of(read(phone_path)) : std::vector<std::string>{};
}

std::vector<std::string> SimPhone::journal() {
    std::vector<std::string> calls;
    const nlohmann::json list = call("journal-list");
    for (const nlohmann::json &entry : list.at("calls")) {
        const nlohmann::json &text = entry.at("text");
        calls.push_back(entry.at("function").get<std::string>() +
                        (text.is_string() ? " " + text.get<std::string>() : std::string{}));
    }
    return calls;
}

} // namespace zel_test
