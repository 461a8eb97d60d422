#pragma once
// What SIM auto setting decided, for people: a check log and a setting log for each slot.
//
//     zel_svc_sim_log_append(slot.check_log, zel_svc_sim_message("SIM%d normally inserted.", slot.number));
//
// An MSIN identifies a subscriber: logs hold its first three digits, and beside them only the subset code of an
// operator that it matched, whole.

#include "base/zel-svc-text.h"
#include "zel-svc.h"

#include <string>
#include <string_view>

using ZelSvcSimMessage = FixedText<306>;

// A formatted message, cut to 305 bytes.
__attribute__((format(printf, 1, 2))) ZelSvcSimMessage zel_svc_sim_message(const char *format, ...);

// Appends a message and a newline to a log; a log that cannot be opened is passed over.
void zel_svc_sim_log_append(const char *path, const ZelSvcSimMessage &message);

// The text of a record's field.
template <std::size_t N> std::string zel_svc_sim_text(const char (&field)[N]) {
    return std::string{zel_svc_text_view(field, N)};
}

// As much of an MSIN as is shown of it.
std::string zel_svc_sim_msin_shown(std::string_view msin);

// "XFV_Vodacom('65501',(Subset)'',(GID)'',(SPName)'')"
std::string zel_svc_sim_operator_text(const ZelSvcSimOperator &entry);
