#include "zel-svc-element-act-connection-profile.h"

#include "base/zel-svc-number.h"

namespace {

using Profile = ZelSvcApnProfile;

bool add_line(const std::string &label, std::string_view spec, std::string_view phone, bool passes) {
    zel_svc_verification_add_compared(label, spec, phone, passes);
    return passes;
}

// Without a word of the spec there is nothing to compare: the line stands for the one before it. Wanted so.
bool compare_auth(const std::string &item, const Profile &spec, const Profile &phone, bool before) {
    const bool passes = spec.auth.empty() ? before : spec.auth == phone.auth.view();
    return add_line(item + "/Auth", spec.auth.view(), phone.auth.view(), passes);
}

// A port without an address is written nowhere.
bool compare_port(const std::string &item, const Profile &spec, const Profile &phone) {
    const std::string_view port = spec.proxy_port.view();
    const std::string_view found = phone.proxy_port.view();
    const bool none = (port == "0" && found.empty()) || (port.empty() && found == "0");
    const bool unused = zel_svc_connection_is_no_address(spec.proxy_address.view()) && found.empty();
    return add_line(item + "/Proxy/Port", port, found, port == found || none || unused);
}

} // namespace

void __zel_svc_connection_verify_profile(int spec_index, Profile &spec) {
    Profile phone;
    if (!__zel_svc_connection_read_profile(spec_index, phone)) return;
    const std::string item = "Profile" + zel_svc_number_text(spec_index);
    bool before = true; // of the line last written for this profile, also when the full list dropped it
    for (const Field<Profile> &field : zel_svc_connection_profile_fields()) {
        if (field.element == ZEL_SVC_ELEMENT_AUTH)
            before = compare_auth(item, spec, phone, before);
        else if (field.element == ZEL_SVC_ELEMENT_PROXY_PORT)
            before = compare_port(item, spec, phone);
        else
            before = zel_svc_field_compare(item, field.rules.report, field.of(spec).view(), field.of(phone).view())
                         .value_or(before);
    }
}
