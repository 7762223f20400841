// The parts of the page, as HTML.
#pragma once

#include <span>
#include <string>

#include "explain/byte_names.h"
#include "explain/rows.h"
#include "platform_check.h"

namespace edid_cli {

std::string summary_html(const std::vector<row_t> &rows);
std::string warnings_html(const std::vector<row_t> &rows);
std::string section_options_html();
std::string decisions_html(const std::vector<row_t> &rows);

/// The facts of an EDID that matter first. @p source is what it is called.
std::string edid_card_html(const edid_t &edid, const std::string &source);
std::string platform_card_html(const platform_check_t &check, const explained_t &explained);
std::string comparison_html(const edid_t &sink, const edid_t &new_edid);
std::string keys_html(const platform_check_t &check);
std::string findings_html(const platform_check_t &check);

std::string legend_html(const std::vector<byte_field_t> &fields);
/// One block's bytes, each leading to its field's row.
std::string bytes_html(std::span<const u8> edid, const std::vector<byte_field_t> &fields, std::size_t begin);
std::string fields_html(std::span<const u8> edid, const std::vector<byte_field_t> &fields);

}  // namespace edid_cli
