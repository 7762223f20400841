/**
 * @file edid_composer.h
 * @brief libedid_composer: composes the EDID that a video platform shows on its own HDMI input.
 *
 * A platform that sits between an HDMI source and a downstream sink presents an EDID of its own on its input. This
 * library composes it from the sink's EDID, the platform's configuration tree and the caller's settings for the port,
 * and decodes an EDID into a readable report.
 *
 * Composing one, with the configuration operations of the host (@ref host) in place:
 *
 * @code{.c}
 * uint8_t new_edid[256];
 * compose_cfg_t settings = {.audio_mask = 0xFFFFFFFF, .hdmi_3d_mode = 1, .port = 0};
 * compose_request_t request = {.size = sizeof request,
 *                              .sink = sink, .sink_bytes = sink_bytes,
 *                              .new_edid = new_edid, .new_edid_bytes = sizeof new_edid,
 *                              .settings = &settings};
 * compose_result_t result = {.size = sizeof result};
 * if (!compose_edid_request(&request, &result)) return -1;
 * if (result.sink_status != COMPOSE_SINK_READ) puts(compose_sink_status_string(result.sink_status));
 * return write_to_receiver(new_edid, result.bytes_written);
 * @endcode
 *
 * Conventions that hold for every operation:
 *
 * - **Results.** Operations return 1 (`true`) for success and 0 (`false`) for failure unless stated otherwise. There
 *   are no error codes and no exceptions: each failure is reported once, where it is detected, by one line on standard
 *   output (see @ref debug_enable for the four kinds of line).
 * - **Ownership.** Records are provided by the caller. All heap memory is list entries and their payloads, owned by the
 *   list that holds them and released by the record's own destroy operation. Nothing survives a call but what the
 *   caller was given.
 * - **Threads.** The library keeps no state but the debug switch. Every operation may run on any thread, and on several
 *   threads at once as long as they work on different records and buffers. Lines that several threads print may
 *   interleave. Composing also calls the host's eight `config_*` operations: whether those may run at once is
 *   up to the host.
 * - **Units.** Pixel clocks are in hertz, refresh rates in whole hertz (truncated), latencies in milliseconds.
 *
 * Standards: EDID 1.3 is "VESA Enhanced EDID Standard, Release A, Revision 1"; CEA-861 is CEA-861-D; HDMI is the "High-
 * Definition Multimedia Interface Specification, Version 1.4a", whose CEC supplement defines physical addresses.
 *
 * The header is self-contained and valid as C11 and as C++17.
 */
#ifndef EDID_COMPOSER_H
#define EDID_COMPOSER_H

#include <stdbool.h>
#include <stdint.h>

/** Marks what the shared library exports, and what it binds to in the host. */
#define EDID_COMPOSER_API __attribute__((visibility("default")))

