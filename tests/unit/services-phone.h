#pragma once
// A phone whose bookmark service and sync agent are looked at from outside, and whose calls are counted.

#include "operator-items.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <string>
#include <string_view>
#include <vector>

namespace zel_test {

inline std::string leaf(std::string_view tag, std::string_view text) {
    const std::string name{tag};
    return "<" + name + ">" + std::string{text} + "</" + name + ">";
}

class ServicesPhone : public BenchPhone {
  protected:
    nlohmann::json bookmarks() { return call("bookmarks").at("bookmarks"); }
    nlohmann::json accounts() { return call("sync-accounts").at("accounts"); }

    // "title" or "folder/title", in the order of their making; folders end in "/".
    std::vector<std::string> shown_bookmarks() {
        std::vector<std::string> result;
        const nlohmann::json all = bookmarks();
        for (const nlohmann::json &bookmark : all) {
            std::string shown = bookmark.at("folder").is_null() ? "" : bookmark.at("folder").get<std::string>() + "/";
            shown += bookmark.at("title").get<std::string>();
            result.push_back(bookmark.at("is_folder") == true ? shown + "/" : shown);
        }
        return result;
    }

    std::vector<std::string> account_names() {
        std::vector<std::string> result;
        const nlohmann::json all = accounts();
        for (const nlohmann::json &account : all)
            result.push_back(account.at("name"));
        return result;
    }

    void start_journal() { call("journal-start"); }

    int calls_of(const std::string &function) {
        int count = 0;
        const nlohmann::json journal = call("journal-list");
        for (const nlohmann::json &entry : journal.at("calls"))
            if (entry.at("function") == function) ++count;
        return count;
    }

    // Whether each use of the bookmark service and of the sync agent that began has ended too.
    void expect_services_closed() {
        EXPECT_EQ(calls_of("bookmark_zel_deinitialize"), calls_of("bookmark_zel_initialize"));
        EXPECT_EQ(calls_of("sync_agent_ds_deinit"), calls_of("sync_agent_ds_init"));
    }
};

} // namespace zel_test
