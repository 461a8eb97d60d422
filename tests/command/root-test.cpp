#include "program.h"

#include <cstdlib>
#include <filesystem>

using namespace zel_test;

namespace {

struct ZelRoot : ZelCommand {};

// What a folder of the workstation holds, one level deep.
std::size_t entries_in(const std::string &folder) {
    std::size_t count = 0;
    for ([[maybe_unused]] const auto &entry : std::filesystem::directory_iterator{folder})
        ++count;
    return count;
}

} // namespace

TEST_F(ZelRoot, IsNeeded) {
    ::unsetenv("ZEL_ROOT");
    const Outcome outcome = run_zel({"vconf", "list"});
    EXPECT_EQ(outcome.code, 3);
    EXPECT_EQ(outcome.out, "");
    EXPECT_EQ(outcome.err, "zel: no phone is named: neither --root nor $ZEL_ROOT is set\n"
                           "Name the phone's folder with 'zel --root DIR ...' or 'export ZEL_ROOT=DIR'.\n");
}

TEST_F(ZelRoot, OptionWinsOverTheEnvironment) {
    set_string("db/test/name", "mine");
    ::setenv("ZEL_ROOT", "/nowhere", 1);
    EXPECT_EQ(run_zel({"--root", root(), "vconf", "get", "db/test/name"}).out, "mine\n");
    EXPECT_EQ(run_zel({"vconf", "get", "db/test/name", "--root", root()}).out, "mine\n");
}

TEST_F(ZelRoot, MayBeRelative) {
    set_string("db/test/name", "mine");
    ::unsetenv("ZEL_ROOT");
    std::filesystem::current_path(std::filesystem::path{root()}.parent_path());
    const std::string name = std::filesystem::path{root()}.filename();
    EXPECT_EQ(run_zel({"--root", name, "vconf", "get", "db/test/name"}).out, "mine\n");
}

TEST_F(ZelRoot, OfTheMachineIsNoPhone) {
    for (const std::string &folder : {std::string{"/"}, std::string{std::getenv("HOME")}}) {
        for (const char *command : {"vconf list", "install XFV", "reboot"}) {
            const std::string text = command;
            const std::size_t space = text.find(' ');
            std::vector<std::string> words{"--root", folder, text.substr(0, space)};
            if (space != std::string::npos) words.push_back(text.substr(space + 1));
            const Outcome outcome = run_zel(words);
            EXPECT_EQ(outcome.code, 3) << folder << " " << command;
            EXPECT_NE(outcome.err.find("'" + folder + "'"), std::string::npos) << outcome.err;
        }
    }
}

TEST_F(ZelRoot, WithoutAPhoneIsRefused) {
    const std::string folder = make_folder();
    const Outcome outcome = run_zel({"--root", folder, "install", "XFV"});
    EXPECT_EQ(outcome.code, 3);
    EXPECT_NE(outcome.err.find("'" + folder + "' is no phone"), std::string::npos) << outcome.err;
    EXPECT_NE(outcome.err.find("phone create"), std::string::npos) << outcome.err;
    EXPECT_EQ(entries_in(folder), 0U);
    remove_folder(folder);
}

TEST_F(ZelRoot, IsMadeByPhoneCreate) {
    const std::string folder = make_folder();
    EXPECT_EQ(run_zel({"--root", folder + "/new", "phone", "create", "--sims", "2"}).code, 0);
    EXPECT_EQ(run_zel({"--root", folder + "/new", "vconf", "get", "memory/telephony/sim_slot_count"}).out, "2\n");
    remove_folder(folder);
}

TEST_F(ZelRoot, WithFilesIsNotMadeAPhone) {
    const std::string folder = make_folder();
    std::filesystem::create_directory(folder + "/mine");
    const Outcome outcome = run_zel({"--root", folder, "phone", "create"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_NE(outcome.err.find(folder), std::string::npos) << outcome.err;
    EXPECT_EQ(entries_in(folder), 1U);
    remove_folder(folder);
}

TEST_F(ZelRoot, InUseIsRefusedWithItsHoldersName) {
    call("lock", {{"holder", "'zel install', process 4711"}});
    const Outcome outcome = run_zel({"vconf", "set", "db/test/name", "other"});
    EXPECT_EQ(outcome.code, 1);
    EXPECT_NE(outcome.err.find("'zel install', process 4711"), std::string::npos) << outcome.err;
    EXPECT_EQ(get_string("db/test/name"), std::nullopt);
}

TEST_F(ZelRoot, InUseCanBeLookedAt) {
    set_string("db/test/name", "mine");
    call("lock", {{"holder", "'zel install', process 4711"}});
    EXPECT_EQ(run_zel({"vconf", "get", "db/test/name"}).out, "mine\n");
    EXPECT_EQ(run_zel({"phone", "status"}).code, 0);
}

TEST_F(ZelRoot, IsFreeAgainAfterEachCommand) {
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/name", "one"}).code, 0);
    EXPECT_EQ(run_zel({"vconf", "set", "db/test/name", "two"}).code, 0);
    EXPECT_EQ(get_string("db/test/name"), "two");
}
