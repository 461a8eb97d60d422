// Which SIMs reach which entry, compared with trying every SIM there is.

#include "sim-matrix.h"

#include "zel-svc-sim-auto-setting-match.h"

#include <algorithm>
#include <cstring>
#include <gmock/gmock.h>
#include <map>
#include <random>
#include <set>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using zel_command::free_msin;
using zel_command::Reach;
using zel_command::Reached;
using zel_command::reached;

using Entries = std::vector<ZelSvcSimOperator>;
using Texts = std::vector<std::string>;

ZelSvcSimOperator entry(const std::string &mccmnc, const std::string &subset = "", const std::string &gid = "",
                        const std::string &spn = "") {
    ZelSvcSimOperator result{};
    std::strcpy(result.mccmnc, mccmnc.c_str());
    std::strcpy(result.subset_code, subset.c_str());
    std::strcpy(result.gid, gid.c_str());
    std::strcpy(result.sp_name, spn.c_str());
    return result;
}

std::vector<Reach> reach_of(const Entries &entries) {
    std::vector<Reach> result;
    for (const Reached &one : reached(entries))
        result.push_back(one.reach);
    return result;
}

// Every SIM of a network that entries with codes of at most two digits, GIDs A and B and SPNs x and y can tell
// apart.
std::vector<ZelSvcSimInfo> every_sim(const std::string &mccmnc) {
    std::vector<ZelSvcSimInfo> sims;
    for (int digits = 0; digits < 100; ++digits)
        for (const char *gid : {"", "A", "B"})
            for (const char *spn : {"", "x", "Y"}) {
                ZelSvcSimInfo sim{};
                std::strcpy(sim.mccmnc, mccmnc.c_str());
                const std::string msin = (digits < 10 ? "0" : "") + std::to_string(digits) + "12345678";
                std::strcpy(sim.msin, msin.c_str());
                std::strcpy(sim.gid, gid);
                std::strcpy(sim.spn, spn);
                sims.push_back(sim);
            }
    return sims;
}

// What trying every SIM tells of an entry.
struct Tried {
    bool by_phone = false;  // a SIM without GID and SPN reaches it
    bool by_caller = false; // one with them does
    std::set<std::size_t> asked;
    std::set<std::size_t> but_for; // fits the entry, and goes to these
};

std::vector<Tried> try_all(const Entries &entries) {
    std::vector<Tried> tried(entries.size());
    for (const ZelSvcSimInfo &sim : every_sim("21401")) {
        const ZelSvcSimMatch match = zel_svc_sim_match(entries, sim);
        const bool plain_sim = sim.gid[0] == '\0' && sim.spn[0] == '\0';
        for (const std::size_t number : match.chosen) {
            (plain_sim ? tried[number].by_phone : tried[number].by_caller) = true;
            if (match.chosen.size() > 1) tried[number].asked.insert(match.chosen.begin(), match.chosen.end());
        }
        for (std::size_t number = 0; number < entries.size(); ++number) {
            const ZelSvcSimVerdict verdict = match.verdicts[number];
            const bool fits = verdict == ZelSvcSimVerdict::Plain || verdict == ZelSvcSimVerdict::Decisive;
            const bool gets = std::find(match.chosen.begin(), match.chosen.end(), number) != match.chosen.end();
            if (fits && !gets) tried[number].but_for.insert(match.chosen.begin(), match.chosen.end());
        }
    }
    return tried;
}

Reach expected(const Tried &tried) {
    if (!tried.by_phone) return tried.by_caller ? Reach::Caller : Reach::Nothing;
    return tried.asked.empty() ? Reach::Alone : Reach::Asked;
}

std::string shown(const Entries &entries) {
    std::string text;
    for (const ZelSvcSimOperator &one : entries)
        text += std::string("[") + one.subset_code + "|" + one.gid + "|" + one.sp_name + "] ";
    return text;
}

template <std::size_t N> std::string any_of(std::mt19937 &random, const char *const (&texts)[N]) {
    return texts[random() % N];
}

ZelSvcSimOperator any_entry(std::mt19937 &random) {
    static const char *const kGids[] = {"", "", "A", "B"};
    static const char *const kSpns[] = {"", "", "x", "X", "y"};
    std::string subset;
    const auto digits = random() % 5;
    for (auto i = digits; i > 2; --i)
        subset += static_cast<char>('0' + random() % 10);
    return entry("21401", subset, any_of(random, kGids), any_of(random, kSpns));
}

