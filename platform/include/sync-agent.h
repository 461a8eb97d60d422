#pragma once
// The platform's sync agent, its SyncML data-sync accounts: a profile is an account at one server, with a
// service for each kind of data. A caller is the agent's client from sync_agent_ds_init() to
// sync_agent_ds_deinit(); calls outside of these fail.
//
//     GList *profiles = NULL;
//     if (sync_agent_ds_get_all_profile(&profiles) == 0)
//         for (guint i = 0; i < g_list_length(profiles); ++i)
//             sync_agent_ds_free_profile_info(g_list_nth_data(profiles, i));
//     g_list_free(profiles);
//
// Every function returns 0 on success, another number on failure; what it would have filled stays untouched
// then. Texts and service entries that a profile's information gives out belong to it and live until
// sync_agent_ds_free_profile_info(); lists are the caller's, to be released with g_list_free().

#include <glib.h>

#ifdef __cplusplus
extern "C" {
#endif

struct sync_agent_ds_profile; // the information of one profile

struct sync_agent_ds_server_info {
    const char *address;
    const char *user_id;
    const char *password;
};

// Absent texts are null.
struct sync_agent_ds_service_info {
    int type;    // 0 contacts, 1 calendar
    int enabled; // 1 when it takes part
    int source;  // the phone's own data base of that kind
    const char *database_name;
    const char *database_id;
    const char *database_password;
};

int sync_agent_ds_init(void);
int sync_agent_ds_deinit(void);

// A list of struct sync_agent_ds_profile *, one for each profile of the agent, oldest first. Each is released
// with sync_agent_ds_free_profile_info().
int sync_agent_ds_get_all_profile(GList **profiles);
int sync_agent_ds_free_profile_info(struct sync_agent_ds_profile *profile);

int sync_agent_ds_get_profile_name(struct sync_agent_ds_profile *profile, const char **name);
int sync_agent_ds_get_server_info(struct sync_agent_ds_profile *profile, struct sync_agent_ds_server_info *info);
// A list of struct sync_agent_ds_service_info *.
int sync_agent_ds_get_sync_service_info(struct sync_agent_ds_profile *profile, GList **services);

// New information, of no profile until it is added. Setting changes the information, not the agent.
int sync_agent_ds_create_profile_info(struct sync_agent_ds_profile **profile);
int sync_agent_ds_set_profile_name(struct sync_agent_ds_profile *profile, const char *name);
int sync_agent_ds_set_profile_attribute(struct sync_agent_ds_profile *profile, int attribute);
int sync_agent_ds_set_server_info(struct sync_agent_ds_profile *profile, const struct sync_agent_ds_server_info *info);
int sync_agent_ds_set_sync_info(struct sync_agent_ds_profile *profile, int mode, int type, int interval);
// Replaces the entry of the same type.
int sync_agent_ds_set_sync_service_info(struct sync_agent_ds_profile *profile,
                                        const struct sync_agent_ds_service_info *service);

int sync_agent_ds_add_profile(struct sync_agent_ds_profile *profile);
// Removes the profile from the agent; its information is released as always.
int sync_agent_ds_delete_profile(struct sync_agent_ds_profile *profile);

#ifdef __cplusplus
}
#endif
