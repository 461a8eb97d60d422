#include "export-document.h"

#include <spec/zel-svc-element-table.h>
#include <spec/zel-svc-encode-sequence.h>

#include <map>
#include <optional>

namespace zel_command {
namespace {

using Step = ZelSvcEncodeStep;

std::string tag_of(const Step &step) {
    return std::string{kZelSvcElementTable.at(static_cast<std::size_t>(step.id)).tag};
}

// Follows the writer's sequence through a document. A value may hold anything, tags and line feeds included, so the
// sequence tells which tags are the document's own: when it does not go on behind a leaf's end tag, that tag
// belonged to the value.
class Reading {
  public:
    explicit Reading(std::string_view document)
        : rest_(document.substr(std::min(document.find('\n'), document.size() - 1) + 1)) {}

    std::vector<std::string> warnings() {
        while (place_.step < steps_.size() && (follow(steps_[place_.step]) || read_on_in_the_value()))
            ;
        judge();
        return std::move(warnings_);
    }

  private:
    struct Opened {
        std::size_t step;
        std::string name;
    };
    struct Place {
        std::size_t step = 0;
        std::vector<Opened> opened{};
    };
    struct Leaf {
        std::string path;
        std::string end;       // its end tag, with the line feed
        std::string_view from; // the document from its value on
        std::size_t size;      // of the value
        Place behind;
    };

    bool take(const std::string &text) {
        const std::size_t blanks = std::min(rest_.find_first_not_of(' '), rest_.size());
        if (!rest_.substr(blanks).starts_with(text)) return false;
        rest_.remove_prefix(blanks + text.size());
        return true;
    }

    bool follow(const Step &step) {
        if (step.kind == Step::Kind::Open) return open(step);
        return step.kind == Step::Kind::Close ? close(step) : read_leaf(step);
    }

    bool open(const Step &step) {
        const std::string tag = tag_of(step);
        if (take("<" + tag + ">\n")) {
            place_.opened.push_back({place_.step++, step.times == nullptr ? tag : numbered(tag)});
            return true;
        }
        if (step.times == nullptr) return false;
        place_.step = zel_svc_encode_behind(steps_, place_.step);
        return true;
    }

    // Behind one item there may be another.
    bool close(const Step &step) {
        if (!take("</" + tag_of(step) + ">\n")) return false;
        const std::size_t opened = place_.opened.back().step;
        place_.opened.pop_back();
        place_.step = steps_[opened].times == nullptr ? place_.step + 1 : opened;
        return true;
    }

    bool read_leaf(const Step &step) {
        const std::string tag = tag_of(step);
        const bool found = take("<" + tag + ">");
        if (!found && step.times == nullptr) return false;
        ++place_.step;
        if (!found) return true;
        judge();
        leaf_ = {path() + tag, "</" + tag + ">\n", rest_, 0, place_};
        return end_value(rest_.find(leaf_->end));
    }

    bool end_value(std::size_t size) {
        leaf_->size = std::min(size, leaf_->from.size());
        if (size > leaf_->from.size()) return false;
        rest_ = leaf_->from.substr(size + leaf_->end.size());
        place_ = leaf_->behind;
        return true;
    }

    // Without a further end tag it cannot be told where the value ends.
    bool read_on_in_the_value() { return leaf_ && end_value(leaf_->from.find(leaf_->end, leaf_->size + 1)); }

    [[nodiscard]] std::string path() const {
        std::string text;
        for (const Opened &opened : place_.opened)
            text += opened.name + "/";
        return text;
    }

    // "Profile[2]" for the second one of its kind in this place.
    std::string numbered(const std::string &tag) {
        const int number = ++seen_[path() + tag];
        return number == 1 ? tag : tag + "[" + std::to_string(number) + "]";
    }

    // Of the leaf that was read last, as soon as it is sure where it ends.
    void judge() {
        if (!leaf_) return;
        const std::string_view value = leaf_->from.substr(0, leaf_->size);
        if (value == "?\?") warnings_.push_back(leaf_->path + ": the phone's value could not be read ('?\?')");
        if (value.find('<') != std::string_view::npos)
            warnings_.push_back(leaf_->path + ": the value holds '<', which stands in the document as it is");
    }

    std::span<const Step> steps_ = zel_svc_encode_sequence();
    std::string_view rest_;
    Place place_;
    std::optional<Leaf> leaf_;
    std::map<std::string, int> seen_;
    std::vector<std::string> warnings_;
};

} // namespace

std::vector<std::string> document_warnings(std::string_view document) { return Reading{document}.warnings(); }

} // namespace zel_command
