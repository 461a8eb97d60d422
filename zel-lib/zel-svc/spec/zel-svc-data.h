#pragma once
// The section store: what the customer's spec installed, one INI file a group, kept under
// "/opt/system/zel-default/data". Later runs, the export and other components read it.
//
//     zel_svc_data_load(ZEL_SVC_DATA_GPS, 0, 1);                          // start the group afresh
//     zel_svc_data_set_int(ZEL_SVC_DATA_GPS, "gps", "gps_activation", 1);
//     zel_svc_data_dump(ZEL_SVC_DATA_GPS, 0);
//     zel_svc_data_free(ZEL_SVC_DATA_GPS);
//
// A group is unloaded until zel_svc_data_load() succeeds; writes to an unloaded group are lost and reads
// give the default. Nothing is logged or reported, one warning excepted: a line feed in a string cannot be
// stored and becomes a blank.

#include <cstddef>
#include <string_view>

enum ZelSvcDataGroup : int {
    ZEL_SVC_DATA_MAIN = 0,
    ZEL_SVC_DATA_SECURITY = 1,
    ZEL_SVC_DATA_NETWORK = 2,
    ZEL_SVC_DATA_WB_AMR = 3,
    ZEL_SVC_DATA_CONTACT = 4,
    ZEL_SVC_DATA_CALENDAR = 5,
    ZEL_SVC_DATA_MULTIMEDIA = 6,
    ZEL_SVC_DATA_CONNECTIVITY = 7,
    ZEL_SVC_DATA_VOICE_MAIL = 8,
    ZEL_SVC_DATA_MESSAGE = 9,
    ZEL_SVC_DATA_EMAIL = 10,
    ZEL_SVC_DATA_EMAIL_ACCOUNT = 11,
    ZEL_SVC_DATA_ACTIVE_SYNC = 12,
    ZEL_SVC_DATA_CONNECTION = 13,
    ZEL_SVC_DATA_FAST_DORMANCY = 14,
    ZEL_SVC_DATA_BOOKMARK = 15,
    ZEL_SVC_DATA_QUICK_ACCESS = 16,
    ZEL_SVC_DATA_BROWSER = 17,
    ZEL_SVC_DATA_SYNCML_DS = 18,
    ZEL_SVC_DATA_MAX_PDP = 19,
    ZEL_SVC_DATA_GPS = 20,
    ZEL_SVC_DATA_IMS = 21,
};
inline constexpr int ZEL_SVC_DATA_GROUP_COUNT = 22;

// Variant 2 is the second SIM's file of the five groups that have one; any other variant is the normal file.
inline constexpr unsigned ZEL_SVC_DATA_SIM1 = 0;
inline constexpr unsigned ZEL_SVC_DATA_SIM2 = 2;

// An index outside the groups selects the main file. `path` receives at most `size` bytes, terminated.
void zel_svc_data_get_path(int group, unsigned variant, char *path, std::size_t size);

void zel_svc_data_load(int group, unsigned variant, int create);
void zel_svc_data_dump(int group, unsigned variant);
void zel_svc_data_free(int group);

void zel_svc_data_set_int(int group, const char *section, const char *key, int value);
// At most 255 bytes are kept, cut at a whole character.
void zel_svc_data_set_str(int group, const char *section, const char *key, std::string_view value);
// A null key removes the whole section.
void zel_svc_data_unset(int group, const char *section, const char *key);

int zel_svc_data_get_int(int group, const char *section, const char *key, int fallback);
// Null when absent. The text belongs to the group. A string set in this run still has its quotes; one that
// was loaded from the file has none: zel_svc_data_get_text() hides the difference.
const char *zel_svc_data_get_str(int group, const char *section, const char *key);
// The string without its quotes; empty when absent.
std::string_view zel_svc_data_get_text(int group, const char *section, const char *key);
int zel_svc_data_find(int group, const char *section, const char *key);
