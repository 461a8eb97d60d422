#pragma once
// What the library passes over in silence during a run: phases with their times, error lines, spec files
// that could not be read to the end, and spec texts that were refused.
//
//     RunWatch watch{verbose};
//     zel_svc_config_set_pre_config_for_config_mode("XFV");
//     for (const FileProblem &problem : watch.file_problems()) ...

#include "progress.h"

#include <base/zel-svc-observer.h>

#include <chrono>
#include <map>
#include <string>
#include <vector>

namespace zel_command {

struct Phase {
    std::string name;
    int depth;
    bool ended = false;
    double seconds = 0;
};

struct FileProblem {
    std::string path; // the phone's
    std::string reason;
    ZelSvcTextPosition end; // line 0 when reading did not begin
};

class RunWatch final : public ZelSvcObserver {
  public:
    explicit RunWatch(bool verbose);
    ~RunWatch() override;

    void refused_text(std::string_view tag, std::string_view text, std::int32_t offset) override;
    void unread_file(std::string_view path, std::string_view reason) override;
    void parsed_file(std::string_view path, std::int32_t result, ZelSvcTextPosition end) override;
    void run_log_line(std::string_view line) override;

    // Each file once, in the order of their first reading.
    [[nodiscard]] std::vector<FileProblem> file_problems() const;
    [[nodiscard]] bool has_read(const std::string &path) const { return files_.count(path) != 0; }
    [[nodiscard]] const std::vector<Phase> &phases() const { return phases_; }
    [[nodiscard]] const std::vector<std::string> &error_lines() const { return error_lines_; }
    [[nodiscard]] double seconds() const;

  private:
    using Clock = std::chrono::steady_clock;

    void phase_started(std::string_view name);
    void phase_ended(std::string_view name);
    void remember(std::string_view path, FileProblem problem);

    ZelSvcObserver *before_;
    Clock::time_point begin_ = Clock::now();
    Progress progress_;
    bool verbose_;
    std::vector<Phase> phases_;
    std::vector<std::pair<std::size_t, double>> running_; // index of the phase and its start
    std::vector<std::string> error_lines_;
    std::map<std::string, std::size_t, std::less<>> files_; // path to index in problems_
    std::vector<FileProblem> problems_;                     // an empty reason: the file was read to its end
};

} // namespace zel_command
