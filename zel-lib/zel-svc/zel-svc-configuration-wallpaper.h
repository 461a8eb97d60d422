#pragma once
// The handset's model and colour, as its product code tells them.

#include "base/zel-svc-text.h"

#include <optional>

struct ZelSvcHandset {
    FixedText<5> model;
    FixedText<3> colour;
};

// Reads an open product code file and logs what it finds, step by step. Nothing when either is missing.
std::optional<ZelSvcHandset> zel_svc_wallpaper_read_handset(int product_code);

// One line of the phase, for both logs.
void zel_svc_wallpaper_log(const char *format, ...) __attribute__((format(printf, 1, 2)));
