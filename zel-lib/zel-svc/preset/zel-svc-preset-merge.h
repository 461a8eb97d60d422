#pragma once
// The merged preset file: the defaults of every customer, then the customer's own over them, row by row.

#include "preset/zel-svc-preset-table.h"

#include <array>
#include <string_view>

// Which rows of the table are to be applied.
using ZelSvcPresetFlags = std::array<bool, ZEL_SVC_PRESET_COUNT>;

// Writes the merged file afresh and marks the rows to apply: at an install (kind 0) every row that a file
// holds, at an upgrade those that the last file with a mark for the row marks with 1. False when the file
// could not be written: nothing is to be applied then.
bool zel_svc_preset_merge(std::string_view customer, int kind, ZelSvcPresetFlags &chosen);
