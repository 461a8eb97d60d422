#include "zel-svc-sync-agent.h"

bool SyncProfiles::read() {
    release();
    GList *list = nullptr;
    if (sync_agent_ds_get_all_profile(&list) != 0) return false;
    list_.reset(list);
    return true;
}

bool SyncProfiles::release() {
    bool taken_back = true;
    for (std::size_t i = 0; i < size(); ++i)
        taken_back = sync_agent_ds_free_profile_info(at(i)) == 0 && taken_back;
    list_.reset();
    return taken_back;
}

sync_agent_ds_profile *SyncProfiles::at(std::size_t index) const {
    return static_cast<sync_agent_ds_profile *>(g_list_nth_data(list_.get(), static_cast<guint>(index)));
}
