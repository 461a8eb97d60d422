#pragma once
// The alarm service, which owns the phone's time zone.

#ifdef __cplusplus
extern "C" {
#endif

// Makes the zone file at a phone path ("/usr/share/zoneinfo/Asia/Kolkata") the phone's time zone.
// Returns 0 on success and a negative number on failure.
int alarmmgr_set_timezone(const char *path);

#ifdef __cplusplus
}
#endif
