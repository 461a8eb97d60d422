#pragma once
// What earlier installs recorded: every group of the section store as it is on disk, while this exists.
// Nothing is written back.

#include "base/zel-svc-guard.h"
#include "spec/zel-svc-data.h"

class ZelSvcRecordedGroups {
  public:
    ZelSvcRecordedGroups() {
        for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group)
            load(group);
    }
    ZelSvcRecordedGroups(const ZelSvcRecordedGroups &) = delete;
    ZelSvcRecordedGroups &operator=(const ZelSvcRecordedGroups &) = delete;
    ~ZelSvcRecordedGroups() {
        for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group)
            zel_svc_data_free(group);
    }

    // Whether there was memory for all that the files hold.
    [[nodiscard]] bool is_whole() const { return is_whole_; }

  private:
    void load(int group) {
        is_whole_ &= zel_svc_guarded_or(false, [group] {
            zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 0);
            return true;
        });
    }

    bool is_whole_ = true;
};
