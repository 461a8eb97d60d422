#pragma once
// The phone's modems by slot: how many slots there are, and each one's modem name.

#include <string_view>

// Whether the modem names have been read. They do not change while a process lives.
extern bool gbZelSvcSimAutoSettingSimCpRead;

// Whether the phone has more than one SIM slot; logged.
bool zel_svc_sim_modems_are_several();

// Reads the modem names once per process; false when they cannot be read. Logged.
bool zel_svc_sim_modem_names_read();

// The name of a slot's modem: of the second for slot 2, of the first for any other. Empty when the phone has
// no such modem.
const char *zel_svc_sim_modem_name(int slot);
