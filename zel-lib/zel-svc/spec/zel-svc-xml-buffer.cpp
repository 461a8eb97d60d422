#include "spec/zel-svc-xml-buffer.h"
#include "spec/zel-svc-xml-entities.h"

#include <algorithm>
#include <cstring>
#include <new>

namespace {

constexpr std::size_t kFirstTextSize = 1024;
constexpr std::size_t kBlockSize = 4096;

constexpr std::size_t aligned(std::size_t size) {
    constexpr std::size_t kAlignment = alignof(ZelSvcXmlAttribute);
    return (size + kAlignment - 1) / kAlignment * kAlignment;
}

// Copies a text with its terminator and returns the end of it.
char *put(char *target, std::string_view text) {
    if (!text.empty()) std::memcpy(target, text.data(), text.size());
    target[text.size()] = '\0';
    return target + text.size() + 1;
}

} // namespace

char *ZelSvcXmlBuffer::grow(std::size_t size) {
    // Doubled, so that ever longer texts do not copy ever more often.
    const std::size_t wanted = std::max({size, capacity_ * 2, kFirstTextSize});
    auto *bytes = static_cast<char *>(std::malloc(wanted));
    if (!bytes) return nullptr;
    std::free(bytes_);
    bytes_ = bytes;
    capacity_ = wanted;
    return bytes_;
}

char *ZelSvcXmlBuffer::copy(std::string_view text) {
    char *bytes = reserve(text.size() + 1);
    if (bytes) put(bytes, text);
    return bytes;
}

ZelSvcXmlAttributes::~ZelSvcXmlAttributes() {
    clear();
    std::free(spare_);
}

void ZelSvcXmlAttributes::drop_blocks() {
    while (blocks_) {
        Block *block = blocks_;
        blocks_ = block->next;
        const bool is_ordinary = block->size == kBlockSize && !spare_;
        if (is_ordinary) spare_ = block;
        if (!is_ordinary) std::free(block);
    }
    used_ = 0;
    first_ = nullptr;
    last_ = nullptr;
}

bool ZelSvcXmlAttributes::add_block(std::size_t size) {
    Block *block = spare_ && size <= kBlockSize ? spare_ : nullptr;
    if (block) spare_ = nullptr;
    const std::size_t wanted = std::max(size, kBlockSize);
    if (!block) block = static_cast<Block *>(std::malloc(sizeof(Block) + wanted));
    if (!block) return false;
    *block = {blocks_, wanted};
    blocks_ = block;
    used_ = 0;
    return true;
}

char *ZelSvcXmlAttributes::allocate(std::size_t size) {
    const bool fits = blocks_ && size <= blocks_->size - used_;
    if (!fits && !add_block(size)) return nullptr;
    char *bytes = reinterpret_cast<char *>(blocks_ + 1) + used_;
    used_ += size;
    return bytes;
}

bool ZelSvcXmlAttributes::append(std::string_view name, std::string_view value) {
    char *bytes = allocate(aligned(sizeof(ZelSvcXmlAttribute) + name.size() + value.size() + 2));
    if (!bytes) return false;
    char *name_copy = bytes + sizeof(ZelSvcXmlAttribute);
    char *value_copy = put(name_copy, name);
    put(value_copy, value);
    zel_svc_xml_decode_in_place(value_copy, value.size());
    auto *attribute = new (bytes) ZelSvcXmlAttribute{nullptr, name_copy, value_copy};
    if (last_) last_->next = attribute;
    if (!last_) first_ = attribute;
    last_ = attribute;
    return true;
}
