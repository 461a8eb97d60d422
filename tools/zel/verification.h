#pragma once
// A verification as people and programs read it: the library's lines taken apart, in their order.
//
//     const RunWatch watch{verbose};
//     const Verification found = verify_phone(watch);
//     for (const VerifiedValue &value : found.values)
//         if (!value.passed) ...

#include "output.h"
#include "run-watch.h"

#include <cstddef>
#include <string>
#include <vector>

namespace zel_command {

enum class VerifiedKind { kMedia, kApplication, kSpec };

struct VerifiedValue {
    VerifiedKind kind;
    bool passed;
    bool secret;          // a password: see secrets.h
    bool compared;        // has two values
    std::string text;     // the library's line
    std::string label;    // "GPS/GPSActivation", "media/image size", "Customer1"
    std::string expected; // by the package, or after the install; of a line without values its text
    std::string phone;

    // What belongs together: "GPS", "Profile3", "Main settings" for labels of one word.
    [[nodiscard]] std::string group() const;
};

struct Verification {
    std::string package_version;
    std::string sales_code;    // empty: no active customer
    std::string internal_name; // of the folder that serves it
    std::vector<VerifiedValue> values;
    bool report_written = false;
    bool complete = true;              // every value of the customer's file was compared
    std::vector<std::string> problems; // what makes the answer worth less than it looks

    [[nodiscard]] std::size_t count(VerifiedKind kind) const;
    [[nodiscard]] std::size_t failed(VerifiedKind kind) const;
    [[nodiscard]] std::size_t failed() const;
    // "OK", "NOT OK" or "INCOMPLETE", of the customer's file alone, as in the library's report.
    [[nodiscard]] std::string verdict() const;
};

Verification verify_phone(const RunWatch &watch);

// Why the active customer's file was not read to its end; empty when it was.
std::vector<std::string> customer_file_problems(const RunWatch &watch);

// One line of the library's list.
VerifiedValue verified_value(std::string_view line, bool passed);

// The value with passwords masked, both sides alike, unless they are to be shown.
VerifiedValue shown(VerifiedValue value, bool reveal);

} // namespace zel_command
