// The lists of the platform configuration, and the grammar of their entries.
#pragma once

#include "edid_composer.h"

namespace edid_composer {

/// Size of the buffer in which a list entry's text is handed to its parser.
inline constexpr u32 list_value_size = 30;

/// What parses one entry: node name, list name, integer value (-1 in lists of texts), text (a writable buffer of
/// list_value_size bytes, terminated), the buffer's size, the reader's context. The walk ignores the result.
using platform_list_callback = bool (*)(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                                        u32 string_size, void *context);

/// The lists of video modes.
enum platform_list_type : u32 {
  list_50_priority = 0,
  list_60_priority = 1,
  list_50_additional = 2,
  list_60_additional = 3,
};

/// Context of the parsers that append to a list.
struct list_context_t {
  ll_list_t *list;
};

/// Context of the 4Kx2K parser.
struct modes_4k_x_2k_context_t {
  i32 *modes;
  u32 count;
};

/// Walks the entries of the list @p list_name, relative to the configuration domain. Always answers true.
bool _get_generic_platform_list(const char *list_name, bool is_int, void *context, platform_list_callback callback);

bool _get_platform_list(u32 type, ll_list_t *list);
void _get_4k_x_2k_modes(const char *list_name, i32 *modes);
void _get_est_timing_list(const char *list_name, u32 *mask);
void _get_std_timing_list(ll_list_t *list);

/// What an entry of a video mode list holds: a number, and up to three words of up to nine characters.
struct video_mode_words_t {
  long number;  ///< Takes any number that fits the text; an int would not.
  char flags[3][10];
};

/// Reads @p text as scanf reads "%ld%9s%9s%9s". Answers the number of fields, 0 without a number; words that aren't
/// there stay as they are.
int _scan_video_mode(const char *text, video_mode_words_t *words);

bool _get_vic_list_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                            u32 string_size, void *context);
bool _get_4k_x_2k_mode_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                                u32 string_size, void *context);
bool _get_est_timing_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                              u32 string_size, void *context);
bool _get_std_timing_callback(const char *node_name, const char *list_name, i32 int_value, char *string_value,
                              u32 string_size, void *context);

}  // namespace edid_composer
