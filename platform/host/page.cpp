#include "page.h"

#include "fd.h"

#include <fcntl.h>
#include <sys/mman.h>

namespace zel_host {

Page *map_page(int state_folder) {
    const Fd file(::openat(state_folder, kPageName, O_RDWR | O_CREAT | O_NOFOLLOW | O_CLOEXEC, 0600));
    if (!file || ::ftruncate(file.get(), sizeof(Page)) != 0) return nullptr;
    void *memory = ::mmap(nullptr, sizeof(Page), PROT_READ | PROT_WRITE, MAP_SHARED, file.get(), 0);
    return memory == MAP_FAILED ? nullptr : static_cast<Page *>(memory); // NOLINT(performance-no-int-to-ptr)
}

void unmap_page(Page *page) {
    if (page != nullptr) ::munmap(page, sizeof(Page));
}

} // namespace zel_host
