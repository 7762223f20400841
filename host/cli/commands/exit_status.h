// The statuses that the program exits with.
#pragma once

namespace edid_cli {

inline constexpr int done_status = 0;
inline constexpr int refused_status = 1;    ///< The library refused.
inline constexpr int bad_input_status = 2;  ///< Usage, or a file that cannot be read, understood or written.

}  // namespace edid_cli
