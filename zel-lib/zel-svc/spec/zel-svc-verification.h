#pragma once
// The lines of a verification: one per compared value, each passed or failed. At most 1000 lines of at most
// 305 bytes are kept; what comes after them is lost without a word.

#include <cstddef>
#include <string_view>

inline constexpr std::size_t ZEL_SVC_VERIFICATION_MAX = 1000;
inline constexpr std::size_t ZEL_SVC_VERIFICATION_LINE_SIZE = 306;

// Room for one formatted line with its terminator.
struct ZelSvcVerificationLine {
    char text[ZEL_SVC_VERIFICATION_LINE_SIZE];
};

// Empties the list: count 0, no lines, all flags 1.
void zel_svc_verification_clear_results();

// Appends a line, cut to its width. An empty line is ignored.
void zel_svc_verification_add_result(std::string_view line, bool matched);

// Formats "[label] Spec='spec',Phone='phone'" and appends it.
void zel_svc_verification_add_compared(std::string_view label, std::string_view spec, std::string_view phone,
                                       bool matched);

int zel_svc_verification_count();
// The line and flag at an index of the 1000 slots; an empty slot gives a null line and its flag.
const char *zel_svc_verification_line(std::size_t index);
int zel_svc_verification_flag(std::size_t index);
