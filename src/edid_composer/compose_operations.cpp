// The operations that compose: three ways to hand over one request.
#include <algorithm>
#include <cstddef>
#include <cstring>

#include "diagnostics.h"
#include "edid_composer/compose.h"
#include "output.h"

namespace edid_composer {
namespace {

REPORTS_AS(compose_edid_request);

/// The size of a record's first version, which callers were compiled with that know none of the members after it.
template <typename record_t>
constexpr u32 first_size = sizeof(record_t);
template <>
constexpr u32 first_size<compose_request_t> = offsetof(compose_request_t, configuration_observer);

/// True when a record is there and has the members of its first version.
template <typename record_t>
bool has_members(const char *name, const record_t *record) {
  if (record == nullptr) {
    LOG_ERROR("\"%s\" parameter is NULL. %s:%s", name, name, address(record).text);
    return false;
  }
  if (record->size >= first_size<record_t>) return true;
  LOG_ERROR("The size of the %s is too small. Expected at least:%u Received:%u", name, first_size<record_t>,
            record->size);
  return false;
}

/// Copies the members that both sides know.
template <typename record_t>
void copy_members(record_t *target, const record_t &source, u32 size) {
  std::memcpy(target, &source, std::min<std::size_t>(size, sizeof source));
}

// A frame of its own for the redirection's line.
[[gnu::noinline]] bool compose_redirected(const compose_request_t &request, compose_result_t *result) {
  const log_redirection_t redirection(request.log, request.log_context);
  return compose(request, hdmi2_access_t::on_demand, result);
}

}  // namespace
}  // namespace edid_composer

using namespace edid_composer;  // NOLINT(google-build-using-namespace): the operations below are the namespace's API

bool compose_edid(const u8 *edid_block, u32 edid_bytes, u8 *new_edid_block, u32 new_edid_bytes,
                  const compose_cfg_t *cfg) {
  return compose_edid_internal(edid_block, edid_bytes, new_edid_block, new_edid_bytes, cfg, nullptr);
}

bool compose_edid_internal(const u8 *edid_block, u32 edid_bytes, u8 *new_edid_block, u32 new_edid_bytes,
                           const compose_cfg_t *cfg, const platform_values_t *platform_values) {
  compose_request_t request{};
  request.size = sizeof request;
  request.sink = edid_block;
  request.sink_bytes = edid_bytes;
  request.new_edid = new_edid_block;
  request.new_edid_bytes = new_edid_bytes;
  request.settings = cfg;
  request.platform_values = platform_values;
  compose_result_t result{};
  return compose(request, hdmi2_access_t::none, &result);
}

bool compose_edid_request(const compose_request_t *request, compose_result_t *result) {
  if (!has_members("request", request) || !has_members("result", result)) return false;
  compose_request_t known{};
  copy_members(&known, *request, request->size);
  compose_result_t filled{};
  filled.size = static_cast<u32>(std::min<std::size_t>(result->size, sizeof filled));
  const bool composed =
      known.log == nullptr ? compose(known, hdmi2_access_t::on_demand, &filled) : compose_redirected(known, &filled);
  if (!composed) filled.bytes_written = filled.physical_address_offset = 0;
  copy_members(result, filled, filled.size);
  return composed;
}
