#pragma once
// Memory that one parse uses again for every item, so that a parse allocates a few times whatever the size
// of its file.

#include "spec/zel-svc-xml-attribute.h"

#include <cstddef>
#include <cstdlib>
#include <string_view>

// Room for one text.
class ZelSvcXmlBuffer {
  public:
    ZelSvcXmlBuffer() = default;
    ZelSvcXmlBuffer(const ZelSvcXmlBuffer &) = delete;
    ZelSvcXmlBuffer &operator=(const ZelSvcXmlBuffer &) = delete;
    ~ZelSvcXmlBuffer() { std::free(bytes_); }

    // At least `size` bytes, earlier contents lost; null when there is no memory.
    char *reserve(std::size_t size) { return size <= capacity_ ? bytes_ : grow(size); }

    // A terminated copy; null when there is no memory.
    char *copy(std::string_view text);

  private:
    char *grow(std::size_t size);

    char *bytes_ = nullptr;
    std::size_t capacity_ = 0;
};

// The attributes of one start tag: nodes and texts in blocks that never move.
class ZelSvcXmlAttributes {
  public:
    ZelSvcXmlAttributes() = default;
    ZelSvcXmlAttributes(const ZelSvcXmlAttributes &) = delete;
    ZelSvcXmlAttributes &operator=(const ZelSvcXmlAttributes &) = delete;
    ~ZelSvcXmlAttributes();

    void clear() {
        if (blocks_) drop_blocks();
    }
    // Appends an attribute, its value entity-decoded. False when there is no memory.
    bool append(std::string_view name, std::string_view value);
    [[nodiscard]] const ZelSvcXmlAttribute *first() const { return first_; }

  private:
    struct Block {
        Block *next;
        std::size_t size; // of the bytes that follow
    };

    void drop_blocks();
    char *allocate(std::size_t size);
    bool add_block(std::size_t size);

    Block *blocks_ = nullptr; // the one in use, then those that are full
    Block *spare_ = nullptr;  // one ordinary block, kept for the next tag
    std::size_t used_ = 0;    // of the block in use
    const ZelSvcXmlAttribute *first_ = nullptr;
    ZelSvcXmlAttribute *last_ = nullptr;
};