#ifdef __cplusplus
extern "C" {
#endif

/** @defgroup types Fixed-width types
 * @{ */
typedef uint8_t u8;   /**< Unsigned byte. As a result or a flag: 0 or 1. */
typedef uint16_t u16; /**< Unsigned 16-bit integer. */
typedef uint32_t u32; /**< Unsigned 32-bit integer. */
typedef int32_t i32;  /**< Signed 32-bit integer. */
/** @} */

/** @defgroup diagnostics Diagnostics and version
 *
 * All diagnostics go to C's `stdout`, in four kinds of line:
 *
 * | kind    | bytes                                                      | written              |
 * |---------|------------------------------------------------------------|----------------------|
 * | error   | `module:line:function() ERROR: ` message, newline          | always               |
 * | warning | `module:line:function() WARNING: ` message, newline        | always               |
 * | bug     | `module:line:function() BUG: ` message, newline            | always               |
 * | trace   | message, ` \t\t\tfunction():line`, newline                 | while tracing is on  |
 *
 * The module is `edid_composer`, `edid_decode_encode`, `utility` or `linked_list`. A bug line reports a broken
 * internal invariant (a corrupt list, a failed allocation), the other two report bad input.
 * @{ */

/**
 * Turns tracing on or off for the whole process. It is off until the first call.
 *
 * The switch may be changed from any thread at any time; a change takes effect on the next line written. Prints
 * nothing.
 *
 * @param enable true to write debug traces and dumps, false to write errors, warnings, bugs and reports only.
 */
EDID_COMPOSER_API void debug_enable(bool enable);

/** @return whether tracing is on. May be called from any thread. */
EDID_COMPOSER_API bool debug_enabled(void);

/**
 * The text that identifies a build: `#@# libedid_composer.so Unofficial Build ` and the date of the build in the form
 * of the system's `date` command. Never NULL, read-only, valid as long as the library is loaded. The marker `#@#` lets
 * the text be found in the library file.
 */
EDID_COMPOSER_API extern const char *const gVersion;
/** @} */

/** @defgroup linked_list Typed linked list
 *
 * The singly linked list that holds every collection. A head carries a magic number made from its own address, and head
 * and entries carry a tag made from the name of their element type, so that a head that was never initialised, was
 * moved or was overwritten, and an entry of the wrong type, are reported instead of followed. Nearly every operation
 * verifies the whole list.
 *
 * A head must never be copied by value or moved: at another address it is not initialised.
 *
 * All operations return true on success. Each failure prints one error or bug line of module `linked_list`. A list may
 * be used by one thread at a time.
 * @{ */

struct ll_entry_t;

/** Head of a typed list; embedded by value in the record that owns it. */
typedef struct ll_list_t {
  u32 magic;               /**< Made from the head's own address while the list is initialised; 0 once deleted. */
  u32 type;                /**< Tag of the element type's name. */
  u32 size;                /**< Number of entries. */
  struct ll_entry_t *head; /**< First entry; NULL when the list is empty. */
} ll_list_t;

/** One entry of a typed list, allocated by @ref ll_create_entry. */
typedef struct ll_entry_t {
  void *data;              /**< The payload; owned by the entry. */
  struct ll_entry_t *next; /**< Following entry; NULL at the end of the list. */
  ll_list_t *list;         /**< The list that holds the entry; NULL while it is in none. */
  u32 type;                /**< Tag of the element type's name. */
} ll_entry_t;

/**
 * Initialises a head: no entries, its magic, the tag of @p type.
 *
 * A head that is initialised already is refused and left unchanged. A head with any other content is accepted.
 *
 * @param list the head; its owner zero-fills it beforehand.
 * @param type name of the element type, NUL-terminated.
 */
EDID_COMPOSER_API bool ll_init(ll_list_t *list, const char *type);

/** @return whether @p list is initialised at this address. Checks nothing else. Prints an error for a NULL list only.
 */
EDID_COMPOSER_API bool ll_is_initialized(const ll_list_t *list);

/** @return whether @p list was initialised with the name @p type. A mismatch prints nothing; NULL arguments do. */
EDID_COMPOSER_API bool ll_verify_list_type(const ll_list_t *list, const char *type);

/**
 * Verifies the whole list: initialised, its size equal to its number of entries, each entry in a list and of the list's
 * type. The first failure is printed.
 */
EDID_COMPOSER_API bool ll_verify_integrity(const ll_list_t *list);

/** @return the number of entries; 0 when @p list is NULL, not initialised or corrupt (which is printed). */
EDID_COMPOSER_API i32 ll_size(const ll_list_t *list);

/**
 * Creates an entry that is in no list yet, with a zero-filled payload.
 *
 * The caller owns the entry until a list has accepted it, and deletes it with @ref ll_delete_entry if none does.
 * Two heap allocations: the entry and its payload.
 *
 * @param size payload size in bytes, 1 or more.
 * @param entry receives the entry.
 * @param data receives the entry's payload, lent.
 * @param type name of the element type, NUL-terminated.
 * @return false for a bad argument or a failed allocation; what the outputs then hold must not be used.
 */
EDID_COMPOSER_API bool ll_create_entry(i32 size, ll_entry_t **entry, void **data, const char *type);

/** Frees an entry that is in no list, and its payload. It does not unlink. */
EDID_COMPOSER_API bool ll_delete_entry(ll_entry_t *delete_entry);

/** Unlinks and frees the entry at position @p index, 0 being the first. */
EDID_COMPOSER_API bool ll_delete_entry_at(ll_list_t *list, u32 index);

/** Appends an entry of the list's type; the list then owns it. On failure it stays the caller's. */
EDID_COMPOSER_API bool ll_add_entry_to_back(ll_list_t *list, ll_entry_t *new_entry);

/** Prepends an entry of the list's type; the list then owns it. On failure it stays the caller's. */
EDID_COMPOSER_API bool ll_add_entry_to_front(ll_list_t *list, ll_entry_t *new_entry);

/**
 * Lends the payload of the entry at position @p index.
 *
 * @param list the list.
 * @param index 0 to size - 1.
 * @param entry_data receives the payload, which the list keeps owning; NULL on failure.
 */
EDID_COMPOSER_API bool ll_entry_at(const ll_list_t *list, i32 index, void **entry_data);

/** Frees every entry and leaves the head uninitialised (magic 0), also when an entry could not be freed. */
EDID_COMPOSER_API bool ll_delete_list(ll_list_t *list);

/**
 * Appends copies of the entries of @p src_list to @p dst_list, in order.
 *
 * Copies made before a failure stay in the destination. Each copy carries its source entry's type tag, so that copying
 * into a list of another type fails at the first entry.
 *
 * @param src_list read only.
 * @param dst_list an initialised list; what it holds stays ahead of the copies.
 * @param size payload size in bytes. Lists do not record it: it must be the size the entries were created with.
 */
EDID_COMPOSER_API bool ll_copy_list(const ll_list_t *src_list, ll_list_t *dst_list, u32 size);
/** @} */

/** @defgroup records EDID records
 * @{ */

/**
 * One detailed timing (EDID 1.3, section 3.10.2). Entry of lists of type "detailed_timing_t".
 *
 * Written by the decoders and by @ref convert_vic_to_dtd.
 */
typedef struct detailed_timing_t {
  u8 valid;           /**< 1 when the record holds a timing. The report skips, the encoder refuses entries with 0. */
  u32 pixel_clock;    /**< Pixel clock, Hz. Stored in units of 10 kHz: 0 to 655350000. */
  u32 h_active;       /**< Horizontal active pixels, 0 to 4095. */
  u32 h_blanking;     /**< Horizontal blanking pixels, 0 to 4095. */
  u32 h_sync_offset;  /**< Horizontal front porch, pixels, 0 to 1023. */
  u32 h_sync_width;   /**< Horizontal sync pulse width, pixels, 0 to 1023. */
  u8 h_border;        /**< Horizontal border, pixels. */
  u32 v_active;       /**< Vertical active lines, per field when interlaced, 0 to 4095. */
  u32 v_blanking;     /**< Vertical blanking lines, per field when interlaced, 0 to 4095. */
  u32 v_sync_offset;  /**< Vertical front porch, lines, 0 to 63. */
  u32 v_sync_width;   /**< Vertical sync pulse width, lines, 0 to 63. */
  u8 v_border;        /**< Vertical border, lines. */
  u32 h_image_size;   /**< Horizontal image size, mm, 0 to 4095; 0 when not given. */
  u32 v_image_size;   /**< Vertical image size, mm, 0 to 4095; 0 when not given. */
  u8 progressive;     /**< 1 progressive, 0 interlaced. */
  u8 stereo;          /**< 1 when the descriptor's stereo bits are not 00. Never encoded. */
  u8 h_sync_positive; /**< 1 when the horizontal sync is positive. */
  u8 v_sync_positive; /**< 1 when the vertical sync is positive. */
} detailed_timing_t;

/** One standard timing (EDID 1.3, section 3.9). Entry of lists of type "std_timing_t". */
typedef struct std_timing_t {
  u32 h_active;     /**< Horizontal active pixels, 248 to 2288, a multiple of 8. */
  u32 aspect_ratio; /**< Aspect-ratio code: 0 = 1:1, 1 = 4:3, 2 = 5:4, 3 = 16:9. */
  u32 refresh_rate; /**< Vertical refresh, Hz, 60 to 123. */
} std_timing_t;

/** One short video descriptor (CEA-861, section 7.5.1). Entry of lists of type "short_video_desc_t". */
typedef struct short_video_desc_t {
  u8 native;  /**< 1 when the descriptor's native bit is set. */
  u32 vic;    /**< Video identification code (CEA-861, section 4), 1 to 127. */
  u32 stereo; /**< Mask of the 3D structures (HDMI 1.4a, appendix H) of the mode; see @ref stereo_mask. 0 = no 3D. */
} short_video_desc_t;

/** Bits of @ref short_video_desc_t::stereo. */
enum stereo_mask {
  STEREO_FRAME_PACKING = 0x01,     /**< FP: frame packing. */
  STEREO_SIDE_BY_SIDE_HALF = 0x02, /**< SBSH: side-by-side (half). */
  STEREO_TOP_AND_BOTTOM = 0x04,    /**< TBH: top-and-bottom. */
  STEREO_FIELD_ALTERNATIVE = 0x08, /**< FA: field alternative. */
  STEREO_LINE_ALTERNATIVE = 0x10,  /**< LA: line alternative. */
  STEREO_SIDE_BY_SIDE_FULL = 0x20, /**< SBSF: side-by-side (full). */
  STEREO_L_DEPTH = 0x40,           /**< LD: L + depth. */
  STEREO_L_DEPTH_GRAPHICS = 0x80   /**< LDGD: L + depth + graphics + graphics-depth. */
};

/**
 * One short audio descriptor (CEA-861, section 7.5.2). Entry of lists of type "short_audio_desc_t".
 *
 * Fields that do not apply to a type are 0.
 */
typedef struct short_audio_desc_t {
  u32 type; /**< Audio format code 1 to 14 (CEA-861, section 7.5.2); 16 HE-AAC, 17 HE-AACv2, 18 MPEG Surround for the
                 extension codes 1 to 3 of format 15; 0 for any other extension code. */
  u32 channels;    /**< Maximum number of channels, 1 to 8. */
  u32 frequencies; /**< Sample-rate mask: bits 0 to 6 are 32, 44.1, 48, 88.2, 96, 176.4 and 192 kHz. */
  u32 pcm_bits;    /**< Type 1: sample-size mask, bits 0 to 2 are 16, 20 and 24 bit. */
  u32 max_bitrate; /**< Types 2 to 8: maximum bit rate, kHz, a multiple of 8, 0 to 2040. */
  u32 value;       /**< Types 9 to 13: the format-dependent third byte, as stored. */
  u32 wma_profile; /**< Type 14: profile, 0 to 7. */
} short_audio_desc_t;

/**
 * The decoded form of one display's EDID: the base block and at most one CEA-861 extension.
 *
 * Prepared by @ref edid_prepare, filled by the decoders (@ref decode_edid_block_0, @ref decode_edid_extensions) or by
 * the composer, released by @ref edid_destroy. Must not be copied or moved while prepared (see @ref linked_list).
 * Offsets below are bytes of the base block (EDID 1.3, section 3) or of the extension (CEA-861, section 7.5); "VSDB" is
 * the HDMI vendor-specific data block (HDMI 1.4a, section 8.3.2).
 */
typedef struct edid_t {
  /* Base block */
  u8 valid;               /**< 1 once the header was verified, even if the checksum then failed. */
  char manufacturer[4];   /**< Three-letter manufacturer ID and NUL (bytes 8-9). */
  u32 product_code;       /**< Product code, 0 to 65535 (bytes 10-11). */
  u32 serial_number;      /**< Serial number (bytes 12-15). */
  u8 week;                /**< Week of manufacture, as stored (byte 16). */
  u32 year;               /**< Year of manufacture, 1990 to 2245 (byte 17). */
  u8 version;             /**< EDID version; the decoder requires 1 (byte 18). */
  u8 revision;            /**< EDID revision; the decoder requires 3 or more (byte 19). */
  u8 digital;             /**< 1 when the video input is digital (byte 20). */
  u8 h_size_cm;           /**< Maximum horizontal image size, cm; 0 = undefined (byte 21). */
  u8 v_size_cm;           /**< Maximum vertical image size, cm; 0 = undefined (byte 22). */
  u32 gamma;              /**< Gamma as stored: gamma x 100 - 100, 0 to 255 (byte 23). */
  u8 standby;             /**< 1 when DPMS stand-by is supported (byte 24, bit 7). */
  u8 suspend;             /**< 1 when DPMS suspend is supported (byte 24, bit 6). */
  u8 active_off;          /**< 1 when DPMS active-off is supported (byte 24, bit 5). */
  u8 standard_colorspace; /**< 1 when sRGB is the default colour space (byte 24, bit 2). */
  u8 preferred_timing;    /**< 1 when the first detailed timing is the preferred mode (byte 24, bit 1). */
  u8 gtf;                 /**< 1 when default GTF is supported (byte 24, bit 0). */
  u32 red_x;              /**< Chromaticity, 10 bits, value / 1024 (bytes 25-34). */
  u32 red_y;              /**< Chromaticity of red, y. */
  u32 green_x;            /**< Chromaticity of green, x. */
  u32 green_y;            /**< Chromaticity of green, y. */
  u32 blue_x;             /**< Chromaticity of blue, x. */
  u32 blue_y;             /**< Chromaticity of blue, y. */
  u32 white_x;            /**< Chromaticity of white, x. */
  u32 white_y;            /**< Chromaticity of white, y. */
  u32 est_timings_1;      /**< Established timings I, bit mask (byte 35). */
  u32 est_timings_2;      /**< Established timings II, bit mask (byte 36). */
  u32 man_timings;        /**< Manufacturer's reserved timings, bit mask (byte 37). */
  ll_list_t std_timings;  /**< Standard timings, list of @ref std_timing_t in block order (bytes 38-53). */
  ll_list_t dtd_list;     /**< Detailed timings, list of @ref detailed_timing_t, base block first, then extension. */
  char serial_string[14]; /**< Serial number text of descriptor 0xFF, up to 13 characters and NUL. */
  char data_string[14];   /**< Text of descriptor 0xFE, up to 13 characters and NUL. */
  char monitor_name[14];  /**< Monitor name of descriptor 0xFC, up to 13 characters and NUL. */
  u8 min_v_rate;          /**< Range limits: minimum vertical rate, Hz (descriptor 0xFD). */
  u8 max_v_rate;          /**< Range limits: maximum vertical rate, Hz. */
  u8 min_h_rate;          /**< Range limits: minimum horizontal rate, kHz. */
  u8 max_h_rate;          /**< Range limits: maximum horizontal rate, kHz. */
  u32 max_pixel_clock;    /**< Range limits: maximum pixel clock, MHz, a multiple of 10. */
  u8 extension_count;     /**< Number of extension blocks announced (byte 126). */
  u8 checksum;            /**< The base block's stored checksum (byte 127). */
  /* CEA-861 extension */
  u8 underscan;         /**< 1 when the sink underscans IT formats by default (byte 3, bit 7). */
  u8 basic_audio;       /**< 1 when basic audio is supported (byte 3, bit 6). */
  u8 ycbcr_444;         /**< 1 when YCbCr 4:4:4 is supported (byte 3, bit 5). */
  u8 ycbcr_422;         /**< 1 when YCbCr 4:2:2 is supported (byte 3, bit 4). */
  ll_list_t video_list; /**< Short video descriptors, list of @ref short_video_desc_t in block order. */
  ll_list_t audio_list; /**< Short audio descriptors, list of @ref short_audio_desc_t in block order. */
  u8 speaker[3];        /**< Payload of the speaker allocation data block (CEA-861, section 7.5.3). */
  /* HDMI vendor-specific data block */
  u8 hdmi_present;        /**< 1 when a VSDB of at least 5 payload bytes was decoded. */
  u8 physical_address[4]; /**< CEC physical address a.b.c.d, 0 to 15 each; the encoder writes the low nibbles. */
  u8 dc_48bit;            /**< 1 when 48-bit deep colour is supported. */
  u8 dc_36bit;            /**< 1 when 36-bit deep colour is supported. */
  u8 dc_30bit;            /**< 1 when 30-bit deep colour is supported. */
  u8 dc_y444;             /**< 1 when deep colour is supported in YCbCr 4:4:4 too. */
  u8 dvi_dual;            /**< 1 when DVI dual-link is supported. */
  u32 max_tmds_clock;     /**< Maximum TMDS clock, MHz, a multiple of 5, 0 to 1275; 0 when not given. */
  u8 supports_ai;         /**< 1 when ACP, ISRC1 and ISRC2 packets are supported (Supports_AI). */
  u8 cnc0;                /**< 1 when content type graphics is supported. */
  u8 cnc1;                /**< 1 when content type photo is supported. */
  u8 cnc2;                /**< 1 when content type cinema is supported. */
  u8 cnc3;                /**< 1 when content type game is supported. */
  u8 hdmi_video_present;  /**< 1 when the VSDB carries HDMI video fields (3D and 4Kx2K). */
  u16 video_latency;      /**< Progressive video latency, ms. 0: not given. No valid latency: 508 as decoded, 65535 to
                             encode. */
  u16 audio_latency;      /**< Progressive audio latency, ms. */
  u16 i_video_latency;    /**< Interlaced video latency, ms. */
  u16 i_audio_latency;    /**< Interlaced audio latency, ms. */
  u8 hdmi_3d_present;     /**< 1 when the mandatory 3D formats are supported (HDMI 1.4a, section 8.3.2, 3D_present). */
  u8 image_size;          /**< Image_Size code, 0 to 3. */
  u8 hdmi_vic_len;        /**< Number of valid codes in @ref hdmi_vic, 0 to 7. */
  u32 hdmi_vic[7]; /**< HDMI_VIC codes (HDMI 1.4a, section 8.2.3): 1 3840x2160p30, 2 3840x2160p25, 3 3840x2160p24,
                        4 4096x2160p24. */
  /* Colorimetry data block */
  u8 xvycc601; /**< 1 when xvYCC601 is supported (CEA-861, section 7.5.5). */
  u8 xvycc709; /**< 1 when xvYCC709 is supported. */
} edid_t;

/** A video mode as a platform describes one. */
typedef struct video_mode_t {
  u32 width;      /**< Active pixels per line. */
  u32 height;     /**< Active lines per frame: 1080 for 1080i. */
  u32 interlaced; /**< 1 interlaced; anything else progressive. */
  u32 refresh;    /**< Whole Hz; the field rate of an interlaced mode. */
} video_mode_t;

/**
 * Prepares a record: clears every field and initialises its four lists.
 *
 * Must be called on every record before it is decoded into, filled or encoded. A record that still holds lists loses
 * them: destroy it first.
 *
 * @param edid the record, with any content. Must not be NULL.
 * @return 1 on success. On failure one error line of module `edid_decode_encode`, and 0.
 */
EDID_COMPOSER_API u8 edid_prepare(edid_t *edid);

/**
 * Releases the four lists of a prepared record, once. The other fields keep their values.
 *
 * @param edid a prepared record, also one whose decoding failed. Must not be NULL.
 * @return 1 on success. 0 with one error line when a list is not initialised (nothing is deleted then) or cannot be
 *         deleted.
 */
EDID_COMPOSER_API u8 edid_destroy(edid_t *edid);
/** @} */

/** @defgroup platform_values Platform values
 * @{ */

/**
 * Everything that the platform configuration says about the EDID to compose.
 *
 * @ref compose_edid reads one from the configuration tree for each composition. A host that has other sources fills one
 * itself, once prepared by @ref platform_values_init, and hands it to @ref compose_edid_internal. Ranges are those that
 * the configuration allows; "tri-state" is 0 off, 1 on, 2 as the downstream sink. Must not be copied or moved while
 * initialised (see @ref linked_list).
 */
typedef struct platform_values_t {
  ll_list_t audio_list;        /**< Platform audio formats: list of "int" (@ref i32), each a short audio descriptor with
                                    its byte 1 in bits 0-7, byte 2 in bits 8-15, byte 3 in bits 16-23. */
  ll_list_t video_50_priority; /**< Modes to offer on a 50 Hz sink, best first: list of @ref short_video_desc_t. */
  ll_list_t video_50_additional;    /**< Modes that a 50 Hz sink counts as able to show, whatever its EDID says. */
  ll_list_t video_60_priority;      /**< Modes to offer on a 60 Hz sink, best first. */
  ll_list_t video_60_additional;    /**< Modes that a 60 Hz sink counts as able to show, whatever its EDID says. */
  i32 modes_4k_x_2k_priority[7];    /**< HDMI_VICs to offer, best first, 1 to 4 each; the first 0 ends the list. */
  i32 modes_4k_x_2k_addition[7];    /**< HDMI_VICs that the sink counts as able to show; the first 0 ends the list. */
  i32 native_refresh_rate;          /**< Refresh family if the sink's EDID shows none: 50 or 60. */
  i32 current_mode_set_to_priority; /**< 1: put the current output mode first. */
  i32 geometry_limit;               /**< 1: drop modes taller than the sink's tallest short video descriptor. */
  i32 audio_pass_through;           /**< 0 platform formats, 1 platform and sink formats, 2 sink formats. */
  i32 underscan;                    /**< 1: declare that IT formats are underscanned. */
  i32 is_tv;                        /**< 1: the platform is the root of the CEC tree. */
  i32 dc_30bit;                     /**< 1: offer 30-bit deep colour (36-bit is then offered too). */
  i32 dc_36bit;                     /**< 1: offer 36-bit deep colour. */
  i32 tmds_override;         /**< Maximum TMDS clock, MHz, from 25 to 1275; 0 to compute it; 1 to 24 to compute and
                                  declare it always. */
  i32 supports_ai;           /**< ACP, ISRC1 and ISRC2 packets, tri-state. */
  i32 speaker_entry;         /**< Speaker allocation bits (CEA-861, section 7.5.3), 1 to 2047. */
  i32 xvYCC601;              /**< xvYCC601 colorimetry, tri-state. */
  i32 xvYCC709;              /**< xvYCC709 colorimetry, tri-state. */
  i32 native_bit;            /**< 1: the encoder sets the native bit of the first short video descriptor and of those
                                  marked native. */
  u32 product_id;            /**< Product code, 0 to 65535. */
  u32 serial;                /**< Serial number. */
  u32 week;                  /**< Week of manufacture, 0 to 53; 255 for a model year. */
  u32 year;                  /**< Year of manufacture, 1990 to 2100. */
  u32 cnc0;                  /**< Content type graphics, tri-state. */
  u32 cnc1;                  /**< Content type photo, tri-state. */
  u32 cnc2;                  /**< Content type cinema, tri-state. */
  u32 cnc3;                  /**< Content type game, tri-state. */
  char manufacturer_id[4];   /**< Three-letter manufacturer ID and NUL. */
  char monitor_name[14];     /**< Monitor name, up to 13 characters and NUL. Empty, one character or a leading blank:
                                  no name descriptor. */
  char monitor_serial[14];   /**< Serial number text, up to 13 characters and NUL; rules as for the name. */
  u32 established_timings_1; /**< Established timings I, bits 0 to 7. 640x480 at 60 Hz is always added. */
  u32 established_timings_2; /**< Established timings II, bits 0 to 7. */
  u32 manufacturer_timings;  /**< Manufacturer's reserved timings, bits 0 to 7. */
  ll_list_t std_timings;     /**< Standard timings to offer: list of @ref std_timing_t; the first 8 are encoded. */
} platform_values_t;

/**
 * Clears a record and initialises its six lists.
 *
 * @param values the record, with any content; lists that it still holds are lost.
 * @return true on success; false with a bug line of module `utility` that names the first list that failed.
 */
EDID_COMPOSER_API bool platform_values_init(platform_values_t *values);

/**
 * Releases the six lists of an initialised record, once.
 *
 * @return true on success; false with a bug line that names the first list that could not be deleted. The lists after
 * it then keep their entries.
 */
EDID_COMPOSER_API bool platform_values_destroy(platform_values_t *values);

/**
 * Traces the name of a configuration node, as "label:Name of node is:name". Prints nothing while tracing is off.
 *
 * @param node a node handle of the host's configuration tree.
 * @param label NUL-terminated text.
 */
EDID_COMPOSER_API void print_platform_node(u32 node, const char *label);
/** @} */

/** @defgroup hdmi2 What HDMI 2 adds
 *
 * What HDMI 1.4 has no words for: VICs above 64, YCbCr 4:2:0, HDR, wide colour, rates above 340 MHz, ALLM and VRR. It
 * has records of its own beside @ref edid_t, plain ones: no lists, no pointers, free to be copied and moved.
 *
 * A composition uses it only when it is asked for twice: by @ref compose_edid_request, and by `enable`, either of the
 * configuration's table `hdmi2` or of @ref compose_request_t::hdmi2.
 *
 * "HDMI 2.1" is the High-Definition Multimedia Interface Specification of that version, which has all of HDMI 2.0;
 * "CTA-861" is CTA-861-G and later, which CEA-861 became.
 * @{ */

/** Most short video descriptors that are kept of a sink: 8 extensions of 123 bytes, headers of data blocks aside. */
#define HDMI2_MOST_SVDS 952
/** Most payload bytes of a data block (CTA-861, section 7.5). */
#define HDMI2_MOST_BLOCK_BYTES 31

/** A data block as it stands in a sink's EDID, which is passed on byte for byte. */
typedef struct hdmi2_block_t {
  u8 length; /**< Payload bytes, extended tag and OUI included; 0: the sink has no such block. */
  u8 payload[HDMI2_MOST_BLOCK_BYTES]; /**< The bytes after the header byte; 0 after the first length of them. */
} hdmi2_block_t;

/** Bits of @ref hdmi2_t::eotfs (CTA-861, section 7.5.13). */
enum hdmi2_eotf {
  HDMI2_EOTF_SDR = 0x01,   /**< Traditional gamma, standard dynamic range. */
  HDMI2_EOTF_GAMMA = 0x02, /**< Traditional gamma, high dynamic range. */
  HDMI2_EOTF_PQ = 0x04,    /**< SMPTE ST 2084, of HDR10. */
  HDMI2_EOTF_HLG = 0x08    /**< Hybrid log-gamma. */
};

/** Bits of @ref hdmi2_t::colorimetry (CTA-861, section 7.5.5). */
enum hdmi2_colorimetry {
  HDMI2_XVYCC601 = 0x01,    /**< xvYCC601. */
  HDMI2_XVYCC709 = 0x02,    /**< xvYCC709. */
  HDMI2_SYCC601 = 0x04,     /**< sYCC601. */
  HDMI2_OPYCC601 = 0x08,    /**< opYCC601. */
  HDMI2_OPRGB = 0x10,       /**< opRGB. */
  HDMI2_BT2020_CYCC = 0x20, /**< BT.2020, constant luminance. */
  HDMI2_BT2020_YCC = 0x40,  /**< BT.2020, YCbCr. */
  HDMI2_BT2020_RGB = 0x80   /**< BT.2020, RGB. */
};

/**
 * What the data blocks of all CTA-861 extensions of an EDID say of HDMI 2.
 *
 * Filled by @ref decode_hdmi2. Where a block comes more than once, the first that is long enough counts. Offsets below
 * are bytes of the block, counted from its header byte.
 */
typedef struct hdmi2_t {
  u32 size;                 /**< sizeof(hdmi2_t) of the caller; see @ref decode_hdmi2. */
  u32 svd_count;            /**< Short video descriptors of all video data blocks. */
  u8 svds[HDMI2_MOST_SVDS]; /**< Their bytes as stored, in block order; see @ref y420_map. */
  /* HDMI Forum vendor-specific data block or, without one, sink capability data structure (HDMI 2.1) */
  u8 forum_present;  /**< 1 when the sink has one of at least 7 payload bytes. */
  u8 forum_version;  /**< Its version (byte 4); 1. */
  u32 max_tmds_rate; /**< Maximum TMDS character rate, MHz, a multiple of 5; 0: at most 340 (byte 5). */
  u8 scdc;           /**< 1 when the status and control data channel is present (byte 6, bit 7). */
  u8 read_request;   /**< 1 when it can ask to be read (byte 6, bit 6). */
  u8 scramble_low;   /**< 1 when it takes scrambling at or below 340 MHz too (byte 6, bit 3). */
  u8 frl_rate;       /**< Maximum fixed rate link code, 0 to 15 (byte 7, bits 7 to 4). */
  u8 uhd_vic;        /**< 1 when it takes the VICs of the modes that have an HDMI_VIC (byte 7, bit 3). */
  u8 dc_48bit_420;   /**< 1 when it takes 48-bit deep colour in YCbCr 4:2:0 (byte 7, bit 2). */
  u8 dc_36bit_420;   /**< 1 when it takes 36-bit deep colour in YCbCr 4:2:0 (byte 7, bit 1). */
  u8 dc_30bit_420;   /**< 1 when it takes 30-bit deep colour in YCbCr 4:2:0 (byte 7, bit 0). */
  u8 allm_present;   /**< 1 when byte 8 is there, as it is where bytes 9 and 10 are. */
  u8 allm;           /**< 1 when it takes the auto low-latency mode (byte 8, bit 1). */
  u8 vrr_present;    /**< 1 when bytes 9 and 10 are there. */
  u8 vrr_min;        /**< Lowest variable refresh rate, Hz, 0 to 63; 0: no VRR (byte 9, bits 5 to 0). */
  u32 vrr_max;       /**< Highest variable refresh rate, Hz, 0 to 1023; 0: none said (bytes 9 and 10). */
  /* Video capability data block (CTA-861, section 7.5.6) */
  u8 video_capability_present; /**< 1 when the sink has one of at least 2 payload bytes. */
  u8 ycc_quantization;         /**< 1 when the YCC quantization range is selectable (byte 2, bit 7). */
  u8 rgb_quantization;         /**< 1 when the RGB quantization range is selectable (byte 2, bit 6). */
  u8 preferred_scan;           /**< S_PT, behaviour for the preferred timing, 0 to 3 (byte 2, bits 5 and 4). */
  u8 it_scan;                  /**< S_IT, behaviour for IT formats, 0 to 3 (byte 2, bits 3 and 2). */
  u8 ce_scan;                  /**< S_CE, behaviour for CE formats, 0 to 3 (byte 2, bits 1 and 0). */
  /* Colorimetry data block (CTA-861, section 7.5.5) */
  u8 colorimetry_present; /**< 1 when the sink has one of at least 3 payload bytes. */
  u8 colorimetry;         /**< Mask of @ref hdmi2_colorimetry (byte 2). */
  u8 gamut_metadata;      /**< Gamut metadata profiles and what else stands there, as stored (byte 3). */
  /* HDR static metadata data block (CTA-861, section 7.5.13) */
  u8 hdr_static_present; /**< 1 when the sink has one of at least 3 payload bytes. */
  u8 eotfs;              /**< Mask of @ref hdmi2_eotf, as stored (byte 2). */
  u8 metadata_types;     /**< Static metadata descriptors, bit 0 for type 1, as stored (byte 3). */
  u8 luminance_count;    /**< How many of the following three are there, 0 to 3 (bytes 4 to 6). */
  u8 luminance[3];       /**< Codes of desired maximum, maximum frame-average and minimum luminance, as stored:
                              50 x 2^(n / 32) cd/m2; the minimum is maximum x (n / 255)^2 / 100. */
  /* YCbCr 4:2:0 (CTA-861, sections 7.5.10 and 7.5.11) */
  u8 y420_count; /**< Modes of the 4:2:0 video data block: those that are taken in 4:2:0 only. */
  u8 y420_vics[HDMI2_MOST_BLOCK_BYTES - 1]; /**< Their short video descriptors, as stored. */
  u8 y420_map_present;                      /**< 1 when the sink has a 4:2:0 capability map data block. */
  u8 y420_map_bytes; /**< Bytes of the map; 0: the block is there without one, and marks every descriptor. */
  u8 y420_map[HDMI2_MOST_BLOCK_BYTES - 1]; /**< Bit i mod 8 of byte i / 8: @ref svds [i] is taken in 4:2:0 too. Bits
                                                beyond @ref svd_count are 0. */
  /* Blocks that can be passed on */
  hdmi2_block_t hdr_dynamic;  /**< HDR dynamic metadata data block (CTA-861, section 7.5.14), at least 4 bytes. */
  hdmi2_block_t hdr10plus;    /**< Vendor-specific video data block of HDR10+, at least 5 bytes. */
  hdmi2_block_t dolby_vision; /**< Vendor-specific video data block of Dolby Vision, at least 9 bytes. */
  hdmi2_block_t freesync;     /**< Vendor-specific data block of FreeSync, at least 8 bytes. */
} hdmi2_t;

/** Most entries of a list of @ref hdmi2_values_t. */
#define HDMI2_MOST_LISTED_VICS 31

/**
 * What a platform says of HDMI 2: the keys of the configuration's table `hdmi2`, which have the same names.
 *
 * A host that has other sources than the configuration prepares one with @ref hdmi2_values_init, fills it and hands it
 * over as @ref compose_request_t::hdmi2. "Tri-state" is 0 never, 1 always (the box does it itself), 2 as the sink,
 * which without a sink is never. A value outside of its limits counts as the nearest limit, and a warning says so.
 */
typedef struct hdmi2_values_t {
  u32 size;                                      /**< sizeof(hdmi2_values_t) of the caller. */
  i32 enable;                                    /**< 1: compose with HDMI 2. 0: the other members have no effect. */
  i32 vic_priority_list[HDMI2_MOST_LISTED_VICS]; /**< Modes that may be offered, best first: VICs from 65 to 127 and
                                                      from 193 to 219; the first 0 ends the list. */
  i32 vic_addition_list[HDMI2_MOST_LISTED_VICS]; /**< Modes that the box makes itself, whatever the sink takes; the
                                                    first 0 ends the list. */
  i32 tmds_limit;         /**< TMDS character rate that the box's receiver takes, MHz, 165 to 600. */
  i32 preferred_extended; /**< 1: the first mode above VIC 64 becomes the first detailed timing. */
  i32 scdc;               /**< 1: the receiver has the status and control data channel at any rate. */
  i32 read_request;       /**< 1: the receiver can ask to be read. */
  i32 scramble_low;       /**< 1: the receiver takes scrambling at or below 340 MHz. */
  i32 y420;               /**< YCbCr 4:2:0, tri-state. */
  i32 dc_30bit_420;       /**< 30-bit deep colour in 4:2:0, tri-state. */
  i32 dc_36bit_420;       /**< 36-bit deep colour in 4:2:0, tri-state. */
  i32 deep_color;         /**< 2: offer deep colour only where the sink has it too; 0: as the platform values say. */
  i32 uhd_vic;            /**< 1: say that the VICs of the modes that have an HDMI_VIC are taken. */
  i32 allm;               /**< Auto low-latency mode, tri-state. */
  i32 vrr;                /**< Variable refresh rate, tri-state. */
  i32 vrr_min;            /**< Lowest variable refresh rate, Hz, 1 to 48. */
  i32 vrr_max;            /**< Highest variable refresh rate, Hz, 0 to 1023; 0: none said. */
  i32 hdr_gamma;          /**< HDR with traditional gamma, tri-state. */
  i32 hdr_pq;             /**< HDR with PQ (SMPTE ST 2084), tri-state. */
  i32 hdr_hlg;            /**< HDR with hybrid log-gamma, tri-state. */
  i32 hdr_luminance;      /**< Luminance: 0 none, 1 the three members below, 2 the sink's. */
  i32 hdr_max;            /**< Desired maximum luminance, as coded in @ref hdmi2_t::luminance, 0 to 255. */
  i32 hdr_average;        /**< Desired maximum frame-average luminance, likewise. */
  i32 hdr_min;            /**< Desired minimum luminance, likewise. */
  i32 bt2020_rgb;         /**< BT.2020 RGB, tri-state. */
  i32 bt2020_ycc;         /**< BT.2020 YCbCr, tri-state. */
  i32 bt2020_cycc;        /**< BT.2020 with constant luminance, tri-state. */
  i32 rgb_quantization;   /**< Selectable RGB quantization range, tri-state. */
  i32 ycc_quantization;   /**< Selectable YCC quantization range, tri-state. */
  i32 pass_hdr_dynamic;   /**< 1: pass on the sink's HDR dynamic metadata data block. */
  i32 pass_hdr10plus;     /**< 1: pass on the sink's HDR10+ block. */
  i32 pass_dolby_vision;  /**< 1: pass on the sink's Dolby Vision block. */
  i32 pass_freesync;      /**< 1: pass on the sink's FreeSync block. */
} hdmi2_values_t;

/**
 * Fills a record with the defaults that the configuration's keys have (@ref configuration_key): nothing is offered.
 *
 * @param values its size is set by the caller; the other members receive their defaults.
 * @return true; false with an error line when @p values is NULL or its size is too small for the record's first
 * version.
 */
EDID_COMPOSER_API bool hdmi2_values_init(hdmi2_values_t *values);

/**
 * Decodes what the CTA-861 extensions of a whole EDID say of HDMI 2.
 *
 * Extensions count that the base block announces and that are there: those of tag 2, revision 3, a right checksum and a
 * timing offset of at most 127, the first 8 of them. Others are passed over without a line. A warning is given for a
 * data block that ends after its collection, which ends the reading of that extension; for a block that is too short,
 * which counts as none; and for bits of a 4:2:0 map that no descriptor belongs to, which are cleared. What
 * @ref decode_edid_extensions reports is not reported again.
 *
 * @param edid the EDID, of which @p edid_bytes bytes are read.
 * @param edid_bytes its size, bytes; a multiple of 128 other than 0.
 * @param hdmi2 its size is set by the caller; the other members are cleared, then filled. A record that is larger than
 *        this version's keeps what it has after that, and its size becomes this version's.
 * @return true; false with an error line for a NULL argument, a record or an EDID of another size, or a base block with
 *         a wrong header, checksum or version. The record, if there is one, then says that the EDID has none of it.
 */
EDID_COMPOSER_API bool decode_hdmi2(const u8 *edid, u32 edid_bytes, hdmi2_t *hdmi2);

/**
 * Encodes a record as data blocks, one after the other: video data blocks of up to 31 descriptors, then the others in
 * the order of the record's members. What @ref decode_hdmi2 has read of an EDID comes back when it reads these blocks.
 *
 * @param hdmi2 the record. A number that is too large for its field is written as the largest that it holds, a rate
 * that is no multiple of 5 MHz as the next lower one; a block to be passed on that is too short is left out.
 * @param blocks receives the data blocks; not NULL.
 * @param size its size, bytes; an extension has room for 123, for 105 beside a detailed timing.
 * @param used receives the bytes that all blocks need, also when they are more than @p size; not NULL.
 * @return true when all blocks were written; false with an error line, and nothing written, for a NULL argument or too
 *         little room.
 */
EDID_COMPOSER_API bool encode_hdmi2(const hdmi2_t *hdmi2, u8 *blocks, u32 size, u32 *used);

/**
 * Prints a record as a report on standard output: every field in words, values with units; "none" for each block that
 * the EDID doesn't have. Bits without a name are printed by their number.
 *
 * @param hdmi2 the record.
 * @param title first line, NUL-terminated; NULL prints as an empty one.
 * @return true; false with an error line when @p hdmi2 is NULL or its size too small.
 */
EDID_COMPOSER_API bool print_hdmi2(const hdmi2_t *hdmi2, const char *title);

/** Name of a VIC above 64 (CTA-861, section 4), such as "3840x2160p60Hz16x9"; "Unknown Value" for any but 65 to 127 and
 *  193 to 219. */
EDID_COMPOSER_API const char *extended_vic_string(u32 vic);
/** @} */

/** @defgroup configuration What is read of the platform configuration
 *
 * The library's keys as data, and a record of what each composition reads of them: what counts, what was replaced or
 * passed over, and why. A tool that checks configurations needs neither a list of keys of its own nor the library's
 * lines.
 * @{ */

/** What a key holds; @ref configuration_key_t::kind. */
enum configuration_kind {
  CONFIGURATION_INTEGER = 1,          /**< An integer, compared as a signed one. */
  CONFIGURATION_UNSIGNED = 2,         /**< An integer, compared as an unsigned one: -1 is larger than any limit. */
  CONFIGURATION_TEXT = 3,             /**< A text. */
  CONFIGURATION_VIDEO_MODES = 4,      /**< A list of texts: a VIC and up to three 3D structures, as in "16 FP TBH". */
  CONFIGURATION_HDMI_VICS = 5,        /**< A list of integers: HDMI_VICs (HDMI 1.4a, section 8.2.3.1). */
  CONFIGURATION_TIMING_BITS = 6,      /**< A list of integers: bit numbers of a byte of timings. */
  CONFIGURATION_STANDARD_TIMINGS = 7, /**< A list of texts: width, height and refresh rate, as in "1280 720 60". */
  CONFIGURATION_AUDIO_FORMATS = 8,    /**< 26 keys with an integer each: "a" to "z" in the place of the path's "?". */
  CONFIGURATION_EXTENDED_VICS = 9     /**< A list of integers: VICs from 65 to 127 and from 193 to 219. */
};

/**
 * A key of the platform configuration. Members that do not apply to its kind are 0 or an empty text.
 *
 * A missing number or text has its default, a missing list is empty, and missing audio formats are none.
 */
typedef struct configuration_key_t {
  u32 size;         /**< Bytes of the record that the library fills. A later version may append members. */
  u32 kind;         /**< @ref configuration_kind. */
  const char *path; /**< The whole path, as the `config_*` operations are asked for it. */
  const char *name; /**< Its end, after "platform.software.drivers.vorex.edid.". */
  u32 minimum; /**< Smallest number: of an integer, which becomes this one where it is smaller; of an entry, which is
                    passed over where it is: a VIC, an HDMI_VIC, a bit, a refresh rate in Hz. Of a text: fewest
                    characters that have an effect. */
  u32 maximum; /**< Largest number, likewise. Of a text: most characters; those after them are not read. */
  u32 default_number;       /**< Of an integer. */
  const char *default_text; /**< Of a text. */
  u32 entry_characters;     /**< Of a list of texts: most characters of an entry; those after them are not read. */
  u32 most_entries;    /**< Of a list and of the audio formats: entries after so many have no effect. 0: no limit. */
  const char *meaning; /**< What it does, in a sentence or two. */
} configuration_key_t;

/**
 * The key at a position, in the order in which keys are read.
 *
 * @param index 0 for the first key.
 * @return the key, static; NULL after the last one.
 */
EDID_COMPOSER_API const configuration_key_t *configuration_key(u32 index);

/** What became of a key or of an entry; @ref configuration_reading_t::reason. */
enum configuration_reason {
  CONFIGURATION_TAKEN = 1,     /**< Taken as it is. */
  CONFIGURATION_ABSENT = 2,    /**< Nothing of its kind is there: a number or text has its default, a list is empty. */
  CONFIGURATION_TOO_SMALL = 3, /**< A number below the smallest, which is taken. */
  CONFIGURATION_TOO_LARGE = 4, /**< A number above the largest, which is taken. */
  CONFIGURATION_WITHOUT_MEANING = 5,      /**< A number within the limits that has no meaning: another one is taken. */
  CONFIGURATION_EMPTY = 6,                /**< A list of video modes of which no entry counts. */
  CONFIGURATION_WRONG_KIND = 7,           /**< Entry passed over: an integer among texts, or the reverse. */
  CONFIGURATION_OUT_OF_RANGE = 8,         /**< Entry passed over: its number is outside of the limits. */
  CONFIGURATION_NOT_A_NUMBER = 9,         /**< Entry passed over: a video mode that does not begin with a number. */
  CONFIGURATION_3D_UNKNOWN = 10,          /**< Entry passed over: a word that is neither FP nor SBSH nor TBH. */
  CONFIGURATION_NO_ROOM = 11,             /**< Entry passed over: @ref configuration_key_t::most_entries are there. */
  CONFIGURATION_WIDTH_NOT_IN_EIGHTS = 12, /**< Entry passed over: the width is no multiple of 8. */
  CONFIGURATION_WIDTH_NOT_ENCODABLE = 13, /**< Entry taken, but it has no byte for its width: sources read another. */
  CONFIGURATION_HEIGHT_UNKNOWN = 14,      /**< Entry passed over: no aspect ratio has this height at its width. */
  CONFIGURATION_RATE_ROUNDED_UP = 15,     /**< Entry taken, its refresh rate without the fraction and one higher. */
  CONFIGURATION_OUT_OF_MEMORY = 16        /**< Entry passed over: no list entry could be had. */
};

/** What was read of a key or of an entry. Its texts are valid until the observer returns. */
typedef struct configuration_reading_t {
  u32 size;   /**< Bytes of the record that the library fills. A later version may append members. */
  u32 reason; /**< What became of it; @ref configuration_reason. */
  const configuration_key_t *key; /**< The key, static. */
  i32 entry; /**< Which entry: its place in the host's list, from 0; of an audio format its letter, 0 for "a".
                  -1: the key itself, of a list after its entries. */
  i32 place; /**< Place, from 0, among the entries that count; -1 for one that was passed over, and for a key. Where
                  @ref compose_decision_t::priority_index and addition_index point. */
  const char *node; /**< Name of an entry's node in the host's tree; empty for an audio format and for a key. */
  const char *text; /**< A text as it counts, a list's text as it was read; else empty. */
  i32 found; /**< The number that is there, or for which an entry was replaced or passed over: width, height, refresh
                rate or VIC; 0 where there is none. Of a list: its entries. Unsigned numbers keep their bits. */
  i32 used;  /**< The number that counts; 0 for an entry that was passed over. Of a list: its entries that count. */
} configuration_reading_t;

/**
 * Receives what was read.
 *
 * Called on the thread that composes: once for each key that is read, and before a list's key for each of its entries.
 * Passed over are audio formats that are absent, and, where HDMI 2 is off, the keys of its table but `enable`.
 *
 * @param reading the record; it is gone when the call returns.
 * @param context @ref compose_request_t::configuration_observer_context.
 */
typedef void (*configuration_observer_t)(const configuration_reading_t *reading, void *context);

/** @return the reason in words, such as "outside of its limits"; "unknown" for any other number. Static. */
EDID_COMPOSER_API const char *configuration_reason_string(u32 reason);
/** @} */

/** @defgroup composing Composing an EDID
 * @{ */

/** The caller's settings of one composition; only read, but for the byte at @ref compose_cfg_t::spa_offset. */
typedef struct compose_cfg_t {
  video_mode_t hdmi_current_mode; /**< The mode the platform puts out now. Used when the platform's
                                       current_mode_set_to_priority is 1 and the mode is plausible: height 100 to 8000,
                                       width 400 to 16000, refresh 20 to 1000, interlaced 0 or 1. */
  u32 audio_mask;        /**< Audio formats that may be offered: types 1 to 14 are bits 0 to 13; types 16, 17, 18 are
                              bits 14, 15, 16. All ones: every format. */
  u32 audio_sink_filter; /**< Exactly 1: offer only audio formats that the sink supports too. */
  i32 hdmi_3d_mode;      /**< 2: always offer 3D; 1: as the sink; anything else: never. */
  u32 edid_latency[4]; /**< The platform's own video, audio, interlaced video and interlaced audio latency, ms; added to
                            the sink's. Only the low 16 bits count: 65636 is 100. Above 500 (as
                            counted): declared as no valid latency. */
  u8 *spa_offset;      /**< Receives the offset, within the 256 bytes, of the two bytes of the physical address, so that
                            a host can patch it for each input. May be NULL. */
  u32 port; /**< Number of the platform's input, from 0 to 14. The physical address holds port + 1 in 4 bits; of a
                 larger one, which is not refused, the low 4 bits of port + 1 are written: port 15 gives
                 the place 0, port 16 the place 1. */
} compose_cfg_t;

/**
 * Composes the EDID that the platform shows on its input.
 *
 * Reads the platform configuration through the host's `config_*` operations. A sink EDID that is missing or malformed
 * is reported, not refused: the composition goes on with what could be decoded.
 *
 * Prints errors and warnings of the modules `edid_composer`, `edid_decode_encode` and `utility`, and, while tracing is
 * on, every decision and both EDIDs in
 * hexadecimal.
 *
 * @param edid_block the sink's EDID, or NULL when there is none. Its first @p edid_bytes bytes are read.
 * @param edid_bytes its size in bytes; a multiple of 128 other than 0, else the sink's EDID is left out. Block 1 is
 *        decoded as CEA-861 extension when the base block announces one.
 * @param new_edid_block the caller's buffer for the new EDID. It may be the buffer of @p edid_block.
 * @param new_edid_bytes its size in bytes; 256.
 * @param cfg the settings; not NULL.
 * @return true when the new EDID was written: base block and CEA-861 extension, 256 bytes. On false the buffer's
 * content is undefined, but nothing outside of it was written.
 */
EDID_COMPOSER_API bool compose_edid(const u8 *edid_block, u32 edid_bytes, u8 *new_edid_block, u32 new_edid_bytes,
                                    const compose_cfg_t *cfg);

/**
 * As @ref compose_edid, with platform values that the caller has at hand.
 *
 * @param edid_block as for @ref compose_edid.
 * @param edid_bytes as for @ref compose_edid.
 * @param new_edid_block as for @ref compose_edid.
 * @param new_edid_bytes as for @ref compose_edid.
 * @param cfg as for @ref compose_edid.
 * @param platform_values an initialised record, which is only read and stays the caller's: several threads may compose
 *        from one. No configuration is read then. NULL: the configuration is read.
 * @return as for @ref compose_edid; false also when @p platform_values is not initialised.
 */
EDID_COMPOSER_API bool compose_edid_internal(const u8 *edid_block, u32 edid_bytes, u8 *new_edid_block,
                                             u32 new_edid_bytes, const compose_cfg_t *cfg,
                                             const platform_values_t *platform_values);
/** @} */

/** @defgroup explaining Why an EDID offers what it offers
 *
 * A composition can be observed: @ref compose_edid_request reports, for everything that could have been in the new
 * EDID, whether it is there, and why. Each candidate gets exactly one record: each VIC that the sink, a priority list
 * or an addition list names, each 4Kx2K mode, each audio format of the platform and of the sink; and so does each of
 * the derived values that @ref compose_subject lists. A record says what became of its candidate in the bytes that were
 * written, also where the encoder had to leave out what the stages before it had chosen. When
 * @ref COMPOSE_SUBJECT_EXTENSION_ROOM says that a data block is too long, sources misread what follows
 * it.
 * @{ */

/** What a decision is about; @ref compose_decision_t::subject. It says what @ref compose_decision_t::code is. */
enum compose_subject {
  /** A video mode; code: its VIC (CEA-861, section 4). */
  COMPOSE_SUBJECT_VIDEO_MODE = 1,
  /** A detailed or standard timing of the sink that has no VIC; code: 0. */
  COMPOSE_SUBJECT_SINK_TIMING = 2,
  /** A 4Kx2K mode; code: its HDMI_VIC (HDMI 1.4a, section 8.2.3.1). */
  COMPOSE_SUBJECT_4K_MODE = 3,
  /** An audio format; code: @ref short_audio_desc_t::type, 0 for none. */
  COMPOSE_SUBJECT_AUDIO_FORMAT = 4,
  /** The refresh family, whose lists are used; code: 50 or 60. */
  COMPOSE_SUBJECT_NATIVE_RATE = 5,
  /** The height that modes may have; code: lines; 0 without a limit, or without a short video descriptor. */
  COMPOSE_SUBJECT_GEOMETRY_LIMIT = 6,
  /** The mode that the platform puts out now; code: its VIC, 0 when unused. */
  COMPOSE_SUBJECT_CURRENT_MODE = 7,
  /** The CEC physical address; code: 0x1230 for 1.2.3.0. */
  COMPOSE_SUBJECT_PHYSICAL_ADDRESS = 8,
  /** A colour depth; code: bits per pixel, 30, 36 or 48. */
  COMPOSE_SUBJECT_DEEP_COLOR = 9,
  /** The maximum TMDS clock; code: MHz, 0 when it is not declared. */
  COMPOSE_SUBJECT_TMDS_CLOCK = 10,
  /** A latency; code: 0 video, 1 audio, 2 interlaced video, 3 interlaced audio. */
  COMPOSE_SUBJECT_LATENCY = 11,
  /** Whether 3D is offered; code: 1 or 0. */
  COMPOSE_SUBJECT_3D = 12,
  /** Modes added to reach the fewest an EDID has; code: how many. */
  COMPOSE_SUBJECT_PADDING = 13,
  /** Room in the CEA extension; code: bytes needed before the checksum. */
  COMPOSE_SUBJECT_EXTENSION_ROOM = 14,
  /* HDMI 2, where the composition has it */
  /** A mode above VIC 64; code: its VIC (CTA-861, section 4). */
  COMPOSE_SUBJECT_EXTENDED_MODE = 15,
  /** The rate of the link to the box, told above 340 MHz; code: MHz. */
  COMPOSE_SUBJECT_LINK_RATE = 16,
  /** A transfer function of HDR; code: its bit of @ref hdmi2_eotf. */
  COMPOSE_SUBJECT_HDR = 17,
  /** A colour space; code: its bit of @ref hdmi2_colorimetry. */
  COMPOSE_SUBJECT_COLORIMETRY = 18,
  /** YCbCr 4:2:0; code: how many modes may be sent in it. */
  COMPOSE_SUBJECT_YCBCR_420 = 19,
  /** A colour depth in 4:2:0; code: bits per pixel, 30 or 36. */
  COMPOSE_SUBJECT_DEEP_COLOR_420 = 20,
  /** The auto low-latency mode; code: 1 or 0. */
  COMPOSE_SUBJECT_ALLM = 21,
  /** The variable refresh rate; code: its lowest rate in Hz, 0 when it is not offered. */
  COMPOSE_SUBJECT_VRR = 22,
  /** A quantization range that sources may select; code: 0 of RGB, 1 of YCbCr. */
  COMPOSE_SUBJECT_QUANTIZATION = 23,
  /** A block of the sink that can be passed on; code: @ref compose_room_item of it, 1 to 4. */
  COMPOSE_SUBJECT_PASSED_BLOCK = 24,
  /** That the VICs of 4Kx2K modes are taken as well as their HDMI_VICs; code: 1 or 0. */
  COMPOSE_SUBJECT_UHD_VIC = 25,
  /** A mode above VIC 64 as first detailed timing; code: its VIC, 0 for none. */
  COMPOSE_SUBJECT_PREFERRED_TIMING = 26,
  /** Something that was left out for room; code: @ref compose_room_item. None when everything has room. */
  COMPOSE_SUBJECT_ROOM_ITEM = 27
};

/** What is left out for room, in this order, until the rest fits. */
enum compose_room_item {
  COMPOSE_ROOM_FREESYNC = 1,       /**< The FreeSync block. */
  COMPOSE_ROOM_HDR_DYNAMIC = 2,    /**< The HDR dynamic metadata data block. */
  COMPOSE_ROOM_HDR10PLUS = 3,      /**< The HDR10+ block. */
  COMPOSE_ROOM_DOLBY_VISION = 4,   /**< The Dolby Vision block. */
  COMPOSE_ROOM_3D_STRUCTURES = 5,  /**< 3D structures beyond the mandatory ones, all of them. */
  COMPOSE_ROOM_MODES = 6,          /**< Modes up to VIC 64, from the last on. */
  COMPOSE_ROOM_MODES_IN_420 = 7,   /**< Modes that are offered in 4:2:0 only, from the last on. */
  COMPOSE_ROOM_EXTENDED_MODES = 8, /**< Other modes above VIC 64, from the last on. */
  COMPOSE_ROOM_SERIAL_TEXT = 9     /**< The serial number text, which comes after all of these. */
};

/** What was decided; @ref compose_decision_t::verdict. */
enum compose_verdict {
  /** In the new EDID, as named; of modes, 3D structures aside. A derived value: as asked for. */
  COMPOSE_VERDICT_OFFERED = 1,
  /** Not in the new EDID. A derived value: not declared, or not in force. */
  COMPOSE_VERDICT_LEFT_OUT = 2,
  /** In the new EDID, but not as it was named or asked for. */
  COMPOSE_VERDICT_CHANGED = 3
};

/**
 * Why; @ref compose_decision_t::reason. The numbers in braces explain it; they lie, in this order, in
 * @ref compose_decision_t::value. @ref compose_reason_string has the reason in words.
 */
enum compose_reason {
  /** The priority list names it and the sink has it. */
  COMPOSE_REASON_SINK_HAS_IT = 1,
  /** The priority list names it and the addition list has it. */
  COMPOSE_REASON_PLATFORM_ADDS_IT = 2,
  /** The platform puts it out now. */
  COMPOSE_REASON_IS_CURRENT_MODE = 3,
  /** Stands in for modes that are missing. */
  COMPOSE_REASON_PADS_THE_LIST = 4,
  /** The sink or the addition list has it, the priority list doesn't. */
  COMPOSE_REASON_NOT_IN_PRIORITY_LIST = 5,
  /** Neither the sink nor the addition list has it. */
  COMPOSE_REASON_NOT_AVAILABLE = 6,
  /** Only lists of the other family name it {family in use}. */
  COMPOSE_REASON_OTHER_REFRESH_FAMILY = 7,
  /** Above the geometry limit {lines of the mode, limit}. */
  COMPOSE_REASON_TALLER_THAN_SINK = 8,
  /** Chosen, but the extension holds no more of its kind {descriptors of its kind there; of what HDMI 2 leaves out for
   *  room: how many}. */
  COMPOSE_REASON_NO_ROOM = 9,
  /** No VIC has it {active pixels, active lines of a frame or 0, Hz, 1 interlaced}. */
  COMPOSE_REASON_TIMING_WITHOUT_VIC = 10,
  /** The platform has it {channels}. */
  COMPOSE_REASON_PLATFORM_FORMAT = 11,
  /** Passed through from the sink {channels}. */
  COMPOSE_REASON_SINK_FORMAT = 12,
  /** Narrowed to what the sink takes {channels asked for, channels left, sample rates asked for, sample rates left}. */
  COMPOSE_REASON_NARROWED_TO_SINK = 13,
  /** Basic audio, added as no format has it {channels}. */
  COMPOSE_REASON_BASIC_AUDIO = 14,
  /** The platform's entry can't be decoded {its value}. */
  COMPOSE_REASON_NOT_AN_AUDIO_FORMAT = 15,
  /** Audio pass-through takes the sink's formats only {pass-through}. */
  COMPOSE_REASON_SINK_FORMATS_ONLY = 16,
  /** Audio pass-through takes the platform's formats only {pass-through}. */
  COMPOSE_REASON_PLATFORM_FORMATS_ONLY = 17,
  /** The sink has no format like it {channels}. */
  COMPOSE_REASON_NOT_IN_SINK = 18,
  /** A format before it covers it {channels, place of that among the formats chosen so far}. */
  COMPOSE_REASON_DUPLICATE = 19,
  /** The audio mask excludes its type {mask in force, bit of the type}. */
  COMPOSE_REASON_AUDIO_MASK = 20,
  /** No audio mask has a bit for its type {mask in force}. */
  COMPOSE_REASON_TYPE_WITHOUT_BIT = 21,
  /** That of the sink's first detailed timing at 50 or 60 Hz {position, Hz}. */
  COMPOSE_REASON_RATE_OF_DETAILED_TIMING = 22,
  /** That of the sink's first standard timing at 60 Hz {position, Hz}. */
  COMPOSE_REASON_RATE_OF_STANDARD_TIMING = 23,
  /** That of the sink's first descriptor at 50 or 60 Hz {position, Hz}. */
  COMPOSE_REASON_RATE_OF_SHORT_VIDEO = 24,
  /** The platform's, as no timing of the sink is at 50 or 60 Hz. */
  COMPOSE_REASON_RATE_OF_PLATFORM = 25,
  /** 60, as the platform's is neither 50 nor 60 {the platform's}. */
  COMPOSE_REASON_RATE_FORCED = 26,
  /** That of the sink's tallest short video descriptor. */
  COMPOSE_REASON_GEOMETRY_OF_SINK = 27,
  /** The platform sets no limit. */
  COMPOSE_REASON_GEOMETRY_UNLIMITED = 28,
  /** Put first {width, height, Hz, interlaced}. */
  COMPOSE_REASON_CURRENT_MODE_FIRST = 29,
  /** The platform doesn't ask for it {width, height, Hz, interlaced}. */
  COMPOSE_REASON_CURRENT_MODE_IGNORED = 30,
  /** Not a mode {width, height, Hz, interlaced}. */
  COMPOSE_REASON_CURRENT_MODE_IMPLAUSIBLE = 31,
  /** No VIC has it {width, height, Hz, interlaced}. */
  COMPOSE_REASON_CURRENT_MODE_WITHOUT_VIC = 32,
  /** The platform is the television {port}. */
  COMPOSE_REASON_ADDRESS_OF_ROOT = 33,
  /** The port in the sink's first free place {port, sink's address}. */
  COMPOSE_REASON_ADDRESS_BELOW_SINK = 34,
  /** None: no HDMI sink {port}. */
  COMPOSE_REASON_ADDRESS_WITHOUT_SINK = 35,
  /** None: the sink's begins with 0 {port, sink's address}. */
  COMPOSE_REASON_ADDRESS_OF_SINK_INVALID = 36,
  /** None: the sink's has no free place {port, sink's address}. */
  COMPOSE_REASON_ADDRESS_WITHOUT_PLACE = 37,
  /** As the platform says {1 or 0}. */
  COMPOSE_REASON_DEEP_COLOR_OF_PLATFORM = 38,
  /** HDMI requires 36 bit where 30 bit is offered. */
  COMPOSE_REASON_DEEP_COLOR_REQUIRED = 39,
  /** Not offered by this library. */
  COMPOSE_REASON_DEEP_COLOR_NEVER = 40,
  /** The platform's own, in steps of 5 MHz {MHz asked for, sink's MHz}. */
  COMPOSE_REASON_TMDS_OVERRIDE = 41,
  /** What the modes need {pixel clock in kHz, percent of it, sink's MHz}. */
  COMPOSE_REASON_TMDS_OF_MODES = 42,
  /** What 4Kx2K modes need {pixel clock in kHz, percent, sink's MHz}. */
  COMPOSE_REASON_TMDS_OF_4K_MODES = 43,
  /** The modes stay below 165 MHz {pixel clock in kHz, percent, sink's}. */
  COMPOSE_REASON_TMDS_NOT_NEEDED = 44,
  /** Cut to what the field can hold {MHz wanted, MHz held}. */
  COMPOSE_REASON_TMDS_LARGEST = 45,
  /** The platform's and the sink's in sum {own ms, sink's ms, ms declared: even, at most 500}. */
  COMPOSE_REASON_LATENCY_OF_BOTH = 46,
  /** Neither delays; offered as 0 ms where the other latencies need it to be. */
  COMPOSE_REASON_LATENCY_NONE = 47,
  /** One of both is longer than 500 ms: declared as not valid {own ms, sink's ms}. */
  COMPOSE_REASON_LATENCY_TOO_LONG = 48,
  /** The caller asks for it {setting, sink's}. */
  COMPOSE_REASON_3D_ALWAYS = 49,
  /** The sink has it {setting, sink's}. */
  COMPOSE_REASON_3D_OF_SINK = 50,
  /** The sink doesn't have it {setting, sink's}. */
  COMPOSE_REASON_3D_NOT_IN_SINK = 51,
  /** The caller doesn't want it {setting, sink's}. */
  COMPOSE_REASON_3D_OFF = 52,
  /** VIC 1 was added {modes chosen, fewest}. */
  COMPOSE_REASON_TOO_FEW_MODES = 53,
  /** Nothing was added {modes chosen, fewest}. */
  COMPOSE_REASON_ENOUGH_MODES = 54,
  /** Every byte fits {bytes needed, bytes there, bytes of the longest data block that can become too long, most}. */
  COMPOSE_REASON_ROOM_ENOUGH = 55,
  /** The rest is left out {as above}. */
  COMPOSE_REASON_ROOM_EXCEEDED = 56,
  /** A data block is too long for its length field, and read as shorter {as above}. */
  COMPOSE_REASON_BLOCK_TOO_LONG = 57,
  /** The base block doesn't announce the extension, as without a monitor name {as above}. */
  COMPOSE_REASON_NOT_ANNOUNCED = 58,
  /* HDMI 2 */
  /** In 4:2:0 only, as it is too fast otherwise {its kHz, its kHz in 4:2:0, limit in kHz}. */
  COMPOSE_REASON_ONLY_IN_420 = 59,
  /** Above the rate of the link {its kHz, limit in kHz, 1 when it is the box's, 0 when it is that of box and sink}. */
  COMPOSE_REASON_ABOVE_RATE = 60,
  /** The sink has it in 4:2:0 only, in which it is not offered {setting}. */
  COMPOSE_REASON_SINK_HAS_IT_IN_420 = 61,
  /** The platform does not offer it {setting, 1 when the sink has it}. */
  COMPOSE_REASON_OFF = 62,
  /** The box does it itself {as above}. */
  COMPOSE_REASON_BOX_ITSELF = 63,
  /** As the sink, which has it {as above}. */
  COMPOSE_REASON_AS_SINK = 64,
  /** As the sink, which doesn't have it {as above}. */
  COMPOSE_REASON_SINK_WITHOUT = 65,
  /** No range that a source may use {minimum, maximum, the sink's minimum, its maximum, Hz}. */
  COMPOSE_REASON_VRR_RANGE_INVALID = 66,
  /** 340 MHz, the most that the HDMI block tells, as the link carries more {its MHz}. */
  COMPOSE_REASON_TMDS_OF_LINK = 67,
  /** What the modes above VIC 64 need {kHz of the fastest on the link}. */
  COMPOSE_REASON_TMDS_OF_EXTENDED_MODES = 68,
  /** Cut to what box and sink take, or to what the modes need {MHz wanted, MHz}. */
  COMPOSE_REASON_TMDS_LIMITED = 69,
  /** The sink's block, byte for byte {its bytes}. */
  COMPOSE_REASON_PASSED_ON = 70,
  /** The sink's block announces a mode above the rate of the link {MHz of the mode, MHz of the link}. */
  COMPOSE_REASON_RATE_BELOW_BLOCK = 71,
  /** The sink's range of refresh rates is not offered unchanged. */
  COMPOSE_REASON_VRR_CHANGED = 72,
  /** What the box's receiver takes {its MHz, the sink's MHz}. */
  COMPOSE_REASON_LINK_RATE_OF_BOX = 73,
  /** What the sink takes {as above}. */
  COMPOSE_REASON_LINK_RATE_OF_SINK = 74,
  /** What modes that the box makes itself need {as above}. */
  COMPOSE_REASON_LINK_RATE_OF_ADDED_MODES = 75,
  /** No offered mode is fast enough for it, or none that the sink takes in it {setting, 1 when the sink has any}. */
  COMPOSE_REASON_NO_MODE_IN_420 = 76,
  /** No offered mode in 4:2:0 leaves room for it on the link {MHz of the link, setting}. */
  COMPOSE_REASON_RATE_BELOW_DEPTH = 77,
  /** HDMI requires 30 bit where 36 bit is offered. */
  COMPOSE_REASON_DEEP_COLOR_420_REQUIRED = 78,
  /** A 4Kx2K mode is offered by its HDMI_VIC and by its VIC. */
  COMPOSE_REASON_UHD_VIC_OF_MODES = 79,
  /** No 4Kx2K mode is offered by both. */
  COMPOSE_REASON_NO_UHD_VIC = 80,
  /** Nothing else calls for the HDMI Forum block, which would say so. */
  COMPOSE_REASON_NO_FORUM_BLOCK = 81,
  /** The first mode above VIC 64 that a detailed timing can hold. */
  COMPOSE_REASON_FIRST_EXTENDED_MODE = 82,
  /** No offered mode above VIC 64 fits a detailed timing. */
  COMPOSE_REASON_NO_EXTENDED_TIMING = 83
};

/** Who named a candidate; bits of @ref compose_decision_t::origins. */
enum compose_origin {
  /** A detailed timing of the sink; place in sink_index. */
  COMPOSE_ORIGIN_DETAILED_TIMING = 0x0001,
  /** A standard timing of the sink; place in sink_index. */
  COMPOSE_ORIGIN_STANDARD_TIMING = 0x0002,
  /** A short video descriptor of the sink; place in sink_index. */
  COMPOSE_ORIGIN_SHORT_VIDEO = 0x0004,
  /** An HDMI_VIC of the sink; place in sink_index. */
  COMPOSE_ORIGIN_SINK_4K = 0x0008,
  /** A short audio descriptor of the sink; place in sink_index. */
  COMPOSE_ORIGIN_SINK_AUDIO = 0x0010,
  /** The priority list in use; place in priority_index. */
  COMPOSE_ORIGIN_PRIORITY_LIST = 0x0020,
  /** The addition list in use; place in addition_index. */
  COMPOSE_ORIGIN_ADDITION_LIST = 0x0040,
  /** The other family's; place in priority_index if alone. */
  COMPOSE_ORIGIN_OTHER_PRIORITY_LIST = 0x0080,
  /** The other family's; place in addition_index if alone. */
  COMPOSE_ORIGIN_OTHER_ADDITION_LIST = 0x0100,
  /** The platform's audio list; place in priority_index. */
  COMPOSE_ORIGIN_PLATFORM_AUDIO = 0x0200,
  /** The caller's current mode. */
  COMPOSE_ORIGIN_CURRENT_MODE = 0x0400,
  /** The library itself: padding and basic audio. */
  COMPOSE_ORIGIN_LIBRARY = 0x0800,
  /** The sink's 4:2:0 video block; place in sink_index. */
  COMPOSE_ORIGIN_SINK_420 = 0x1000
};

/** One decision of a composition. It holds no pointers: a copy of it keeps its meaning. */
typedef struct compose_decision_t {
  u32 size;    /**< Bytes of the record that the library fills. A later version may append members, never move one. */
  u32 subject; /**< What it is about; @ref compose_subject. */
  u32 code;    /**< Which one of them; see @ref compose_subject. */
  u32 verdict; /**< What was decided; @ref compose_verdict. */
  u32 reason;  /**< Why; @ref compose_reason. */
  u32 origins; /**< Who named the candidate: mask of @ref compose_origin; 0 for derived values. */
  i32 sink_index; /**< Place, from 0, of the first descriptor of the sink that names it, among those of the kind that
                       the lowest bit of origins names and that could be decoded; -1 when none does. */
  i32 priority_index; /**< Place, from 0, among the entries of the list that names it as it was read, without those that
                         were skipped; -1 when none does. */
  i32 addition_index; /**< As above, for the addition list. */
  i32 position;       /**< Place, from 0, among the new EDID's descriptors of its kind; -1 when it isn't there. */
  i32 value[4];       /**< The numbers that explain the reason; see @ref compose_reason. The others are 0. */
} compose_decision_t;

/**
 * Hears of a decision.
 *
 * @param decision the record; it is gone when the call returns.
 * @param context @ref compose_request_t::observer_context.
 */
typedef void (*compose_observer_t)(const compose_decision_t *decision, void *context);

/** @return the subject in words, such as "video mode"; "unknown" for any other number. Static. */
EDID_COMPOSER_API const char *compose_subject_string(u32 subject);

/** @return the verdict in words, such as "left out"; "unknown" for any other number. Static. */
EDID_COMPOSER_API const char *compose_verdict_string(u32 verdict);

/** @return the reason in words, such as "the priority list does not name it"; "unknown" for any other number. Static.
 */
EDID_COMPOSER_API const char *compose_reason_string(u32 reason);
/** @} */

/** @defgroup request A composition as one request
 *
 * @ref compose_edid_request does what @ref compose_edid_internal does and returns more: what became of the sink's EDID,
 * why the new EDID offers what it offers, and every line of the call by callback instead of standard output.
 * @{ */

/** What kind of line a composition has written; @ref compose_log_line_t::kind. */
enum compose_log_kind {
  /** On standard output: `module:line:function() ERROR: text`. */
  COMPOSE_LOG_ERROR = 1,
  /** On standard output: `module:line:function() WARNING: text`. */
  COMPOSE_LOG_WARNING = 2,
  /** On standard output: `module:line:function() BUG: text`. */
  COMPOSE_LOG_BUG = 3,
  /** On standard output: the text, then ` \t\t\tfunction():line`. */
  COMPOSE_LOG_TRACE = 4,
  /** A line of a report or of a dump: on standard output the text alone. */
  COMPOSE_LOG_TEXT = 5
};

/** One line of a composition. The texts are valid until the callback returns. */
typedef struct compose_log_line_t {
  u32 size;             /**< Bytes of the record that the library fills. A later version may append members. */
  u32 kind;             /**< @ref compose_log_kind. */
  const char *module;   /**< The module that reports, such as "edid_composer"; "" for @ref COMPOSE_LOG_TEXT. */
  const char *function; /**< The operation that reports; "" for @ref COMPOSE_LOG_TEXT. */
  u32 line;             /**< Line number in the library's source; 0 for @ref COMPOSE_LOG_TEXT. */
  const char *text;     /**< The message, NUL-terminated, without the newline that ends the line on standard output.
                             Up to 1023 bytes; the rest of a longer one is cut. Texts of the sink and of the platform
                             are in it as they are, control characters included. */
} compose_log_line_t;

/**
 * Receives a line.
 *
 * Called on the thread that composes, once for each line, in order. It may call operations of this library: what they
 * print is not part of the composition and goes to standard output.
 *
 * @param line the line; it is gone when the call returns.
 * @param context @ref compose_request_t::log_context.
 */
typedef void (*compose_log_t)(const compose_log_line_t *line, void *context);

/** What became of the sink's base block; @ref compose_result_t::sink_status. */
enum compose_sink_status {
  /** No sink was given: a NULL pointer, or no bytes. */
  COMPOSE_SINK_NONE = 1,
  /** The base block was read. */
  COMPOSE_SINK_READ = 2,
  /** Not read: its length is no multiple of 128 bytes. */
  COMPOSE_SINK_LENGTH_INVALID = 3,
  /** Refused: bytes 0 to 7 are not the header (EDID 1.3, section 3.1). */
  COMPOSE_SINK_HEADER_INVALID = 4,
  /** Refused: the 128 bytes do not sum to 0 (EDID 1.3, section 3.12). */
  COMPOSE_SINK_CHECKSUM_INVALID = 5,
  /** Refused: neither version 1.3 nor a later revision of version 1. */
  COMPOSE_SINK_VERSION_UNSUPPORTED = 6,
  /** Reading ended at a malformed 18-byte descriptor: what comes before it is used, what follows it and the extension
   *  are not. */
  COMPOSE_SINK_DESCRIPTOR_INVALID = 7,
  /** Reading ended because a list entry could not be had. */
  COMPOSE_SINK_OUT_OF_MEMORY = 8
};

/** What became of the sink's block 1; @ref compose_result_t::sink_extension_status. */
enum compose_extension_status {
  /** The base block was not read to its end, so block 1 was not either. */
  COMPOSE_EXTENSION_NOT_LOOKED_AT = 1,
  /** The base block announces no extension (byte 126 is 0). */
  COMPOSE_EXTENSION_NOT_ANNOUNCED = 2,
  /** Block 1 was read as CEA-861 extension. */
  COMPOSE_EXTENSION_READ = 3,
  /** Announced, but the sink has no more than 128 bytes. */
  COMPOSE_EXTENSION_MISSING = 4,
  /** Refused: its tag (byte 0) is not 2. */
  COMPOSE_EXTENSION_NOT_CEA = 5,
  /** Refused: its revision (byte 1) is not 3. */
  COMPOSE_EXTENSION_REVISION_UNSUPPORTED = 6,
  /** Refused: its 128 bytes do not sum to 0. */
  COMPOSE_EXTENSION_CHECKSUM_INVALID = 7,
  /** Refused: its detailed timings (byte 2) begin after byte 110, which the standard allows and this library does not.
   */
  COMPOSE_EXTENSION_OFFSET_UNSUPPORTED = 8,
  /** A data block overruns its collection: what comes before it is used. See @ref
   *  compose_result_t::sink_malformed_at. */
  COMPOSE_EXTENSION_MALFORMED = 9,
  /** Reading ended because a list entry could not be had. */
  COMPOSE_EXTENSION_OUT_OF_MEMORY = 10
};

/**
 * What a composition works from. Zero-fill it, set size, and set what is needed.
 *
 * Later versions append members; one that is not there, because the caller was compiled earlier, counts as zero.
 */
typedef struct compose_request_t {
  u32 size;                                 /**< sizeof(compose_request_t) of the caller. */
  u32 sink_bytes;                           /**< Size of the sink's EDID, bytes: a multiple of 128. */
  const u8 *sink;                           /**< The sink's EDID, or NULL when there is none. */
  u8 *new_edid;                             /**< Receives the new EDID; may be the buffer of @ref sink. */
  u32 new_edid_bytes;                       /**< Size of that buffer, bytes: 256. */
  const compose_cfg_t *settings;            /**< The caller's settings; not NULL. */
  const platform_values_t *platform_values; /**< As for @ref compose_edid_internal; NULL: the configuration is read. */
  compose_observer_t observer;              /**< Receives each decision after the new EDID was written; may be NULL. */
  void *observer_context;                   /**< Goes to @ref observer as it is. */
  compose_log_t log;                        /**< Receives each line of the call instead of standard output; may be NULL.
                                                 Whether traces are among them is the affair of @ref debug_enable. */
  void *log_context;                        /**< Goes to @ref log as it is. */
  configuration_observer_t configuration_observer; /**< Receives what is read of the configuration; may be NULL. Not
                                                        called where @ref platform_values is given. */
  void *configuration_observer_context;            /**< Goes to @ref configuration_observer as it is. */
  const hdmi2_values_t *hdmi2; /**< What the platform says of HDMI 2. NULL: the configuration is read, unless
                                    @ref platform_values is given, which leaves HDMI 2 off. */
} compose_request_t;

/** What a composition returns. Set size; all other members are filled, on failure too. */
typedef struct compose_result_t {
  u32 size;                    /**< sizeof(compose_result_t) of the caller. */
  u32 bytes_written;           /**< Bytes of the new EDID: 256; 0 when the composition failed. */
  u32 physical_address_offset; /**< Offset of the physical address' two bytes in the new EDID, so that a host can patch
                                    them for each input; 0 when the composition failed. */
  u32 sink_status;             /**< What became of the sink's base block; @ref compose_sink_status. 0 when the call was
                                    refused before the sink was looked at. */
  u32 sink_extension_status;   /**< What became of block 1; @ref compose_extension_status. With HDMI 2, of the first
                                    CTA-861 extension that can be read, of block 1 where there is none. */
  u32 sink_malformed_at; /**< The byte, when @ref sink_extension_status is COMPOSE_EXTENSION_MALFORMED, of block 1, from
                            0, at which the data block begins that overruns; else 0. */
  u32 sink_blocks_unread; /**< Extension blocks after block 1 that are announced and given, but not read. With HDMI 2,
                               those of all blocks. */
} compose_result_t;

/**
 * Composes as @ref compose_edid_internal does, from a request record into a result record.
 *
 * What is written, and every line, is the same as from @ref compose_edid_internal, in whose name the lines are, unless
 * HDMI 2 is asked for (@ref hdmi2); with observer or log callback and without. An observed composition needs list
 * entries of its own; when one cannot be had, that is reported and no decision is passed on, but the EDID is written.
 *
 * Several threads may compose at once, each with its own request, result and buffers; each call's lines go to its own
 * callback.
 *
 * @param request not NULL; its @ref compose_request_t::size is that of any version of this header. Only read.
 * @param result not NULL; its @ref compose_result_t::size likewise. Members that it does not have are not written.
 * @return true when the new EDID was written. On false no decision was passed on.
 */
EDID_COMPOSER_API bool compose_edid_request(const compose_request_t *request, compose_result_t *result);

/** @return the status in words, such as "base block refused: checksum"; "unknown" for any other number. Static. */
EDID_COMPOSER_API const char *compose_sink_status_string(u32 status);

/** @return the status in words, such as "refused: not a CEA-861 extension"; "unknown" for any other number. Static. */
EDID_COMPOSER_API const char *compose_extension_status_string(u32 status);
/** @} */

/** @defgroup inspection Looking at an EDID
 * @{ */

/**
 * Decodes an EDID and prints its report. When decoding fails only the error lines are printed.
 *
 * @param edid_block the EDID. 128 bytes must be there even when @p size is 0.
 * @param size its size in bytes, a multiple of 128. From 256 on, block 1 is decoded as CEA-861 extension.
 * @param brief nonzero for the brief report (identity, video, audio, physical address), 0 for every field.
 * @param title first line of the report, NUL-terminated; NULL prints as an empty one.
 */
EDID_COMPOSER_API void print_edid(const u8 *edid_block, u32 size, u8 brief, const char *title);

/**
 * Prints an audio mask (see @ref compose_cfg_t::audio_mask) in words, as one line.
 *
 * @param mask 0xFFFFFFFF prints "All audio formats supported", 0 prints "No audio formats". Bits 17 to 31 have no name.
 */
EDID_COMPOSER_API void print_edid_audio_mask(u32 mask);
/** @} */

/** @defgroup codec Decoding and encoding
 * @{ */

/**
 * Decodes a base block (EDID 1.3, section 3) into a record: identity, features, timings and descriptors.
 *
 * @param edid_block exactly 128 bytes are read.
 * @param edid a prepared record; decoding only adds to it.
 * @return 1 on success. 0, with one error line, at the first hard error: a NULL argument, a record that is not
 * prepared, a bad header, checksum or version, a malformed descriptor. The record keeps what was decoded before, and
 * must be destroyed all the same.
 */
EDID_COMPOSER_API u8 decode_edid_block_0(const u8 *edid_block, edid_t *edid);

/**
 * Decodes a CEA-861 extension of revision 3 (CEA-861, section 7.5), with the HDMI vendor-specific data block
 * (HDMI 1.4a, section 8.3.2), into a record.
 *
 * @param edid_extension the extension block.
 * @param length number of bytes there; none is read after them, and what is missing of a block reads as 0. More than
 * 128 bytes: detailed timings are looked for in the blocks that follow as well.
 * @param edid the record that the base block was decoded into; its lists are appended to.
 * @return 1 on success; 0, with one error line, for a NULL argument, another tag or revision, a bad checksum, or a data
 *         block that overruns its collection. The record keeps what was decoded before.
 */
EDID_COMPOSER_API u8 decode_edid_extensions(const u8 *edid_extension, u32 length, edid_t *edid);

/**
 * Decodes the three bytes of a short audio descriptor (CEA-861, section 7.5.2).
 *
 * @param byte1 format code and number of channels.
 * @param byte2 sample rates.
 * @param byte3 depends on the format code.
 * @param audio the descriptor; cleared first.
 * @return 1 on success; 0, with one error line, when @p audio is NULL or the format code is 0.
 */
EDID_COMPOSER_API u8 decode_edid_short_audio(u8 byte1, u8 byte2, u8 byte3, short_audio_desc_t *audio);

/**
 * Encodes a record as base block and CEA-861 extension with the HDMI vendor-specific data block.
 *
 * At most 8 standard timings, 32 short video descriptors and 10 short audio descriptors are written; more of the latter
 * two give a warning. What does not fit the extension is not written, and one error line says how many bytes it
 * needed; the result does not change by it.
 *
 * @param edid_blocks receives the bytes; nothing is written outside of them.
 * @param size must be 256.
 * @param edid the record, prepared, with exactly 2 detailed timings. Changed in two places: mandatory 3D structures are
 *        cleared from its video list's 3D masks, and audio types 16 to 18 become 15. So one record must not be encoded
 * by two threads at once.
 * @param spa_offset receives the offset of the physical address within @p edid_blocks; may be NULL.
 * @param values its native_bit is read; not NULL.
 * @return 1 on success; 0 with one error or bug line. For a bad argument the buffer is untouched, otherwise it is
 * partly written.
 */
EDID_COMPOSER_API u8 encode_edid(u8 *edid_blocks, i32 size, edid_t *edid, u8 *spa_offset,
                                 const platform_values_t *values);

/**
 * Encodes a latency (HDMI 1.4a, section 8.3.2, Video_Latency).
 *
 * @param latency_ms milliseconds.
 * @return latency_ms / 2 + 1; 251, which stands for 500 ms, for 501 to 65534 ms; 255 (not supported) for 65535.
 */
EDID_COMPOSER_API u8 encode_edid_latency_value(u16 latency_ms);

/**
 * Prints a decoded record as a report on standard output.
 *
 * @param edid a prepared record.
 * @param brief nonzero for the brief report, 0 for every field. The long report of a record that is not valid is its
 * title.
 * @param title first line, NUL-terminated; NULL prints as an empty one.
 * @return 1; 0 with an error line when @p edid is NULL.
 */
EDID_COMPOSER_API u8 print_edid_struct(const edid_t *edid, u8 brief, const char *title);
/** @} */

/** @defgroup timings Video timings
 *
 * Conversions between video identification codes (VICs 1 to 64 of CEA-861, section 4), timings and modes. They return 1
 * when a match was found and 0 otherwise; bad arguments print an error line of module `utility`.
 * @{ */

/** Fills @p timing with the timing of @p vic, 1 to 64. Any other VIC prints a warning and leaves @p timing unchanged.
 */
EDID_COMPOSER_API u8 convert_vic_to_dtd(u32 vic, detailed_timing_t *timing);

/**
 * Finds the VIC of a detailed timing: equal pixel clock, scan, horizontal active and blanking pixels, vertical active
 * lines and picture aspect ratio.
 *
 * @param edid its monitor size gives the aspect ratio of a timing without image size.
 * @param timing the timing.
 * @param vic receives the VIC; 0 when there is none.
 */
EDID_COMPOSER_API u8 convert_dtd_to_vic(const edid_t *edid, const detailed_timing_t *timing, u32 *vic);

/** Finds the VIC of a standard timing. @p edid is only tested for NULL. @p vic receives the VIC; 0 when there is none.
 */
EDID_COMPOSER_API u8 convert_std_to_vic(const edid_t *edid, const std_timing_t *timing, u32 *vic);

/** Finds the first VIC with the size, scan and whole refresh rate of @p mode. @p vic is untouched when there is none.
 */
EDID_COMPOSER_API u8 mode_to_vic(const video_mode_t *mode, u32 *vic);

/**
 * Classifies a size into an aspect-ratio code: 0 = 1:1, 1 = 4:3, 2 = 5:4, 3 = 16:9.
 *
 * @param width pixels, mm or cm.
 * @param height in the same unit.
 * @param ratio receives the code; untouched when the size is none of the four.
 */
EDID_COMPOSER_API u8 convert_geo_to_ratio(u32 width, u32 height, u32 *ratio);

/**
 * The refresh rate of a timing: (pixel_clock / (h_active + h_blanking)) / (v_active + v_blanking), each division
 * truncated.
 *
 * @return whole Hz, the field rate of an interlaced timing; 0 when a total is 0.
 */
EDID_COMPOSER_API u32 calculate_refresh_rate(u32 pixel_clock, u32 h_active, u32 h_blanking, u32 v_active,
                                             u32 v_blanking);
/** @} */

/** @defgroup names Names and printers
 *
 * Name functions return a read-only text, never NULL, valid as long as the library is loaded. Unknown values have a
 * text too.
 * @{ */

/** Name of an aspect-ratio code, such as "16:9"; "InvalidRatio" above 3. */
EDID_COMPOSER_API const char *std_aspect_string(u32 ratio);
/** Name of an audio type (@ref short_audio_desc_t::type); "AUDIO_TYPE_UNKNOWN" above 18. */
EDID_COMPOSER_API const char *short_audio_string(u32 type);
/** Name of an HDMI_VIC, such as "3840x2160p30Hz"; "Unknown Value" for any but 1 to 4. */
EDID_COMPOSER_API const char *hdmi_vic_string(u32 hdmi_vic);
/** Name of one bit value (1 << bit) of established timings I; "Unknown Value" for any other value. */
EDID_COMPOSER_API const char *est_timing_1_string(u32 bit);
/** Name of one bit value (1 << bit) of established timings II; "Unknown Value" for any other value. */
EDID_COMPOSER_API const char *est_timing_2_string(u32 bit);
/** Name of one bit value (1 << bit) of the manufacturer's reserved timings; "Unknown Value" for any other value. */
EDID_COMPOSER_API const char *man_timing_string(u32 bit);
/** Name of a VIC, such as "1920x1080p60Hz16x9"; "Unknown Value" for any but 1 to 64. */
EDID_COMPOSER_API const char *short_video_timing_string(u32 vic);

/**
 * Writes the names of the set bits of a sample-rate mask, each followed by a blank.
 *
 * @param freq_mask see @ref short_audio_desc_t::frequencies. 0 gives " NoFreqSpecified".
 * @param string receives the text; cleared first.
 * @param string_len its size in bytes, 17 or more; a longer text is cut.
 * @return the length of the whole text; 0, with an error line, for a bad argument.
 */
EDID_COMPOSER_API int audio_freq_string(u32 freq_mask, char *string, u32 string_len);

/** As @ref audio_freq_string, for a sample-size mask (@ref short_audio_desc_t::pcm_bits). 0 gives " NoBitsSpecified".
 */
EDID_COMPOSER_API int audio_pcm_bits_string(u32 bits_mask, char *string, u32 string_len);

/** Prints the speakers of a speaker allocation payload (CEA-861, section 7.5.3) as one line. @p byte3 is not used. */
EDID_COMPOSER_API void print_speaker(u8 byte1, u8 byte2, u8 byte3);

/** Prints a short audio descriptor as one line. NULL prints an error line. */
EDID_COMPOSER_API void print_audio_structure(const short_audio_desc_t *audio);

/** Prints the short names of a 3D mask's bits, each followed by a blank, without a newline; a single blank for 0. */
EDID_COMPOSER_API void print_stereo_type(u32 stereo_mask);

/**
 * Prints a titled list of the timings of an established or manufacturer's timing byte; nothing when @p bits is 0.
 *
 * @param bits the byte; bits 7 to 0 are listed.
 * @param string_func names one bit value: @ref est_timing_1_string, @ref est_timing_2_string or @ref man_timing_string.
 *        NULL prints a bug line.
 * @param str the title, NUL-terminated. NULL or empty prints a bug line.
 */
EDID_COMPOSER_API void print_est_man_type(u32 bits, const char *(*string_func)(u32), const char *str);

/** For each bit of 3D_Structure_ALL (HDMI 1.4a, section 8.3.2), the bit of @ref stereo_mask that it stands for, or 0.
 */
EDID_COMPOSER_API extern const u32 _3d_struct_all_array[16];

/** The mandatory 3D formats (HDMI 1.4a, section 8.2.3): VIC and mask of the structures that 3D_present implies. */
EDID_COMPOSER_API extern const short_video_desc_t _3d_man_modes[5];
/** @} */

/** @defgroup getters Configuration getters
 *
 * Read single values of the platform configuration, under the domain "platform.software.drivers.vorex.edid.". A problem
 * never fails a getter: it yields the default or the nearest limit, with a warning of module `utility` if asked for.
 * @{ */

/**
 * Reads a text.
 *
 * @param key relative to the domain, NUL-terminated.
 * @param dst receives the text; the caller zero-fills it. A default as long as the field leaves it without a NUL.
 * @param size its size in bytes.
 * @param default_val the text to use when the key is absent or holds no text.
 * @param print_warnings true to warn when the default is used.
 * @return true when the text came from the configuration.
 */
EDID_COMPOSER_API bool get_pc_str(const char *key, char *dst, u32 size, const char *default_val, bool print_warnings);

/**
 * Reads an unsigned number.
 *
 * Limits that contradict each other are a programming error: the process is aborted, in every build type.
 *
 * @param key relative to the domain, NUL-terminated.
 * @param min smallest value allowed.
 * @param max largest value allowed.
 * @param default_val used when the key is absent or holds no integer; min <= default_val <= max.
 * @param print_warnings true to warn when the default or a limit is used.
 * @return the value, min to max.
 */
EDID_COMPOSER_API u32 get_pc_uint(const char *key, u32 min, u32 max, u32 default_val, bool print_warnings);

/** As @ref get_pc_uint, for a signed number. */
EDID_COMPOSER_API i32 get_pc_int(const char *key, i32 min, i32 max, i32 default_val, bool print_warnings);
/** @} */

/** @defgroup host Operations that the host supplies
 *
 * The platform's configuration: a tree of named nodes that hold integers and strings. The library leaves these eight
 * operations undefined; the process that loads it defines them. They return 0 for success.
 *
 * A path is a sequence of node names separated by dots, from the root. @p root is always 0. Nodes are known by handles
 * of the host's choice, which must stay valid for the duration of one call into the library. An operation that returns
 * another status leaves its output alone.
 * @{ */

/** Reads the integer at @p path into @p value. Nonzero: no such node, or it holds no integer. */
EDID_COMPOSER_API int config_get_int(u32 root, const char *path, i32 *value);
/** Copies what fits of the string at @p path, with its NUL, into the @p size bytes of @p buffer. Nonzero: no string. */
EDID_COMPOSER_API int config_get_str(u32 root, const char *path, char *buffer, u32 size);
/** Finds the node at @p path. 2: not found; any other status counts as found. */
EDID_COMPOSER_API int config_node_find(u32 root, const char *path, u32 *node);
/** Finds the first child of @p node. 2: no children; any other status counts as found. */
EDID_COMPOSER_API int config_node_first_child(u32 node, u32 *child);
/** Finds the node after @p node. Nonzero: it is the last one. */
EDID_COMPOSER_API int config_node_next_sibling(u32 node, u32 *sibling);
/** Copies what fits of the name of @p node (the last component of its path), with its NUL, into @p buffer. */
EDID_COMPOSER_API int config_node_get_name(u32 node, char *buffer, u32 size);
/** Reads the integer that @p node holds into @p value. Nonzero: it holds none. */
EDID_COMPOSER_API int config_node_get_int(u32 node, i32 *value);
/** Copies what fits of the string that @p node holds, with its NUL, into @p buffer. Nonzero: it holds none. */
EDID_COMPOSER_API int config_node_get_str(u32 node, char *buffer, u32 size);
/** @} */

#ifdef __cplusplus
}
#endif

#endif /* EDID_COMPOSER_H */
