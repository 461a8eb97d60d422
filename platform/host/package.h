#pragma once
// The customisation package of a phone: the folder /opt/system/zel.

#include "folder.h"
#include "phone.h"

#include <string>

namespace zel_host {

// Replaces the package with a copy of a workstation folder. Nothing outside that folder is read: links are
// copied as links, devices, sockets and FIFOs are skipped. On failure, which throws, the old package stays.
Copied replace_package(Phone &phone, const std::string &folder);

// Makes the phone as it left the factory: the platform's folders, empty databases, no keys but the slots',
// no log, no faults. Its package, its product code and its slots stay.
void reset_phone(Phone &phone);

} // namespace zel_host
