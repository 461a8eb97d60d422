#include "sim-phone.h"

namespace zel_test {

namespace {
constexpr const char *kPackage = "/opt/system/zel/mps/ZEL/";
constexpr const char *kStart = "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";
} // namespace

std::string SimCommand::network(const std::string &name, const std::string &mccmnc, const std::string &more) {
    return one("NetworkInfo", one("NetworkName", name) + one("MCCMNC", mccmnc) + more);
}

void SimCommand::write_networks(const std::string &customer, const std::string &networks, const std::string &settings) {
    const std::string info = one("GeneralInfo", one("SalesCode", customer) + networks);
    write(kPackage + ("Customer/" + customer) + "/customer.xml",
          kStart + one("CustomerData", info + one("Settings", one("Main", settings))) + "\n");
}

void SimCommand::write_header(int customers) {
    const std::string count = one("NbCustomer", std::to_string(customers));
    write(std::string{kPackage} + "SW_Configuration.xml",
          kStart + one("SW-Configuration",
                       one("CustomerDataSet", count + "<CustomerData src=\"/Customer/AAA/customer.xml\"/>"
                                                      "<CustomerData src=\"/Customer/BBB/customer.xml\"/>")));
}

// Customer AAA, active, has two operators in one network that a SIM tells apart, two that the user is asked
// about, and one that comes too late; BBB is another customer of the package.
void SimCommand::SetUp() {
    ZelCommand::SetUp();
    write_header(2);
    write_networks("AAA",
                   network("Home", "21405") + network("Young", "21405", one("SPCode", "98")) +
                       network("Late", "21405", one("SPCode", "987")) + network("North", "21401") +
                       network("South", "21401") + network("Brand", "21401", one("SPName", "Brand")),
                   one("Network", one("AutoVoicemail", "on")));
    write_networks("BBB", network("Elsewhere", "26201"));
    set_string("db/zel/salescode", "AAA");
    set_int("db/private/zel/sim_auto_enable", 1);
}

std::string SimCommand::run(const std::vector<std::string> &arguments) {
    const Outcome outcome = run_zel(arguments);
    EXPECT_EQ(outcome.code, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    return outcome.out;
}

} // namespace zel_test
