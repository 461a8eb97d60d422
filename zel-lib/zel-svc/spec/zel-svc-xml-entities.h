#pragma once
// Entities of texts and attribute values, decoded where they stand.

#include <cstddef>

// Longest text whose entities are decoded; a longer one is passed as it is written.
inline constexpr std::size_t ZEL_SVC_XML_TEXT_MAX = 65535;

// Decodes the entities of a terminated text of `length` bytes in place and returns its new length.
std::size_t zel_svc_xml_decode_in_place(char *text, std::size_t length);
