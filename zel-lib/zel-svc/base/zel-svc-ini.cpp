#include "base/zel-svc-ini.h"

#include "base/zel-svc-file.h"

#include <iniparser/iniparser.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <utility>

namespace {

struct CloseStream {
    void operator()(std::FILE *stream) const { std::fclose(stream); }
};

// A column of the dictionary with twice the room; the library frees it. Null, and nothing done, without memory.
template <class T> T *twice(T *column, std::size_t size) {
    T *larger = static_cast<T *>(std::calloc(2 * size, sizeof(T)));
    if (larger) std::copy_n(column, size, larger);
    return larger;
}

bool grow(dictionary &all) {
    const auto size = static_cast<std::size_t>(all.size);
    char **values = twice(all.val, size);
    char **keys = twice(all.key, size);
    unsigned *hashes = twice(all.hash, size);
    if (!values || !keys || !hashes) {
        std::free(values);
        std::free(keys);
        std::free(hashes);
        return false;
    }
    std::free(std::exchange(all.val, values));
    std::free(std::exchange(all.key, keys));
    std::free(std::exchange(all.hash, hashes));
    all.size *= 2;
    return true;
}

} // namespace

void ZelSvcIni::Free::operator()(_dictionary_ *loaded) const { iniparser_freedict(loaded); }

ZelSvcIni ZelSvcIni::load(const char *path) {
    const ZelSvcFd file = zel_svc_file_open(path, O_RDONLY);
    return file ? load(file.get()) : ZelSvcIni{};
}

ZelSvcIni ZelSvcIni::load(int fd) {
    ZelSvcIni ini;
    // The library opens files by itself, and only the platform may turn a phone path into one.
    if (fd >= 0) ini.dictionary_.reset(iniparser_load(("/proc/self/fd/" + std::to_string(fd)).c_str()));
    return ini;
}

bool ZelSvcIni::has(const std::string &key) const {
    return dictionary_ && iniparser_find_entry(dictionary_.get(), key.c_str()) != 0;
}

const char *ZelSvcIni::text(const std::string &key) const {
    return dictionary_ ? iniparser_getstring(dictionary_.get(), key.c_str(), nullptr) : nullptr;
}

// The library's number getters crash on the name of a section: it has no value.
int ZelSvcIni::number(const std::string &key, int fallback) const {
    return text(key) ? iniparser_getint(dictionary_.get(), key.c_str(), fallback) : fallback;
}

int ZelSvcIni::boolean(const std::string &key, int fallback) const {
    return text(key) ? iniparser_getboolean(dictionary_.get(), key.c_str(), fallback) : fallback;
}

bool ZelSvcIni::add_section(const std::string &section) {
    return dictionary_ && iniparser_set(dictionary_.get(), section.c_str(), nullptr) == 0;
}

bool ZelSvcIni::set(const std::string &key, const std::string &value) {
    return dictionary_ && iniparser_set(dictionary_.get(), key.c_str(), value.c_str()) == 0;
}

void ZelSvcIni::clear() {
    if (!dictionary_) return;
    dictionary &all = *dictionary_;
    for (ssize_t i = 0; i < all.size; ++i) {
        std::free(std::exchange(all.key[i], nullptr));
        std::free(std::exchange(all.val[i], nullptr));
    }
    all.n = 0;
}

// The library looks for an entry among all that there are before it adds one, which a customer of many
// networks would feel. So it is shown an empty dictionary: the free places behind the entries.
bool ZelSvcIni::append(const std::string &key, const char *value) {
    if (!dictionary_) return false;
    dictionary &all = *dictionary_;
    if ((all.n == all.size && !grow(all)) || all.key[all.n]) return false;
    dictionary free_places{
        .n = 0, .size = all.size - all.n, .val = all.val + all.n, .key = all.key + all.n, .hash = all.hash + all.n};
    if (iniparser_set(&free_places, key.c_str(), value) != 0 || !free_places.key[0]) return false;
    ++all.n;
    return true;
}

std::vector<std::pair<std::string, const char *>> ZelSvcIni::entries() const {
    std::vector<std::pair<std::string, const char *>> found;
    if (!dictionary_) return found;
    const dictionary &all = *dictionary_;
    found.reserve(static_cast<std::size_t>(std::max(all.n, 0)));
    for (ssize_t i = 0; i < all.size; ++i)
        if (all.key[i]) found.emplace_back(all.key[i], all.val[i]);
    return found;
}

bool ZelSvcIni::dump(int fd) const {
    if (!dictionary_) return false;
    ZelSvcFd copy{::fcntl(fd, F_DUPFD_CLOEXEC, 0)};
    std::unique_ptr<std::FILE, CloseStream> stream{copy ? ::fdopen(copy.get(), "w") : nullptr};
    if (!stream) return false;
    copy.release(); // the stream closes it
    iniparser_dump_ini(dictionary_.get(), stream.get());
    const bool written = std::fflush(stream.get()) == 0 && std::ferror(stream.get()) == 0;
    return std::fclose(stream.release()) == 0 && written;
}

std::string zel_svc_ini_quoted(std::string_view value) {
    if (value.empty()) return {};
    std::string text{value};
    std::replace(text.begin(), text.end(), '\n', ' ');
    const bool has_double = text.find('"') != std::string::npos;
    const bool has_single = text.find('\'') != std::string::npos;
    if (has_double && has_single) std::replace(text.begin(), text.end(), '"', '\'');
    const char quote = has_double && !has_single ? '\'' : '"';
    return quote + text + quote;
}

int zel_svc_ini_number(const std::string &value) { return static_cast<int>(std::strtol(value.c_str(), nullptr, 0)); }
