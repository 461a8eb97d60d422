#pragma once
// One bench phone: its root folder, its state, and the page that its processes share.

#include "page.h"
#include "resolve.h"
#include "root.h"
#include "store.h"

#include <memory>
#include <string>

namespace zel_host {

class Phone {
  public:
    // Null when `path` is no phone; `error` then says why.
    static std::unique_ptr<Phone> open(const std::string &path, std::string &error);
    ~Phone();
    Phone(const Phone &) = delete;
    Phone &operator=(const Phone &) = delete;

    [[nodiscard]] const std::string &path() const { return root_.path; }
    [[nodiscard]] int folder() const { return root_.folder.get(); }
    [[nodiscard]] int state_folder() const { return root_.state.get(); }
    [[nodiscard]] Store &store() { return store_; }
    [[nodiscard]] Page &page() { return *page_; }
    // The lock on the phone, held until it is closed (phone-lock.h).
    [[nodiscard]] Fd &lock() { return lock_; }

  private:
    Phone(Root root, Page *page);
    Root root_;
    Page *page_;
    Store store_;
    Fd lock_;
};

// The phone that this process's platform calls act on: the one that $ZEL_ROOT names at the first call, for
// good. Null without one, or when $ZEL_ROOT has come to name another; standard error says so once.
Phone *process_phone();

} // namespace zel_host
