#include "phone.h"

#include "bus-address.h"

#include <cstdio>
#include <cstdlib>
#include <sys/stat.h>

namespace zel_host {

Phone::Phone(Root root, Page *page)
    : root_(std::move(root)), page_(page), store_(root_.path + "/" + kStateFolder + "/state.db") {}

Phone::~Phone() { unmap_page(page_); }

std::unique_ptr<Phone> Phone::open(const std::string &path, std::string &error) {
    Root root = open_root(path, error);
    if (!root.folder) return nullptr;
    Page *page = map_page(root.state.get());
    if (page == nullptr) {
        error = "cannot map '" + root.path + "/" + kStateFolder + "/" + kPageName + "'";
        return nullptr;
    }
    return std::unique_ptr<Phone>(new Phone(std::move(root), page));
}

namespace {

struct ProcessPhone {
    std::unique_ptr<Phone> phone;
    std::string named; // $ZEL_ROOT when it was opened
    bool told = false;
};

ProcessPhone &process() {
    static ProcessPhone instance;
    return instance;
}

Phone *refuse(const std::string &error) {
    if (!process().told) std::fprintf(stderr, "zel: no phone: %s\n", error.c_str());
    process().told = true;
    return nullptr;
}

bool same_folder(const Phone &phone, const char *path) {
    struct stat opened {};
    struct stat named {};
    return ::fstat(phone.folder(), &opened) == 0 && ::stat(path, &named) == 0 && opened.st_dev == named.st_dev &&
           opened.st_ino == named.st_ino;
}

Phone *open_first(const char *root) {
    std::string error;
    process().phone = Phone::open(root, error);
    if (process().phone == nullptr) return refuse(error);
    process().named = root;
    set_bus_address(process().phone->path());
    return process().phone.get();
}

} // namespace

Phone *process_phone() {
    const char *root = std::getenv("ZEL_ROOT");
    if (root == nullptr || *root == '\0') return refuse("$ZEL_ROOT names no folder");
    ProcessPhone &known = process();
    if (known.phone == nullptr) return open_first(root);
    if (known.named == root) return known.phone.get();
    if (!same_folder(*known.phone, root))
        return refuse("this process already runs on '" + known.phone->path() + "', not on '" + root + "'");
    known.named = root;
    return known.phone.get();
}

} // namespace zel_host
