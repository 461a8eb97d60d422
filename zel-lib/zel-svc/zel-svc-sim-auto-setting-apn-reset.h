#pragma once
// Tells the telephony daemon that the APN profiles of a slot are new.

// Calls "ResetProfile" of the slot's modem and waits for the answer, for the bus library's default time at
// most. Whatever goes wrong is logged, and the caller goes on.
void __zel_svc_sim_auto_setting_reset_apn_with_dbus(int slot);
