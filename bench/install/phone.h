#pragma once
// The phone on which installs are measured: in memory where the machine can, one for the process.

#include <string>

namespace zel_bench {

class Phone {
  public:
    Phone(); // ends the program when no phone can be made
    Phone(const Phone &) = delete;
    Phone &operator=(const Phone &) = delete;
    ~Phone();

    // Makes the bytes the file of the customer.
    void write_customer(const std::string &bytes) const;
    // The network database as a new phone has it.
    void reset_database() const;
    // Everything that the network database holds, as a text.
    [[nodiscard]] std::string database_content() const;
    [[nodiscard]] long database_rows() const;

  private:
    [[nodiscard]] std::string database_file() const { return root_ + "/opt/dbspace/.dnet.db"; }

    std::string root_;
    std::string new_database_;
};

inline constexpr const char *kCustomer = "BIG";
inline constexpr const char *kCustomerFile = "/opt/system/zel/mps/ZEL/Customer/BIG/customer.xml";

std::string read_file(const std::string &path);

} // namespace zel_bench
