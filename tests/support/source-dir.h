#pragma once
// Where the sources of this checkout are, for tests that read its documents and examples.

#include <string>

namespace zel_test {

const std::string &source_dir();

} // namespace zel_test
