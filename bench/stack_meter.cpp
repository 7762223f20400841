#include "stack_meter.h"

#include <pthread.h>

#include <algorithm>
#include <cstdint>
#include <stdexcept>
#include <vector>

namespace bench {
namespace {

constexpr std::size_t stack_size = std::size_t{256} * 1024;
constexpr std::size_t page_size = 4096;
constexpr unsigned char paint = 0xA5;

void *run(void *operation) {
  (*static_cast<const std::function<void()> *>(operation))();
  return nullptr;
}

/// The depth of the deepest byte that lost its paint; the stack grows downwards.
std::size_t touched(const std::function<void()> &operation) {
  std::vector<unsigned char> memory(stack_size + page_size, paint);
  const auto misalignment = reinterpret_cast<std::uintptr_t>(memory.data()) % page_size;
  unsigned char *const stack = memory.data() + (page_size - misalignment);

  pthread_attr_t attributes;
  pthread_t thread{};
  if (pthread_attr_init(&attributes) != 0 || pthread_attr_setstack(&attributes, stack, stack_size) != 0 ||
      pthread_create(&thread, &attributes, run, const_cast<std::function<void()> *>(&operation)) != 0 ||
      pthread_join(thread, nullptr) != 0) {
    throw std::runtime_error("cannot run a thread with a stack of its own");
  }
  pthread_attr_destroy(&attributes);
  const unsigned char *const end = stack + stack_size;
  return static_cast<std::size_t>(
      end - std::find_if(stack, stack + stack_size, [](unsigned char byte) { return byte != paint; }));
}

}  // namespace

std::size_t stack_use_of(const std::function<void()> &operation) {
  return touched(operation) - touched([] {});
}

}  // namespace bench
