#include "batch/batch.h"

#include <fcntl.h>
#include <unistd.h>

#include <cstdio>
#include <filesystem>
#include <thread>

#include "batch/batch_summary.h"
#include "batch/batch_tasks.h"
#include "batch/ordered_workers.h"
#include "batch/progress_bar.h"
#include "composition/composition.h"
#include "composition/library_line.h"
#include "edid_input/edid_file.h"
#include "io/atomic_file.h"
#include "io/bad_input.h"
#include "io/file_descriptor.h"
#include "io/standard_output.h"

namespace edid_cli {
namespace {

/// Keeps what the library writes during one composition.
class kept_lines_t {
 public:
  explicit kept_lines_t(bool keeps_all) : keeps_all_(keeps_all) {}

  void take(const compose_log_line_t &line) {
    if (keeps_all_) {
      text += printed(line);
    }
    if (is_diagnostic(line)) {
      diagnostics.push_back(std::string(kind_of(line)) + ": " + message_of(line));
    }
  }

  std::string text;
  std::vector<std::string> diagnostics;

 private:
  bool keeps_all_;
};

/// Does any of the compositions, on any thread.
class batch_worker_t {
 public:
  batch_worker_t(const compose_options_t &options, const std::vector<task_t> &tasks)
      : options_(options), tasks_(tasks), shared_sink_(read_shared_sink(options, tasks)) {}

  batch_result_t work(std::size_t number) const {
    try {
      return compose_one(tasks_[number]);
    } catch (const not_an_edid_t &problem) {
      return {"", "", {}, problem.what()};
    } catch (const std::exception &problem) {
      return {problem.what(), "", {}};
    }
  }

 private:
  /// The one sink of several ports is read once: it may be standard input.
  static std::vector<u8> read_shared_sink(const compose_options_t &options, const std::vector<task_t> &tasks) {
    return tasks.front().sink_file.empty() ? read_sink(options.composition.sink, options.composition.drm_directory)
                                           : std::vector<u8>{};
  }

  batch_result_t compose_one(const task_t &task) const {
    if (task.output_file.empty()) {
      throw bad_input_t("another EDID has its file name");
    }
    const bool is_traced = options_.composition.debug;
    kept_lines_t lines(is_traced || options_.log);
    const composition_t composition = compose(
        options_.composition, task.port, task.sink_file.empty() ? shared_sink_ : read_edid_file(task.sink_file),
        [&lines](const compose_log_line_t &line) { lines.take(line); }, decisions_of(options_));
    const std::string failure = failure_of(composition, options_);
    if (failure.empty()) {
      write_file_atomically(task.output_file, formatted(composition.new_edid, options_.format), durability_t::later);
    }
    if (options_.log) {
      write_file_atomically(task.log_file, lines.text, durability_t::later);
    }
    batch_result_t result;
    result.failure = failure;
    result.output = is_traced ? std::move(lines.text) : std::string();
    result.diagnostics = std::move(lines.diagnostics);
    return result;
  }

  const compose_options_t &options_;
  const std::vector<task_t> &tasks_;
  std::vector<u8> shared_sink_;
};

/// Once for all files instead of once for each.
void flush_file_system_of(const std::string &file) {
  const std::string folder = std::filesystem::path(file).parent_path().string();
  const file_descriptor_t descriptor(open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_CLOEXEC));
  if (descriptor.is_open()) {
    static_cast<void>(syncfs(descriptor.get()));
  }
}

std::size_t jobs_of(const compose_options_t &options) {
  return options.jobs != 0 ? options.jobs : std::max(std::thread::hardware_concurrency(), 1U);
}

}  // namespace

bool compose_several(const compose_options_t &options) {
  const std::vector<task_t> tasks = plan_tasks(options);
  const batch_worker_t worker(options, tasks);
  batch_summary_t summary;
  {
    progress_bar_t progress(tasks.size());
    const auto take = [&](std::size_t number, const batch_result_t &result) {
      const std::string &label = tasks[number].label;
      summary.add(label, result);
      if (options.composition.debug) {
        progress.clear();
        std::printf("==> %s <==\n%s\n", label.c_str(), result.output.c_str());
      }
      progress.show(number + 1);
    };
    run_in_order(
        tasks.size(), jobs_of(options), [&worker](std::size_t number) { return worker.work(number); }, take);
  }
  flush_file_system_of(tasks.front().output_file);
  if (!summary.has_compositions()) {
    throw bad_input_t(*options.composition.sink + ": holds no sinks");
  }
  std::fputs(summary.text().c_str(), stdout);
  flush_standard_output();
  return !summary.has_failures();
}

}  // namespace edid_cli
