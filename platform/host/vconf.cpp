#include "call.h"
#include "keys.h"

#include <cstdlib>
#include <cstring>
#include <vconf.h>

namespace zel_host {
namespace {

int get_number(Phone &phone, const char *key, KeyType type, int *value) {
    if (key == nullptr || value == nullptr) return -1;
    const std::optional<KeyValue> stored = get_key(phone, key);
    if (!stored || stored->type != type) return -1;
    *value = static_cast<int>(stored->number);
    return 0;
}

int set_number(Phone &phone, const char *key, KeyType type, int value) {
    if (key == nullptr || *key == '\0') return -1;
    set_key(phone, key, type, value);
    return 0;
}

char *get_text(Phone &phone, const char *key) {
    if (key == nullptr) return nullptr;
    const std::optional<KeyValue> stored = get_key(phone, key);
    if (!stored || stored->type != KeyType::Text) return nullptr;
    return ::strdup(stored->text.c_str());
}

int set_text(Phone &phone, const char *key, const char *value) {
    if (key == nullptr || *key == '\0' || value == nullptr) return -1;
    set_key(phone, key, value);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int vconf_get_int(const char *key, int *value) {
    return answer<function("vconf_get_int")>(
        [&](Phone &phone) { return get_number(phone, key, KeyType::Integer, value); }, key);
}

ZEL_HOST_EXPORT int vconf_get_bool(const char *key, int *value) {
    return answer<function("vconf_get_bool")>(
        [&](Phone &phone) { return get_number(phone, key, KeyType::Boolean, value); }, key);
}

ZEL_HOST_EXPORT char *vconf_get_str(const char *key) {
    return answer<function("vconf_get_str")>([&](Phone &phone) { return get_text(phone, key); }, key);
}

ZEL_HOST_EXPORT int vconf_set_int(const char *key, int value) {
    return answer<function("vconf_set_int")>(
        [&](Phone &phone) { return set_number(phone, key, KeyType::Integer, value); }, key, value);
}

ZEL_HOST_EXPORT int vconf_set_bool(const char *key, int value) {
    return answer<function("vconf_set_bool")>(
        [&](Phone &phone) { return set_number(phone, key, KeyType::Boolean, value != 0 ? 1 : 0); }, key, value);
}

ZEL_HOST_EXPORT int vconf_set_str(const char *key, const char *value) {
    return answer<function("vconf_set_str")>([&](Phone &phone) { return set_text(phone, key, value); }, key, value);
}
