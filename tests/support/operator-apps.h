#pragma once
// The operator applications and what is logged about them. A set of them is a number: bit 0 is the first.

#include <string>
#include <vector>

namespace zel_test {

struct OperatorApp {
    const char *name;
    const char *package;
    const char *executable;
};

inline constexpr OperatorApp kOperatorApps[] = {
    {"SkatamfaBeats", "com.skatamfa.beats", "/opt/usr/apps/com.skatamfa.beats/bin/jiobeats"},
    {"SkatamfaOnDemand", "com.skatamfa.ondemand", "/opt/usr/apps/com.skatamfa.ondemand/bin/jioondemand"},
    {"SkatamfaXPressNews", "ZFQ9uYrIPH", "/opt/usr/apps/ZFQ9uYrIPH/bin/ZFQ9uYrIPH.SkatamfaNews"},
    {"MySkatamfa", "AOzuftR6Ou", "/opt/usr/apps/AOzuftR6Ou/bin/AOzuftR6Ou.MySkatamfa"},
};
inline constexpr unsigned kEveryOperatorApp = 15;

inline bool holds(unsigned set, unsigned index) { return (set >> index & 1U) != 0; }

inline std::string operator_app_line(unsigned index, const std::string &what) {
    return std::string{"[Config] "} + kOperatorApps[index].name + " App " + what;
}

// The lines of the look before an upgrade.
inline std::vector<std::string> lines_of_check(unsigned before) {
    std::vector<std::string> lines{"[Config/Start] Check App existence before App upgrade (FOTA)."};
    for (unsigned i = 0; i < 4; ++i)
        lines.push_back(operator_app_line(i, holds(before, i) ? "already existed before App upgrade."
                                                              : "NOT existed before App upgrade."));
    lines.emplace_back("[Config/End] Check App existence before App upgrade (FOTA).");
    return lines;
}

// The lines of the phase that disables what was not there before.
inline std::vector<std::string> lines_of_disable(unsigned before, unsigned after) {
    std::vector<std::string> lines{"[Config/Start] Disable App as default."};
    for (unsigned i = 0; i < 4; ++i) {
        if (holds(before, i)) {
            lines.push_back(operator_app_line(i, "is NOT NEW, skip."));
        } else if (holds(after, i)) {
            lines.push_back(operator_app_line(i, "normally existed."));
            lines.push_back(operator_app_line(i, "is disabled(result=0)."));
        } else {
            lines.push_back(operator_app_line(i, "NOT existed."));
        }
    }
    lines.emplace_back("[Config/Ended] Disable App as default.");
    return lines;
}

} // namespace zel_test
