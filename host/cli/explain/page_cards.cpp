#include "explain/page_cards.h"

#include <algorithm>

#include "edid_text/alignment.h"
#include "edid_text/edid_fields.h"
#include "text/utf8_text.h"

namespace edid_cli {
namespace {

/// Fields of an EDID, and how a card shows those that have many values.
struct card_field_t {
  std::string_view field;
  bool is_counted;
};

constexpr card_field_t edid_card_fields[] = {
    {"monitor name", false},
    {"manufacturer", false},
    {"video mode", true},
    {"4Kx2K mode", false},
    {"audio format", true},
    {"speakers", false},
    {"physical address", false},
    {"highest TMDS clock in MHz", false},
    {"deep colour, 30 bits", false},
    {"deep colour, 36 bits", false},
    {"mandatory 3D", false},
};

constexpr std::string_view platform_card_keys[] = {
    "monitor_name",          "native_refresh_rate",   "geometry_limit",      "current_mode_set_to_priority",
    "60_hz_priority_list",   "60_hz_addition_list",   "50_hz_priority_list", "50_hz_addition_list",
    "4k_x_2k_priority_list", "4k_x_2k_addition_list", "audio.pass_through",
};

/// A name that may be broken after its underscores.
std::string breakable_html(std::string_view name) {
  std::string html;
  for (const char character : html_text(name)) {
    html += character;
    html += character == '_' ? "<wbr>" : "";
  }
  return html;
}

/// A name and its values, a line each.
std::string facts_html(std::string_view name, const std::vector<std::string> &values) {
  std::string html = "<dt>" + breakable_html(name) + "</dt><dd>";
  for (const std::string &value : values) {
    html += "<span>" + html_text(value) + "</span>";
  }
  return html + (values.empty() ? "none" : "") + "</dd>\n";
}

std::string fact_html(std::string_view name, const std::string &value) {
  return facts_html(name, {value});
}

std::string line_text(const position_t &position) {
  return position.line != 0 ? "line " + std::to_string(position.line) : "default";
}

std::string cell_html(const std::string &text, const char *label = nullptr) {
  return "<td" + (label != nullptr ? std::string(" data-l=\"") + label + "\"" : "") + ">" + html_text(text) + "</td>";
}

}  // namespace

std::string edid_card_html(const edid_t &edid, const std::string &source) {
  std::string html = "<dl>" + fact_html("from", source);
  for (const card_field_t &shown : edid_card_fields) {
    for (const edid_field_t &field : edid_fields()) {
      if (field.name == shown.field) {
        const auto values = field.values(edid);
        html += shown.is_counted ? fact_html(std::string(field.name) + "s", std::to_string(values.size()))
                                 : facts_html(field.name, values);
      }
    }
  }
  return html + "</dl>";
}

std::string platform_card_html(const platform_check_t &check, const explained_t &explained) {
  std::string html = "<dl>" + fact_html("from", explained.places.name());
  for (const std::string_view key : platform_card_keys) {
    for (const key_reading_t &reading : check.readings) {
      html += reading.key == key ? fact_html(key, reading.value + ", " + line_text(reading.position)) : "";
    }
  }
  html += fact_html("findings", check.findings.empty() ? "none" : std::to_string(check.findings.size()));
  return html + "</dl>";
}

std::string comparison_html(const edid_t &sink, const edid_t &new_edid) {
  std::string html;
  for (const edid_field_t &field : edid_fields()) {
    for (const aligned_row_t &row : align(field.values(sink), field.values(new_edid))) {
      html += "<tr><th scope=\"row\">" + html_text(field.name) + "</th>" + cell_html(row.left.value_or("-"), "Sink:") +
              cell_html(row.right.value_or("-"), "New:") + "</tr>\n";
    }
  }
  return html;
}

std::string keys_html(const platform_check_t &check) {
  std::string html;
  for (const key_reading_t &reading : check.readings) {
    html += "<tr><th scope=\"row\" class=\"mono\">" + html_text(reading.key) + "</th>" + cell_html(reading.value) +
            cell_html(reading.default_value, "Default:") + cell_html(reading.limits, "Limits:") +
            cell_html(line_text(reading.position), "From:") + "</tr>\n";
  }
  return html;
}

std::string findings_html(const platform_check_t &check) {
  std::string html;
  for (const finding_t &finding : check.findings) {
    html += "<li>" + html_text(line_text(finding.position) + ", " + finding.key + ": " + finding.text) + "</li>\n";
  }
  return html.empty() ? "" : "<h3 class=\"second\">What is wrong with it</h3>\n<ul>\n" + html + "</ul>";
}

}  // namespace edid_cli
