#include "composition.h"

#include <algorithm>
#include <fstream>
#include <sstream>
#include <stdexcept>

#include "config_store.h"
#include "explain/byte_names.h"
#include "explain/explanation_text.h"
#include "support/hex_text.h"
#include "support/observation.h"
#include "support/output_capture.h"
#include "text_format.h"

namespace golden {
namespace {

void load_platform(const std::string &name) {
  const std::string_view hdmi2 = config_store_hdmi2_text();
  const bool loaded = name == "default" ? config_store_load_default()
                      : name == "hdmi2" ? config_store_load_text(hdmi2.data(), hdmi2.size(), "hdmi2 platform")
                                        : config_store_load_file((platforms_directory() / (name + ".toml")).c_str());
  if (!loaded) throw std::runtime_error(config_store_error());
}

/// Whether the platform that is loaded composes with HDMI 2.
bool has_hdmi2_table() {
  u32 node = 0;
  return config_node_find(0, "platform.software.drivers.vorex.edid.hdmi2", &node) == 0;
}

compose_cfg_t settings_of(const golden_case_t &golden_case, u8 *address_offset) {
  compose_cfg_t settings{};
  settings.hdmi_current_mode = golden_case.current_mode;
  settings.audio_mask = golden_case.audio_mask;
  settings.audio_sink_filter = golden_case.audio_sink_filter ? 1 : 0;
  settings.hdmi_3d_mode = golden_case.hdmi_3d_mode;
  std::copy(golden_case.latency_ms.begin(), golden_case.latency_ms.end(), settings.edid_latency);
  settings.spa_offset = address_offset;
  settings.port = golden_case.port;
  return settings;
}

std::vector<u8> sink_of(const golden_case_t &golden_case) {
  return test_support::bytes_of_hex_file((sinks_directory() / (golden_case.sink + ".txt")).string());
}

std::string report_of(const golden_case_t &golden_case, const std::vector<u8> &edid, bool brief) {
  return test_support::output_of(
      [&] { print_edid(edid.data(), static_cast<u32>(edid.size()), brief ? 1 : 0, golden_case.name().c_str()); });
}

/// The second report, of what HDMI 2 added; of a platform without it there is none.
std::string hdmi2_report_of(const golden_case_t &golden_case, const std::vector<u8> &edid) {
  if (!has_hdmi2_table()) return "";
  return "\n" + test_support::output_of([&] {
           const hdmi2_t hdmi2 = edid_cli::decoded_hdmi2(edid);
           print_hdmi2(&hdmi2, (golden_case.name() + ": HDMI 2").c_str());
         });
}

/// The bytes as the program names them, each field on a line of its own, or on several; the name stands on the first.
std::string named_bytes(const std::vector<u8> &edid) {
  constexpr std::size_t bytes_in_a_line = 18;  // As many as a descriptor has.
  std::string text;
  for (const edid_cli::byte_field_t &field : edid_cli::name_bytes(edid)) {
    std::string line;
    for (std::size_t i = 0; i < field.size; ++i) {
      line += format("%02X ", edid[field.offset + i]);
      if (i == std::min(field.size, bytes_in_a_line) - 1) {
        line.resize(3 * bytes_in_a_line, ' ');
        line += "# " + field.name + ": " + field.meaning + "\n";
      } else if (i % bytes_in_a_line == bytes_in_a_line - 1 || i == field.size - 1) {
        line += "\n";
      }
    }
    text += line;
  }
  return text;
}

/// What the program says of the decisions.
std::string explanation_of(const golden_case_t &golden_case) {
  edid_cli::composition_options_t options;
  u8 address_offset = 0;
  options.settings = settings_of(golden_case, &address_offset);
  const std::vector<u8> sink = sink_of(golden_case);
  const edid_cli::composition_t composition = edid_cli::compose(
      options, golden_case.port, sink, [](const compose_log_line_t &) {}, edid_cli::decisions_t::kept);
  std::string text;
  test_support::output_of([&] {
    const edid_cli::decoded_edid_t decoded(edid_cli::sink_of_stages(sink, composition));
    const edid_cli::platform_places_t places(golden_case.platform);
    const edid_cli::sink_reading_t reading = edid_cli::sink_reading(sink, composition);
    text = edid_cli::explanation_text(
        edid_cli::explanation_of({composition, sink, decoded.record(), golden_case.sink, reading, places, options}),
        edid_cli::table_width_t::wide);
  });
  return text;
}

std::string hex_of(const golden_case_t &golden_case, const composition_t &composition) {
  return golden_case.heading() + format("# The physical address stands at byte %u.\n\n", composition.address_offset) +
         named_bytes(composition.edid);
}

}  // namespace

std::filesystem::path sinks_directory() {
  return std::filesystem::path(EXAMPLES_DIRECTORY) / "sinks";
}

std::filesystem::path platforms_directory() {
  return std::filesystem::path(EXAMPLES_DIRECTORY) / "platforms";
}

std::filesystem::path golden_directory() {
  return GOLDEN_DIRECTORY;
}

namespace {

/// Composes from a sink into the buffer of a composition.
using composer_t = bool (*)(const std::vector<u8> &sink, std::vector<u8> *edid, const compose_cfg_t *settings,
                            void *context);

composition_t composed_by(composer_t composer, void *context, const golden_case_t &golden_case, bool tracing) {
  constexpr u32 edid_size = 256;
  load_platform(golden_case.platform);
  const std::vector<u8> sink = sink_of(golden_case);
  composition_t composition;
  composition.edid.resize(edid_size);
  const compose_cfg_t settings = settings_of(golden_case, &composition.address_offset);

  bool done = false;
  const auto compose = [&] { done = composer(sink, &composition.edid, &settings, context); };
  composition.log = tracing ? test_support::traced_output_of(compose) : test_support::output_of(compose);
  if (!done) throw std::runtime_error(golden_case.name() + ": the library refused\n" + composition.log);
  return composition;
}

u32 size_of(const std::vector<u8> &bytes) {
  return static_cast<u32>(bytes.size());
}

}  // namespace

composition_t composed(const golden_case_t &golden_case, bool tracing) {
  const composer_t composer = [](const std::vector<u8> &sink, std::vector<u8> *edid, const compose_cfg_t *settings,
                                 void *) {
    // Only a request composes with HDMI 2.
    return has_hdmi2_table() ? test_support::compose_observed(sink, *edid, settings, nullptr, nullptr, nullptr)
                             : compose_edid(sink.data(), size_of(sink), edid->data(), size_of(*edid), settings);
  };
  return composed_by(composer, nullptr, golden_case, tracing);
}

composition_t observed(const golden_case_t &golden_case, bool tracing, int *decisions) {
  const composer_t composer = [](const std::vector<u8> &sink, std::vector<u8> *edid, const compose_cfg_t *settings,
                                 void *context) {
    const compose_observer_t count = [](const compose_decision_t *, void *number) { ++*static_cast<int *>(number); };
    return test_support::compose_observed(sink, *edid, settings, nullptr, count, context);
  };
  *decisions = 0;
  return composed_by(composer, decisions, golden_case, tracing);
}

std::map<std::string, std::string> golden_texts(const golden_case_t &golden_case) {
  const composition_t composition = composed(golden_case, true);
  return {{golden_case.name() + ".hex", hex_of(golden_case, composition)},
          {golden_case.name() + ".brief.txt", report_of(golden_case, composition.edid, true)},
          {golden_case.name() + ".explain.txt", explanation_of(golden_case)},
          {golden_case.name() + ".report.txt",
           report_of(golden_case, composition.edid, false) + hdmi2_report_of(golden_case, composition.edid)},
          {golden_case.name() + ".trace.txt", composition.log}};
}

std::string content_of(const std::filesystem::path &file) {
  std::ifstream stream(file, std::ios::binary);
  std::ostringstream content;
  content << stream.rdbuf();
  if (!stream) throw std::runtime_error("cannot read " + file.string());
  return content.str();
}

}  // namespace golden
