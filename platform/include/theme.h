#pragma once
// The toolkit and the theme colour derived from a wallpaper.

#ifdef __cplusplus
extern "C" {
#endif

int elm_init(int argc, char **argv);
int elm_shutdown(void);

// Derives the system colours from the picture at a phone path; the third argument is unused and null.
// Returns 0 on success, an error number otherwise.
int uxt_theme_set_suitable_system_color_info_from_image(const char *path, int kind, void *reserved);

#ifdef __cplusplus
}
#endif
