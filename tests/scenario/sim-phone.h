#pragma once
// A phone whose SIM decides the operator: its customer's networks, its cards, its SIM logs.

#include "service-phone.h"

#include <string>
#include <vector>

namespace zel_test {

// One NetworkInfo element; an empty text leaves its element out.
struct Network {
    std::string name;
    std::string mccmnc;
    std::string sp_code = {};
    std::string subset_code = {};
    std::string sp_name = {};
};

class SimPhone : public ServicePhone {
  protected:
    // Makes TST the active customer, with the SIM auto setting switched on.
    void SetUp() override;

    static constexpr const char *kCheckLog = "/opt/system/zel-default/output/zel-sim-check.log";
    static constexpr const char *kCheckLog2 = "/opt/system/zel-default/output/zel-sim2-check.log";
    static constexpr const char *kSettingLog = "/opt/system/zel-default/output/zel-sim-setting.log";
    static constexpr const char *kSettingLog2 = "/opt/system/zel-default/output/zel-sim2-setting.log";

    // A customer's file; an empty sales code leaves its element out.
    void write_networks(const std::string &customer, const std::string &sales_code,
                        const std::vector<Network> &networks, const std::string &settings = "");
    void insert(int slot, const std::string &mcc, const std::string &mnc, const std::string &msin, int result = 0);
    void remove_sim(int slot) { call("sim-remove", {{"slot", slot}}); }

    // The system log, each message without the file, function and line in front.
    std::vector<std::string> messages();
    std::vector<std::string> lines_in(const std::string &phone_path); // none when the file is not there
    // The functions that the journal holds, each with its text: "vconf_set_int db/...".
    std::vector<std::string> journal();
};

struct TwoSimPhone : SimPhone {
    TwoSimPhone() { create_arguments["sims"] = 2; }
};

std::string element(const std::string &tag, const std::string &text);

} // namespace zel_test
