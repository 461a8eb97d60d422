#include "support/source-dir.h"

namespace zel_test {

const std::string &source_dir() {
    static const std::string folder = ZEL_SOURCE_DIR;
    return folder;
}

} // namespace zel_test
