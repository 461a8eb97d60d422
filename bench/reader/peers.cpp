#include "reader/contestants.h"

#include <cstdio>
#include <cstdlib>
#include <expat.h>
#include <libxml/parser.h>
#include <pugixml.hpp>

namespace zel_bench {
namespace {

[[noreturn]] void refuse(const char *peer) {
    std::fprintf(stderr, "%s refuses the file\n", peer);
    std::exit(1);
}

Seen &seen_by(void *user) { return *static_cast<Seen *>(user); }

void expat_start(void *user, const XML_Char *, const XML_Char **) { ++seen_by(user).elements; }
void expat_end(void *, const XML_Char *) {}
void expat_text(void *user, const XML_Char *, int) { ++seen_by(user).texts; }

void libxml2_start(void *user, const xmlChar *, const xmlChar **) { ++seen_by(user).elements; }
void libxml2_end(void *, const xmlChar *) {}
void libxml2_text(void *user, const xmlChar *, int) { ++seen_by(user).texts; }

// From node to node without recursion.
Seen walk_tree(pugi::xml_node root) {
    Seen seen;
    for (pugi::xml_node node = root.first_child(); node;) {
        if (node.type() == pugi::node_element) ++seen.elements;
        if (node.type() == pugi::node_pcdata) ++seen.texts;
        pugi::xml_node next = node.first_child();
        while (!next && node != root) {
            next = node.next_sibling();
            if (!next) node = node.parent();
        }
        node = next;
    }
    return seen;
}

} // namespace

Seen read_with_expat(std::span<char> bytes) {
    Seen seen;
    XML_Parser parser = XML_ParserCreate(nullptr);
    XML_SetUserData(parser, &seen);
    XML_SetElementHandler(parser, expat_start, expat_end);
    XML_SetCharacterDataHandler(parser, expat_text);
    if (XML_Parse(parser, bytes.data(), static_cast<int>(bytes.size()), 1) != XML_STATUS_OK) refuse("expat");
    XML_ParserFree(parser);
    return seen;
}

Seen read_with_libxml2(std::span<char> bytes) {
    Seen seen;
    xmlSAXHandler handler = {};
    handler.startElement = libxml2_start;
    handler.endElement = libxml2_end;
    handler.characters = libxml2_text;
    if (xmlSAXUserParseMemory(&handler, &seen, bytes.data(), static_cast<int>(bytes.size())) != 0) refuse("libxml2");
    return seen;
}

Seen read_with_pugixml(std::span<char> bytes) {
    pugi::xml_document document;
    if (!document.load_buffer_inplace(bytes.data(), bytes.size())) refuse("pugixml");
    return walk_tree(document);
}

} // namespace zel_bench
