#pragma once
// The groups of the section store: which are loaded, and how their entries come from and go to the file.

#include "base/zel-svc-ini.h"
#include "spec/zel-svc-data-entries.h"
#include "spec/zel-svc-data.h"

// A group is loaded while it has a dictionary. The dictionary is the file's side and is brought up to date
// when the group is dumped; the entries are what reads and writes work on.
struct ZelSvcDataGroupState {
    ZelSvcIni dictionary;
    ZelSvcDataEntries entries;
};

// The state of a group; an index outside the groups selects the main one.
ZelSvcDataGroupState &zel_svc_data_group(int group);
