#include "layout.h"

#include "modem.h"
#include "system-information.h"
#include "tools.h"

#include <fcntl.h>
#include <sqlite3.h>
#include <sys/stat.h>

namespace zel_host {
namespace {

constexpr const char *kStateTables = R"(
CREATE TABLE vconf (key TEXT PRIMARY KEY, type INTEGER NOT NULL, value NOT NULL) WITHOUT ROWID;
CREATE TABLE record (name TEXT PRIMARY KEY, value) WITHOUT ROWID;
CREATE TABLE attribute (device INTEGER, inode INTEGER, birth INTEGER, name TEXT, value TEXT NOT NULL,
                        PRIMARY KEY (device, inode, birth, name)) WITHOUT ROWID;
CREATE TABLE fault (id INTEGER PRIMARY KEY AUTOINCREMENT, function TEXT NOT NULL, text TEXT NOT NULL,
                    first INTEGER NOT NULL, times INTEGER NOT NULL, result INTEGER NOT NULL,
                    error INTEGER NOT NULL, seen INTEGER NOT NULL DEFAULT 0);
CREATE TABLE journal (id INTEGER PRIMARY KEY, function TEXT NOT NULL, arguments TEXT NOT NULL);
CREATE TABLE tool (path TEXT PRIMARY KEY, status INTEGER NOT NULL, file TEXT NOT NULL,
                   content TEXT NOT NULL, does TEXT NOT NULL) WITHOUT ROWID;
CREATE TABLE application (name TEXT PRIMARY KEY, type TEXT NOT NULL, state TEXT NOT NULL,
                          refusal TEXT NOT NULL) WITHOUT ROWID;
CREATE TABLE modem (slot INTEGER PRIMARY KEY, name TEXT NOT NULL, state INTEGER NOT NULL, mcc TEXT, mnc TEXT,
                    msin TEXT, gid TEXT, spn TEXT, result INTEGER);
CREATE TABLE bookmark (id INTEGER PRIMARY KEY, parent INTEGER NOT NULL, folder INTEGER NOT NULL,
                       editable INTEGER NOT NULL, title TEXT NOT NULL, url TEXT NOT NULL);
CREATE INDEX bookmark_title ON bookmark (parent, title);
INSERT INTO bookmark VALUES (1, 0, 1, 0, 'Bookmarks', '');
CREATE TABLE sync_account (id INTEGER PRIMARY KEY, attribute INTEGER NOT NULL, name TEXT NOT NULL,
                           address TEXT NOT NULL, user_id TEXT NOT NULL, password TEXT NOT NULL,
                           sync_mode INTEGER NOT NULL, sync_type INTEGER NOT NULL, sync_interval INTEGER NOT NULL);
CREATE TABLE sync_service (account INTEGER NOT NULL, type INTEGER NOT NULL, enabled INTEGER NOT NULL,
                           source INTEGER NOT NULL, name TEXT, database_id TEXT, password TEXT,
                           PRIMARY KEY (account, type)) WITHOUT ROWID;
)";

// The telephony side reads pdp_profile by position: columns 24 and 25 follow one that only it writes.
constexpr const char *kNetworkTables = R"(
BEGIN;
CREATE TABLE network_info (network_info_id INTEGER PRIMARY KEY, network_name TEXT, mccmnc TEXT);
CREATE TABLE pdp_profile (
  profile_id INTEGER PRIMARY KEY, profile_name TEXT, apn TEXT, auth_type INTEGER, auth_id TEXT, auth_pwd TEXT,
  pdp_protocol INTEGER, roam_pdp_protocol INTEGER, proxy_ip_addr TEXT, home_url TEXT, linger_time INTEGER,
  traffic_class INTEGER, is_static_ip_addr INTEGER, ip_addr TEXT, is_static_dns_addr INTEGER, dns_addr1 TEXT,
  dns_addr2 TEXT, network_info_id INTEGER, svc_category_id INTEGER, hidden INTEGER, editable INTEGER,
  default_internet_con INTEGER, user_defined INTEGER, platform_flag INTEGER DEFAULT 0, is_roaming_apn INTEGER,
  profile_enable INTEGER);
CREATE TABLE fast_dormancy (
  dormant_id INTEGER PRIMARY KEY, network_info_id INTEGER, lcd_on_timeout INTEGER, lcd_off_timeout INTEGER,
  lcd_on_timeout_rel8 INTEGER, lcd_off_timeout_rel8 INTEGER);
CREATE TABLE max_pdp (max_id INTEGER PRIMARY KEY, network_info_id INTEGER, max_pdp_3g INTEGER);
COMMIT;
)";

