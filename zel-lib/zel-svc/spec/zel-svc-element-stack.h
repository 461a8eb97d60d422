#pragma once
// Which elements are open, how often each came, and which rows of the element table may fire.

#include "spec/zel-svc-element-id.h"

#include <cstdint>

// Open elements. A push of no element, or beyond ZEL_SVC_ELEMENT_MAX_DEPTH, stores nothing and returns 0.
int zel_svc_element_push(ZelSvcElementId id);
ZelSvcElementId zel_svc_element_pop();
ZelSvcElementId zel_svc_element_get_current_id();
// The element that encloses the current one, ZEL_SVC_ELEMENT_NONE when there is none.
ZelSvcElementId zel_svc_element_get_enclosing_id();
void zel_svc_element_stack_reset();

// Occurrences of a repeating element that have ended in this parse: the index of the one that is open.
std::int32_t zel_svc_element_get_count(ZelSvcElementId id);
void zel_svc_element_count_up(ZelSvcElementId id);
void zel_svc_element_counts_reset();

// Rows that may fire. An empty list enables every row; the list holds at most 50. The stop element ends the
// parse right after it closes.
inline constexpr std::int32_t ZEL_SVC_ELEMENT_MAX_ENABLED = 50;
void zel_svc_element_clear_enabled(); // unsets the stop element too
int zel_svc_element_enable(ZelSvcElementId id);
int zel_svc_element_is_enabled(ZelSvcElementId id);
void zel_svc_element_set_stop(ZelSvcElementId id);
int zel_svc_element_is_stop(ZelSvcElementId id);
