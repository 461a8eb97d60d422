#include "summary-parts.h"

#include "secrets.h"

#include <algorithm>
#include <base/zel-svc-text.h>

namespace zel_command {
namespace {

void print_title(const std::string &title) { print_line("\n" + title); }

std::string or_dash(const std::string &text) { return text.empty() ? "-" : text; }

void print_customer(const Json &customer) {
    const std::string code = bytes_of(customer, "code");
    const std::string folder = bytes_of(customer, "folder");
    print_line("Customer");
    print_table({}, {{"  Active customer", or_dash(code) + (folder == code ? "" : " (folder " + folder + ")")},
                     {"  Configured", customer.value("configured", false) ? "yes" : "no"},
                     {"  Package", or_dash(bytes_of(customer, "package"))},
                     {"  Country", or_dash(bytes_of(customer, "country"))},
                     {"  Language", or_dash(bytes_of(customer, "language"))}});
}

void print_auto_flags(const Json &flags) {
    std::string on;
    if (flags.is_object())
        for (const auto &[name, value] : flags.items())
            if (value == true) on += (on.empty() ? "" : ", ") + name;
    if (on.empty()) on = "none";
    print_title("Decided by the SIM card (Auto flags)");
    print_line("  " + (flags.is_object() ? on : std::string{"unknown: the customer's file cannot be read"}));
}

void print_settings(const Json &settings) {
    std::vector<std::vector<std::string>> rows;
    for (const Json &row : settings) {
        const std::string value = bytes_of(row, "value");
        rows.push_back({"  " + bytes_of(row, "name"), is_secret(bytes_of(row, "key")) ? masked(value) : value});
    }
    print_title("Settings");
    print_table({}, rows);
}

void print_records(const Json &records) {
    std::vector<std::vector<std::string>> rows;
    for (const Json &row : records)
        rows.push_back({"  " + bytes_of(row, "name") + (row.value("sim", 1) == 2 ? ", SIM 2" : ""),
                        or_dash(bytes_of(row, "value"))});
    if (rows.empty()) return;
    print_title("Recorded options (0: off, 1: on)");
    print_table({}, rows);
}

// An operator has up to dozens of MCC+MNC, most of them with the same profiles: the page shows the first few,
// and the profiles once.
constexpr std::size_t kShownCodes = 4;

struct NamedNetwork {
    std::string name;
    std::vector<std::string> codes;
    Json profiles;
};

std::vector<NamedNetwork> by_name_and_profiles(const Json &networks) {
    std::vector<NamedNetwork> result;
    for (const Json &network : networks) {
        const std::string name = bytes_of(network, "name");
        auto found = std::find_if(result.begin(), result.end(), [&](const NamedNetwork &known) {
            return known.name == name && known.profiles == network["profiles"];
        });
        if (found == result.end()) found = result.insert(result.end(), {name, {}, network["profiles"]});
        found->codes.push_back(bytes_of(network, "mccmnc"));
    }
    return result;
}

std::string codes_text(const std::vector<std::string> &codes) {
    std::string result;
    for (std::size_t i = 0; i < codes.size() && i < kShownCodes; ++i)
        result += (i == 0 ? "" : " ") + codes[i];
    return codes.size() <= kShownCodes ? result : result + " +" + std::to_string(codes.size() - kShownCodes) + " more";
}

constexpr std::size_t kShownProfiles = 4;
constexpr std::size_t kShownName = 36;

std::string shortened(const std::string &text) {
    return text.size() <= kShownName ? text : text.substr(0, zel_svc_text_cut(text, kShownName - 3)) + "...";
}

// The defaults of the services, which is what data goes through, before the others.
std::vector<Json> defaults_first(const Json &profiles) {
    std::vector<Json> result(profiles.begin(), profiles.end());
    std::stable_partition(result.begin(), result.end(),
                          [](const Json &profile) { return profile.value("default", false); });
    return result;
}

void add_profiles(std::vector<std::vector<std::string>> &rows, const Json &profiles) {
    std::size_t shown = 0;
    for (const Json &profile : defaults_first(profiles)) {
        if (shown == kShownProfiles) break;
        rows.push_back({"    " + shortened(bytes_of(profile, "name")), shortened(bytes_of(profile, "apn")),
                        bytes_of(profile, "service"), profile.value("default", false) ? "default" : ""});
        ++shown;
    }
    if (profiles.size() > shown) rows.push_back({"    +" + std::to_string(profiles.size() - shown) + " more"});
}

void print_networks(const Json &sims) {
    for (const Json &sim : sims) {
        std::vector<std::vector<std::string>> rows;
        for (const NamedNetwork &network : by_name_and_profiles(sim["networks"])) {
            rows.push_back({"  " + network.name, codes_text(network.codes)});
            add_profiles(rows, network.profiles);
        }
        if (rows.empty()) continue;
        print_title("Networks (MCC+MNC) and their profiles (APN), SIM " + sim["sim"].dump());
        print_table({}, rows);
    }
}

void print_media(const Json &folders) {
    std::vector<std::vector<std::string>> rows;
    for (const Json &folder : folders)
        for (const Json &file : folder["files"])
            rows.push_back({"  " + bytes_of(folder, "folder") + "/" + bytes_of(file, "name"), file["size"].dump()});
    if (rows.empty()) return;
    print_title("Media files, with their sizes");
    print_table({}, rows);
}

void print_section_store(const Json &files) {
    std::vector<std::vector<std::string>> rows;
    for (const Json &file : files)
        if (file.value("size", 0) > 0) rows.push_back({"  " + bytes_of(file, "name"), file["size"].dump()});
    print_title("Recorded customer defaults (/opt/system/zel-default/data), with their sizes");
    print_table({}, rows);
}

} // namespace

void print_summary(const Json &summary) {
    print_customer(summary["customer"]);
    print_auto_flags(summary["auto_flags"]);
    print_settings(summary["settings"]);
    print_records(summary["records"]);
    print_networks(summary["sims"]);
    print_media(summary["media"]);
    print_section_store(summary["section_store"]);
}

} // namespace zel_command
