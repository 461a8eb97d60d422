#pragma once
// Display power. Lock type 1 keeps the display on; a time-out of 0 milliseconds means until released.
// Both return 0 on success and a negative number on failure.

#ifdef __cplusplus
extern "C" {
#endif

int device_power_request_lock(int type, int timeout_ms);
int device_power_release_lock(int type);

#ifdef __cplusplus
}
#endif
