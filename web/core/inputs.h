// What a request of the page is about: platform, sink and settings, read and checked as the program does it.
#pragma once

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "composition/composition_options.h"
#include "explain/observation.h"

namespace edid_web {

using json_t = nlohmann::ordered_json;

/// Something that the user has to mend.
struct complaint_t {
  std::string place;  ///< "platform", "sink", "setting" or "library".
  std::string text;
  std::string name{};  ///< Of a setting: which.
  unsigned line = 0;   ///< Of a platform.
  unsigned column = 0;
};

json_t json_complaints(const std::vector<complaint_t> &complaints);

/// The settings that there are, for a form.
json_t setting_descriptions();

/// The text of a file in a request: an object with "name" and "text".
std::string name_of(const json_t &file);
std::string text_of(const json_t &file);

/// Reads "platform" and "sink", which may be null, and "settings", an object of texts and flags by name. Loads the
/// platform. Throws bad_input_t for a request that makes no sense.
class inputs_t {
 public:
  explicit inputs_t(const json_t &request);
  inputs_t(const inputs_t &) = delete;
  inputs_t &operator=(const inputs_t &) = delete;

  bool are_usable() const { return complaints.empty(); }
  /// What was loaded.
  std::string platform_text() const;

  edid_cli::composition_options_t options;
  edid_cli::given_sink_t sink;
  std::string platform_name;
  bool is_platform_loaded = false;
  std::vector<complaint_t> complaints;

 private:
  void take_settings(const json_t &settings);
  void load_platform(const json_t &platform);
  void read_sink(const json_t &file);

  std::string platform_text_;
};

}  // namespace edid_web
