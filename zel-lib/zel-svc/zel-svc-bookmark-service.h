#pragma once
// The platform's bookmark service as the handlers use it: opened and closed around every use, its lists and
// texts owned. A call that fails gives nothing.
//
//     BookmarkService service;
//     if (!service) return;
//     const auto root = service.root();

#include <optional>
#include <string>
#include <vector>

class BookmarkService {
  public:
    BookmarkService();
    ~BookmarkService() { close(); }
    BookmarkService(const BookmarkService &) = delete;
    BookmarkService &operator=(const BookmarkService &) = delete;

    explicit operator bool() const { return open_; }
    // Closes before its time, for whoever wants to know: false when the service was not open or refuses.
    bool close();

    struct Info {
        int parent = 0;
        bool editable = false;
        std::string title;
        std::string url;
    };

    // Members, though they use none: without an open service there is nobody to ask.
    [[nodiscard]] std::optional<int> root() const;
    [[nodiscard]] std::optional<std::vector<int>> ids() const; // of bookmarks, without folders
    [[nodiscard]] std::optional<Info> info(int id) const;
    [[nodiscard]] std::optional<std::vector<int>> folders_titled(const char *title, int parent) const;
    [[nodiscard]] std::optional<int> create_folder(std::string title, int parent) const;
    [[nodiscard]] std::optional<int> create_bookmark(Info bookmark) const;
    void reset() const;
    [[nodiscard]] std::optional<std::string> manual_url() const; // empty when none was set
    [[nodiscard]] bool set_manual_url(const char *url) const;

  private:
    bool open_;
};
