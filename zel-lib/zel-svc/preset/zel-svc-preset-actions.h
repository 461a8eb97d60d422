#pragma once
// The presets that are more than a key of the settings store. Values are never null.

// Makes an input method the initial and the active one; an empty value leaves the phone's.
void zel_svc_preset_set_keyboard(const char *uuid);

// Sets the time zone by its name below "/usr/share/zoneinfo"; an empty value leaves the phone's.
void zel_svc_preset_set_time_zone(const char *zone);

// Fills a template and sets it as the browser's user agent: "$(MODEL)", "$(BUILD_VER)" and "$(PLATFORM_VER)"
// become what the phone tells about itself, any other "$(name)" is dropped.
void zel_svc_preset_set_user_agent(const char *pattern);
