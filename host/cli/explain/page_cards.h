// The sink, the platform and the new EDID on the page, as HTML.
#pragma once

#include <string>

#include "explain/explained.h"
#include "platform/platform_check.h"

namespace edid_cli {

/// The facts of an EDID that matter first. @p source is what it is called.
std::string edid_card_html(const edid_t &edid, const std::string &source);
std::string platform_card_html(const platform_check_t &check, const explained_t &explained);
std::string comparison_html(const edid_t &sink, const edid_t &new_edid);
std::string keys_html(const platform_check_t &check);
std::string findings_html(const platform_check_t &check);

}  // namespace edid_cli
