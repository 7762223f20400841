#include "explain/page_cards.h"

#include "text/utf8_text.h"

namespace edid_cli {
namespace {

/// A name that may be broken after its underscores.
std::string breakable_html(std::string_view name) {
  std::string html;
  for (const char character : html_text(name)) {
    html += character;
    html += character == '_' ? "<wbr>" : "";
  }
  return html;
}

std::string cell_html(const std::string &text, const char *label = nullptr) {
  return "<td" + (label != nullptr ? std::string(" data-l=\"") + label + "\"" : "") + ">" + html_text(text) + "</td>";
}

}  // namespace

std::string facts_html(const std::vector<fact_t> &facts) {
  std::string html = "<dl>";
  for (const fact_t &fact : facts) {
    html += "<dt>" + breakable_html(fact.name) + "</dt><dd>";
    for (const std::string &value : fact.values) {
      html += "<span>" + html_text(value) + "</span>";
    }
    html += fact.values.empty() ? "none</dd>\n" : "</dd>\n";
  }
  return html + "</dl>";
}

std::string comparison_html(const std::vector<compared_t> &rows) {
  std::string html;
  for (const compared_t &row : rows) {
    html += "<tr><th scope=\"row\">" + html_text(row.field) + "</th>" + cell_html(row.left, "Sink:") +
            cell_html(row.right, "New:") + "</tr>\n";
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
    const std::string key = finding.key.empty() ? "" : ", " + finding.key;
    html += std::string("<li><b>") + severity_text(finding.severity) +
            "</b>: " + html_text(line_text(finding.position) + key + ": " + finding.text) + "</li>\n";
  }
  return html.empty() ? "" : "<h3 class=\"second\">What is wrong with it</h3>\n<ul>\n" + html + "</ul>";
}

}  // namespace edid_cli
