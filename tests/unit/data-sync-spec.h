#pragma once
// Spec texts of data-sync accounts.

#include "services-phone.h"

namespace zel_test {

inline std::string database(const std::string &tag, const std::string &enabled, const std::string &prefix) {
    return leaf(tag, leaf("EnableFlag", enabled) + leaf("DBName", prefix + "-name") + leaf("DBId", prefix + "-id") +
                         leaf("DBPassword", prefix + "-secret"));
}

inline std::string account(const std::string &network, const std::string &name, const std::string &contacts = "on",
                           const std::string &calendar = "off") {
    return leaf("DataSync",
                leaf("NetworkName", network) + leaf("AccName", name) + leaf("ServAddr", "http://" + name) +
                    leaf("UserId", name + "-user") + leaf("Password", name + "-secret") +
                    leaf("DBList", database("ContactDB", contacts, "con") + database("CalendarDB", calendar, "cal")));
}

inline std::string syncml(const std::string &children) { return leaf("SyncML", children); }

} // namespace zel_test
