#include "spec/zel-svc-encode-text.h"

#include <algorithm>
#include <cstring>
#include <utility>

// Doubled, so that a long document is not copied for each of its tags.
bool ZelSvcEncodeText::reserve(std::size_t size) {
    if (size <= capacity_) return true;
    const std::size_t wanted = std::max(size, capacity_ * 2);
    auto *bytes = static_cast<char *>(allocate_(wanted, 1));
    if (!bytes) return false;
    if (size_ != 0) std::memcpy(bytes, bytes_, size_);
    std::free(bytes_);
    bytes_ = bytes;
    capacity_ = wanted;
    return true;
}

void ZelSvcEncodeText::put(std::string_view bytes) {
    if (failed_ || bytes.empty()) return;
    failed_ = !reserve(size_ + bytes.size());
    if (failed_) return;
    std::memcpy(bytes_ + size_, bytes.data(), bytes.size());
    size_ += bytes.size();
}

char *ZelSvcEncodeText::release() {
    if (failed_ || !reserve(size_ + 1)) return nullptr;
    size_ = 0;
    capacity_ = 0;
    return std::exchange(bytes_, nullptr);
}
