// The page that says, for each network of a package, which SIMs reach it.

#include "commands.h"
#include "sim-cards.h"
#include "sim-matrix.h"
#include "sim-operators.h"

#include <algorithm>

namespace zel_command {
namespace {

using Numbers = std::vector<std::size_t>;
using Rows = std::vector<std::vector<std::string>>;

struct Page {
    CustomerOperators operators;
    std::vector<Reached> reached;

    [[nodiscard]] std::string name(std::size_t number) const {
        return field_text(operators.entries[number].network_name) + " (" + std::to_string(number + 1) + ")";
    }
    [[nodiscard]] std::string names(const Numbers &numbers) const {
        std::string text;
        for (const std::size_t number : numbers)
            text += (text.empty() ? "" : ", ") + name(number);
        return text;
    }
};

std::string without_repeats(const Page &page, const Numbers &numbers) {
    std::vector<std::string> asked;
    for (const std::size_t number : numbers)
        if (std::string text = asked_text(page.operators.entries[number]);
            std::find(asked.begin(), asked.end(), text) == asked.end())
            asked.push_back(std::move(text));
    std::string text;
    for (const std::string &one : asked)
        text += (text.empty() ? "" : ", ") + one;
    return text;
}

// "every SIM", "MSIN 98...", with what others take.
std::string sims_text(const Page &page, std::size_t number) {
    const std::string asked = asked_text(page.operators.entries[number]);
    const std::string others = without_repeats(page, page.reached[number].but_for);
    return (asked.empty() ? "every SIM" : asked) + (others.empty() ? "" : " but " + others);
}

std::string reach_text(const Page &page, std::size_t number) {
    switch (page.reached[number].reach) {
    case Reach::Alone:
        return sims_text(page, number);
    case Reach::Asked:
        return sims_text(page, number) + "; the user is asked";
    case Reach::Caller:
        return sims_text(page, number) + "; only when a caller states it";
    case Reach::Nothing:
        return "NOTHING";
    }
    return {};
}

const char *word_for(Reach reach) {
    switch (reach) {
    case Reach::Alone:
        return "alone";
    case Reach::Asked:
        return "user_chooses";
    case Reach::Caller:
        return "caller_only";
    case Reach::Nothing:
        return "nothing";
    }
    return "";
}

// The groups of entries that a user is asked about, each once.
std::vector<Numbers> questions(const Page &page) {
    std::vector<Numbers> result;
    for (const Reached &reached : page.reached)
        if (!reached.asked.empty() && std::find(result.begin(), result.end(), reached.asked) == result.end())
            result.push_back(reached.asked);
    return result;
}

Json numbers_json(const Numbers &numbers) {
    Json result = Json::array();
    for (const std::size_t number : numbers)
        result.push_back(number + 1);
    return result;
}

Json json_of(const Page &page) {
    Json answer = Json::object();
    put_text(answer, "customer", page.operators.customer);
    answer["entries"] = Json::array();
    for (std::size_t number = 0; number < page.reached.size(); ++number) {
        const Reached &reached = page.reached[number];
        Json entry = operator_json(page.operators.entries[number], number);
        entry["reached_by"] = word_for(reached.reach);
        put_text(entry, "sims", reached.reach == Reach::Nothing ? "" : sims_text(page, number));
        entry["but_for"] = numbers_json(reached.but_for);
        entry["instead"] = numbers_json(reached.instead);
        put_text(entry, "why", reached.why);
        answer["entries"].push_back(std::move(entry));
    }
    answer["user_is_asked"] = Json::array();
    for (const Numbers &question : questions(page)) {
        Json entry = Json::object();
        put_text(entry, "mccmnc", field_text(page.operators.entries[question.front()].mccmnc));
        put_text(entry, "sims", sims_text(page, question.front()));
        entry["entries"] = numbers_json(question);
        answer["user_is_asked"].push_back(std::move(entry));
    }
    return answer;
}

void print_section(const std::string &title, const std::vector<std::string> &headings, const Rows &rows) {
    if (rows.empty()) return;
    print_line("\n" + title);
    print_table(headings, rows);
}

void print_entries(const Page &page) {
    Rows rows;
    for (std::size_t number = 0; number < page.reached.size(); ++number)
        rows.push_back({std::to_string(number + 1), field_text(page.operators.entries[number].mccmnc),
                        field_text(page.operators.entries[number].network_name), reach_text(page, number)});
    print_table({"#", "MCC+MNC", "NETWORK", "REACHED BY"}, rows);
}

void print_questions(const Page &page) {
    Rows rows;
    for (const Numbers &question : questions(page))
        rows.push_back({field_text(page.operators.entries[question.front()].mccmnc), sims_text(page, question.front()),
                        page.names(question)});
    print_section("The user is asked:", {"MCC+MNC", "SIMS", "TO CHOOSE FROM"}, rows);
}

void print_unreached(const Page &page) {
    Rows rows;
    for (std::size_t number = 0; number < page.reached.size(); ++number) {
        const Reached &reached = page.reached[number];
        const std::string winners = reached.instead.empty() ? "" : ", such as " + page.names(reached.instead);
        if (reached.reach == Reach::Nothing) rows.push_back({page.name(number), reached.why + winners});
    }
    print_section("Reached by nothing:", {"NETWORK", "WHY"}, rows);
}

void print_page(const Page &page) {
    print_line(page.operators.customer + ", " + std::to_string(page.reached.size()) +
               (page.reached.size() == 1 ? " entry" : " entries"));
    print_entries(page);
    print_questions(page);
    print_unreached(page);
    const bool callers = std::any_of(page.reached.begin(), page.reached.end(),
                                     [](const Reached &reached) { return reached.reach == Reach::Caller; });
    if (callers)
        print_line("\nThe phone reads neither GID nor SPN from its SIMs: to it every SIM is one without them.");
}

std::vector<Page> pages_of(const Invocation &invocation) {
    std::vector<CustomerOperators> customers;
    if (invocation.has("CUSTOMER"))
        customers.push_back(operators_of(invocation, invocation.value("CUSTOMER")));
    else
        customers = operators_of_package(invocation);
    std::vector<Page> pages;
    for (CustomerOperators &customer : customers) {
        std::vector<Reached> result = reached(customer.entries);
        pages.push_back({std::move(customer), std::move(result)});
    }
    return pages;
}

} // namespace

int sim_matrix(Invocation &invocation) {
    const std::vector<Page> pages = pages_of(invocation);
    Json answer = Json::array();
    for (const Page &page : pages) {
        if (!invocation.json && &page != &pages.front()) print_line("");
        if (!invocation.json) print_page(page);
        if (invocation.json) answer.push_back(json_of(page));
    }
    if (invocation.json) print_json(answer);
    return kDone;
}

} // namespace zel_command
