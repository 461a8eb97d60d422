#include "progress.h"

#include "output.h"

#include <unistd.h>

#include <cstdio>
#include <string>

namespace zel_command {
namespace {

std::string indented(std::string_view name, int depth) {
    return std::string(static_cast<std::size_t>(depth) * 2, ' ') + escaped_line(name);
}

std::string time_text(double seconds) {
    char buffer[32];
    std::snprintf(buffer, sizeof buffer, "%8.3f s  ", seconds);
    return buffer;
}

void put(const std::string &text) {
    std::fwrite(text.data(), 1, text.size(), stderr);
    std::fflush(stderr);
}

} // namespace

Progress::Progress(bool verbose)
    : form_{verbose                      ? Form::kPlain
            : is_terminal(STDERR_FILENO) ? Form::kLive
                                         : Form::kSilent} {}

Progress::~Progress() { erase_live_line(); }

void Progress::erase_live_line() {
    if (live_line_shown_) put("\r\033[K");
    live_line_shown_ = false;
}

void Progress::phase_started(std::string_view name, int depth) {
    if (form_ != Form::kLive) return;
    erase_live_line();
    put("       ...  " + indented(name, depth));
    live_line_shown_ = true;
}

void Progress::phase_ended(std::string_view name, int depth, double seconds) {
    if (form_ != Form::kLive) return;
    erase_live_line();
    put(time_text(seconds) + indented(name, depth) + "\n");
}

void Progress::line(std::string_view text, double seconds) {
    if (form_ == Form::kPlain) put(time_text(seconds) + escaped_line(text) + "\n");
}

} // namespace zel_command
