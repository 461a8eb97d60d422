#pragma once
// The document that the library exports, looked at and completed.

#include <string>
#include <string_view>
#include <vector>

namespace zel_command {

// The places whose value could not be read ("??") or that no other XML reader takes ("<"), one sentence each:
// "GPS/GPSActivation: ...".
std::vector<std::string> document_warnings(std::string_view document);

// The NetworkInfo elements of a customer's file, byte for byte as they stand there.
struct NetworkElements {
    std::vector<std::string> texts;
    std::string problem; // "LINE:COLUMN: reason" when the file cannot be read to its end
};
NetworkElements network_elements(std::string_view customer_file);

// The document with these elements behind its CountryISO, each on a line of its own; nothing else changes.
std::string document_with_networks(std::string_view document, const std::vector<std::string> &networks);

} // namespace zel_command
