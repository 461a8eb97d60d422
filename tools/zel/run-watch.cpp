#include "run-watch.h"

#include "output.h"

#include <spec/zel-svc-xml.h>

#include <algorithm>

namespace zel_command {
namespace {

constexpr std::string_view kStart = "[Config/Start] ";
constexpr std::string_view kEnded = "[Config/Ended] ";

bool is_error_line(std::string_view line) {
    const std::string_view label = line.substr(0, line.find(']'));
    return line.starts_with('[') && label.find("Error") != std::string_view::npos;
}

// "* Upgrade pre-config for FOTA mode *" and "Install header." are the names of phases.
std::string_view without_ornament(std::string_view text) {
    while (!text.empty() && (text.front() == '*' || text.front() == ' '))
        text.remove_prefix(1);
    while (!text.empty() && (text.back() == '*' || text.back() == ' ' || text.back() == '.'))
        text.remove_suffix(1);
    return text;
}

std::string reason_of(std::int32_t result) {
    if (result == ZEL_SVC_XML_ERR_EOF) return "the file ends in the middle of something";
    return "syntax error";
}

} // namespace

RunWatch::RunWatch(bool verbose) : before_{zel_svc_set_observer(this)}, progress_{verbose}, verbose_{verbose} {}

RunWatch::~RunWatch() { zel_svc_set_observer(before_); }

double RunWatch::seconds() const { return std::chrono::duration<double>(Clock::now() - begin_).count(); }

void RunWatch::refused_text(std::string_view tag, std::string_view text, std::int32_t offset) {
    if (!verbose_) return;
    progress_.line("[refused] <" + std::string{tag} + "> does not take '" + std::string{text} + "' (byte " +
                       std::to_string(offset) + ")",
                   seconds());
}

void RunWatch::remember(std::string_view path, FileProblem problem) {
    const auto [place, is_new] = files_.try_emplace(std::string{path}, problems_.size());
    if (is_new)
        problems_.push_back(std::move(problem));
    else
        problems_[place->second] = std::move(problem);
}

void RunWatch::unread_file(std::string_view path, std::string_view reason) {
    remember(path, {std::string{path}, std::string{reason}, {0, 0, 0}});
}

void RunWatch::parsed_file(std::string_view path, std::int32_t result, ZelSvcTextPosition end) {
    const bool whole = result == ZEL_SVC_XML_OK || result == ZEL_SVC_XML_STOP;
    remember(path, {std::string{path}, whole ? std::string{} : reason_of(result), end});
}

std::vector<FileProblem> RunWatch::file_problems() const {
    std::vector<FileProblem> result;
    std::copy_if(problems_.begin(), problems_.end(), std::back_inserter(result),
                 [](const FileProblem &problem) { return !problem.reason.empty(); });
    return result;
}

void RunWatch::run_log_line(std::string_view line) {
    if (line.ends_with('\n')) line.remove_suffix(1);
    progress_.line(line, seconds());
    if (is_error_line(line)) error_lines_.emplace_back(line);
    if (line.starts_with(kStart)) phase_started(without_ornament(line.substr(kStart.size())));
    if (line.starts_with(kEnded)) phase_ended(without_ornament(line.substr(kEnded.size())));
}

void RunWatch::phase_started(std::string_view name) {
    const int depth = static_cast<int>(running_.size());
    running_.emplace_back(phases_.size(), seconds());
    phases_.push_back({std::string{name}, depth});
    progress_.phase_started(name, depth);
}

// An end whose start never came is no phase; phases that were not ended before it ended with it.
void RunWatch::phase_ended(std::string_view name) {
    const auto is_it = [&](const auto &running) { return phases_[running.first].name == name; };
    if (std::none_of(running_.begin(), running_.end(), is_it)) return;
    for (bool found = false; !found;) {
        const auto [index, start] = running_.back();
        running_.pop_back();
        Phase &phase = phases_[index];
        phase.seconds = seconds() - start;
        phase.ended = true;
        progress_.phase_ended(phase.name, phase.depth, phase.seconds);
        found = phase.name == name;
    }
}

} // namespace zel_command
