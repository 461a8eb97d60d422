#include "verify-page.h"

#include "html.h"
#include "verify-page-style.h"

#include <algorithm>
#include <cstdio>

namespace zel_command {
namespace {

struct Group {
    std::string name;
    std::vector<const VerifiedValue *> values; // failures first
    std::size_t failed = 0;
};

std::string element(const std::string &tag, std::string_view text) {
    return "<" + tag + ">" + html_text(text) + "</" + tag.substr(0, tag.find(' ')) + ">";
}

std::string policy() {
    return "default-src 'none'; style-src 'sha256-" + std::string{kPageStyleSum} + "'; script-src 'sha256-" +
           std::string{kPageScriptSum} + "'";
}

std::string head(const Verification &found) {
    std::string text = "<!DOCTYPE html>\n<html lang=\"en\">\n<head>\n<meta charset=\"utf-8\">\n";
    text += "<meta http-equiv=\"Content-Security-Policy\" content=\"" + policy() + "\">\n";
    text += "<meta name=\"viewport\" content=\"width=device-width, initial-scale=1\">\n";
    text += element("title", "Verification of " + found.sales_code) + "\n";
    return text.append("<style>").append(kPageStyle).append("</style>\n</head>\n<body>\n<main>\n");
}

std::string fact(const std::string &name, std::string_view text) {
    return element("dt", name) + element("dd", text) + "\n";
}

std::string of(std::size_t failed, std::size_t all) { return std::to_string(failed) + " of " + std::to_string(all); }

std::string count_fact(const Verification &found, VerifiedKind kind, const std::string &name, const std::string &what) {
    const std::size_t failed = found.failed(kind);
    return element("dt", name) +
           element(failed == 0 ? "dd" : "dd class=\"bad\"", of(failed, found.count(kind)) + what) + "\n";
}

std::string problems(const Verification &found) {
    if (found.problems.empty()) return {};
    std::string text = "<ul class=\"problems\">\n";
    for (const std::string &problem : found.problems)
        text += element("li", problem) + "\n";
    return text + "</ul>\n";
}

std::string summary(const Verification &found) {
    const std::string verdict = found.verdict();
    std::string text = element("h1", "Verification of " + found.sales_code) + "\n";
    text += element(verdict == "OK" ? "p class=\"verdict ok\"" : "p class=\"verdict not-ok\"", verdict) + "\n";
    text += problems(found) + "<dl>\n" + fact("Package", found.package_version);
    text += fact("Sales code", found.sales_code);
    if (found.internal_name != found.sales_code) text += fact("Internal name", found.internal_name);
    text += count_fact(found, VerifiedKind::kSpec, "Customer's file", " values differ");
    text += count_fact(found, VerifiedKind::kMedia, "Media folders", " figures changed");
    text += count_fact(found, VerifiedKind::kApplication, "Applications", " results failed");
    return text + "</dl>\n";
}

// Media folders have a table of their own.
std::vector<Group> groups_of(const Verification &found) {
    std::vector<Group> groups;
    for (const VerifiedValue &value : found.values) {
        if (value.kind == VerifiedKind::kMedia) continue;
        const std::string name = value.group();
        auto group = std::find_if(groups.begin(), groups.end(), [&](const Group &known) { return known.name == name; });
        if (group == groups.end()) group = groups.insert(groups.end(), {name, {}, 0});
        group->values.push_back(&value);
        group->failed += value.passed ? 0 : 1;
    }
    for (Group &group : groups)
        std::stable_partition(group.values.begin(), group.values.end(),
                              [](const VerifiedValue *value) { return !value->passed; });
    std::stable_partition(groups.begin(), groups.end(), [](const Group &group) { return group.failed != 0; });
    return groups;
}

// Under a heading "GPS" the value "GPS/GPSActivation" needs no "GPS" of its own.
std::string in_its_group(const VerifiedValue &value) {
    const std::string head = value.group() + "/";
    return value.label.starts_with(head) ? value.label.substr(head.size()) : value.label;
}

std::string value_row(const VerifiedValue &value, bool reveal) {
    const VerifiedValue seen = shown(value, reveal);
    std::string row = seen.passed ? "<div class=\"value\"><b>pass</b>" : "<div class=\"value failed\"><b>failure</b>";
    row += element("span", in_its_group(seen));
    row += element(seen.compared ? "i data-is=\"package\"" : "i", seen.expected);
    if (seen.compared) row += element("u data-is=\"phone\"", seen.phone);
    return row + "</div>\n";
}

std::string values(const Verification &found, bool reveal) {
    std::string text = "<div id=\"values\">\n<h2>Values</h2>\n<div class=\"filter\" hidden>"
                       "<input type=\"search\" id=\"words\" placeholder=\"Filter values\" aria-label=\"Filter values\">"
                       "<label><input type=\"checkbox\" id=\"failures\"> failures only</label>"
                       "<output id=\"count\" for=\"words failures\"></output></div>\n";
    for (const Group &group : groups_of(found)) {
        text += "<section class=\"group\" data-name=\"" + html_text(group.name) + "\">\n<h3>" + html_text(group.name);
        text += " <small>" + (group.failed == 0 ? std::to_string(group.values.size()) + " passed"
                                                : of(group.failed, group.values.size()) + " failed");
        text += "</small></h3>\n";
        for (const VerifiedValue *value : group.values)
            text += value_row(*value, reveal);
        text += "</section>\n";
    }
    return text + "</div>\n";
}

std::string media_cells(const VerifiedValue &value) {
    const std::string changed = value.passed ? "" : " class=\"changed\"";
    return element("td", value.expected) + element("td" + changed, value.phone);
}

// Two lines of the report, size and count, make one row.
std::string media(const Verification &found) {
    std::string rows;
    const auto &values = found.values;
    for (std::size_t i = 0; i + 1 < values.size(); i += 2) {
        if (values[i].kind != VerifiedKind::kMedia || values[i + 1].kind != VerifiedKind::kMedia) break;
        const std::string &label = values[i].label; // "media/image size"
        const std::string name = label.substr(label.find('/') + 1, label.find(' ') - label.find('/') - 1);
        rows += "<tr>" + element("th scope=\"row\"", name) + media_cells(values[i]) + media_cells(values[i + 1]) +
                "</tr>\n";
    }
    if (rows.empty()) return {};
    return "<h2 id=\"folders\">Media folders</h2>\n<div class=\"wide\" role=\"region\" aria-labelledby=\"folders\" "
           "tabindex=\"0\"><table id=\"media\">\n<tr><th scope=\"col\">Folder</th><th scope=\"col\">Bytes after the "
           "install</th><th scope=\"col\">Bytes now</th><th scope=\"col\">Items after the install</th>"
           "<th scope=\"col\">Items now</th></tr>\n" +
           rows + "</table></div>\n";
}

std::string seconds_text(double seconds) {
    char text[32];
    std::snprintf(text, sizeof text, "%.3f s", seconds);
    return text;
}

// A clock that was set back meanwhile gives a lap below zero, which has no bar.
std::string lap_row(const TimeLap &lap, double longest) {
    char width[32];
    std::snprintf(width, sizeof width, "%.2f", longest > 0 ? std::max(lap.seconds, 0.0) / longest * 100 : 0.0);
    return "<div class=\"lap\">" + element("span", lap.phase) +
           "<svg viewBox=\"0 0 100 1\" preserveAspectRatio=\"none\" aria-hidden=\"true\"><rect width=\"" + width +
           "\" height=\"1\"/></svg>" + element("span", seconds_text(lap.seconds)) + "</div>\n";
}

std::string laps(const std::vector<TimeLap> &all) {
    if (all.empty()) return {};
    double longest = 0;
    for (const TimeLap &lap : all)
        longest = std::max(longest, lap.seconds);
    std::string text = "<h2>Times of the last install</h2>\n";
    for (const TimeLap &lap : all)
        text += lap_row(lap, longest);
    return text;
}

} // namespace

std::string verify_page(const VerifyPage &page) {
    std::string text = head(page.found) + summary(page.found) + values(page.found, page.reveal);
    text += media(page.found) + laps(page.laps);
    return text.append("</main>\n<script>").append(kPageScript).append("</script>\n</body>\n</html>\n");
}

} // namespace zel_command
