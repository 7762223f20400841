#include "explain/explanation_page.h"

#include <array>
#include <string_view>

#include "explain/byte_names.h"
#include "explain/page_bytes.h"
#include "explain/page_cards.h"
#include "explain/page_decisions.h"
#include "explain/page_template.h"
#include "io/program_name.h"
#include "io/standard_output.h"
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

/// A file without its folders: whoever reads the page does not have them.
std::string short_name(const std::string &source) {
  return source.empty() ? "none" : source.substr(source.rfind('/') + 1);
}

std::string title_of(const explained_t &explained) {
  const bool has_name = explained.sink.monitor_name[0] != '\0';
  const std::string sink = explained.sink_bytes.empty() ? "no sink"
                           : has_name                   ? explained.sink.monitor_name
                                                        : short_name(explained.sink_name);
  return "EDID for " + sink + " behind " + explained.places.name();
}

}  // namespace

std::string explanation_page(const explained_t &explained) {
  const new_edid_t &bytes = explained.composition.new_edid;
  const std::vector<row_t> rows = rows_of(explained);
  const std::vector<byte_field_t> fields = name_bytes(bytes);
  // What the library prints here it has printed before, or the page says it in other words.
  const discarded_output_t unseen;
  const decoded_edid_t new_edid(std::vector<u8>(bytes.begin(), bytes.end()));
  const platform_check_t check = check_platform(explained.options.settings, {});
  const std::array parts{
      part_t{"title", html_text(title_of(explained))},
      part_t{"summary", summary_html(rows)},
      part_t{"warnings", warnings_html(rows)},
      part_t{"sink", edid_card_html(explained.sink, short_name(explained.sink_name))},
      part_t{"platform", platform_card_html(check, explained)},
      part_t{"new_edid", edid_card_html(new_edid.record(), "composed")},
      part_t{"sections", section_options_html()},
      part_t{"decisions", decisions_html(rows)},
      part_t{"legend", legend_html(fields)},
      part_t{"base_bytes", bytes_html(bytes, fields, 0)},
      part_t{"extension_bytes", bytes_html(bytes, fields, bytes.size() / 2)},
      part_t{"fields", fields_html(bytes, fields)},
      part_t{"comparison", comparison_html(explained.sink, new_edid.record())},
      part_t{"keys", keys_html(check)},
      part_t{"findings", findings_html(check)},
      part_t{"program", html_text(std::string(program_name) + " " EDID_COMPOSER_VERSION)},
  };
  return filled(explain_page_template, parts);
}

}  // namespace edid_cli
