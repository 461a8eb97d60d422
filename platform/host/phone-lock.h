#pragma once
// One program at a time may work on a phone as a whole; the others are told who does.

#include "phone.h"

#include <string>

namespace zel_host {

// Takes the phone's lock until the phone is closed. Throws VerbFailed naming the holder when another has it.
void take_lock(Phone &phone, const std::string &holder);

} // namespace zel_host
