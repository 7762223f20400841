// One process that does numbered pieces of work, forked from this one.
#pragma once

#include <sys/types.h>

#include <functional>
#include <optional>
#include <string>

#include "file_descriptor.h"

namespace edid_cli {

/// Does the piece of work of a number, in a worker process; the result is any bytes.
using work_t = std::function<std::string(std::size_t)>;

class worker_process_t {
 public:
  /// @p in_child is called first in the new process, before any work. Throws bad_input_t.
  worker_process_t(const work_t &work, const std::function<void()> &in_child);
  /// Ends it and waits for its end.
  ~worker_process_t();
  worker_process_t(worker_process_t &&) = delete;
  worker_process_t &operator=(worker_process_t &&) = delete;

  /// False when the process has ended.
  bool give(std::size_t number);
  /// The result of the work given last. None when the process has ended before it was whole.
  std::optional<std::string> take_result();
  /// Becomes readable when there is a result, or the end.
  int descriptor() const { return channel_.get(); }
  /// Waits for the end of a process that gave no result, and tells how it came.
  std::string explain_end();
  /// In another worker: what belongs to this one is left alone.
  void abandon();

 private:
  file_descriptor_t channel_;
  pid_t process_ = -1;
};

}  // namespace edid_cli
