#include "memory/failing-memory.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <link.h>
#include <map>
#include <new>
#include <set>
#include <string_view>
#include <unwind.h>
#include <utility>

// The allocator behind this program's: a sanitizer's where there is one, else the C library's.
extern "C" {
void *__libc_malloc(std::size_t size);
void *__libc_calloc(std::size_t count, std::size_t size);
void *__libc_realloc(void *memory, std::size_t size);
__attribute__((weak)) void *__interceptor_malloc(std::size_t size);
__attribute__((weak)) void *__interceptor_calloc(std::size_t count, std::size_t size);
__attribute__((weak)) void *__interceptor_realloc(void *memory, std::size_t size);
}

namespace {

using zel_test::Asked;

// Where the code of a library lies.
struct Code {
    std::string_view name;
    std::uintptr_t from = 0;
    std::uintptr_t to = 0;

    [[nodiscard]] bool holds(const void *address) const {
        const auto at = reinterpret_cast<std::uintptr_t>(address);
        return from <= at && at < to;
    }
};
Code gLibrary{.name = "/libzel-svc.so"};
// The INI library does not look whether it got its memory: it crashes, and no caller can keep it from that.
Code gOthers[] = {{.name = "/libzel-platform-host.so"}, {.name = "/libiniparser.so"}};

// The places of one path of callers.
struct Places {
    int first = 0;
    int last = 0;
};

struct Watch {
    bool on = false;
    int seen = 0;
    int refused = 0; // the place that is refused; 0 for none
    Asked asked = Asked::Nobody;
    std::map<std::vector<void *>, Places> *paths = nullptr; // where the library's are written down
};
Watch gWatch;

void find_code(const dl_phdr_info &object, Code &code) {
    if (std::string_view{object.dlpi_name}.find(code.name) == std::string_view::npos) return;
    for (int i = 0; i < object.dlpi_phnum; ++i) {
        const auto &part = object.dlpi_phdr[i];
        if (part.p_type != PT_LOAD || (part.p_flags & PF_X) == 0) continue;
        code.from = object.dlpi_addr + part.p_vaddr;
        code.to = code.from + part.p_memsz;
    }
}

int find_all_code(dl_phdr_info *object, std::size_t /*size*/, void * /*unused*/) {
    find_code(*object, gLibrary);
    for (Code &code : gOthers)
        find_code(*object, code);
    return 0;
}

// Not backtrace(): what that loads looks like a leak behind an allocator of our own.
std::vector<void *> callers() {
    std::vector<void *> found;
    const auto take = [](_Unwind_Context *frame, void *to) {
        // The address stands behind the call.
        static_cast<std::vector<void *> *>(to)->push_back(reinterpret_cast<void *>(_Unwind_GetIP(frame) - 1));
        return _URC_NO_REASON;
    };
    _Unwind_Backtrace(take, &found);
    return found;
}

// By the innermost caller that is one of the known libraries.
Asked who_asks(const std::vector<void *> &path, bool with_new) {
    for (const void *caller : path) {
        if (gLibrary.holds(caller)) return with_new ? Asked::Library : Asked::ItsC;
        for (const Code &code : gOthers)
            if (code.holds(caller)) return Asked::Otherwise;
    }
    return Asked::Otherwise;
}

void write_down(std::vector<void *> path) {
    Places &places = (*gWatch.paths)[std::move(path)];
    places.last = gWatch.seen;
    if (places.first == 0) places.first = gWatch.seen;
}

bool is_refused(bool with_new) {
    if (!gWatch.on) return false;
    ++gWatch.seen;
    const bool refused = gWatch.seen == gWatch.refused;
    if (!refused && !gWatch.paths) return false;
    gWatch.on = false; // what follows takes memory itself
    std::vector<void *> path = callers();
    const Asked asked = who_asks(path, with_new);
    if (refused) gWatch.asked = asked;
    if (gWatch.paths && asked != Asked::Otherwise) write_down(std::move(path));
    gWatch.on = true;
    return refused;
}

void *given(std::size_t size) { return __interceptor_malloc ? __interceptor_malloc(size) : __libc_malloc(size); }

void *given_to_new(std::size_t size) { return is_refused(true) ? nullptr : given(size ? size : 1); }

void *given_or_thrown(std::size_t size) {
    if (void *memory = given_to_new(size)) return memory;
    throw std::bad_alloc{};
}

void watched(const std::function<void()> &work) {
    if (!gLibrary.to) ::dl_iterate_phdr(find_all_code, nullptr);
    gWatch.on = true;
    work();
    gWatch.on = false;
}

} // namespace

extern "C" {
void *malloc(std::size_t size) { return is_refused(false) ? nullptr : given(size); }
void *calloc(std::size_t count, std::size_t size) {
    if (is_refused(false)) return nullptr;
    return __interceptor_calloc ? __interceptor_calloc(count, size) : __libc_calloc(count, size);
}
void *realloc(void *memory, std::size_t size) {
    if (is_refused(false)) return nullptr;
    return __interceptor_realloc ? __interceptor_realloc(memory, size) : __libc_realloc(memory, size);
}
}

void *operator new(std::size_t size) { return given_or_thrown(size); }
void *operator new[](std::size_t size) { return given_or_thrown(size); }
void *operator new(std::size_t size, const std::nothrow_t & /*tag*/) noexcept { return given_to_new(size); }
void *operator new[](std::size_t size, const std::nothrow_t & /*tag*/) noexcept { return given_to_new(size); }
void operator delete(void *memory) noexcept { std::free(memory); }
void operator delete[](void *memory) noexcept { std::free(memory); }
void operator delete(void *memory, std::size_t /*size*/) noexcept { std::free(memory); }
void operator delete[](void *memory, std::size_t /*size*/) noexcept { std::free(memory); }
void operator delete(void *memory, const std::nothrow_t & /*tag*/) noexcept { std::free(memory); }
void operator delete[](void *memory, const std::nothrow_t & /*tag*/) noexcept { std::free(memory); }

namespace zel_test {

std::vector<int> requests_of_library(const std::function<void()> &work) {
    std::map<std::vector<void *>, Places> paths;
    gWatch = {.paths = &paths};
    watched(work);
    gWatch = {};
    std::set<int> places;
    for (const auto &path : paths)
        places.insert({path.second.first, path.second.last});
    return {places.begin(), places.end()};
}

Asked refuse_one(int place, const std::function<void()> &work) {
    gWatch = {.refused = place};
    watched(work);
    const Asked asked = gWatch.asked;
    gWatch = {};
    return asked;
}

} // namespace zel_test
