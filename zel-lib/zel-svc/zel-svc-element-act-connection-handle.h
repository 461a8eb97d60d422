#pragma once
// The table of profile handles that the `Connections` element being read has given so far.
//
//     const ZelSvcProfileHandle *handle = zel_svc_connection_find_handle("One");
//     zel_svc_connection_category(handle, "One MMS");   // 2, when the handle names it for MMS

#include "base/zel-svc-text.h"

#include <cstdint>
#include <optional>
#include <string_view>

struct ZelSvcProfileHandle {
    FixedText<40> network_name;
    FixedText<10> mccmnc; // the spec has none: always empty
    FixedText<200> browser;
    FixedText<200> mms;
    FixedText<200> internet_sharing;
    FixedText<200> ims;
    FixedText<200> xcap;
    FixedText<200> emergency_ims_call;
};
static_assert(sizeof(ZelSvcProfileHandle) == 1250);

inline constexpr std::size_t ZEL_SVC_PROFILE_HANDLE_MAX = 50;

// What telephony calls the services, in `svc_category_id`. A profile that no handle names serves the internet.
inline constexpr std::int32_t ZEL_SVC_CATEGORY_INTERNET = 1;

void zel_svc_connection_clear_handles();

// The first handle of exactly that network name; null without one.
const ZelSvcProfileHandle *zel_svc_connection_find_handle(std::string_view network_name);

// The service that a handle names a profile for; nothing when it names it for none.
std::optional<std::int32_t> zel_svc_connection_category(const ZelSvcProfileHandle *handle,
                                                        std::string_view profile_name);

// Fills a handle with the names of a network's default profiles in the network database. False, and the handle
// is left alone, when the database has no such network or fails.
bool __zel_svc_connection_read_profile_handle(const char *network_name, const char *mccmnc,
                                              ZelSvcProfileHandle &handle);

// Compares a handle of the spec with the phone's default profiles, a line for each name that the spec gives.
// None when the phone's cannot be read.
void __zel_svc_connection_verify_profile_handle(ZelSvcProfileHandle &spec);