// Sometimes a whole decade of codes, which leaves a shorter code or a plain entry without SIMs.
Entries any_entries(std::mt19937 &random) {
    Entries entries;
    const std::string decade = random() % 2 ? std::string(1, static_cast<char>('0' + random() % 10)) : "";
    if (random() % 2)
        for (char digit = '0'; digit <= '9'; ++digit)
            entries.push_back(entry("21401", decade + digit));
    if (random() % 3) entries.push_back(entry("21401", decade));
    for (auto more = random() % 7; more > 0; --more)
        entries.insert(entries.begin() + static_cast<long>(random() % (entries.size() + 1)), any_entry(random));
    return entries;
}

} // namespace

TEST(SimMatrix, AgreesWithTryingEverySim) {
    std::mt19937 random(20140701);
    std::map<Reach, int> seen;
    for (int round = 0; round < 300; ++round) {
        const Entries entries = any_entries(random);
        const std::vector<Tried> tried = try_all(entries);
        const std::vector<Reached> found = reached(entries);
        ASSERT_EQ(found.size(), entries.size());
        for (std::size_t number = 0; number < entries.size(); ++number) {
            const std::string where = shown(entries) + "entry " + std::to_string(number);
            ++seen[found[number].reach];
            EXPECT_EQ(found[number].reach, expected(tried[number])) << where;
            if (found[number].reach == Reach::Nothing) continue;
            const std::set<std::size_t> but_for(found[number].but_for.begin(), found[number].but_for.end());
            EXPECT_EQ(but_for, tried[number].but_for) << where;
            const std::set<std::size_t> asked(found[number].asked.begin(), found[number].asked.end());
            EXPECT_EQ(asked, tried[number].asked) << where;
        }
    }
    for (const Reach reach : {Reach::Alone, Reach::Asked, Reach::Caller, Reach::Nothing})
        EXPECT_GT(seen[reach], 20) << static_cast<int>(reach);
}

TEST(SimMatrix, KnowsNetworksApart) {
    EXPECT_THAT(reach_of({entry("21401"), entry("21402"), entry("310410"), entry("21402", "5")}),
                ElementsAre(Reach::Alone, Reach::Alone, Reach::Alone, Reach::Alone));
}

TEST(SimMatrix, NothingReachesWhatNoSimCanBe) {
    const Entries entries{entry(""),      entry("2140"),        entry("2140111"),
                          entry("2140a"), entry("21401", "9a"), entry("310410", "123456789")};
    const std::vector<Reached> found = reached(entries);
    for (std::size_t number = 0; number < 5; ++number) {
        EXPECT_EQ(found[number].reach, Reach::Nothing) << number;
        EXPECT_FALSE(found[number].why.empty()) << number;
        EXPECT_THAT(found[number].instead, IsEmpty()) << number;
    }
    EXPECT_THAT(found[1].why, HasSubstr("'2140'"));
    EXPECT_EQ(found[5].reach, Reach::Alone); // nine digits are all that this network's SIMs have
}

TEST(SimMatrix, SaysWhoGetsTheSimsOfAnUnreachedEntry) {
    const std::vector<Reached> found =
        reached(Entries{entry("21401", "", "A"), entry("21401", "", "A"), entry("21401", "98"), entry("21401", "987")});
    EXPECT_THAT(found[1].instead, ElementsAre(0U));
    EXPECT_THAT(found[3].instead, ElementsAre(2U));
    EXPECT_THAT(found[0].instead, IsEmpty());
}

TEST(SimMatrix, AnEmptyListHasNoEntries) { EXPECT_THAT(reached({}), IsEmpty()); }

TEST(FreeMsin, AvoidsWhatIsTaken) {
    EXPECT_EQ(free_msin("", {}, 10), "0000000000");
    EXPECT_EQ(free_msin("98", {}, 9), "980000000");
    EXPECT_EQ(free_msin("98", Texts{"980", "981", "7"}, 10), "9820000000");
    EXPECT_EQ(free_msin("98", Texts{"9"}, 10), "");
    EXPECT_EQ(free_msin("98", Texts{"98"}, 10), "");
    EXPECT_EQ(free_msin("12", Texts{"123"}, 2), "12"); // no MSIN is as long as what is taken
    EXPECT_EQ(free_msin("123", {}, 2), "");
    EXPECT_EQ(free_msin("", Texts{"0", "1", "2", "3", "4", "5", "6", "7", "8", "9"}, 10), "");
    EXPECT_EQ(free_msin("", Texts{"x"}, 3), "000");
}
