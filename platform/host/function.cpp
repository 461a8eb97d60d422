#include "function.h"

#include <algorithm>

namespace zel_host {

const Function *find_function(std::string_view name) {
    const auto *row = std::find_if(std::begin(kFunctions), std::end(kFunctions),
                                   [name](const Function &function) { return function.name == name; });
    return row == std::end(kFunctions) ? nullptr : row;
}

} // namespace zel_host
