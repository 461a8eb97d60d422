#pragma once
// A live line per phase on standard error when that is a terminal; every run-log line with its time, plainly,
// with --verbose; nothing otherwise.

#include <string_view>

namespace zel_command {

class Progress {
  public:
    explicit Progress(bool verbose);
    Progress(const Progress &) = delete;
    Progress &operator=(const Progress &) = delete;
    ~Progress();

    void phase_started(std::string_view name, int depth);
    void phase_ended(std::string_view name, int depth, double seconds);
    void line(std::string_view text, double seconds);

  private:
    enum class Form { kSilent, kLive, kPlain };

    void erase_live_line();

    Form form_;
    bool live_line_shown_ = false;
};

} // namespace zel_command
