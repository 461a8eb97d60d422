#pragma once
// Marks what the library exports: exactly the functions of platform/include and zel-host.h.

#define ZEL_HOST_EXPORT extern "C" [[gnu::visibility("default")]]
