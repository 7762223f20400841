#include "edid_composer/compose.h"

#include "diagnostics.h"
#include "edid_composer/edid_reading.h"
#include "edid_composer/explain/explain.h"
#include "edid_composer/explain/written_offer.h"
#include "edid_composer/hdmi2/explanation.h"
#include "edid_composer/hdmi2/layer.h"
#include "edid_composer/hdmi2/layer_encoder.h"
#include "edid_composer/hdmi2/platform_values.h"
#include "edid_composer/journal.h"
#include "edid_composer/new_edid/population.h"
#include "edid_composer/platform/platform_values_reader.h"
#include "edid_composer/selection/audio_formats.h"
#include "edid_composer/selection/modes_4k_x_2k.h"
#include "edid_composer/selection/video_modes.h"
#include "edid_decode_encode/encoder.h"
#include "edid_decode_encode/layout.h"
#include "utility/vic_timings.h"

namespace edid_composer {
namespace {

REPORTS_AS(compose_edid_internal);

constexpr u32 smallest_size = block_size;
constexpr u32 largest_size = 2 * block_size;

/// The records of one composition. All their list entries lie in the arena.
struct workspace_t {
  entry_arena_t arena;
  platform_values_t platform{};
  edid_t sink{};
  edid_t new_edid{};
};

/// Whether the sink's EDID can be looked at: COMPOSE_SINK_READ, or why not. One that can't is left out, not refused.
compose_sink_status look_at_sink(const compose_request_t &request) {
  compose_sink_status status = COMPOSE_SINK_READ;
  if (request.sink == nullptr) {
    status = COMPOSE_SINK_NONE;
    LOG_TRACE(
        "\"edid_block\" memory block parameter is NULL. Skipping edid reading and proceeding with creation. "
        "edid_block:%s",
        address(request.sink).text);
  }
  if (request.sink_bytes == 0 || request.sink_bytes % block_size != 0) {
    if (status == COMPOSE_SINK_READ) {
      status = request.sink_bytes == 0 ? COMPOSE_SINK_NONE : COMPOSE_SINK_LENGTH_INVALID;
    }
    LOG_TRACE(
        "Edid is not an valid value. edid_bytes=%d Range=(%d-%d) Skipping edid reading and proceeding with creation.",
        request.sink_bytes, smallest_size, largest_size);
  }
  return status;
}

bool is_output_valid(const compose_request_t &request) {
  if (request.new_edid == nullptr) {
    LOG_ERROR("\"new_edid_block\" memory block parameter is NULL. Unable to proceed. new_edid_block:%s",
              address(request.new_edid).text);
    return false;
  }
  if (request.new_edid_bytes < smallest_size || request.new_edid_bytes > largest_size) {
    LOG_ERROR("New EDID size is not an valid value. Unable to proceed. edid_bytes=%d Expected=%d",
              request.new_edid_bytes, largest_size);
    return false;
  }
  if (request.settings == nullptr) {
    LOG_ERROR("cfg is NULL. Unable to proceed. cfg : %s.", address(request.settings).text);
    return false;
  }
  return true;
}

configuration_readings_t readings_of(const compose_request_t &request) {
  return {request.configuration_observer, request.configuration_observer_context};
}

/// The caller's platform values, else those of the configuration; null when that can't be read.
const platform_values_t *platform_of(const compose_request_t &request, workspace_t *work) {
  if (request.platform_values != nullptr) return request.platform_values;
  if (_read_platform_values(&work->platform, &work->arena, readings_of(request))) return &work->platform;
  LOG_ERROR("Failed trying to read the platform config file.");
  return nullptr;
}

/// kept: without a configuration the other records are destroyed although they were never prepared, which is reported.
void destroy_unprepared(workspace_t *work) {
  ll_list_t modes{};
  if (edid_destroy(&work->sink) != 1) LOG_ERROR("Failed cleaning up edid.");
  if (edid_destroy(&work->new_edid) != 1) LOG_ERROR("Failed cleaning up new_edid.");
  if (!ll_delete_list(&modes)) LOG_ERROR("Failed cleaning up video list.");
}

/// The stages, each from its inputs to its outcome or into the new record. False when one can't go on.
bool run_stages(const inputs_t &inputs, edid_t *new_edid, journal_t *journal, outcomes_t *outcomes) {
  outcomes->video = _filter_video_modes(inputs, &new_edid->video_list, journal);
  if (!outcomes->video.complete) {
    LOG_ERROR("Failed filtering the video modes.");
    return false;
  }
  outcomes->modes_4k = _filter_4k_modes(inputs);
  if (!_filter_audio_formats(inputs, &new_edid->audio_list, journal)) {
    LOG_ERROR("Failed filtering the audio formats.");
    return false;
  }
  outcomes->population = _populate_new_edid(inputs, outcomes->modes_4k.selected, new_edid);
  if (!outcomes->population.complete) {
    LOG_ERROR("Failed populating the new edid.");
    return false;
  }
  return true;
}

/// Takes over what became of the encoding, and traces the new EDID.
bool conclude_encoding(const compose_request_t &request, const encoding_t &encoding, compose_result_t *result) {
  const u8 offset = encoding.physical_address_offset;
  if (offset != 0 && request.settings->spa_offset != nullptr) *request.settings->spa_offset = offset;
  if (!encoding.complete) {
    LOG_ERROR("Failed encoding the new edid.");
    return false;
  }
  result->bytes_written = largest_size;
  result->physical_address_offset = offset;
  trace_new_edid(request.new_edid);
  return true;
}

/// Encodes the new record into the caller's buffer.
bool write(const compose_request_t &request, const platform_values_t &platform, edid_t *new_edid, encoding_t *encoding,
           compose_result_t *result) {
  *encoding = encode(request.new_edid, static_cast<i32>(request.new_edid_bytes), new_edid, &platform);
  return conclude_encoding(request, *encoding, result);
}

/// Reads the sink, with HDMI 2 into @p hdmi2 too, which is null without.
void read_sink_into(workspace_t *work, const compose_request_t &request, compose_sink_status status, hdmi2_t *hdmi2,
                    compose_result_t *result) {
  sink_reading_t reading{.status = status};
  if (status != COMPOSE_SINK_READ) {
    LOG_TRACE("Valid edid not available. Continuing composing edid. Passed in edid:%s size:%d bytes",
              address(request.sink).text, request.sink_bytes);
  } else if (hdmi2 != nullptr) {
    reading = read_sink_with_hdmi2(request.sink, request.sink_bytes, &work->sink, hdmi2, &work->arena);
  } else {
    reading = read_sink(request.sink, request.sink_bytes, &work->sink, &work->arena);
  }
  result->sink_status = reading.status;
  result->sink_extension_status = reading.extension_status;
  result->sink_malformed_at = reading.malformed_at;
  result->sink_blocks_unread = reading.blocks_unread;
}

/// Passes the decisions on to the observer, all or none. Without HDMI 2 its parts are null.
void pass_on_decisions(const compose_request_t &request, const inputs_t &inputs, const outcomes_t &outcomes,
                       const journal_t &journal, const edid_t &new_record, const layer_inputs_t *layer_inputs = nullptr,
                       const layer_outcome_t *layer = nullptr) {
  if (request.observer == nullptr || !journal.is_complete()) return;
  decisions_t decisions(inputs.arena);
  const u32 largest_vic = layer != nullptr ? g_vic_dtd_size : UINT32_MAX;
  explain(inputs, outcomes, journal, new_record, request.new_edid, largest_vic, &decisions);
  if (layer != nullptr) explain_hdmi2(*layer_inputs, *layer, new_record, outcomes.encoding, &decisions);
  place_candidates(request.new_edid, &decisions);
  decisions.pass_on(request.observer, request.observer_context);
}

/// What is at hand once the platform's values are.
struct preparation_t {
  const compose_request_t &request;
  const platform_values_t &platform;
  compose_sink_status status;  ///< Of the sink, before it is read.
};

bool compose_plain(const preparation_t &preparation, workspace_t *work, compose_result_t *result) {
  const auto &[request, platform, status] = preparation;
  read_sink_into(work, request, status, nullptr, result);
  const inputs_t inputs{work->sink, platform, *request.settings, &work->arena};
  outcomes_t outcomes;
  journal_t journal(request.observer != nullptr, &work->arena);
  if (!run_stages(inputs, &work->new_edid, &journal, &outcomes) ||
      !write(request, platform, &work->new_edid, &outcomes.encoding, result)) {
    return false;
  }
  pass_on_decisions(request, inputs, outcomes, journal, work->new_edid);
  return true;
}

/// The same road, with HDMI 2 between the stages and the encoder.
// A frame of its own: its records are needed only here.
[[gnu::noinline]] bool compose_with_hdmi2(const preparation_t &preparation, workspace_t *work,
                                          compose_result_t *result) {
  const auto &[request, platform, status] = preparation;
  hdmi2_values_t values;
  if (request.hdmi2 != nullptr) {
    take_hdmi2_values(*request.hdmi2, &values);
  } else {
    read_hdmi2_values(&values, readings_of(request));
  }
  hdmi2_t sink{};
  sink.size = sizeof sink;
  read_sink_into(work, request, status, &sink, result);
  const inputs_t inputs{work->sink, platform, *request.settings, &work->arena};
  outcomes_t outcomes;
  journal_t journal(request.observer != nullptr, &work->arena);
  if (!run_stages(inputs, &work->new_edid, &journal, &outcomes)) return false;

  const layer_inputs_t layer_inputs{inputs, values, sink, status != COMPOSE_SINK_NONE};
  layer_outcome_t layer;
  if (!add_hdmi2(layer_inputs, outcomes.population, &work->new_edid, &layer)) {
    LOG_ERROR("Failed adding HDMI 2 to the new edid.");
    return false;
  }
  outcomes.encoding = encode_with_hdmi2(request.new_edid, static_cast<i32>(request.new_edid_bytes), &work->new_edid,
                                        layer.offer.blocks, platform);
  if (!conclude_encoding(request, outcomes.encoding, result)) return false;
  outcomes.population.deep_color = layer.offer.depths;
  outcomes.population.tmds_clock = layer.offer.tmds_clock;
  pass_on_decisions(request, inputs, outcomes, journal, work->new_edid, &layer_inputs, &layer);
  return true;
}

/// Whether request or configuration ask for HDMI 2. A caller that has platform values has all of them.
bool is_hdmi2_wanted(const compose_request_t &request) {
  if (request.hdmi2 != nullptr) return is_hdmi2_enabled(*request.hdmi2);
  return request.platform_values == nullptr && is_hdmi2_configured(readings_of(request));
}

}  // namespace

bool compose(const compose_request_t &request, hdmi2_access_t access, compose_result_t *result) {
  const compose_sink_status status = look_at_sink(request);
  if (!is_output_valid(request)) return false;
  if (request.platform_values != nullptr && !ll_is_initialized(&request.platform_values->audio_list)) {
    LOG_ERROR("The passed in platform_values has not been initialized.");
    return false;
  }
  if (request.hdmi2 != nullptr && !has_enable(*request.hdmi2)) return false;
  workspace_t work;
  platform_values_init(&work.platform);
  const platform_values_t *const platform = platform_of(request, &work);
  if (platform == nullptr) {
    destroy_unprepared(&work);
    return false;
  }
  const bool with_hdmi2 = access == hdmi2_access_t::on_demand && is_hdmi2_wanted(request);
  edid_prepare(&work.sink);
  edid_prepare(&work.new_edid);
  const preparation_t preparation{request, *platform, status};
  return with_hdmi2 ? compose_with_hdmi2(preparation, &work, result) : compose_plain(preparation, &work, result);
}

}  // namespace edid_composer
