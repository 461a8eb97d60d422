#pragma once
// Items that a service of the phone holds in a list of its own, such as bookmarks: how many there are, and how
// one of them compares with the spec's.

#include "handler/zel-svc-applies.h"
#include "handler/zel-svc-record.h"

#include <string>
#include <string_view>

// The number in an export; in a verification of the group a line that compares it as text. `count` is asked
// only when one of them needs it.
void zel_svc_phone_list_count(Occurrence &occurrence, ZelSvcAutoFlag flag, std::string_view label,
                              std::string (*count)());

// The failing line of an item that cannot be read.
void zel_svc_phone_list_add_unread(std::string_view item);

// The lines of the list's item number `number`, with 1 as the first; `phone` is null where it cannot be read.
template <class R>
void zel_svc_phone_list_compare(std::string_view label, int number, std::span<const Field<R>> fields, R &spec,
                                R *phone) {
    const std::string item = std::string{label} + std::to_string(number);
    if (!phone) return zel_svc_phone_list_add_unread(item);
    zel_svc_record_compare<R>(item, fields, spec, *phone);
}
