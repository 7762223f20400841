// An explanation of a composition as one document. Text, JSON and page are made from it, and from nothing else.
#pragma once

#include <string>
#include <vector>

#include "edid_text/edid_comparison.h"
#include "explain/byte_names.h"
#include "explain/rows.h"
#include "explain/summary.h"
#include "platform/platform_check.h"

namespace edid_cli {

/// A name and its values.
struct fact_t {
  std::string name;
  std::vector<std::string> values;
};

struct explanation_t {
  std::string title;
  std::string program;      ///< Name and version.
  std::string sink_source;  ///< As given; empty: no sink.
  std::string sink_file;    ///< The same without its folders.
  std::string sink_manufacturer;
  std::string sink_name;
  std::vector<u8> sink_bytes;
  sink_reading_t reading;
  std::string platform;
  composition_options_t options;

  summary_t summary;
  std::vector<std::string> warnings;
  std::vector<row_t> rows;

  std::vector<fact_t> sink_facts;
  std::vector<fact_t> platform_facts;
  std::vector<fact_t> new_edid_facts;
  std::vector<compared_t> comparison;  ///< Of the sink, to the left, and the new EDID.
  platform_check_t platform_check;
  new_edid_t new_edid{};
  std::vector<byte_field_t> bytes;  ///< What each of the new EDID's bytes is.
};

/// "line 40", or "default" for a key that is not in the file.
std::string line_text(const position_t &position);

explanation_t explanation_of(const explained_t &explained);

}  // namespace edid_cli
