#pragma once
// What a new phone holds: its folders, its network databases, its tools, its state.

#include "phone.h"

namespace zel_host {

// The tables of the bench phone's own state.
void make_state(Phone &phone);
// The platform's folders and network databases; throws StoreError.
void make_platform(Phone &phone);

} // namespace zel_host
