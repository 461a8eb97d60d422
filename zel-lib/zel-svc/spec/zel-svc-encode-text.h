#pragma once
// The document that an export writes: bytes that grow, and what became of them when memory ran out.

#include <cstddef>
#include <cstdlib>
#include <string_view>

class ZelSvcEncodeText {
  public:
    using Allocate = void *(*)(std::size_t count, std::size_t size); // zeroed, for std::free()

    explicit ZelSvcEncodeText(Allocate allocate = std::calloc) : allocate_(allocate) {}
    ZelSvcEncodeText(const ZelSvcEncodeText &) = delete;
    ZelSvcEncodeText &operator=(const ZelSvcEncodeText &) = delete;
    ~ZelSvcEncodeText() { std::free(bytes_); }

    // Appends bytes. Once there was no memory for some, all that come behind them are dropped as well: half a
    // document must not look like a whole one.
    void put(std::string_view bytes);

    // The same for something that there was no memory to ask for.
    void drop_rest() { failed_ = true; }

    [[nodiscard]] bool is_whole() const { return !failed_; }
    [[nodiscard]] std::string_view view() const { return {bytes_ ? bytes_ : "", size_}; }

    // Hands over what was written, with a terminating NUL; the receiver frees it. Null when it is not whole.
    char *release();

  private:
    bool reserve(std::size_t size);

    Allocate allocate_;
    char *bytes_ = nullptr; // zero behind the written ones
    std::size_t capacity_ = 0;
    std::size_t size_ = 0;
    bool failed_ = false;
};
