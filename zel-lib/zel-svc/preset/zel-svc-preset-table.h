#pragma once
// The presets, a row each: the key in a preset file, and what its value sets.

#include <cstddef>

enum class ZelSvcPresetType { String, Integer, Boolean };

struct ZelSvcPresetRow {
    const char *key; // in the sections of a preset file
    ZelSvcPresetType type = ZelSvcPresetType::String;
    const char *store = nullptr;              // key of the settings store, or
    void (*act)(const char *value) = nullptr; // what is done instead
};

inline constexpr std::size_t ZEL_SVC_PRESET_COUNT = 27;
extern const ZelSvcPresetRow ZEL_SVC_PRESETS[ZEL_SVC_PRESET_COUNT];
