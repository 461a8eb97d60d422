#pragma once
// How many GLib lists this process has released: g_list_free() is counted on its way.

namespace zel_test {

int released_lists(); // null lists do not count

} // namespace zel_test
