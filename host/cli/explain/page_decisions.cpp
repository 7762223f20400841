#include "explain/page_decisions.h"

#include <algorithm>

#include "text/utf8_text.h"

namespace edid_cli {
namespace {

const char *verdict_class(const row_t &row) {
  switch (row.decision.verdict) {
    case COMPOSE_VERDICT_OFFERED:
      return "offered";
    case COMPOSE_VERDICT_CHANGED:
      return "changed";
    default:
      return is_of_values(row.section) ? "idle" : "out";
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

/// A name and its values, a line each.
std::string fact_html(const char *name, const std::vector<std::string> &values) {
  std::string html = std::string("<dt>") + name + "</dt><dd>";
  bool is_empty = true;
  for (const std::string &value : values) {
    html += value.empty() ? "" : "<span>" + html_text(value) + "</span>";
    is_empty = is_empty && value.empty();
  }
  return html + (is_empty ? "none" : "") + "</dd>\n";
}

std::vector<std::string> first_ones(const std::vector<std::string> &lost) {
  constexpr std::size_t shown = 5;
  std::vector<std::string> texts(lost.begin(),
                                 lost.begin() + static_cast<std::ptrdiff_t>(std::min(shown, lost.size())));
  if (lost.size() > shown) {
    texts.push_back("and " + std::to_string(lost.size() - shown) + " more");
  }
  return texts;
}

std::vector<std::string> reason_texts(const summary_t &summary) {
  std::vector<std::string> texts;
  for (const common_reason_t &reason : summary.reasons) {
    texts.push_back(std::to_string(reason.count) + " times: " + reason.text);
  }
  return texts;
}

bool is_shown(section_t section, const std::vector<row_t> &rows) {
  return is_always_there(section) ||
         std::any_of(rows.begin(), rows.end(), [section](const row_t &row) { return row.section == section; });
}

}  // namespace

std::string summary_html(const explanation_t &explanation) {
  const summary_t &summary = explanation.summary;
  // What was not read of the sink stands among the warnings.
  const bool is_told = !explanation.reading.gaps.empty();
  std::string html =
      "<dl class=\"first\">" + (is_told ? "" : fact_html("Sink", {summary.status})) +
      fact_html("Best video", {summary.best_video}) + fact_html("Preferred video", {summary.preferred_video}) +
      (summary.hdmi2.empty() ? "" : fact_html("HDMI 2", summary.hdmi2)) + fact_html("Audio", summary.audio);
  if (explanation.reading.is_given) {
    html += fact_html("Lost", first_ones(summary.lost));
  }
  html += fact_html("Most common reasons", reason_texts(summary)) + "</dl>\n<ul class=\"sum\">";
  for (const count_t &count : summary.counts) {
    html += std::string("<li>") + section_title(count.section) + ": <b>" + std::to_string(count.offered) +
            " offered</b>, " + std::to_string(count.left_out) + " left out</li>";
  }
  return html + "</ul>";
}

std::string warnings_html(const explanation_t &explanation) {
  std::string html;
  for (const std::string &gap : explanation.reading.gaps) {
    html += "<p class=\"warning\"><b>Sink:</b> " + html_text(gap) + "</p>\n";
  }
  for (const std::string &warning : explanation.warnings) {
    html += "<p class=\"warning\"><b>Warning:</b> " + html_text(warning) + "</p>\n";
  }
  return html;
}

std::string section_options_html(const std::vector<row_t> &rows) {
  std::string html;
  for (const section_t section : sections) {
    if (!is_shown(section, rows)) {
      continue;
    }
    html += std::string("<option value=\"") + section_id(section) + "\">" + section_title(section) + "</option>";
  }
  return html;
}

std::string decisions_html(const std::vector<row_t> &rows) {
  std::string html;
  for (const section_t section : sections) {
    if (!is_shown(section, rows)) {
      continue;
    }
    html += std::string("<tbody><tr><th colspan=\"4\" scope=\"rowgroup\">") + section_title(section) + "</th></tr>\n";
    for (const row_t &row : rows) {
      html += row.section == section ? row_html(row) : "";
    }
    html += "</tbody>\n";
  }
  return html;
}

}  // namespace edid_cli
