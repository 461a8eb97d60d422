#include "spec/zel-svc-data-entries.h"

#include "base/zel-svc-text.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace {

// As the INI library does it: other letters than A to Z are left alone.
std::string lower_case(std::string_view name) {
    std::string lower{name};
    std::transform(lower.begin(), lower.end(), lower.begin(), zel_svc_text_lower);
    return lower;
}

} // namespace

const ZelSvcDataEntry *ZelSvcDataEntries::find(std::string_view name) const {
    const auto found = index_.find(lower_case(name));
    return found == index_.end() ? nullptr : &*found->second;
}

void ZelSvcDataEntries::put(std::string_view name, std::string value, ZelSvcDataEntry::Form form) {
    std::string lower = lower_case(name);
    if (const auto found = index_.find(lower); found != index_.end()) {
        found->second->value = std::move(value);
        found->second->form = form;
        return;
    }
    list_.push_back({.name = std::move(lower), .value = std::move(value), .form = form});
    index_.emplace(list_.back().name, std::prev(list_.end()));
}

ZelSvcDataEntries::List::iterator ZelSvcDataEntries::erase(List::iterator entry) {
    index_.erase(entry->name);
    return list_.erase(entry);
}

void ZelSvcDataEntries::erase(std::string_view name) {
    if (const auto found = index_.find(lower_case(name)); found != index_.end()) erase(found->second);
}

void ZelSvcDataEntries::erase_section(std::string_view section) {
    const std::string keys = lower_case(section) + ':';
    for (auto entry = list_.begin(); entry != list_.end();)
        entry = entry->name.starts_with(keys) ? erase(entry) : std::next(entry);
    erase(section);
}

void ZelSvcDataEntries::clear() {
    index_.clear();
    list_.clear();
}
