#pragma once
// Selective passes: one group of a customer's file is read again, everything else is left alone. The upgrade,
// the second SIM and the install of a SIM's operator are sequences of these.
//
//     zel_svc_selective_pass_run(ZEL_SVC_PASS_FAST_DORMANCY,
//                                {.wanted_flag = 0, .mode = ZEL_SVC_PARSE_MODE_FULL, .path = path});

#include "base/zel-svc-time-lap.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-element-id.h"
#include "spec/zel-svc-parse-context.h"

#include <array>
#include <span>
#include <string>

struct ZelSvcElementRange {
    ZelSvcElementId first;
    ZelSvcElementId last; // the same as `first` for a single element
};

inline constexpr int ZEL_SVC_PASS_NO_GROUP = -1;

struct ZelSvcSelectivePass {
    ZelSvcAutoFlag auto_flag; // ZEL_SVC_AUTO_NEVER: the pass always runs
    std::span<const ZelSvcElementRange> elements;
    int group; // of the section store, started afresh; or ZEL_SVC_PASS_NO_GROUP
};

enum ZelSvcPass : int {
    ZEL_SVC_PASS_NETWORK_INFO,
    ZEL_SVC_PASS_CONNECTIONS,
    ZEL_SVC_PASS_BOOKMARK,
    ZEL_SVC_PASS_VOICE_MAIL,
    ZEL_SVC_PASS_EMAIL_ACCOUNT,
    ZEL_SVC_PASS_WB_AMR,
    ZEL_SVC_PASS_FAST_DORMANCY,
    ZEL_SVC_PASS_MAX_PDP,
    ZEL_SVC_PASS_IMS,
    ZEL_SVC_PASS_COUNT,
};

const ZelSvcSelectivePass &zel_svc_selective_pass(ZelSvcPass pass);

// What all passes of one sequence have in common.
struct ZelSvcPassSequence {
    int wanted_flag; // a pass with an Auto flag runs only while the flag has this value
    ZelSvcParseMode mode;
    unsigned variant; // of the groups' files, see ZEL_SVC_DATA_SIM2
    std::string path; // of the customer's file; empty: no file
};

// Runs a pass, and takes its time in a lap's slot, when its flag has the wanted value. Whatever the file
// holds or lacks, the group's file is rewritten.
void zel_svc_selective_pass_run(ZelSvcPass pass, const ZelSvcPassSequence &sequence, int lap = ZEL_TIME_LAP_NONE);

// Reads the Auto flags of a customer's file into the parse context. False, and the flags as they were, when the
// file cannot be read.
bool zel_svc_selective_pass_read_auto_flags(const std::string &path,
                                            ZelSvcParseAction action = ZEL_SVC_PARSE_ACTION_INSTALL);

// Enables exactly these elements; no element ends the parse early.
void zel_svc_selective_enable(std::span<const ZelSvcElementRange> elements);

// Parses one customer's file with exactly these elements enabled; false when it cannot be read.
bool zel_svc_selective_parse(std::span<const ZelSvcElementRange> elements, ZelSvcParseMode mode, const char *path,
                             ZelSvcParseAction action = ZEL_SVC_PARSE_ACTION_INSTALL);
