#pragma once
// The parts of `zel summary`, each as the JSON that --json prints; the pages are made from the same.

#include "invocation.h"

#include <string>
#include <vector>

namespace zel_command {

// summary-settings.cpp
Json summary_customer(const Phone &phone);
Json summary_settings(const Phone &phone);
// Null when the customer's file cannot be read.
Json summary_auto_flags(const std::string &customer);

// summary-records.cpp: options that the section store keeps, of both SIMs.
Json summary_records();

// summary-networks.cpp: one entry per network database that can be opened.
Json summary_networks();

// summary-files.cpp
Json summary_media(const Phone &phone);
Json summary_section_store(const Phone &phone);

// summary-pages.cpp
void print_summary(const Json &summary);

} // namespace zel_command
