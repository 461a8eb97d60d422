#pragma once
// Texts of fixed width: N bytes, always terminated, cut at a whole UTF-8 character. One routine cuts every
// text of the system, so that two cut names still match each other.

#include <cstddef>
#include <cstring>
#include <string_view>

// Length of the longest prefix of `text` that fits into `limit` bytes without splitting a UTF-8 character.
// Bytes that are no UTF-8 count as characters of their own.
std::size_t zel_svc_text_cut(std::string_view text, std::size_t limit);

// Clears `size` bytes at `target` and copies as much of `text` as fits with a terminator. Text ends at its
// first NUL byte. A size of 0 touches nothing.
void zel_svc_text_copy(char *target, std::size_t size, std::string_view text);

// The letters A to Z in lower case, everything else as it is, whatever the locale.
constexpr char zel_svc_text_lower(char byte) {
    return byte >= 'A' && byte <= 'Z' ? static_cast<char>(byte - 'A' + 'a') : byte;
}

// The bytes of a buffer whose size a caller of the interface gives; a size below 0 is none.
constexpr std::size_t zel_svc_buffer_size(int size) { return size > 0 ? static_cast<std::size_t>(size) : 0; }

// The text that a fixed-width field holds: up to its terminator or its width.
inline std::string_view zel_svc_text_view(const char *field, std::size_t width) {
    return {field, strnlen(field, width)};
}

// The text of a null-terminated string that may be a null pointer.
inline std::string_view zel_svc_text_view(const char *text) {
    return text ? std::string_view{text} : std::string_view{};
}

// A field of a record: N bytes of which the last is always zero.
template <std::size_t N> class FixedText {
  public:
    static constexpr std::size_t width = N;

    FixedText() = default;
    explicit FixedText(std::string_view text) { assign(text); }

    void assign(std::string_view text) { zel_svc_text_copy(bytes_, N, text); }
    void clear() { std::memset(bytes_, 0, N); }
    [[nodiscard]] bool empty() const { return bytes_[0] == '\0'; }
    [[nodiscard]] std::string_view view() const { return zel_svc_text_view(bytes_, N); }
    [[nodiscard]] const char *c_str() const { return bytes_; }
    [[nodiscard]] char *data() { return bytes_; }

    friend bool operator==(const FixedText &field, std::string_view text) { return field.view() == text; }

  private:
    char bytes_[N] = {};
};
