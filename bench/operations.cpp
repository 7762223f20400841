#include "operations.h"

#include <algorithm>
#include <array>
#include <stdexcept>
#include <string>

#include "config_store.h"
#include "edid_composer/platform/platform_values_reader.h"

namespace bench {
namespace {

constexpr u32 block_size = 128;
using output_t = std::array<u8, 2 * block_size>;

u32 size_of(sink_bytes_t sink) {
  return static_cast<u32>(sink.size());
}

void compose_with_store(sink_bytes_t sink, const platform_t &platform) {
  output_t output;
  compose_edid(sink.data(), size_of(sink), output.data(), size_of(output), &platform.settings);
}

void compose(sink_bytes_t sink, const platform_t &platform, compose_observer_t observer) {
  output_t output;
  compose_request_t request{};
  request.size = sizeof request;
  request.sink = sink.data();
  request.sink_bytes = size_of(sink);
  request.new_edid = output.data();
  request.new_edid_bytes = size_of(output);
  request.settings = &platform.settings;
  request.platform_values = &platform.values;
  request.observer = observer;
  compose_result_t result{};
  result.size = sizeof result;
  compose_edid_request(&request, &result);
}

void ignore_decision(const compose_decision_t *, void *) {}

constexpr operation_t all_operations[] = {
    {"decode", [](sink_bytes_t sink, const platform_t &) { decode(sink); }},
    {"compose", [](sink_bytes_t sink, const platform_t &platform) { compose(sink, platform, nullptr); }},
    {"compose_with_store", compose_with_store},
    {"compose_observed",
     [](sink_bytes_t sink, const platform_t &platform) { compose(sink, platform, ignore_decision); }},
    {"print", [](sink_bytes_t sink, const platform_t &) { print_edid(sink.data(), size_of(sink), 0, "Sink"); }},
};

}  // namespace

platform_t::platform_t() {
  const std::string_view document = config_store_default_text();
  if (!config_store_load_text(document.data(), document.size(), "default platform")) {
    throw std::runtime_error(config_store_error());
  }
  if (!platform_values_init(&values) || !edid_composer::_read_platform_values(&values, nullptr)) {
    throw std::runtime_error("cannot read the platform's values");
  }
  settings.audio_mask = 0xFFFFFFFF;
  settings.hdmi_3d_mode = 1;
}

platform_t::~platform_t() {
  platform_values_destroy(&values);
}

void make_heaviest(platform_t *platform) {
  platform->values.geometry_limit = 1;
  platform->values.audio_pass_through = 2;
}

bool decode(sink_bytes_t sink) {
  edid_t edid;
  edid_prepare(&edid);
  const bool decoded = decode_edid_block_0(sink.data(), &edid) == 1 &&
                       decode_edid_extensions(sink.data() + block_size, size_of(sink) - block_size, &edid) == 1;
  edid_destroy(&edid);
  return decoded;
}

const std::span<const operation_t> operations = all_operations;

const operation_t &operation_named(std::string_view name) {
  const auto found = std::find_if(operations.begin(), operations.end(),
                                  [&](const operation_t &operation) { return name == operation.name; });
  if (found == operations.end()) throw std::out_of_range("no such operation: " + std::string(name));
  return *found;
}

}  // namespace bench
