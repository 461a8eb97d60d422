#pragma once
// A phone with a package whose operators a SIM decides on.

#include "program.h"

namespace zel_test {

struct SimCommand : ZelCommand {
    void SetUp() override;

    // The package's list of AAA and BBB, which promises so many customers.
    void write_header(int customers);
    void write_networks(const std::string &customer, const std::string &networks, const std::string &settings = "");
    // One NetworkInfo; `more` is SPCode, SubsetCode or SPName.
    static std::string network(const std::string &name, const std::string &mccmnc, const std::string &more = "");
    static std::string one(const std::string &tag, const std::string &text) {
        return "<" + tag + ">" + text + "</" + tag + ">";
    }
    // Runs a command that must succeed.
    std::string run(const std::vector<std::string> &arguments);
};

struct TwoSimCommand : SimCommand {
    TwoSimCommand() { create_arguments["sims"] = 2; }
};

} // namespace zel_test
