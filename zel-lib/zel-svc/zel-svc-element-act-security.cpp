#include "zel-svc-element-act-security.h"

#include "base/zel-svc-number.h"
#include "handler/zel-svc-record.h"

#include <algorithm>
#include <iterator>

namespace {

using Locks = ZelSvcSecurityLock;

constexpr const char *kSection = "security";

// An empty text keeps the number that the table holds; it is recorded all the same.
std::int32_t number(std::string_view text, std::int32_t held) {
    return text.empty() ? held : zel_svc_number_from_text(text);
}

std::int32_t is_on(std::string_view text, std::int32_t /*held*/) { return text == "on" ? 1 : 0; }

struct LockNumber {
    ZelSvcElementId element;
    std::int32_t Locks::*field;
    std::int32_t (*read)(std::string_view text, std::int32_t held);
    const char *key;
};

constexpr LockNumber kNumbers[] = {
    {ZEL_SVC_ELEMENT_NB_NETWORK_LOCK, &Locks::network_lock_count, number, "net_lock_count"},
    {ZEL_SVC_ELEMENT_NB_SP_LOCK, &Locks::sp_lock_count, number, "sp_lock_count"},
    {ZEL_SVC_ELEMENT_NB_SUBSET_LOCK, &Locks::subset_lock_count, number, "subset_lock_count"},
    {ZEL_SVC_ELEMENT_NB_CP_LOCK, &Locks::cp_lock_count, number, "cp_lock_count"},
    {ZEL_SVC_ELEMENT_AUTO_SIM_LOCK, &Locks::auto_sim_lock, is_on, "auto_sim_lock"},
    {ZEL_SVC_ELEMENT_AUTO_SP_LOCK, &Locks::auto_sp_lock, is_on, "auto_sp_lock"},
    {ZEL_SVC_ELEMENT_UNLOCK_CNT, &Locks::unlock_count, number, "unlock_count"},
};

using LockText = char[20];

struct LockList {
    ZelSvcElementId element;
    LockText (Locks::*entries)[ZEL_SVC_MAX_LOCKS];
    const char *key; // of the entry with a number, counted from 0
};

constexpr LockList kLists[] = {
    {ZEL_SVC_ELEMENT_NETWORK_LOCK, &Locks::network_locks, "net_lock_%d"},
    {ZEL_SVC_ELEMENT_SP_LOCK, &Locks::sp_locks, "sp_lock_%d"},
    {ZEL_SVC_ELEMENT_SUBSET_LOCK, &Locks::subset_locks, "subset_lock_%d"},
    {ZEL_SVC_ELEMENT_CP_LOCK, &Locks::cp_locks, "cp_lock_%d"},
};

template <class Row, std::size_t N> const Row *row_of(const Row (&rows)[N], ZelSvcElementId element) {
    const auto *found =
        std::find_if(std::begin(rows), std::end(rows), [element](const Row &row) { return row.element == element; });
    return found == std::end(rows) ? nullptr : found;
}

void collect_number(const LockNumber &row, std::string_view text) {
    std::int32_t &held = zel_svc_collected_locks().*row.field;
    held = row.read(text, held);
    zel_svc_data_set_int(ZEL_SVC_DATA_SECURITY, kSection, row.key, held);
}

// What the table keeps of the text is what is recorded.
void collect_text(LockText &field, const char *key, std::int32_t index, std::string_view text) {
    zel_svc_text_copy(field, sizeof field, text);
    zel_svc_field_save(ZEL_SVC_DATA_SECURITY, kSection, {.record = {.key = key}}, index,
                       zel_svc_text_view(field, sizeof field));
}

void collect_entry(const LockList &row, std::int32_t index, std::string_view text) {
    if (index < 0 || index >= ZEL_SVC_MAX_LOCKS) return;
    collect_text((zel_svc_collected_locks().*row.entries)[index], row.key, index, text);
}

bool collects(const Occurrence &occurrence) {
    return occurrence.installs() && occurrence.mode == ZEL_SVC_PARSE_MODE_SECURITY_LOCK;
}

} // namespace

void zel_svc_element_act_security_start(Occurrence &occurrence) {
    if (occurrence.element == ZEL_SVC_ELEMENT_SECURITY && collects(occurrence)) zel_svc_collected_locks() = {};
}

void zel_svc_element_act_security_value(Occurrence &occurrence) {
    if (!collects(occurrence)) return;
    if (const LockNumber *row = row_of(kNumbers, occurrence.element)) return collect_number(*row, occurrence.text);
    if (const LockList *row = row_of(kLists, occurrence.element))
        return collect_entry(*row, occurrence.index, occurrence.text);
    if (occurrence.element == ZEL_SVC_ELEMENT_AUTO_NETWORK_LOCK)
        collect_text(zel_svc_collected_locks().auto_network_lock, "auto_net_lock", 0, occurrence.text);
}
