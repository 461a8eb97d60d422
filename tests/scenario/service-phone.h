#pragma once
// A phone with a package: what tests of the service API write into it and look for in its logs.

#include "support/bench-phone.h"

#include <zel-svc.h>

#include <string>
#include <string_view>
#include <vector>

namespace zel_test {

class ServicePhone : public BenchPhone {
  protected:
    static constexpr const char *kHeader = "/opt/system/zel/mps/ZEL/SW_Configuration.xml";
    static constexpr const char *kLapLog = "/opt/system/zel-default/output/zel-time-lap.log";
    static constexpr const char *kData = "/opt/system/zel-default/data/zel-default-data-";

    // A spec file: a byte-order mark and the document.
    void write_spec(const std::string &path, const std::string &document) { write(path, "\xEF\xBB\xBF" + document); }
    void write_header(const std::string &elements);
    void write_customer(const std::string &customer, const std::string &elements);

    std::string data_path(const std::string &group) { return kData + group + ".ini"; }
    // Leaves a mark in a group's file, to see later whether the group was started afresh.
    void mark_group(const std::string &group) { write(data_path(group), "[mark]\n\nmark:kept = 1\n\n"); }
    bool group_is_marked(const std::string &group);

    std::vector<std::string> run_log_lines();
    // The phases in the time-lap log, in its order: "Spec", "App", ...
    std::vector<std::string> laps();
    // Whether all lines stand in the run log in this order, other lines between them or not.
    ::testing::AssertionResult logged_in_order(const std::vector<std::string> &lines);
    bool logged(const std::string &line);
    // Whether a system-log message ends in "> TEXT".
    bool system_logged(const std::string &text);

    // The lines of a verification that begin so, "+" in front of a passed one and "-" in front of a failed one.
    static std::vector<std::string> verified_lines(std::string_view begin = "");
};

} // namespace zel_test
