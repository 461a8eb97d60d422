#pragma once
// The input-method framework: which keyboard the phone starts with and which is in use, by UUID.
// Both return 0 on success and a negative number on failure.

#ifdef __cplusplus
extern "C" {
#endif

int isf_control_set_initial_ise_by_uuid(const char *uuid);
int isf_control_set_active_ise_by_uuid(const char *uuid);

#ifdef __cplusplus
}
#endif
