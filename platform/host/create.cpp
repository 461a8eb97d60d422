#include "create.h"

#include "content.h"
#include "folder.h"
#include "layout.h"
#include "modem.h"
#include "open-file.h"
#include "record.h"
#include "verb.h"

#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>

namespace zel_host {
namespace {

constexpr const char *kProductCode = "/csa/imei/prodcode.dat";

[[noreturn]] void fail(const std::string &what) { throw VerbFailed(what + ": " + std::strerror(errno)); }

Fd open_empty_folder(const std::string &path) {
    if (::mkdir(path.c_str(), 0755) != 0 && errno != EEXIST) fail("cannot make '" + path + "'");
    Fd folder(::open(path.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    if (!folder) fail("cannot open '" + path + "'");
    if (is_forbidden_root(folder.get()))
        throw VerbFailed("'" + path + "' is never a phone: it is the root or home folder of this machine");
    if (!names_in(folder.get()).empty()) throw VerbFailed("'" + path + "' is not empty");
    return folder;
}

void make_marker(const Fd &folder) {
    if (::mkdirat(folder.get(), kStateFolder, 0755) != 0) fail("cannot make the state folder");
    const Fd state(::openat(folder.get(), kStateFolder, O_PATH | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
    const Fd marker(::openat(state.get(), kMarkerName, O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0644));
    if (!marker || !write_content(marker.get(), "zel bench phone\n")) fail("cannot mark the folder as a phone");
}

void put_product_code(Phone &phone, const std::string &code) {
    const Fd file(open_file(phone, kProductCode, O_WRONLY | O_CREAT | O_TRUNC, 0644));
    if (!file || !write_content(file.get(), code)) fail(std::string("cannot write ") + kProductCode);
}

} // namespace

std::unique_ptr<Phone> create_phone(const NewPhone &wanted) {
    make_marker(open_empty_folder(wanted.root));
    std::string error;
    std::unique_ptr<Phone> phone = Phone::open(wanted.root, error);
    if (phone == nullptr) throw VerbFailed(error);
    make_state(*phone);
    Transaction transaction(phone->store());
    make_platform(*phone);
    record(*phone, "slots", wanted.slots);
    announce_slots(*phone);
    transaction.commit();
    if (wanted.product_code) put_product_code(*phone, *wanted.product_code);
    return phone;
}

} // namespace zel_host
