#pragma once
// Languages as the spec names them and as the phone's locales.

#include <string_view>

// Looks `value` up by language name (to_locale 1) or by locale (0) and copies the other one to `out`, a
// buffer of 256 bytes that is cleared first. A value that is not in the table but has an underscore at its
// second character or later is taken for a locale already and copied as it is. Returns 1 when found, else 0.
int zel_svc_language_lookup(const char *value, char *out, int to_locale);

// Whether a spec text names a language: it is in the table or looks like a locale.
bool zel_svc_language_known(std::string_view text);

inline constexpr unsigned ZEL_SVC_LANGUAGE_SIZE = 256;
