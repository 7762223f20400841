#include "batch.h"

#include <fcntl.h>
#include <unistd.h>

#include <cstdio>
#include <filesystem>
#include <memory>
#include <thread>

#include "atomic_file.h"
#include "bad_input.h"
#include "batch_summary.h"
#include "batch_tasks.h"
#include "diagnostic_lines.h"
#include "edid_file.h"
#include "exit_status.h"
#include "output_capture.h"
#include "progress_bar.h"
#include "standard_output.h"
#include "text_lines.h"
#include "worker_pool.h"

namespace edid_cli {
namespace {

std::span<const u8> bytes_of(const std::string &text) {
  return {reinterpret_cast<const u8 *>(text.data()), text.size()};
}

/// The lines that tell of something wrong.
std::string diagnostics_in(const std::string &output) {
  std::string diagnostics;
  for (const text_line_t &line : lines_of(output)) {
    if (parse_diagnostic(line.text)) {
      diagnostics.append(line.text).append("\n");
    }
  }
  return diagnostics;
}

/// The library's first error, as the end of a sentence.
std::string first_error_in(const std::string &output) {
  for (const text_line_t &line : lines_of(output)) {
    const auto diagnostic = parse_diagnostic(line.text);
    if (diagnostic && diagnostic->kind != "WARNING") {
      return ": " + std::string(trimmed(diagnostic->message));
    }
  }
  return "";
}

/// Does the compositions one at a time, in a worker process.
class batch_worker_t {
 public:
  batch_worker_t(const compose_options_t &options, const std::vector<task_t> &tasks)
      : options_(options), tasks_(tasks), shared_sink_(read_shared_sink(options, tasks)) {}

  std::string work(std::size_t number) {
    if (capture_ == nullptr) {
      capture_ = std::make_unique<output_capture_t>();
    }
    batch_result_t result;
    try {
      result = compose_one(tasks_[number]);
    } catch (const std::exception &problem) {
      result.failure = problem.what();
    }
    return packed(result);
  }

 private:
  /// The one sink of several ports is read once: it may be standard input.
  static std::vector<u8> read_shared_sink(const compose_options_t &options, const std::vector<task_t> &tasks) {
    return tasks.front().sink_file.empty() ? read_sink(options.composition) : std::vector<u8>{};
  }

  batch_result_t compose_one(const task_t &task) {
    if (task.output_file.empty()) {
      throw bad_input_t("another EDID has its file name");
    }
    const std::vector<u8> sink = task.sink_file.empty() ? shared_sink_ : read_edid_file(task.sink_file);
    const auto new_edid = compose(options_.composition, task.port, sink);
    const std::string output = capture_->take();
    batch_result_t result;
    result.output = options_.composition.debug ? output : diagnostics_in(output);
    if (new_edid) {
      write_file_atomically(task.output_file, bytes_of(formatted(*new_edid, options_.format)), durability_t::later);
    } else {
      result.failure = "the library refused to compose an EDID" + first_error_in(output);
    }
    if (options_.log) {
      write_file_atomically(task.log_file, bytes_of(output), durability_t::later);
    }
    return result;
  }

  const compose_options_t &options_;
  const std::vector<task_t> &tasks_;
  std::vector<u8> shared_sink_;
  std::unique_ptr<output_capture_t> capture_;
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

int compose_several(const compose_options_t &options) {
  const std::vector<task_t> tasks = plan_tasks(options);
  batch_worker_t worker(options, tasks);
  batch_summary_t summary;
  {
    progress_bar_t progress(tasks.size());
    const auto take = [&](std::size_t number, const outcome_t &outcome) {
      const batch_result_t result = outcome.is_done ? unpacked(outcome.text) : batch_result_t{outcome.text, ""};
      const std::string &label = tasks[number].label;
      summary.add(label, result);
      if (options.composition.debug) {
        progress.clear();
        std::printf("==> %s <==\n%s\n", label.c_str(), result.output.c_str());
      }
      progress.show(number + 1);
    };
    run_in_workers(
        tasks.size(), jobs_of(options), [&worker](std::size_t number) { return worker.work(number); }, take);
  }
  flush_file_system_of(tasks.front().output_file);
  std::fputs(summary.text().c_str(), stdout);
  flush_standard_output();
  return summary.has_failures() ? refused_status : done_status;
}

}  // namespace edid_cli
