#include "explain/page_decisions.h"

#include <algorithm>

#include "text/utf8_text.h"

namespace edid_cli {
namespace {

constexpr section_t sections[] = {section_t::video, section_t::mode_4k, section_t::audio, section_t::derived};

const char *verdict_class(const row_t &row) {
  switch (row.decision.verdict) {
    case COMPOSE_VERDICT_OFFERED:
      return "offered";
    case COMPOSE_VERDICT_CHANGED:
      return "changed";
    default:
      return row.section == section_t::derived ? "idle" : "out";
  }
}

/// A line for each source.
std::string sources_html(const row_t &row) {
  std::string html;
  for (const source_t &source : row.sources) {
    html += "<span>" + html_text(source.text) + "</span>";
  }
  return html;
}

std::string row_html(const row_t &row) {
  return "<tr data-v=\"" + html_text(compose_verdict_string(row.decision.verdict)) + "\" data-s=\"" +
         section_id(row.section) + "\"><td class=\"" + verdict_class(row) + "\">" + html_text(verdict_text(row)) +
         "</td><th scope=\"row\">" + html_text(row.name) + "</th><td>" + html_text(row.sentence) +
         "</td><td class=\"mono\">" + sources_html(row) + "</td></tr>\n";
}

}  // namespace

std::string summary_html(const std::vector<row_t> &rows) {
  std::string html;
  for (const section_t section : sections) {
    if (section == section_t::derived) {
      continue;
    }
    const auto count = [&rows, section](bool offered) {
      return std::count_if(rows.begin(), rows.end(), [section, offered](const row_t &row) {
        return row.section == section && row.is_offered() == offered;
      });
    };
    html += std::string("<li>") + section_title(section) + ": <b>" + std::to_string(count(true)) + " offered</b>, " +
            std::to_string(count(false)) + " left out</li>";
  }
  return html;
}

std::string warnings_html(const std::vector<row_t> &rows) {
  std::string html;
  for (const std::string &warning : warnings_of(rows)) {
    html += "<p class=\"warning\"><b>Warning:</b> " + html_text(warning) + "</p>\n";
  }
  return html;
}

std::string section_options_html() {
  std::string html;
  for (const section_t section : sections) {
    html += std::string("<option value=\"") + section_id(section) + "\">" + section_title(section) + "</option>";
  }
  return html;
}

std::string decisions_html(const std::vector<row_t> &rows) {
  std::string html;
  for (const section_t section : sections) {
    html += std::string("<tbody><tr><th colspan=\"4\" scope=\"rowgroup\">") + section_title(section) + "</th></tr>\n";
    for (const row_t &row : rows) {
      html += row.section == section ? row_html(row) : "";
    }
    html += "</tbody>\n";
  }
  return html;
}

}  // namespace edid_cli
