// Bookmarks and data-sync accounts as `zel` shows them.

#include "program.h"

#include <gmock/gmock.h>

namespace {

using ::testing::HasSubstr;
using ::testing::Not;

struct Services : zel_test::ZelCommand {
    void add_account() {
        const zel_test::Outcome added =
            zel_test::run_zel({"phone", "sync-accounts-add", "Work", "--password", "hunter2", "--contacts",
                               "--contacts-password", "hunter3", "--calendar-password", "hunter4"});
        EXPECT_EQ(added.code, 0) << added.err;
        EXPECT_THAT(added.out, Not(HasSubstr("hunter")));
    }
};

TEST_F(Services, AccountsHideTheirPasswordsUntilRevealed) {
    add_account();
    const std::string hidden = zel_test::run_zel({"phone", "sync-accounts"}).out;
    EXPECT_THAT(hidden, HasSubstr("Work"));
    EXPECT_THAT(hidden, HasSubstr("********"));
    EXPECT_THAT(hidden, Not(HasSubstr("hunter")));
    const std::string shown = zel_test::run_zel({"phone", "sync-accounts", "--reveal"}).out;
    for (const char *password : {"hunter2", "hunter3", "hunter4"})
        EXPECT_THAT(shown, HasSubstr(password));
}

TEST_F(Services, AccountsAreRawInJson) {
    add_account();
    const nlohmann::json account = json_of({"phone", "sync-accounts"}).at("accounts").at(0);
    EXPECT_EQ(account.at("password"), "hunter2");
    EXPECT_EQ(account.at("contacts_enabled"), true);
    EXPECT_EQ(account.at("calendar_enabled"), false);
    EXPECT_TRUE(account.at("calendar_name").is_null());
}

TEST_F(Services, BookmarksAreListedWithTheirFolders) {
    EXPECT_EQ(zel_test::run_zel({"phone", "bookmarks-add", "Portal", "http://p", "--fixed"}).code, 0);
    EXPECT_EQ(zel_test::run_zel({"phone", "bookmarks-add", "Morning", "http://m", "--folder", "News"}).code, 0);
    EXPECT_EQ(zel_test::run_zel({"phone", "bookmarks-manual", "http://manual"}).code, 0);
    const std::string page = zel_test::run_zel({"phone", "bookmarks"}).out;
    for (const char *text : {"Portal", "http://p", "Morning", "News", "http://manual"})
        EXPECT_THAT(page, HasSubstr(text));
    EXPECT_EQ(json_of({"phone", "bookmarks"}).at("bookmarks").size(), 3U);
    EXPECT_EQ(zel_test::run_zel({"phone", "bookmarks-clear"}).code, 0);
    EXPECT_EQ(json_of({"phone", "bookmarks"}).at("bookmarks").size(), 0U);
}

TEST_F(Services, SummaryShowsWhatWasRecordedWithoutPasswords) {
    write("/opt/system/zel-default/data/zel-default-data-bookmark.ini",
          "[bookmark]\ncount = 1\nname_1 = Portal\nurl_1 = http://p\n");
    write("/opt/system/zel-default/data/zel-default-data-quick-access.ini", "[quickaccess]\ntitle_1 = Search\n");
    write("/opt/system/zel-default/data/zel-default-data-browser.ini", "[emanual]\nurl = http://manual\n");
    write("/opt/system/zel-default/data/zel-default-data-syncml-ds.ini",
          "[ds]\naccount_name_1 = Work\nserver_addr_1 = http://s\npwd_1 = hunter2\n");
    const std::string page = zel_test::run_zel({"summary"}).out;
    for (const char *row :
         {"Bookmark 1 +Portal\n", "Bookmark address 1 +http://p\n", "Quick access 1 +Search\n",
          "User manual +http://manual\n", "Data sync account 1 +Work\n", "Data sync server 1 +http://s\n"})
        EXPECT_THAT(page, ::testing::ContainsRegex(row));
    EXPECT_THAT(page, Not(HasSubstr("hunter2")));
}

} // namespace
