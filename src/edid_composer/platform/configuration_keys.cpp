#include "edid_composer/platform/configuration_keys.h"

#include <algorithm>
#include <iterator>

#include "edid_composer/platform/hdmi2_keys.h"
#include "edid_composer/platform/key_builders.h"
#include "edid_composer/platform/meaningless_numbers.h"

namespace edid_composer {
namespace {

#define FIELD(member) offsetof(platform_values_t, member)

constexpr platform_key_t keys[] = {
    {integer(PATH("native_refresh_rate"), {50, 60, 60},
             "Refresh family, 50 or 60, where the display's EDID shows none; 51 to 59 count as 60."),
     FIELD(native_refresh_rate), settle_refresh_rate},
    {integer(PATH("current_mode_set_to_priority"), {0, 1}, "1: offer the mode that the box puts out now first."),
     FIELD(current_mode_set_to_priority)},
    {integer(PATH("audio.pass_through"), {0, 2},
             "Whose formats are offered: 0 the box's, 1 the box's and the display's, 2 the display's."),
     FIELD(audio_pass_through)},
    {integer(PATH("underscan"), {0, 1}, "1: say that computer formats are underscanned."), FIELD(underscan)},
    {integer(PATH("is_tv"), {0, 1},
             "1: the box is the display itself, with inputs 1.0.0.0, 2.0.0.0 and so on; 0: its inputs continue the "
             "display's address."),
     FIELD(is_tv)},
    {integer(PATH("geometry_limit"), {0, 1},
             "1: offer no mode with more lines than the display's tallest short video descriptor."),
     FIELD(geometry_limit)},
    {integer(PATH("dc_30bit"), {0, 1}, "1: offer deep colour with 30 bits; 36 bits are then offered too."),
     FIELD(dc_30bit)},
    {integer(PATH("dc_36bit"), {0, 1}, "1: offer deep colour with 36 bits."), FIELD(dc_36bit)},
    {integer(PATH("tmds_override"), {0, 1275},
             "Maximum TMDS clock in MHz, from 25 on; 0: worked out, declared where it matters; 1 to 24: worked out, "
             "always declared."),
     FIELD(tmds_override)},
    {integer(PATH("supports_ai"), {0, 2}, "ACP, ISRC1 and ISRC2 packets: 0 no, 1 yes, 2 as the display."),
     FIELD(supports_ai)},
    {integer(PATH("speaker_entry"), {1, 2047, 1}, "Loudspeakers: the sum of their bits (CEA-861, section 7.5.3)."),
     FIELD(speaker_entry)},
    {integer(PATH("xvYCC601"), {0, 2}, "Extended colour gamut of standard definition: 0 no, 1 yes, 2 as the display."),
     FIELD(xvYCC601)},
    {integer(PATH("xvYCC709"), {0, 2}, "Extended colour gamut of high definition: 0 no, 1 yes, 2 as the display."),
     FIELD(xvYCC709)},
    {integer(PATH("native_bit"), {0, 1, 1}, "1: mark the first mode as native."), FIELD(native_bit)},
    {unsigned_integer(PATH("product_id"), {0, 65535}, "Product code."), FIELD(product_id)},
    {unsigned_integer(PATH("serial"), {0, 0xFFFFFFFF}, "Serial number."), FIELD(serial)},
    {unsigned_integer(PATH("week"), {0, 255, 1},
                      "Week of manufacture; 54 to 254 count as 53, 255 makes the year a model year."),
     FIELD(week), settle_week},
    {unsigned_integer(PATH("year"), {1990, 2100, 2012}, "Year of manufacture, or model year."), FIELD(year)},
    {unsigned_integer(PATH("CNC0"), {0, 2}, "Content type graphics: 0 no, 1 yes, 2 as the display."), FIELD(cnc0)},
    {unsigned_integer(PATH("CNC1"), {0, 2}, "Content type photo: 0 no, 1 yes, 2 as the display."), FIELD(cnc1)},
    {unsigned_integer(PATH("CNC2"), {0, 2}, "Content type cinema: 0 no, 1 yes, 2 as the display."), FIELD(cnc2)},
    {unsigned_integer(PATH("CNC3"), {0, 2}, "Content type game: 0 no, 1 yes, 2 as the display."), FIELD(cnc3)},
    {audio_formats(PATH("audio.entry_?"),
                   "Formats of the box, each the three bytes of a short audio descriptor, as 0xCCBBAA."),
     FIELD(audio_list)},
    {video_modes(PATH("50_hz_priority_list"),
                 "Modes that may be offered to a display of the 50 Hz family, best first."),
     FIELD(video_50_priority)},
    {video_modes(PATH("50_hz_addition_list"), "Those of them that are offered whatever the display can do."),
     FIELD(video_50_additional)},
    {video_modes(PATH("60_hz_priority_list"),
                 "Modes that may be offered to a display of the 60 Hz family, best first."),
     FIELD(video_60_priority)},
    {video_modes(PATH("60_hz_addition_list"), "Those of them that are offered whatever the display can do."),
     FIELD(video_60_additional)},
    {hdmi_vics(PATH("4k_x_2k_priority_list"), "4Kx2K modes that may be offered, best first."),
     FIELD(modes_4k_x_2k_priority)},
    {hdmi_vics(PATH("4k_x_2k_addition_list"), "Those of them that are offered whatever the display can do."),
     FIELD(modes_4k_x_2k_addition)},
    {text(PATH("manufacturer_id"), {3, 3}, "YYY", "Three letters that name the maker."), FIELD(manufacturer_id)},
    {text(PATH("monitor_name"), {2, 13}, "",
          "Name of the box, which must not begin with a blank. Without one, no source reads the CEA-861 extension."),
     FIELD(monitor_name)},
    {text(PATH("monitor_serial"), {2, 13}, "",
          "Serial number as text, which must not begin with a blank. Without one, none is sent."),
     FIELD(monitor_serial)},
    {timing_bits(PATH("established_timings_1"),
                 "Established timings I, the bits of byte 35; 640x480 at 60 Hz is always offered."),
     FIELD(established_timings_1)},
    {timing_bits(PATH("established_timings_2"), "Established timings II, the bits of byte 36."),
     FIELD(established_timings_2)},
    {timing_bits(PATH("manufacturer_timings"), "Manufacturer's timings, the bits of byte 37."),
     FIELD(manufacturer_timings)},
    {standard_timings(PATH("standard_timings"), "Standard timings, as width, height and refresh rate."),
     FIELD(std_timings)},
};

static_assert(std::all_of(std::begin(keys), std::end(keys), is_sound));

}  // namespace

std::span<const platform_key_t> platform_keys() {
  return keys;
}

}  // namespace edid_composer

const configuration_key_t *configuration_key(u32 index) {
  const auto keys = edid_composer::platform_keys();
  if (index < keys.size()) return &keys[index].key;
  const auto further_keys = edid_composer::hdmi2_keys();
  const auto further = index - keys.size();
  return further < further_keys.size() ? &further_keys[further].key : nullptr;
}
