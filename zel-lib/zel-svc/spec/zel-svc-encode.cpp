#include "spec/zel-svc-encode.h"

#include "base/zel-svc-guard.h"
#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-encode-sequence.h"
#include "spec/zel-svc-encode-writer.h"
#include "spec/zel-svc-parse-context.h"

#include <optional>

namespace {

using Kind = ZelSvcEncodeStep::Kind;

class Document {
  public:
    explicit Document(ZelSvcEncodeText &text) : text_(text), writer_(text) {}

    void write() {
        writer_.header();
        for (std::size_t at = 0; at < steps_.size();)
            at = write_step(at);
    }

  private:
    // Each gives the place behind what it wrote.
    std::size_t write_step(std::size_t at) {
        const ZelSvcEncodeStep &step = steps_[at];
        const int times = times_of(step);
        if (step.kind != Kind::Open) return write_leaf(at, times);
        for (int i = 0; i < times; ++i)
            write_container(at);
        return zel_svc_encode_behind(steps_, at);
    }

    // None where there is no memory to find out, and then there is no document either.
    int times_of(const ZelSvcEncodeStep &step) {
        if (!step.times) return 1;
        const auto times = zel_svc_guarded_or(std::optional<int>{}, [&] { return std::optional{step.times()}; });
        if (!times) text_.drop_rest();
        return times.value_or(0);
    }

    std::size_t write_leaf(std::size_t at, int times) {
        if (times > 0 && steps_[at].kind == Kind::Leaf) writer_.leaf(steps_[at].id);
        if (times > 0 && steps_[at].kind == Kind::EmptyLeaf) writer_.empty_leaf(steps_[at].id);
        return at + 1;
    }

    void write_container(std::size_t at) {
        writer_.open(steps_[at].id);
        std::size_t child = at + 1;
        while (steps_[child].kind != Kind::Close)
            child = write_step(child);
        writer_.close(steps_[at].id);
    }

    std::span<const ZelSvcEncodeStep> steps_ = zel_svc_encode_sequence();
    ZelSvcEncodeText &text_;
    ZelSvcEncodeWriter writer_;
};

} // namespace

int zel_svc_spec_encode_xml(char **document, ZelSvcEncodeText::Allocate allocate) {
    if (!document) return 0;
    geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_ENCODE;
    zel_svc_element_table_init();
    ZelSvcEncodeText text{allocate};
    Document{text}.write();
    *document = text.release();
    return *document ? 1 : 0;
}
