#pragma once
// A program that links this gives out all memory itself, operator new's included, and can refuse some of it. That
// holds for the libraries it uses as well, and also where a sanitizer has its own allocator.
//
//     const auto places = zel_test::requests_of_library([] { zel_svc_config_encoding_xml(); });
//     const auto asked = zel_test::refuse_one(places[7], [&] { result = zel_svc_config_encoding_xml(); });

#include <functional>
#include <vector>

namespace zel_test {

enum class Asked {
    Nobody,    // the work made fewer requests
    Library,   // the library's own C++: an exception tells it
    ItsC,      // what the library calls, or itself in C: a null pointer tells it
    Otherwise, // the phone, the INI library, or whoever else
};

// The places, among all requests for memory that the work makes, of those that the library makes: itself or
// through what it calls, the phone and the INI library excepted. Of requests that come by the same path of calls,
// as from a loop, the first and the last.
std::vector<int> requests_of_library(const std::function<void()> &work);

// Does the work while the request at one place is refused, and tells whose it was.
Asked refuse_one(int place, const std::function<void()> &work);

} // namespace zel_test
