#include "package.h"

#include "bookmarks.h"
#include "clock.h"
#include "content.h"
#include "fault.h"
#include "layout.h"
#include "modem.h"
#include "open-file.h"
#include "sync-accounts.h"
#include "system-log.h"
#include "verb.h"

#include <cerrno>
#include <cstring>
#include <fcntl.h>

namespace zel_host {
namespace {

constexpr const char *kPackage = "/opt/system/zel";
constexpr const char *kProductCode = "/csa/imei/prodcode.dat";
constexpr const char *kWaiting = "package"; // in the state folder, while the phone's place for it is made

bool is_inside(const std::string &path, const std::string &folder) {
    return path == folder || path.starts_with(folder == "/" ? folder : folder + "/");
}

Fd open_source(Phone &phone, const std::string &path) {
    Fd source(::open(path.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    if (!source) throw VerbFailed("cannot open the package '" + path + "': " + std::strerror(errno));
    const std::string real = real_path(source.get());
    if (is_inside(real, phone.path()) || is_inside(phone.path(), real))
        throw VerbFailed("the package '" + path + "' and the phone '" + phone.path() + "' lie in each other");
    return source;
}

Fd make_waiting(Phone &phone) {
    remove_tree(phone.state_folder(), kWaiting);
    if (::mkdirat(phone.state_folder(), kWaiting, 0755) != 0) throw VerbFailed("cannot make the package's folder");
    return open_subfolder(phone.state_folder(), kWaiting);
}

void put_in_place(Phone &phone) {
    const NameInFolder place = resolve_parent(phone.folder(), kPackage);
    if (!place.folder) throw VerbFailed(std::string("the phone has no folder for ") + kPackage);
    remove_tree(place.folder.get(), place.name);
    if (::renameat(phone.state_folder(), kWaiting, place.folder.get(), place.name.c_str()) != 0)
        throw VerbFailed(std::string("cannot put the package at ") + kPackage + ": " + std::strerror(errno));
}

// True when the phone had a package, which now waits in the state folder.
bool take_away(Phone &phone) {
    const NameInFolder place = resolve_parent(phone.folder(), kPackage);
    remove_tree(phone.state_folder(), kWaiting);
    return place.folder && ::renameat(place.folder.get(), place.name.c_str(), phone.state_folder(), kWaiting) == 0;
}

void forget(Phone &phone) {
    phone.store().execute("DELETE FROM vconf; DELETE FROM attribute; DELETE FROM journal; DELETE FROM tool; "
                          "DELETE FROM application; "
                          "DELETE FROM record WHERE name <> 'slots'");
    clear_bookmarks(phone);
    clear_sync_accounts(phone);
    clear_faults(phone);
    clear_log(phone);
    run_clock(phone);
    phone.page().journal_on.store(0);
}

std::optional<std::string> product_code(Phone &phone) {
    const Fd file(open_file(phone, kProductCode, O_RDONLY, 0));
    return file ? std::optional<std::string>(read_content(file.get())) : std::nullopt;
}

void put_product_code(Phone &phone, const std::optional<std::string> &code) {
    if (!code) return;
    const Fd file(open_file(phone, kProductCode, O_WRONLY | O_CREAT | O_TRUNC, 0644));
    if (!file || !write_content(file.get(), *code)) throw VerbFailed(std::string("cannot write ") + kProductCode);
}

} // namespace

Copied replace_package(Phone &phone, const std::string &folder) {
    const Fd source = open_source(phone, folder);
    const Fd target = make_waiting(phone);
    Copied copied;
    copy_tree(source.get(), target.get(), copied);
    put_in_place(phone);
    return copied;
}

void reset_phone(Phone &phone) {
    const std::optional<std::string> code = product_code(phone);
    const bool packaged = take_away(phone);
    for (const std::string &name : names_in(phone.folder()))
        if (name != kStateFolder) remove_tree(phone.folder(), name);
    Transaction transaction(phone.store());
    forget(phone);
    make_platform(phone);
    announce_slots(phone);
    transaction.commit();
    if (packaged) put_in_place(phone);
    put_product_code(phone, code);
}

} // namespace zel_host
