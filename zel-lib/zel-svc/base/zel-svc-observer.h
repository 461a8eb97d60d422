#pragma once
// A listener to what the library otherwise passes over in silence. None is set by default, and nothing the
// library does depends on one: progress displays and package checkers listen here.

#include <cstdint>
#include <string_view>

struct ZelSvcTextPosition {
    std::int32_t offset; // bytes from the start of the file, byte-order mark included
    std::int32_t line;   // from 1
    std::int32_t column; // in bytes, from 1
};

class ZelSvcObserver {
  public:
    ZelSvcObserver() = default;
    ZelSvcObserver(const ZelSvcObserver &) = delete;
    ZelSvcObserver &operator=(const ZelSvcObserver &) = delete;
    virtual ~ZelSvcObserver() = default;

    // A spec text that its element does not accept; the setting was left alone.
    virtual void refused_text(std::string_view /*tag*/, std::string_view /*text*/, std::int32_t /*offset*/) {}
    // A start tag that the element table does not know at this place.
    virtual void unknown_element(std::string_view /*tag*/, std::int32_t /*offset*/) {}
    // A start tag whose row this parse has not enabled.
    virtual void disabled_element(std::string_view /*tag*/, std::int32_t /*offset*/) {}
    // A spec file could not be read at all: missing, empty, or without a byte-order mark.
    virtual void unread_file(std::string_view /*path*/, std::string_view /*reason*/) {}
    // A spec file was parsed; the result is a ZelSvcXmlResult, the position is where reading ended.
    virtual void parsed_file(std::string_view /*path*/, std::int32_t /*result*/, ZelSvcTextPosition /*end*/) {}
    // A run-log line, whether or not it could be written.
    virtual void run_log_line(std::string_view /*line*/) {}
};

// Sets the one listener, null for none. It is not owned. Returns the one set before.
ZelSvcObserver *zel_svc_set_observer(ZelSvcObserver *observer);

// The listener; never null: one that ignores everything stands in for none.
ZelSvcObserver &zel_svc_observer();

// Whether one is set: for news that costs work to put together.
bool zel_svc_is_observed();
