// The road of one composition, from the caller's arguments to the bytes of the new EDID.
#include <algorithm>
#include <optional>

#include "diagnostics.h"
#include "edid_composer/audio_formats.h"
#include "edid_composer/decisions.h"
#include "edid_composer/modes_4k_x_2k.h"
#include "edid_composer/platform_values_reader.h"
#include "edid_composer/population.h"
#include "edid_composer/raw_dump.h"
#include "edid_composer/video_modes.h"
#include "edid_composer/written_offer.h"
#include "edid_decode_encode/base_block_layout.h"
#include "edid_decode_encode/cea_extension_layout.h"
#include "edid_decode_encode/checksum.h"
#include "edid_decode_encode/decoder.h"
#include "edid_decode_encode/encoder.h"
#include "linked_list/element_types.h"
#include "output.h"

namespace edid_composer {
namespace {

constexpr u32 smallest_size = block_size;
constexpr u32 largest_size = 2 * block_size;

/// The records of one composition. They start zero-filled, so that one that was never prepared is destroyed cleanly.
struct workspace_t {
  platform_values_t platform_values{};
  edid_t edid{};
  edid_t new_edid{};
  ll_list_t modes{};
};

/// A sink's EDID that can't be read is left out, not refused.
bool is_sink_usable(const site_t &site, const compose_request_t &request) {
  bool usable = true;
  if (request.sink == nullptr) {
    usable = false;
    LOG_TRACE_AS(site,
                 "\"edid_block\" memory block parameter is NULL. Skipping edid reading and proceeding with creation. "
                 "edid_block:%p",
                 address(request.sink));
  }
  if (request.sink_bytes == 0 || request.sink_bytes % block_size != 0) {
    usable = false;
    LOG_TRACE_AS(site,
                 "Edid is not an valid value. edid_bytes=%d Range=(%d-%d) Skipping edid reading and proceeding with "
                 "creation.",
                 request.sink_bytes, smallest_size, largest_size);
  }
  return usable;
}

bool is_output_valid(const site_t &site, const compose_request_t &request) {
  if (request.new_edid == nullptr) {
    LOG_ERROR_AS(site, "\"new_edid_block\" memory block parameter is NULL. Unable to proceed. new_edid_block:%p",
                 address(request.new_edid));
    return false;
  }
  if (request.new_edid_bytes < smallest_size || request.new_edid_bytes > largest_size) {
    LOG_ERROR_AS(site, "New EDID size is not an valid value. Unable to proceed. edid_bytes=%d Expected=%d",
                 request.new_edid_bytes, largest_size);
    return false;
  }
  if (request.settings == nullptr) {
    LOG_ERROR_AS(site, "cfg is NULL. Unable to proceed. cfg : %p.", address(request.settings));
    return false;
  }
  return true;
}

bool prepare(const site_t &site, workspace_t *work) {
  if (edid_prepare(&work->edid) != 1) {
    LOG_ERROR_AS(site, "Failed preparing edid.");
    return false;
  }
  if (!init_list<short_video_desc_t>(&work->modes)) {
    LOG_ERROR_AS(site, "Failed initializing modes.");
    return false;
  }
  if (edid_prepare(&work->new_edid) != 1) {
    LOG_ERROR_AS(site, "Failed preparing new edid.");
    return false;
  }
  return true;
}

void decode_sink(const site_t &site, const compose_request_t &request, edid_t *edid, compose_result_t *result) {
  result->sink_extension_status = COMPOSE_EXTENSION_NOT_LOOKED_AT;
  LOG_TRACE_AS(site, "Decode EDID Block %d", 0);
  _dump_raw_edid_block(request.sink, 1);
  result->sink_status = decode_base_block(request.sink, edid);
  if (result->sink_status != COMPOSE_SINK_READ) {
    LOG_ERROR_AS(site, "Failed decoding the edid block 0. Continuing.");
    return;
  }
  result->sink_extension_status = COMPOSE_EXTENSION_NOT_ANNOUNCED;
  if (edid->extension_count == 0) return;
  // A sink may announce an extension that it doesn't have.
  const u32 length = request.sink_bytes - block_size;
  const u8 *const extension = request.sink + block_size;
  LOG_TRACE_AS(site, "Decode EDID Block 1");
  _dump_raw_edid_block(extension, length >= block_size ? 1 : 0);
  const extension_outcome_t outcome = decode_cea_extension(extension, length, edid);
  if (outcome.status != COMPOSE_EXTENSION_READ) LOG_ERROR_AS(site, "Failed decoding the extension. Continuing.");
  result->sink_extension_status = length == 0 ? COMPOSE_EXTENSION_MISSING : outcome.status;
  result->sink_malformed_at = outcome.malformed_at;
  const u32 blocks = std::min<u32>(edid->extension_count, length / block_size);
  result->sink_blocks_unread = blocks > 1 ? blocks - 1 : 0;
}

void note_room(decisions_t *decisions, const extension_size_t &size, const u8 *new_edid) {
  constexpr u32 there = checksum_offset;
  constexpr u32 longest = data_block::length_mask;
  compose_verdict verdict = COMPOSE_VERDICT_CHANGED;
  compose_reason reason = COMPOSE_REASON_ROOM_ENOUGH;
  if (new_edid[base_block::extension_count] == 0) {
    reason = COMPOSE_REASON_NOT_ANNOUNCED;
  } else if (size.longest_block > longest) {
    reason = COMPOSE_REASON_BLOCK_TOO_LONG;
  } else if (size.bytes > there) {
    reason = COMPOSE_REASON_ROOM_EXCEEDED;
  } else {
    verdict = COMPOSE_VERDICT_OFFERED;
  }
  decisions->note(COMPOSE_SUBJECT_EXTENSION_ROOM, size.bytes, verdict, reason,
                  reason_values(size.bytes, there, size.longest_block, longest));
}

/// The stages, each from its inputs into the new record or the list of modes.
bool run_stages(const site_t &site, const compose_request_t &request, const platform_values_t *values, u8 port,
                decisions_t *decisions, workspace_t *work, compose_result_t *result) {
  const compose_cfg_t *const cfg = request.settings;
  if (_filter_video_modes(&work->edid, cfg, &work->modes, values, decisions) != 1) {
    LOG_ERROR_AS(site, "Failed filtering the video modes.");
    return false;
  }
  if (_filter_4k_modes(&work->edid, &work->new_edid, values, decisions) != 1) {
    LOG_ERROR_AS(site, "Failed filtering the 4k x 2k video modes.");
    return false;
  }
  const u8 sink_filter = cfg->audio_sink_filter == 1 ? 1 : 0;
  if (_filter_audio_formats(&work->edid, cfg->audio_mask, sink_filter, &work->new_edid.audio_list, values, decisions) !=
      1) {
    LOG_ERROR_AS(site, "Failed filtering the audio formats.");
    return false;
  }
  if (_populate_new_edid(&work->new_edid, &work->modes, &work->edid, port, cfg->hdmi_3d_mode, cfg->edid_latency, values,
                         decisions) != 1) {
    LOG_ERROR_AS(site, "Failed populating the new edid.");
    return false;
  }
  extension_size_t size{};
  u8 spa_offset = 0;
  const bool encoded = encode_and_measure_edid(request.new_edid, static_cast<i32>(request.new_edid_bytes),
                                               &work->new_edid, &spa_offset, values, &size) == 1;
  if (spa_offset != 0 && cfg->spa_offset != nullptr) *cfg->spa_offset = spa_offset;
  if (!encoded) {
    LOG_ERROR_AS(site, "Failed encoding the new edid.");
    return false;
  }
  result->bytes_written = largest_size;
  result->physical_address_offset = spa_offset;
  if (decisions != nullptr) {
    note_room(decisions, size, request.new_edid);
    settle_decisions(decisions, request.new_edid);
  }
  return true;
}

/// Decodes the result again: what the decoders trace of it is the point.
void trace_result(const site_t &site, const u8 *new_edid_block) {
  if (!debug_enabled()) return;
  log_trace(HERE_AS(site), "New EDID...");
  _dump_raw_edid_block(new_edid_block, 2);
  edid_t edid{};
  if (edid_prepare(&edid) != 1) {
    LOG_WARNING_AS(site, "edid_prepare failed.");
    return;
  }
  if (decode_edid_block_0(new_edid_block, &edid) != 1) {
    LOG_WARNING_AS(site, "Failed decoding the new edid block 0.");
  } else if (decode_edid_extensions(new_edid_block + block_size, block_size, &edid) != 1) {
    LOG_WARNING_AS(site, "Failed decoding the new edid extension.");
  }
  if (edid_destroy(&edid) != 1) LOG_WARNING_AS(site, "Failed to destroy the debug edid.");
}

bool compose(const site_t &site, const compose_request_t &request, bool sink_usable, decisions_t *decisions,
             workspace_t *work, compose_result_t *result) {
  const platform_values_t *values = request.platform_values;
  if (values == nullptr) {
    values = &work->platform_values;
    if (!_read_platform_values(&work->platform_values)) {
      LOG_ERROR_AS(site, "Failed trying to read the platform config file.");
      return false;
    }
  }
  const auto port = static_cast<u8>((request.settings->port + 1) & 0xFF);
  if (!prepare(site, work)) return false;
  if (sink_usable) {
    decode_sink(site, request, &work->edid, result);
  } else {
    LOG_TRACE_AS(site, "Valid edid not available. Continuing composing edid. Passed in edid:%p size:%d bytes",
                 address(request.sink), request.sink_bytes);
  }
  if (!run_stages(site, request, values, port, decisions, work, result)) return false;
  trace_result(site, request.new_edid);
  return true;
}

/// All of it, always, in this order; what fails here doesn't change the result.
void clean_up(const site_t &site, workspace_t *work) {
  if (edid_destroy(&work->edid) != 1) LOG_ERROR_AS(site, "Failed cleaning up edid.");
  if (edid_destroy(&work->new_edid) != 1) LOG_ERROR_AS(site, "Failed cleaning up new_edid.");
  if (!ll_delete_list(&work->modes)) LOG_ERROR_AS(site, "Failed cleaning up video list.");
  platform_values_destroy(&work->platform_values);
}

/// The status of a sink that is not decoded.
compose_sink_status unread_status(const compose_request_t &request) {
  return request.sink == nullptr || request.sink_bytes == 0 ? COMPOSE_SINK_NONE : COMPOSE_SINK_LENGTH_INVALID;
}

/// A composition, in the name of compose_edid_internal().
bool compose_request(const compose_request_t &request, compose_result_t *result) {
  const site_t site{EDID_COMPOSER_MODULE, "compose_edid_internal", __LINE__};
  const bool sink_usable = is_sink_usable(site, request);
  if (!is_output_valid(site, request)) return false;

  result->sink_status = unread_status(request);
  result->sink_extension_status = COMPOSE_EXTENSION_NOT_LOOKED_AT;
  workspace_t work;
  if (!platform_values_init(&work.platform_values)) {
    LOG_ERROR_AS(site, "Failed initializing platfrom values.");
    return false;
  }
  if (request.platform_values != nullptr && !ll_is_initialized(&request.platform_values->audio_list)) {
    LOG_ERROR_AS(site, "The passed in platform_values has not been initialized.");
    return false;
  }
  std::optional<decisions_t> decisions;
  if (request.observer != nullptr) decisions.emplace(site);
  const bool composed = compose(site, request, sink_usable, decisions ? &*decisions : nullptr, &work, result);
  clean_up(site, &work);
  if (composed && decisions) decisions->tell(request.observer, request.observer_context);
  return composed;
}

[[gnu::noinline]] bool compose_logged(const compose_request_t &request, compose_result_t *result) {
  const log_redirection_t redirection(request.log, request.log_context);
  return compose_request(request, result);
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
  const compose_request_t request{.size = sizeof(compose_request_t),
                                  .sink_bytes = edid_bytes,
                                  .sink = edid_block,
                                  .new_edid = new_edid_block,
                                  .new_edid_bytes = new_edid_bytes,
                                  .settings = cfg,
                                  .platform_values = platform_values,
                                  .observer = nullptr,
                                  .observer_context = nullptr,
                                  .log = nullptr,
                                  .log_context = nullptr};
  compose_result_t unasked{};
  return compose_request(request, &unasked);
}

bool compose_edid_request(const compose_request_t *request, compose_result_t *result) {
  if (request == nullptr) {
    LOG_ERROR("\"request\" parameter is NULL. request:%p", address(request));
    return false;
  }
  if (request->size < sizeof *request) {
    LOG_ERROR("The request's size is too small. Expected at least:%u Received:%u", static_cast<u32>(sizeof *request),
              request->size);
    return false;
  }
  if (result == nullptr) {
    LOG_ERROR("\"result\" parameter is NULL. result:%p", address(result));
    return false;
  }
  if (result->size < sizeof *result) {
    LOG_ERROR("The result's size is too small. Expected at least:%u Received:%u", static_cast<u32>(sizeof *result),
              result->size);
    return false;
  }
  *result = {.size = sizeof *result,
             .bytes_written = 0,
             .physical_address_offset = 0,
             .sink_status = 0,
             .sink_extension_status = 0,
             .sink_malformed_at = 0,
             .sink_blocks_unread = 0};
  const bool composed = request->log == nullptr ? compose_request(*request, result) : compose_logged(*request, result);
  if (!composed) {
    result->bytes_written = 0;
    result->physical_address_offset = 0;
  }
  return composed;
}
