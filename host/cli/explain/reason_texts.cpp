#include "explain/reason_texts.h"

#include <cstdio>

#include "edid_text/physical_address_text.h"
#include "explain/mode_names.h"
#include "explain/reason_table.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

std::string sample_rates(i32 value) {
  char text[128] = "";
  audio_freq_string(static_cast<u32>(value), text, sizeof text);
  const std::string rates(text);
  return rates.substr(0, rates.find_last_not_of(' ') + 1);
}

std::string megahertz_of_kilohertz(i32 value) {
  char text[32];
  std::snprintf(text, sizeof text, "%.2f MHz", value / 1000.0);
  return text;
}

/// One number in the form that a letter stands for.
std::string formatted(i32 value, char form) {
  switch (form) {
    case 'n':  // A place, counted from 1.
      return std::to_string(value + 1);
    case 'h':
      return hex_number(static_cast<u32>(value));
    case 'a':
      return physical_address_text(static_cast<u32>(value));
    case 'r':
      return sample_rates(value);
    case 'k':
      return megahertz_of_kilohertz(value);
    case 'm':  // A sink's TMDS clock.
      return value == 0 ? "declares none" : "declares " + std::to_string(value) + " MHz";
    case 'c':
      return std::to_string(value) + (value == 1 ? " channel" : " channels");
    case 'o':
      return value != 0 ? "yes" : "no";
    default:
      return std::to_string(value);
  }
}

std::string priority_list(const compose_decision_t &decision, const explained_t &explained) {
  return decision.subject == COMPOSE_SUBJECT_4K_MODE ? platform_list::priority_4k
                                                     : platform_list::priority(explained.family());
}

std::string addition_list(const compose_decision_t &decision, const explained_t &explained) {
  return decision.subject == COMPOSE_SUBJECT_4K_MODE ? platform_list::addition_4k
                                                     : platform_list::addition(explained.family());
}

/// Who has a mode that the priority list doesn't name.
std::string who_has_it(const compose_decision_t &decision, const explained_t &explained) {
  const bool sink = decision.sink_index >= 0;
  const bool addition = (decision.origins & COMPOSE_ORIGIN_ADDITION_LIST) != 0;
  return addition && !sink ? addition_list(decision, explained) : "The sink";
}

/// What a place in braces stands for.
std::string resolved(std::string_view place, const compose_decision_t &decision, const explained_t &explained) {
  if (place == "priority") {
    return priority_list(decision, explained);
  }
  if (place == "addition") {
    return addition_list(decision, explained);
  }
  if (place == "who") {
    return who_has_it(decision, explained);
  }
  const i32(&value)[4] = decision.value;
  if (place == "raster0") {
    return raster_name(value[0], value[1], value[2], value[3] != 0);
  }
  const std::size_t number = static_cast<std::size_t>(place.front() - '0');
  return formatted(value[number], place.size() > 2 ? place[2] : ' ');
}

}  // namespace

std::string reason_sentence(const compose_decision_t &decision, const explained_t &explained) {
  const char *const sentence = reason_text(decision.reason).sentence;
  if (sentence == nullptr) {
    return compose_reason_string(decision.reason);
  }
  std::string text;
  std::string_view rest = sentence;
  for (std::size_t open = 0; (open = rest.find('{')) != std::string_view::npos;) {
    const std::size_t close = rest.find('}', open);
    text += rest.substr(0, open);
    text += resolved(rest.substr(open + 1, close - open - 1), decision, explained);
    rest.remove_prefix(close + 1);
  }
  return text.append(rest);
}

}  // namespace edid_cli
