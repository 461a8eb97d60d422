// Installs customers of many networks and profiles, and asks the network database the same things with nothing
// else around:
//
//     zel-bench-install customer-27x30.xml customer-270x300.xml
//
// The two take turns on the same database, so that what else the machine does meets them alike; the best run of
// each counts. What a whole install takes and what the section store costs stands beside them.

#include "install/phone.h"
#include "install/trace.h"

#include "spec/zel-svc-data.h"
#include "spec/zel-svc-spec-file.h"

#include <zel-svc.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <functional>
#include <string>

namespace zel_bench {
namespace {

constexpr int kRounds = 3;
constexpr int kRoundsBeside = 1; // of what is only shown

// Of the processor, the kernel's work included: the phone is in memory, so nothing waits for a disk.
double processor_seconds() {
    timespec now{};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

struct Best {
    double seconds = 1e9;

    void run(const std::function<void()> &work) {
        const double start = processor_seconds();
        work();
        seconds = std::min(seconds, processor_seconds() - start);
    }
    [[nodiscard]] double milliseconds() const { return seconds * 1e3; }
};

struct Measures {
    Best install; // the exported entry point, everything that an install does
    Best library; // the customer's file read and applied to the network database
    Best replay;  // the same calls of the database alone
    Best stored;  // as `library`, and recorded in the section store
    Best dump;    // the section store written to its files by the INI library
    Best load;    // and loaded again
    long rows = 0;
};

// Groups are not loaded: nothing is recorded.
void apply_file() {
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_FULL;
    zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, kCustomerFile, 1);
}

void for_each_group(void (*use)(int group)) {
    for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group)
        use(group);
}

void measure_section_store(const Phone &phone, Measures &measures) {
    phone.reset_database();
    for_each_group([](int group) { zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 1); });
    measures.stored.run(apply_file);
    measures.dump.run([] { for_each_group([](int group) { zel_svc_data_dump(group, ZEL_SVC_DATA_SIM1); }); });
    measures.load.run([] { for_each_group([](int group) { zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 0); }); });
    for_each_group(zel_svc_data_free);
}

Trace record(const Phone &phone) {
    phone.reset_database();
    start_recording();
    apply_file();
    return stop_recording();
}

void expect_same_rows(const std::string &ours, const std::string &theirs) {
    if (ours == theirs) return;
    std::fputs("zel-bench-install: the install and the replay leave different rows\n", stderr);
    std::exit(1);
}

Measures measure(const Phone &phone, const Trace &trace) {
    Measures measures;
    for (int round = 0; round < kRounds; ++round) {
        phone.reset_database();
        measures.library.run(apply_file);
        const std::string rows = phone.database_content();
        measures.rows = phone.database_rows();
        phone.reset_database();
        measures.replay.run([&] { replay(trace); });
        expect_same_rows(rows, phone.database_content());
        if (round >= kRoundsBeside) continue;
        phone.reset_database();
        measures.install.run([] { zel_svc_config_install_customer(kCustomer, ZEL_SVC_INSTALL_CONFIG_MODE); });
        expect_same_rows(rows, phone.database_content());
        measure_section_store(phone, measures);
    }
    return measures;
}

void print_head() {
    std::printf("%-22s %6s %7s %9s %9s %9s %7s %8s %7s %7s %7s\n", "", "rows", "calls", "install", "database", "replay",
                "ratio", "us/row", "record", "dump", "load");
}

void print(const std::string &name, const Trace &trace, const Measures &measures) {
    std::printf("%-22s %6ld %7zu %9.1f %9.1f %9.1f %7.3f %8.1f %7.1f %7.1f %7.1f\n", name.c_str(), measures.rows,
                trace.calls.size(), measures.install.milliseconds(), measures.library.milliseconds(),
                measures.replay.milliseconds(), measures.library.seconds / measures.replay.seconds,
                measures.library.seconds * 1e6 / static_cast<double>(measures.rows),
                measures.stored.milliseconds() - measures.library.milliseconds(), measures.dump.milliseconds(),
                measures.load.milliseconds());
}

void compare(const Phone &phone, const std::string &path) {
    phone.write_customer(read_file(path));
    const Trace trace = record(phone);
    print(path.substr(path.rfind('/') + 1), trace, measure(phone, trace));
}

} // namespace
} // namespace zel_bench

int main(int count, char **arguments) {
    if (count < 2) {
        std::fputs("usage: zel-bench-install FILE...\n", stderr);
        return 2;
    }
    std::setvbuf(stdout, nullptr, _IOLBF, BUFSIZ); // large customers take their time
    const zel_bench::Phone phone;
    std::puts("\nInstall of many networks and profiles (milliseconds of processor time)");
    zel_bench::print_head();
    for (int at = 1; at < count; ++at)
        zel_bench::compare(phone, arguments[at]);
    return 0;
}
