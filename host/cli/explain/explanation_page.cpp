#include "explain/explanation_page.h"

#include <array>
#include <span>
#include <string_view>

#include "explain/page_bytes.h"
#include "explain/page_cards.h"
#include "explain/page_decisions.h"
#include "explain/page_template.h"
#include "text/utf8_text.h"

namespace edid_cli {
namespace {

struct part_t {
  std::string_view name;
  std::string html;
};

/// The template with its parts. They are looked for in the template only, never in what a part says.
std::string filled(std::string_view page, std::span<const part_t> parts) {
  constexpr std::string_view open = "{{";
  constexpr std::string_view close = "}}";
  std::string html;
  for (std::size_t begin = 0; (begin = page.find(open)) != std::string_view::npos;) {
    const std::size_t end = page.find(close, begin);
    const std::string_view name = page.substr(begin + open.size(), end - begin - open.size());
    html += page.substr(0, begin);
    for (const part_t &part : parts) {
      html += part.name == name ? part.html : "";
    }
    page.remove_prefix(end + close.size());
  }
  return html.append(page);
}

}  // namespace

std::string explanation_page(const explanation_t &explanation) {
  const new_edid_t &bytes = explanation.new_edid;
  const std::vector<byte_field_t> &fields = explanation.bytes;
  const std::array parts{
      part_t{"title", html_text(explanation.title)},
      part_t{"summary", summary_html(explanation)},
      part_t{"warnings", warnings_html(explanation)},
      part_t{"sink", facts_html(explanation.sink_facts)},
      part_t{"platform", facts_html(explanation.platform_facts)},
      part_t{"new_edid", facts_html(explanation.new_edid_facts)},
      part_t{"sections", section_options_html(explanation.rows)},
      part_t{"decisions", decisions_html(explanation.rows)},
      part_t{"legend", legend_html(fields)},
      part_t{"base_bytes", bytes_html(bytes, fields, 0)},
      part_t{"extension_bytes", bytes_html(bytes, fields, bytes.size() / 2)},
      part_t{"fields", fields_html(bytes, fields)},
      part_t{"comparison", comparison_html(explanation.comparison)},
      part_t{"keys", keys_html(explanation.platform_check)},
      part_t{"findings", findings_html(explanation.platform_check)},
      part_t{"program", html_text(explanation.program)},
  };
  return filled(explain_page_template, parts);
}

}  // namespace edid_cli
