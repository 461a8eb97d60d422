#include "zel-svc-element-act-bookmark.h"

#include "base/zel-svc-run-log.h"
#include "handler/zel-svc-phone-list.h"
#include "zel-svc-bookmark-service.h"

namespace {

struct Bookmark {
    FixedText<40> network_name;
    FixedText<20> editable;
    FixedText<200> folder;
    FixedText<200> name;
    FixedText<200> url;
};
static_assert(sizeof(Bookmark) == 660);

constexpr const char *kSection = "bookmark";

// Whatever is not "no" means yes, in the service and in the record.
constexpr FieldRules kEditable{
    .accepts = yes_no(),
    .others = FieldOthers::Kept,
    .record = {.key = "editable_%d", .form = FieldForm::Word, .otherwise = 1},
    .report = {.label = "Editable", .when = LineWhen::SpecGiven},
};

constexpr Field<Bookmark> kFields[] = {
    field<&Bookmark::network_name>(ZEL_SVC_ELEMENT_BOOKMARK_NETWORK_NAME, {.fills = FieldFills::Install}),
    field<&Bookmark::editable>(ZEL_SVC_ELEMENT_BOOKMARK_EDITABLE, kEditable),
    field<&Bookmark::folder>(ZEL_SVC_ELEMENT_BOOKMARK_FOLDER, {.report = {.label = "Folder"}}),
    field<&Bookmark::name>(ZEL_SVC_ELEMENT_BOOKMARK_NAME,
                           {.record = {.key = "name_%d"}, .report = {.label = "BookmarkName"}}),
    field<&Bookmark::url>(ZEL_SVC_ELEMENT_BOOKMARK_URL, {.record = {.key = "url_%d"}, .report = {.label = "URL"}}),
};
constexpr std::span<const Field<Bookmark>> kUpToEditable = std::span{kFields}.first(2);
constexpr std::span<const Field<Bookmark>> kBehindEditable = std::span{kFields}.subspan(2);

OpenRecord<Bookmark> gBookmark;
int gIndex = 0; // in the service's list, for verification and export

void clear_service() {
    zel_svc_run_log("[Bookmark/Start] Clear bookmark.\n");
    BookmarkService service;
    zel_svc_run_log("[Bookmark] Run init().\n");
    if (!service) return zel_svc_run_log("[Bookmark/Error] Run init().\n");
    service.reset();
    zel_svc_run_log("[Bookmark] Run reset().\n");
    service.close();
    zel_svc_run_log("[Bookmark] Run deinit().\n");
    zel_svc_run_log("[Bookmark/Ended] Clear bookmark.\n");
}

std::string count_in_service() {
    BookmarkService service;
    const auto ids = service ? service.ids() : std::nullopt;
    return service.close() && ids ? std::to_string(ids->size()) : "??";
}

bool fill(const BookmarkService &service, std::size_t index, Bookmark &bookmark) {
    const auto ids = service.ids();
    if (!ids || ids->size() <= index) return false;
    const auto info = service.info((*ids)[index]);
    const auto root = service.root();
    if (!info || !root) return false;
    if (info->parent != *root) {
        const auto folder = service.info(info->parent);
        if (!folder) return false;
        bookmark.folder.assign(folder->title);
    }
    bookmark.editable.assign(info->editable ? "yes" : "no");
    bookmark.name.assign(info->title);
    bookmark.url.assign(info->url);
    return true;
}

// Of a bookmark that cannot be read nothing is kept.
bool read_from_phone(int index, Bookmark &bookmark) {
    BookmarkService service;
    const bool filled = service && fill(service, static_cast<std::size_t>(index), bookmark);
    const bool read = service.close() && filled;
    if (!read) bookmark = Bookmark{};
    return read;
}

std::optional<int> find_or_make_folder(const BookmarkService &service, const char *title, int root) {
    const auto found = service.folders_titled(title, root);
    if (!found) {
        zel_svc_run_log("[Bookmark/Error] Run get duplicated_title().\n");
        return std::nullopt;
    }
    if (!found->empty()) return found->front();
    const auto made = service.create_folder(title, root);
    if (!made) zel_svc_run_log("[Bookmark/Error] Run create().\n");
    return made;
}

std::optional<int> parent_of(const BookmarkService &service, const Bookmark &bookmark) {
    const auto root = service.root();
    if (!root) {
        zel_svc_run_log("[Bookmark/Error] Run get root().\n");
        return std::nullopt;
    }
    return bookmark.folder.empty() ? root : find_or_make_folder(service, bookmark.folder.c_str(), *root);
}

void record(Bookmark &bookmark, int parent) {
    const int number = zel_svc_record_count_up(ZEL_SVC_DATA_BOOKMARK, kSection);
    zel_svc_record_save<Bookmark>(ZEL_SVC_DATA_BOOKMARK, kSection, kUpToEditable, bookmark, number);
    const std::string folder_key = "folder_id_" + std::to_string(number);
    zel_svc_data_set_int(ZEL_SVC_DATA_BOOKMARK, kSection, folder_key.c_str(), parent);
    zel_svc_record_save<Bookmark>(ZEL_SVC_DATA_BOOKMARK, kSection, kBehindEditable, bookmark, number);
}

void create(const BookmarkService &service, Bookmark &bookmark) {
    const auto parent = parent_of(service, bookmark);
    if (!parent) return;
    const bool editable = zel_svc_field_number(kEditable, bookmark.editable.view()) != 0;
    const auto id = service.create_bookmark({.parent = *parent,
                                             .editable = editable,
                                             .title = std::string{bookmark.name.view()},
                                             .url = std::string{bookmark.url.view()}});
    if (!id) return zel_svc_run_log("[Bookmark/Error] Run create().\n");
    record(bookmark, *parent);
}

void install(const Occurrence &occurrence, Bookmark &bookmark) {
    if (!zel_svc_item_applies(occurrence, ZEL_SVC_AUTO_BOOKMARK, bookmark.network_name.view(),
                              Wildcard::DefaultIsEverybodys))
        return;
    zel_svc_run_log("[Bookmark/Start] Set bookmark.\n");
    BookmarkService service;
    if (!service) return zel_svc_run_log("[Bookmark/Error] Run init().\n");
    create(service, bookmark);
    service.close();
    zel_svc_run_log("[Bookmark/Ended] Set bookmark.\n");
}

void verify(const Occurrence &occurrence, Bookmark &spec) {
    if (!zel_svc_group_applies(occurrence, ZEL_SVC_AUTO_BOOKMARK)) return;
    Bookmark phone;
    const bool read = read_from_phone(gIndex, phone);
    zel_svc_phone_list_compare<Bookmark>("Bookmark", ++gIndex, kFields, spec, read ? &phone : nullptr);
}

} // namespace

void zel_svc_element_act_bookmark_begin_parse() { gBookmark.close(); }

void zel_svc_element_act_bookmark_count(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_NB_BOOKMARK) return;
    if (occurrence.installs()) return clear_service();
    gIndex = 0;
    zel_svc_phone_list_count(occurrence, ZEL_SVC_AUTO_BOOKMARK, "Bookmark", count_in_service);
}

void zel_svc_element_act_bookmark_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_BOOKMARK) return;
    gBookmark.open();
    if (occurrence.exports() && gBookmark) read_from_phone(gIndex, *gBookmark);
}

void zel_svc_element_act_bookmark_value(Occurrence &occurrence) { gBookmark.copy(kFields, occurrence); }

void zel_svc_element_act_bookmark_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_BOOKMARK) return;
    const auto bookmark = gBookmark.take();
    if (occurrence.exports()) ++gIndex;
    if (!bookmark) return;
    if (occurrence.verifies()) verify(occurrence, *bookmark);
    if (occurrence.installs()) install(occurrence, *bookmark);
}
