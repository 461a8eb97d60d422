#pragma once
// The platform functions of the bench phone, a row each: what a call is called in the journal and in a
// fault, what its failing means, and which argument is the text that a fault may name.

#include <cstddef>
#include <iterator>
#include <string_view>

namespace zel_host {

enum class Failing {
    Result,      // the function returns the fault's number; what it would have filled stays untouched
    NullPointer, // the function returns a null pointer
    Nothing,     // the function has no result: it just does not do its work
};

struct Function {
    std::string_view name;
    Failing failing = Failing::Result;
    int result = -1;   // what it returns when it fails, unless a fault says otherwise
    int text = -1;     // number of the argument that is its text, from 0; -1: it has none
    bool part = false; // a fault's text matches when it is a part of the call's
};

inline constexpr Function kFunctions[] = {
    {.name = "vconf_get_int", .text = 0},
    {.name = "vconf_get_bool", .text = 0},
    {.name = "vconf_get_str", .failing = Failing::NullPointer, .text = 0},
    {.name = "vconf_set_int", .text = 0},
    {.name = "vconf_set_bool", .text = 0},
    {.name = "vconf_set_str", .text = 0},
    {.name = "__dlog_print", .text = 2},
    {.name = "db_util_open", .result = 14, .text = 0}, // SQLITE_CANTOPEN
    {.name = "db_util_close", .result = 5},            // SQLITE_BUSY
    {.name = "security_server_label_access", .text = 0},
    {.name = "smack_lgetlabel", .text = 0},
    {.name = "device_power_request_lock"},
    {.name = "device_power_release_lock"},
    {.name = "elm_init", .result = 0},
    {.name = "elm_shutdown", .result = 0},
    {.name = "uxt_theme_set_suitable_system_color_info_from_image", .text = 0},
    {.name = "tel_get_cp_name_list", .failing = Failing::NullPointer},
    {.name = "tel_init", .failing = Failing::NullPointer, .text = 0},
    {.name = "tel_get_sim_imsi", .text = 0}, // the modem's name
    {.name = "tel_deinit", .text = 0},
    {.name = "bookmark_zel_initialize"},
    {.name = "bookmark_zel_deinitialize"},
    {.name = "bookmark_zel_get_root"},
    {.name = "bookmark_zel_get_full_ids_p"},
    {.name = "bookmark_zel_get_info"},
    {.name = "bookmark_zel_get_duplicated_title_ids_p", .text = 0},
    {.name = "bookmark_zel_create", .text = 0},
    {.name = "bookmark_zel_reset"},
    {.name = "bookmark_zel_get_user_manual_url"},
    {.name = "bookmark_zel_set_user_manual_url", .text = 0},
    {.name = "sync_agent_ds_init"},
    {.name = "sync_agent_ds_deinit"},
    {.name = "sync_agent_ds_get_all_profile"},
    {.name = "sync_agent_ds_free_profile_info"},
    {.name = "sync_agent_ds_get_profile_name"},
    {.name = "sync_agent_ds_get_server_info"},
    {.name = "sync_agent_ds_get_sync_service_info"},
    {.name = "sync_agent_ds_create_profile_info"},
    {.name = "sync_agent_ds_set_profile_name", .text = 0},
    {.name = "sync_agent_ds_set_profile_attribute"},
    {.name = "sync_agent_ds_set_server_info", .text = 0},
    {.name = "sync_agent_ds_set_sync_info"},
    {.name = "sync_agent_ds_set_sync_service_info"},
    {.name = "sync_agent_ds_add_profile"},
    {.name = "sync_agent_ds_delete_profile"},
    {.name = "isf_control_set_initial_ise_by_uuid", .text = 0},
    {.name = "isf_control_set_active_ise_by_uuid", .text = 0},
    {.name = "alarmmgr_set_timezone", .text = 0},
    {.name = "system_info_get_value_string"},
    {.name = "zel_platform_open", .text = 0},
    {.name = "zel_platform_open_parent", .text = 0},
    {.name = "zel_platform_set_owner"},
    {.name = "zel_platform_get_owner"},
    {.name = "zel_platform_command", .text = 0},
    {.name = "zel_platform_sync", .failing = Failing::Nothing},
    {.name = "zel_platform_reboot"},
    {.name = "zel_platform_now"},
    // What is no function of the platform, but fails on phones: statements on databases that db_util_open()
    // opened (database-faults.h), and storage that is full (no file opens for writing, databases do not grow).
    {.name = "sqlite3_prepare_v2", .result = 18, .text = 0},        // SQLITE_TOOBIG
    {.name = "sqlite3_bind_text", .result = 18, .text = 0},         // SQLITE_TOOBIG
    {.name = "sqlite3_step", .result = 9, .text = 0, .part = true}, // SQLITE_INTERRUPT
    {.name = "disk_full", .text = 0},
};

// The number of a function's row; a name without a row does not compile.
consteval std::size_t function(std::string_view name) {
    for (std::size_t row = 0; row < std::size(kFunctions); ++row)
        if (kFunctions[row].name == name) return row;
    throw "no platform function has this name";
}

// The same for a name from outside; null without a row.
const Function *find_function(std::string_view name);

} // namespace zel_host
