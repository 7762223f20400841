// The name under which each element type is kept in lists, and the tag that lists and entries make of it.
#pragma once

#include "edid_composer.h"
#include "linked_list/linked_list.h"

namespace edid_composer {

template <typename record_t>
inline constexpr const char *element_type_name = nullptr;
template <>
inline constexpr const char *element_type_name<i32> = "int";
template <>
inline constexpr const char *element_type_name<short_video_desc_t> = "short_video_desc_t";
template <>
inline constexpr const char *element_type_name<std_timing_t> = "std_timing_t";
template <>
inline constexpr const char *element_type_name<detailed_timing_t> = "detailed_timing_t";
template <>
inline constexpr const char *element_type_name<short_audio_desc_t> = "short_audio_desc_t";

/// Known to the compiler, so that no walk and no new entry makes it from the name again.
template <typename record_t>
inline constexpr u32 element_tag = _calculate_str_checksum(element_type_name<record_t>);

/// Initialises a list for elements of @p record_t.
template <typename record_t>
[[nodiscard]] bool init_list(ll_list_t *list) {
  return ll_init(list, element_type_name<record_t>);
}

}  // namespace edid_composer
