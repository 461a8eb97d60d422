#pragma once
// Making a phone in an empty folder.

#include "phone.h"

#include <optional>
#include <string>

namespace zel_host {

struct NewPhone {
    std::string root; // an empty folder, or one to be made
    int slots = 1;
    std::optional<std::string> product_code; // text of /csa/imei/prodcode.dat
};

// Throws VerbFailed.
std::unique_ptr<Phone> create_phone(const NewPhone &wanted);

} // namespace zel_host
