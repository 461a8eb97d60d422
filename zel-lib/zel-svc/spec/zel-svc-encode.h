#pragma once
// The phone's present settings as a customer's file.
//
//     char *document = nullptr;
//     if (zel_svc_spec_encode_xml(&document) == 1) write(document, std::strlen(document));
//     std::free(document);
//
// The caller has loaded the groups of the section store and set the network database and the mode.

#include "spec/zel-svc-encode-text.h"

// Sets the parse action to encode and builds the document; the caller frees it. 0, and a null document, when
// memory ran out.
int zel_svc_spec_encode_xml(char **document, ZelSvcEncodeText::Allocate allocate = std::calloc);