constexpr const char *kFolders[] = {
    "/csa/imei",
    "/opt/dbspace",
    "/opt/system/zel",
    "/opt/system/zel-default/output",
    "/opt/system/zel-default/data",
    "/opt/system/zel-default/app",
    "/opt/system/zel-default/preset",
    "/opt/system/zel-default/fsupdate",
    "/opt/system/zel-default/usr",
    "/opt/usr/apps",
    "/opt/usr/media/DCIM",
    "/opt/usr/media/Downloads/Others",
    "/opt/usr/media/Images",
    "/opt/usr/media/Screenshots",
    "/opt/usr/media/Sounds",
    "/opt/usr/media/Videos",
    "/opt/usr/share/settings/Alarms",
    "/opt/usr/share/settings/Alerts",
    "/opt/usr/share/settings/Ringtones",
    "/opt/usr/share/settings/Wallpapers",
    "/run/dbus",
    "/tmp",
    "/usr/bin",
};

constexpr const char *kNetworkDatabases[] = {"/opt/dbspace/.dnet.db", "/opt/dbspace/.dnet2.db"};

struct PlatformTool {
    const char *path;
    const char *does;
};
constexpr PlatformTool kTools[] = {
    {"/usr/bin/pkgcmd", "install-list"},
    {"/usr/bin/pkg", "disable"},
    {"/usr/bin/rpm-backend", "uninstall"},
};

void make_folder(Phone &phone, std::string_view path) {
    for (std::size_t end = path.find('/', 1);; end = path.find('/', end + 1)) {
        const NameInFolder name = resolve_parent(phone.folder(), path.substr(0, end));
        if (name.folder) static_cast<void>(::mkdirat(name.folder.get(), name.name.c_str(), 0755));
        if (end == std::string_view::npos) return;
    }
}

void make_network_database(Phone &phone, const char *path) {
    const NameInFolder name = resolve_parent(phone.folder(), path);
    const Fd file(::openat(name.folder.get(), name.name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0660));
    sqlite3 *database = nullptr;
    int result = sqlite3_open_v2(real_path(file.get()).c_str(), &database, SQLITE_OPEN_READWRITE, nullptr);
    if (result == SQLITE_OK) result = sqlite3_exec(database, "PRAGMA synchronous=OFF", nullptr, nullptr, nullptr);
    if (result == SQLITE_OK) result = sqlite3_exec(database, kNetworkTables, nullptr, nullptr, nullptr);
    sqlite3_close(database);
    if (result != SQLITE_OK) throw StoreError(std::string("cannot make '") + path + "'");
}

} // namespace

void make_state(Phone &phone) {
    Transaction transaction(phone.store());
    phone.store().execute(kStateTables);
    make_modems(phone);
    transaction.commit();
}

void make_platform(Phone &phone) {
    for (const char *path : kFolders)
        make_folder(phone, path);
    for (const char *path : kNetworkDatabases)
        make_network_database(phone, path);
    for (const PlatformTool &tool : kTools)
        add_tool(phone, {.path = tool.path, .does = tool.does});
    for (const InformationRow &row : kInformation)
        set_information(phone, row, row.at_first);
}

} // namespace zel_host
