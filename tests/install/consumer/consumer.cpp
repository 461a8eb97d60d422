// Reads back, from C++ and in another process, the customer that the C program gave the phone.
#include <array>
#include <iostream>
#include <string_view>
#include <zel-svc.h>

int main() {
    std::array<char, 10> customer{};
    if (zel_svc_config_get_active_customer_name(customer.data(), static_cast<int>(customer.size())) != 1) return 1;
    std::cout << "consumer-cpp: " << customer.data() << '\n';
    return std::string_view{customer.data()} == "XFV" ? 0 : 1;
}
