#pragma once
// What earlier installs recorded: every group of the section store as it is on disk, while this exists.
// Nothing is written back.

#include "base/zel-svc-guard.h"
#include "spec/zel-svc-data.h"

class ZelSvcRecordedGroups {
  public:
    ZelSvcRecordedGroups() {
        for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group)
            zel_svc_guarded([group] { zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 0); });
    }
    ZelSvcRecordedGroups(const ZelSvcRecordedGroups &) = delete;
    ZelSvcRecordedGroups &operator=(const ZelSvcRecordedGroups &) = delete;
    ~ZelSvcRecordedGroups() {
        for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group)
            zel_svc_data_free(group);
    }
};
