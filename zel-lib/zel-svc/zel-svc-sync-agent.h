#pragma once
// The platform's sync agent as the handlers use it: its lists and the information of its profiles, owned.
//
//     SyncProfiles profiles;
//     if (profiles.read())
//         for (std::size_t i = 0; i < profiles.size(); ++i) use(profiles.at(i));

#include <sync-agent.h>

#include <cstddef>
#include <memory>

struct SyncListFree {
    void operator()(GList *list) const { g_list_free(list); }
};
using SyncList = std::unique_ptr<GList, SyncListFree>;

struct SyncProfileFree {
    void operator()(sync_agent_ds_profile *profile) const { sync_agent_ds_free_profile_info(profile); }
};
using SyncProfile = std::unique_ptr<sync_agent_ds_profile, SyncProfileFree>;

// All profiles of the agent.
class SyncProfiles {
  public:
    SyncProfiles() = default;
    ~SyncProfiles() { release(); }
    SyncProfiles(const SyncProfiles &) = delete;
    SyncProfiles &operator=(const SyncProfiles &) = delete;

    bool read();
    // Releases before its time, for whoever wants to know: false when the agent refuses to take one back.
    bool release();

    [[nodiscard]] std::size_t size() const { return g_list_length(list_.get()); }
    [[nodiscard]] sync_agent_ds_profile *at(std::size_t index) const;

  private:
    SyncList list_;
};
