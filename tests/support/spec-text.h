#pragma once
// Runs pieces of spec text and single elements of the export against the phone under test, the way the
// library's entry points do. For unit tests: it needs the library's objects.
//
//     TEST_F(Gps, OnStoresOne) {
//         const zel_test::LoadedGroup group{ZEL_SVC_DATA_GPS};
//         zel_test::install_spec("<GPS><GPSActivation>on</GPSActivation></GPS>");
//         EXPECT_EQ(get_int("db/..."), 1);
//         EXPECT_EQ(group.number("gps", "gps_activation"), 1);
//     }
//     TEST_F(Gps, AnotherValueFails) {
//         set_int("db/...", 0);
//         EXPECT_THAT(zel_test::verify_spec("<GPS><GPSActivation>on</GPSActivation></GPS>"),
//                     ElementsAre(zel_test::failed("[GPS/GPSActivation] Spec='on',Phone='off'")));
//     }
//     TEST_F(Gps, ExportSaysOn) { EXPECT_EQ(zel_test::export_value(ZEL_SVC_ELEMENT_GPS_ACTIVATION), "on"); }
//
// A record is exported as the writer does it, its children between its start and its end:
//
//     zel_test::export_start(ZEL_SVC_ELEMENT_BOOKMARK);
//     EXPECT_EQ(zel_test::export_value(ZEL_SVC_ELEMENT_BOOKMARK_NAME), "News");
//     zel_test::export_end(ZEL_SVC_ELEMENT_BOOKMARK);

#include "spec/zel-svc-data.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-element-table.h"
#include "spec/zel-svc-spec-file.h"
#include "spec/zel-svc-verification.h"

#include <optional>
#include <ostream>
#include <string>
#include <string_view>
#include <vector>

namespace zel_test {

// Parses a piece of spec text with every row enabled. The piece stands directly inside the root element.
inline void parse_spec(std::string_view piece, ZelSvcParseAction action, ZelSvcParseMode mode) {
    geZelSvcParseAction = action;
    geZelSvcParseMode = mode;
    zel_svc_element_clear_enabled();
    std::string document = R"(<?xml version="1.0" encoding="UTF-8" ?><SW-Configuration>)";
    document.append(piece).append("</SW-Configuration>");
    zel_svc_spec_parse_buffer(document.data(), static_cast<std::int32_t>(document.size()));
}

inline void install_spec(std::string_view piece, ZelSvcParseMode mode = ZEL_SVC_PARSE_MODE_FULL) {
    parse_spec(piece, ZEL_SVC_PARSE_ACTION_INSTALL, mode);
}

struct ResultLine {
    std::string text;
    bool passed = false;

    friend bool operator==(const ResultLine &, const ResultLine &) = default;
    friend std::ostream &operator<<(std::ostream &out, const ResultLine &line) {
        return out << (line.passed ? "passed " : "failed ") << line.text;
    }
};

inline ResultLine passed(std::string_view text) { return {std::string{text}, true}; }
inline ResultLine failed(std::string_view text) { return {std::string{text}, false}; }

inline std::vector<ResultLine> result_lines() {
    std::vector<ResultLine> lines;
    for (std::size_t i = 0; i < static_cast<std::size_t>(zel_svc_verification_count()); ++i)
        lines.push_back({zel_svc_verification_line(i), zel_svc_verification_flag(i) == 1});
    return lines;
}

// Verifies a piece of spec text and gives its result lines, none of an earlier call among them.
inline std::vector<ResultLine> verify_spec(std::string_view piece, ZelSvcParseMode mode = ZEL_SVC_PARSE_MODE_PARTIAL) {
    zel_svc_verification_clear_results();
    parse_spec(piece, ZEL_SVC_PARSE_ACTION_VERIFY, mode);
    return result_lines();
}

// Calls one handler of a row in the encode action and gives what it wrote. The element must be open.
inline std::string run_export_handler(ZelSvcElementId id, OccurrenceKind kind, Handler handler) {
    geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_ENCODE;
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_HEADER;
    ZelSvcExportText out;
    Occurrence occurrence{.kind = kind,
                          .element = zel_svc_element_get_current_id(),
                          .tag = kZelSvcElementTable.at(static_cast<std::size_t>(id)).tag,
                          .action = geZelSvcParseAction,
                          .mode = geZelSvcParseMode,
                          .index = zel_svc_element_get_count(id),
                          .offset = -1,
                          .text = {},
                          .attributes = nullptr,
                          .out = &out};
    if (handler) handler(occurrence);
    return std::string{out.view()};
}

// The attribute text of an element, which stays open until export_end().
inline std::string export_start(ZelSvcElementId id) {
    zel_svc_element_push(id);
    return run_export_handler(id, OccurrenceKind::Start, kZelSvcElementTable.at(static_cast<std::size_t>(id)).start);
}

inline void export_end(ZelSvcElementId id) {
    const ZelSvcElement &row = kZelSvcElementTable.at(static_cast<std::size_t>(id));
    run_export_handler(id, OccurrenceKind::End, row.end);
    if (row.repeats) zel_svc_element_count_up(id);
    zel_svc_element_pop();
}

// The value of a leaf.
inline std::string export_value(ZelSvcElementId id) {
    export_start(id);
    std::string text =
        run_export_handler(id, OccurrenceKind::Value, kZelSvcElementTable.at(static_cast<std::size_t>(id)).value);
    export_end(id);
    return text;
}

// A group of the section store, loaded afresh and empty; writes to a group that is not loaded are lost. Make
// it in the test or in SetUp(), behind BenchPhone's: a member of the fixture comes before the phone.
class LoadedGroup {
  public:
    explicit LoadedGroup(ZelSvcDataGroup group) : group_(group) { zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 1); }
    LoadedGroup(const LoadedGroup &) = delete;
    LoadedGroup &operator=(const LoadedGroup &) = delete;
    ~LoadedGroup() { zel_svc_data_free(group_); }

    // Nothing when the entry is absent.
    [[nodiscard]] std::optional<std::string> text(const char *section, const char *key) const {
        if (!zel_svc_data_find(group_, section, key)) return std::nullopt;
        return std::string{zel_svc_data_get_text(group_, section, key)};
    }
    [[nodiscard]] std::optional<int> number(const char *section, const char *key) const {
        if (!zel_svc_data_find(group_, section, key)) return std::nullopt;
        return zel_svc_data_get_int(group_, section, key, -1);
    }

  private:
    ZelSvcDataGroup group_;
};

} // namespace zel_test
