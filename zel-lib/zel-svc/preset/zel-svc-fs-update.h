#pragma once
// The file-system update: files that a package puts onto the phone, and small scripted file operations.
// Each package folder has a tree "fs" that mirrors the phone's root and a script "zel-fsupdate.ini":
//
//     [rel]            run at a full install, behind the copy of the tree
//     version = 2
//     1_rm = /opt/old
//     [up_always]      run at every upgrade
//     [up_1]           run at an upgrade of a phone whose version is lower
//     version = 2
//     1_cp = /opt/new
//
// What was applied last is kept in a state file, a version for the defaults and one for each customer.

#include "base/zel-svc-ini.h"

#include <string>
#include <string_view>

inline constexpr const char *ZEL_SVC_FS_UPDATE_STATE_PATH = "/opt/system/zel-default/fsupdate/zel-fsupdate-info.ini";

// Kind 0 is the full install, any other value an upgrade.
void zel_svc_fs_update(std::string_view customer, int kind);

// Runs the operations "1_rm", "2_cp_r", ... of one section of a package's script, to the first number
// that is missing.
void zel_svc_fs_update_run_section(std::string_view package, const ZelSvcIni &script, const std::string &section);
