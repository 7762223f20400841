#include "worker_pool.h"

#include <poll.h>

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <map>
#include <memory>
#include <optional>
#include <vector>

#include "bad_input.h"

namespace edid_cli {
namespace {

/// How far a result may be ahead of the one that is due, for each process.
constexpr std::size_t lead = 16;

struct place_t {
  std::unique_ptr<worker_process_t> worker;
  std::optional<std::size_t> number;  ///< What it works on.
};

class worker_pool_t {
 public:
  worker_pool_t(std::size_t count, std::size_t jobs, const work_t &work,
                const std::function<void(std::size_t, const outcome_t &)> &take)
      : count_(count), work_(work), take_(take), places_(std::min(count, jobs)) {}

  void run() {
    while (taken_ < count_) {
      for (place_t &place : places_) {
        if (!place.number && given_ < std::min(count_, taken_ + lead * places_.size())) {
          give(place, given_++);
        }
      }
      wait();
      while (!waiting_.empty() && waiting_.begin()->first == taken_) {
        take_(taken_, waiting_.begin()->second);
        waiting_.erase(waiting_.begin());
        ++taken_;
      }
    }
  }

 private:
  void give(place_t &place, std::size_t number) {
    place.number = number;
    if (place.worker == nullptr || !place.worker->give(number)) {
      // One that ended while it had nothing to do is no fault of the work.
      place.worker.reset();
      place.worker = std::make_unique<worker_process_t>(work_, [this] { abandon_all(); });
      place.worker->give(number);
    }
  }

  /// A worker that held the others' channels open would keep them from noticing that this process is gone.
  void abandon_all() {
    for (place_t &place : places_) {
      if (place.worker != nullptr) {
        place.worker->abandon();
      }
    }
  }

  void wait() {
    std::vector<pollfd> polled;
    std::vector<place_t *> busy;
    for (place_t &place : places_) {
      if (place.number) {
        polled.push_back({place.worker->descriptor(), POLLIN, 0});
        busy.push_back(&place);
      }
    }
    while (poll(polled.data(), polled.size(), -1) < 0) {
      if (errno != EINTR) {
        throw bad_input_t(std::string("cannot wait for a worker process: ") + std::strerror(errno));
      }
    }
    for (std::size_t i = 0; i < polled.size(); ++i) {
      if (polled[i].revents != 0) {
        collect(*busy[i]);
      }
    }
  }

  void collect(place_t &place) {
    const std::size_t number = *place.number;
    place.number.reset();
    if (auto result = place.worker->take_result()) {
      waiting_[number] = {true, *std::move(result)};
      return;
    }
    waiting_[number] = {false, place.worker->explain_end()};
    place.worker.reset();
  }

  std::size_t count_;
  const work_t &work_;
  const std::function<void(std::size_t, const outcome_t &)> &take_;
  std::vector<place_t> places_;
  std::map<std::size_t, outcome_t> waiting_;
  std::size_t given_ = 0;
  std::size_t taken_ = 0;
};

}  // namespace

void run_in_workers(std::size_t count, std::size_t jobs, const work_t &work,
                    const std::function<void(std::size_t, const outcome_t &)> &take) {
  worker_pool_t(count, jobs, work, take).run();
}

}  // namespace edid_cli
