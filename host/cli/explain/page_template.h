// The page that explanations are written into: page.html, with names in double braces where they stand.
#pragma once

namespace edid_cli {

extern const char *const explain_page_template;

}  // namespace edid_cli
