#include "batch/ordered_workers.h"

#include <algorithm>
#include <condition_variable>
#include <exception>
#include <mutex>
#include <optional>
#include <thread>
#include <vector>

#include "io/bad_input.h"

namespace edid_cli {
namespace {

/// How many results may wait for their turn, for each thread.
constexpr std::size_t lead = 4;

class ordered_workers_t {
 public:
  ordered_workers_t(std::size_t count, std::size_t jobs, const work_t &work)
      : count_(count), work_(work), results_(lead * jobs) {
    threads_.reserve(std::min(count, jobs));
    for (std::size_t started = 0; started < std::min(count, jobs); ++started) {
      try {
        threads_.emplace_back([this] { serve(); });
      } catch (const std::exception &error) {
        // Those that could be started do the work of all.
        if (threads_.empty()) {
          throw bad_input_t(std::string("cannot start a thread: ") + error.what());
        }
        return;
      }
    }
  }

  ~ordered_workers_t() {
    {
      const std::lock_guard lock(mutex_);
      given_ = count_;
    }
    changed_.notify_all();
  }
  ordered_workers_t(const ordered_workers_t &) = delete;
  ordered_workers_t &operator=(const ordered_workers_t &) = delete;

  /// The result of the next number; waits for it.
  batch_result_t take() {
    std::unique_lock lock(mutex_);
    std::optional<batch_result_t> &place = place_of(taken_);
    changed_.wait(lock, [&place] { return place.has_value(); });
    batch_result_t result = std::move(*place);
    place.reset();
    ++taken_;
    lock.unlock();
    changed_.notify_all();
    return result;
  }

 private:
  void serve() {
    std::unique_lock lock(mutex_);
    for (;;) {
      changed_.wait(lock, [this] { return given_ == count_ || given_ < taken_ + results_.size(); });
      if (given_ == count_) {
        return;
      }
      const std::size_t number = given_++;
      lock.unlock();
      batch_result_t result = work_(number);
      lock.lock();
      place_of(number) = std::move(result);
      changed_.notify_all();
    }
  }

  std::optional<batch_result_t> &place_of(std::size_t number) { return results_[number % results_.size()]; }

  const std::size_t count_;
  const work_t &work_;
  std::mutex mutex_;
  std::condition_variable changed_;
  std::size_t given_ = 0;
  std::size_t taken_ = 0;
  std::vector<std::optional<batch_result_t>> results_;  ///< Those that wait for their turn, round and round.
  std::vector<std::jthread> threads_;                   ///< The last member: its end waits for all of them.
};

}  // namespace

void run_in_order(std::size_t count, std::size_t jobs, const work_t &work,
                  const std::function<void(std::size_t number, const batch_result_t &result)> &take) {
  ordered_workers_t workers(count, jobs, work);
  for (std::size_t number = 0; number < count; ++number) {
    take(number, workers.take());
  }
}

}  // namespace edid_cli
