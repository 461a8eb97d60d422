// What the phone holds, on one page.

#include "commands.h"
#include "summary-parts.h"

namespace zel_command {

int summary(Invocation &invocation) {
    const Phone &phone = invocation.phone;
    Json answer{{"customer", summary_customer(phone)}};
    answer["auto_flags"] = summary_auto_flags(bytes_of(answer["customer"], "code"));
    answer["settings"] = summary_settings(phone);
    answer["records"] = summary_records();
    answer["sims"] = summary_networks();
    answer["media"] = summary_media(phone);
    answer["section_store"] = summary_section_store(phone);
    if (invocation.json)
        print_json(answer);
    else
        print_summary(answer);
    return kDone;
}

} // namespace zel_command
