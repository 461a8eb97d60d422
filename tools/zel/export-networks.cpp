#include "export-document.h"

#include <spec/zel-svc-xml.h>

#include <algorithm>
#include <memory>

namespace zel_command {
namespace {

constexpr std::string_view kMark = "\xEF\xBB\xBF";

// The tokenizer hands its callbacks a number and no pointer: the one search that runs at a time.
struct Search {
    std::string_view text;
    const ZelSvcXmlParser *parser = nullptr;
    int depth = 0; // of the elements that are open
    int level = 0; // the open NetworkInfo's depth, 0 without one
    std::size_t start = 0;
    std::vector<std::string> found;
};
Search *gSearch = nullptr;

std::size_t place() { return static_cast<std::size_t>(gSearch->parser->item); }

std::int32_t start_element(std::uint32_t /*user*/, const char *name, std::int32_t /*size*/,
                           const ZelSvcXmlAttribute * /*attributes*/) {
    ++gSearch->depth;
    if (gSearch->level != 0 || std::string_view{name} != "NetworkInfo") return 0;
    gSearch->level = gSearch->depth;
    gSearch->start = place();
    return 0;
}

// An element without content ends in its start tag, whose attributes may hold a ">" as well.
std::size_t end_of_tag(std::string_view text, std::size_t place) {
    bool quoted = false;
    while (place < text.size() && (quoted || text[place] != '>'))
        quoted ^= text[place++] == '"';
    return std::min(place + 1, text.size());
}

// What an end tag is called does not matter: the phone's reader does not look at it either.
std::int32_t end_element(std::uint32_t /*user*/, const char * /*name*/) {
    if (gSearch->depth-- != gSearch->level) return 0;
    gSearch->level = 0;
    gSearch->found.emplace_back(
        gSearch->text.substr(gSearch->start, end_of_tag(gSearch->text, place()) - gSearch->start));
    return 0;
}

std::string position_text(std::string_view text, std::int32_t position) {
    const std::string_view before = text.substr(0, static_cast<std::size_t>(position));
    const std::size_t feed = before.rfind('\n');
    const std::size_t column = before.size() - (feed == std::string_view::npos ? 0 : feed + 1) + 1;
    return std::to_string(std::count(before.begin(), before.end(), '\n') + 1) + ":" + std::to_string(column);
}

} // namespace

NetworkElements network_elements(std::string_view customer_file) {
    if (!customer_file.starts_with(kMark)) return {{}, "1:1: the file has no byte-order mark"};
    Search search{.text = customer_file.substr(kMark.size()), .found = {}};
    ZelSvcXmlCallbacks callbacks{};
    callbacks.start_element = start_element;
    callbacks.end_element = end_element;
    const std::unique_ptr<ZelSvcXmlParser, decltype(&zel_svc_xml_parser_destroy)> parser{
        zel_svc_xml_parser_create(&callbacks, 0), &zel_svc_xml_parser_destroy};
    search.parser = parser.get();
    gSearch = &search;
    const ZelSvcXmlResult result =
        zel_svc_xml_parse(parser.get(), search.text.data(), static_cast<std::int32_t>(search.text.size()));
    gSearch = nullptr;
    if (result == ZEL_SVC_XML_OK) return {std::move(search.found), {}};
    return {{},
            position_text(search.text, parser && parser->cursor ? parser->cursor->position : 0) +
                ": the file cannot be read to its end"};
}

std::string document_with_networks(std::string_view document, const std::vector<std::string> &networks) {
    constexpr std::string_view kBehind = "</CountryISO>\n";
    const std::size_t found = document.find(kBehind);
    if (found == std::string_view::npos) return std::string{document};
    std::string result{document.substr(0, found + kBehind.size())};
    for (const std::string &network : networks)
        result.append("    ").append(network).append("\n");
    return result.append(document.substr(found + kBehind.size()));
}

} // namespace zel_command
