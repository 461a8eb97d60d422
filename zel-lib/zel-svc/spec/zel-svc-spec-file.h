#pragma once
// Reading a spec file: from the phone into memory, through the tokenizer, to the handlers.

#include "spec/zel-svc-parse-context.h"

#include <cstdint>

inline constexpr const char *ZEL_SVC_SPEC_ROOT = "/opt/system/zel/mps/ZEL";
inline constexpr const char *ZEL_SVC_SPEC_HEADER_PATH = "/opt/system/zel/mps/ZEL/SW_Configuration.xml";
// With the customer's folder in place of %s.
#define ZEL_SVC_SPEC_CUSTOMER_FORMAT "/opt/system/zel/mps/ZEL/Customer/%s/customer.xml"

// Parses a buffer with the action and mode that are set. Element counts and open elements start afresh.
void zel_svc_spec_parse_buffer(const char *buffer, std::int32_t length);

// Sets the action and parses a file of the phone, without the three bytes of its byte-order mark. With
// reset_filter 1 every row of the element table fires; with 0 the enabled ones. Returns 1 when the file was
// handed to the parser, 0 when it cannot be read, is empty, or begins with "<".
int zel_svc_spec_parse_file(ZelSvcParseAction action, const char *path, int reset_filter);
