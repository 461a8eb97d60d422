#include "fault.h"

#include <string_view>
#include <vector>

namespace zel_host {
namespace {

struct KnownFaults {
    std::uint64_t change = 0;
    std::vector<Fault> faults;
};

void read_again(Phone &phone, KnownFaults &known, std::uint64_t change) {
    known.faults.clear();
    each_fault(phone, [&known](const Fault &fault, std::int64_t /*seen*/) { known.faults.push_back(fault); });
    known.change = change;
}

bool matches(const Fault &fault, const Function &row, std::string_view text) {
    if (fault.function != row.name) return false;
    if (fault.text.empty() || fault.text == text) return true;
    return row.part && text.find(fault.text) != std::string_view::npos;
}

// Counts a matching call, and says whether it is one of those that fail.
bool strikes(Phone &phone, const Fault &fault) {
    Query query = phone.store().query("UPDATE fault SET seen = seen + 1 WHERE id = ? RETURNING seen");
    query.bind(fault.id);
    if (!query.row()) return false;
    const std::int64_t seen = query.integer(0);
    query.run();
    return seen >= fault.from && (fault.times < 0 || seen < std::int64_t{fault.from} + fault.times);
}

} // namespace

const Fault *matching_fault(Phone &phone, const Function &row, const char *text) {
    static KnownFaults known;
    const std::uint64_t change = phone.page().fault_change.load();
    if (known.change != change) read_again(phone, known, change);
    const Fault *found = nullptr;
    for (const Fault &fault : known.faults)
        if (matches(fault, row, text) && strikes(phone, fault) && found == nullptr) found = &fault;
    return found;
}

std::int64_t add_fault(Phone &phone, const Fault &fault) {
    Query query = phone.store().query("INSERT INTO fault (function, text, first, times, result, error) "
                                      "VALUES (?, ?, ?, ?, ?, ?) RETURNING id");
    query.bind(fault.function).bind(fault.text).bind(fault.from).bind(fault.times).bind(fault.result).bind(fault.error);
    query.row();
    const std::int64_t id = query.integer(0);
    query.run();
    phone.page().fault_change.fetch_add(1);
    return id;
}

void each_fault(Phone &phone, const std::function<void(const Fault &fault, std::int64_t seen)> &use) {
    Query query =
        phone.store().query("SELECT id, function, text, first, times, result, error, seen FROM fault ORDER BY id");
    while (query.row())
        use({.id = query.integer(0),
             .function = query.text(1),
             .text = query.text(2),
             .from = static_cast<int>(query.integer(3)),
             .times = static_cast<int>(query.integer(4)),
             .result = static_cast<int>(query.integer(5)),
             .error = static_cast<int>(query.integer(6))},
            query.integer(7));
}

bool any_faults(Phone &phone) { return phone.page().fault_change.load(std::memory_order_relaxed) != 0; }

void clear_faults(Phone &phone) {
    phone.store().query("DELETE FROM fault").run();
    phone.page().fault_change.fetch_add(1);
}

} // namespace zel_host
