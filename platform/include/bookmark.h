#pragma once
// The platform's bookmark service: the browser's bookmarks in their folders, and the address of the phone's
// user manual. A caller is the service's client from bookmark_zel_initialize() to bookmark_zel_deinitialize();
// every other call outside of these fails. Folders and bookmarks share one numbering of ids.
//
// Every function returns 0 on success, another number on failure; what it would have filled stays untouched
// then. Lists and texts that it gives out are the caller's, to be released with free(3).

#ifdef __cplusplus
extern "C" {
#endif

struct bookmark_zel_info {
    int is_folder; // 1 for a folder, which has no URL
    int parent;    // id of the folder that it is in
    int editable;  // 1 when the user may change it
    char *title;
    char *url;
};

int bookmark_zel_initialize(void);
int bookmark_zel_deinitialize(void);

// The folder that everything is in.
int bookmark_zel_get_root(int *id);
// All bookmarks, folders not among them, in the order in which they were made; null and 0 when there are none.
int bookmark_zel_get_full_ids_p(int **ids, int *count);
// What is known of a bookmark or a folder; both texts are new ones.
int bookmark_zel_get_info(int id, struct bookmark_zel_info *info);
// The folders (`is_folder` 1) or bookmarks (0) of a title directly in `parent`, oldest first; null and 0 when
// there are none.
int bookmark_zel_get_duplicated_title_ids_p(const char *title, int parent, int is_folder, int **ids, int *count);

// Makes a bookmark or a folder and gives its id. The texts stay the caller's; a folder's URL is null.
int bookmark_zel_create(const struct bookmark_zel_info *info, int *id);
// Removes all bookmarks and all folders but the root.
int bookmark_zel_reset(void);

int bookmark_zel_get_user_manual_url(char **url); // null when none was set
int bookmark_zel_set_user_manual_url(const char *url);

#ifdef __cplusplus
}
#endif
