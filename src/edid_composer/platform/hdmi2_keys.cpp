#include "edid_composer/platform/hdmi2_keys.h"

#include <algorithm>

#include "edid_composer/platform/key_builders.h"
#include "edid_composer/platform/meaningless_numbers.h"

namespace edid_composer {
namespace {

#define FIELD(member) offsetof(hdmi2_values_t, member)

constexpr platform_key_t keys[] = {
    {integer(PATH("hdmi2.enable"), {0, 1},
             "1: compose with what HDMI 2 adds; 0 or missing: no other key of the table is read."),
     FIELD(enable)},
    {extended_vics(PATH("hdmi2.vic_priority_list"),
                   "Modes above VIC 64 that may be offered, best first; the rate and the display decide."),
     FIELD(vic_priority_list)},
    {extended_vics(PATH("hdmi2.vic_addition_list"),
                   "Those of them that the box makes itself, whatever the display can do."),
     FIELD(vic_addition_list)},
    {integer(PATH("hdmi2.tmds_limit"), {165, 600, 340}, "TMDS character rate that the box's receiver takes, in MHz."),
     FIELD(tmds_limit)},
    {integer(PATH("hdmi2.preferred_extended"), {0, 1}, "1: the first mode above VIC 64 becomes the preferred timing."),
     FIELD(preferred_extended)},
    {integer(PATH("hdmi2.scdc"), {0, 1},
             "1: the receiver has the status and control data channel at any rate; above 340 MHz it is always told."),
     FIELD(scdc)},
    {integer(PATH("hdmi2.read_request"), {0, 1}, "1: the receiver can ask the source to read that channel."),
     FIELD(read_request)},
    {integer(PATH("hdmi2.scramble_low"), {0, 1}, "1: the receiver takes scrambling at or below 340 MHz too."),
     FIELD(scramble_low)},
    {integer(PATH("hdmi2.y420"), {0, 2}, "YCbCr 4:2:0 from 590 MHz on: 0 no, 1 yes, 2 as the display."), FIELD(y420)},
    {integer(PATH("hdmi2.dc_30bit_420"), {0, 2}, "Deep colour with 30 bits in 4:2:0: 0 no, 1 yes, 2 as the display."),
     FIELD(dc_30bit_420)},
    {integer(PATH("hdmi2.dc_36bit_420"), {0, 2},
             "Deep colour with 36 bits in 4:2:0: 0 no, 1 yes, 2 as the display; 30 bits are then offered too."),
     FIELD(dc_36bit_420)},
    {integer(PATH("hdmi2.deep_color"), {0, 2},
             "Deep colour outside of 4:2:0: 0 as dc_30bit and dc_36bit say, 2 of those only what the display has too; "
             "1 counts as 0."),
     FIELD(deep_color), settle_deep_color},
    {integer(PATH("hdmi2.uhd_vic"), {0, 1, 1},
             "1: say that 4Kx2K modes are taken by their VICs as well as by their HDMI_VICs."),
     FIELD(uhd_vic)},
    {integer(PATH("hdmi2.allm"), {0, 2}, "Auto low-latency mode: 0 no, 1 yes, 2 as the display."), FIELD(allm)},
    {integer(PATH("hdmi2.vrr"), {0, 2},
             "Variable refresh rate: 0 no, 1 yes, 2 as the display, within the limits below."),
     FIELD(vrr)},
    {integer(PATH("hdmi2.vrr_min"), {1, 48, 48}, "Lowest variable refresh rate of the box, in Hz."), FIELD(vrr_min)},
    {integer(PATH("hdmi2.vrr_max"), {0, 1023},
             "Highest variable refresh rate of the box, in Hz, from 100 on; 0: no limit told."),
     FIELD(vrr_max)},
    {integer(PATH("hdmi2.hdr_gamma"), {0, 2}, "HDR with traditional gamma: 0 no, 1 yes, 2 as the display."),
     FIELD(hdr_gamma)},
    {integer(PATH("hdmi2.hdr_pq"), {0, 2}, "HDR10, which is HDR with PQ: 0 no, 1 yes, 2 as the display."),
     FIELD(hdr_pq)},
    {integer(PATH("hdmi2.hdr_hlg"), {0, 2}, "HDR with hybrid log-gamma: 0 no, 1 yes, 2 as the display."),
     FIELD(hdr_hlg)},
    {integer(PATH("hdmi2.hdr_luminance"), {0, 2, 2},
             "Luminance beside HDR: 0 none, 1 the three below, 2 the display's."),
     FIELD(hdr_luminance)},
    {integer(PATH("hdmi2.hdr_max"), {0, 255}, "Code n of the largest luminance, 50 x 2^(n / 32) cd/m2."),
     FIELD(hdr_max)},
    {integer(PATH("hdmi2.hdr_average"), {0, 255},
             "Code n of the largest frame-average luminance, 50 x 2^(n / 32) cd/m2."),
     FIELD(hdr_average)},
    {integer(PATH("hdmi2.hdr_min"), {0, 255}, "Code n of the smallest luminance, the largest x (n / 255)^2 / 100."),
     FIELD(hdr_min)},
    {integer(PATH("hdmi2.bt2020_rgb"), {0, 2}, "BT.2020 in RGB: 0 no, 1 yes, 2 as the display."), FIELD(bt2020_rgb)},
    {integer(PATH("hdmi2.bt2020_ycc"), {0, 2}, "BT.2020 in YCbCr: 0 no, 1 yes, 2 as the display."), FIELD(bt2020_ycc)},
    {integer(PATH("hdmi2.bt2020_cycc"), {0, 2}, "BT.2020 with constant luminance: 0 no, 1 yes, 2 as the display."),
     FIELD(bt2020_cycc)},
    {integer(PATH("hdmi2.rgb_quantization"), {0, 2, 2},
             "Selectable quantization range in RGB: 0 no, 1 yes, 2 as the display."),
     FIELD(rgb_quantization)},
    {integer(PATH("hdmi2.ycc_quantization"), {0, 2, 2},
             "Selectable quantization range in YCbCr: 0 no, 1 yes, 2 as the display."),
     FIELD(ycc_quantization)},
    {integer(PATH("hdmi2.pass_hdr_dynamic"), {0, 1}, "1: pass on the display's HDR dynamic metadata block."),
     FIELD(pass_hdr_dynamic)},
    {integer(PATH("hdmi2.pass_hdr10plus"), {0, 1}, "1: pass on the display's HDR10+ block."), FIELD(pass_hdr10plus)},
    {integer(PATH("hdmi2.pass_dolby_vision"), {0, 1}, "1: pass on the display's Dolby Vision block."),
     FIELD(pass_dolby_vision)},
    {integer(PATH("hdmi2.pass_freesync"), {0, 1},
             "1: pass on the display's FreeSync block, where vrr is 2 and the display's range is offered unchanged."),
     FIELD(pass_freesync)},
};
static_assert(std::all_of(std::begin(keys), std::end(keys), is_sound));

}  // namespace

std::span<const platform_key_t> hdmi2_keys() {
  return keys;
}

}  // namespace edid_composer
