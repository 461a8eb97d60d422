#include "base/zel-svc-file.h"
#include "zel-svc-configuration-wallpaper.h"

#include <unistd.h>

namespace {

enum class Found { Yes, NoPlace, NoBytes };

// Part of a product code: it ends where the file ends, so places are counted from there.
struct Place {
    off_t from_end;
    std::size_t size;
};

constexpr Place kModel = {.from_end = 11, .size = 4};
constexpr Place kColour = {.from_end = 6, .size = 2};

template <std::size_t N> Found read_place(int file, const Place &place, std::size_t least, FixedText<N> &text) {
    static_assert(N > 1);
    char bytes[N] = {};
    if (::lseek(file, -place.from_end, SEEK_END) < 0) return Found::NoPlace;
    if (zel_svc_file_read_all(file, bytes, place.size) < least) return Found::NoBytes;
    text.assign({bytes, N - 1});
    return Found::Yes;
}

} // namespace

std::optional<ZelSvcHandset> zel_svc_wallpaper_read_handset(int product_code) {
    ZelSvcHandset handset;
    const Found model = read_place(product_code, kModel, 1, handset.model);
    if (model == Found::NoPlace)
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Model name not found.\n");
    else if (model == Found::NoBytes)
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Model name not read.\n");
    else
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Model='%s' recognized.\n", handset.model.c_str());

    const Found colour = read_place(product_code, kColour, kColour.size, handset.colour);
    if (colour == Found::NoPlace)
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Color code not found.\n");
    else if (colour == Found::NoBytes)
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Color code not read.\n");
    else
        zel_svc_wallpaper_log("[Config][DefaultWallpaperByHWColor] Color='%s' recognized.\n", handset.colour.c_str());

    if (model != Found::Yes || colour != Found::Yes) return std::nullopt;
    return handset;
}
