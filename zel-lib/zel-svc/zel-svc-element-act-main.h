#pragma once
// Settings that every customer has: volumes, touch and call tones, the media files, languages, input
// prediction, date and time. None depends on the parse mode or on an Auto flag.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_main_value(Occurrence &occurrence);
void zel_svc_element_act_main_language_value(Occurrence &occurrence);
void zel_svc_element_act_main_media_start(Occurrence &occurrence);

std::span<const Setting> zel_svc_main_settings();
std::span<const Setting> zel_svc_language_settings();

// A key of the store that receives a media file's path. `line` stands behind the tag in a result line,
// "[MessageTone/EmailAlert]".
struct MediaLine {
    const char *key = nullptr;
    std::string_view line = {};
};

// A media element: its start tag names a file of the package in the attribute "src". The file is copied into
// a folder of the user's media on every occurrence; the first occurrence alone becomes the phone's own.
struct Media {
    ZelSvcElementId element;
    std::string_view folder;     // ends in "/"
    const char *keys[3] = {};    // written in order, the first refusal stops
    const char *records[2] = {}; // in section "sound", behind all keys
    MediaLine lines[2] = {};     // compared on their own
};

std::span<const Media> zel_svc_media();
