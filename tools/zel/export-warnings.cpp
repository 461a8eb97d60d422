#include "export-document.h"

#include <spec/zel-svc-element-table.h>
#include <spec/zel-svc-encode-sequence.h>

#include <algorithm>
#include <map>

namespace zel_command {
namespace {

bool is_container(std::string_view tag) {
    const auto steps = zel_svc_encode_sequence();
    return std::any_of(steps.begin(), steps.end(), [tag](const ZelSvcEncodeStep &step) {
        return step.kind == ZelSvcEncodeStep::Kind::Open &&
               kZelSvcElementTable.at(static_cast<std::size_t>(step.id)).tag == tag;
    });
}

// Goes through a document as the library writes it. A value may hold anything, "<" and line feeds included, so a
// leaf ends at its own end tag with a line feed behind it.
class Reading {
  public:
    explicit Reading(std::string_view document) : rest_(document) {}

    std::vector<std::string> warnings() {
        while (next_tag())
            read_element();
        return std::move(warnings_);
    }

  private:
    bool next_tag() {
        const std::size_t start = rest_.find('<');
        const std::size_t end = rest_.find('>', start);
        if (start == std::string_view::npos || end == std::string_view::npos) return false;
        tag_ = rest_.substr(start + 1, end - start - 1);
        rest_.remove_prefix(end + 1);
        return true;
    }

    void read_element() {
        if (tag_.starts_with('?')) return;
        if (tag_.starts_with('/')) return leave();
        const std::string_view name = tag_.substr(0, tag_.find(' '));
        if (is_container(name)) return open_.push_back(numbered(std::string{name}));
        const std::string end = "</" + std::string{name} + ">\n";
        const std::size_t size = std::min(rest_.find(end), rest_.size());
        judge(std::string{name}, rest_.substr(0, size));
        rest_.remove_prefix(std::min(size + end.size(), rest_.size()));
    }

    void leave() {
        if (!open_.empty()) open_.pop_back();
    }

    [[nodiscard]] std::string path() const {
        std::string text;
        for (const std::string &name : open_)
            text += name + "/";
        return text;
    }

    // "Profile[2]" for the second one of its kind in this place.
    std::string numbered(const std::string &name) {
        const int number = ++seen_[path() + name];
        return number == 1 ? name : name + "[" + std::to_string(number) + "]";
    }

    void judge(const std::string &name, std::string_view value) {
        if (value == "?\?") warnings_.push_back(path() + name + ": the phone's value could not be read ('?\?')");
        if (value.find('<') != std::string_view::npos)
            warnings_.push_back(path() + name + ": the value holds '<', which stands in the document as it is");
    }

    std::string_view rest_;
    std::string_view tag_;
    std::vector<std::string> open_;
    std::map<std::string, int> seen_;
    std::vector<std::string> warnings_;
};

} // namespace

std::vector<std::string> document_warnings(std::string_view document) { return Reading{document}.warnings(); }

} // namespace zel_command
