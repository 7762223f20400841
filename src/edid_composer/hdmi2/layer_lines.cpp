#include "edid_composer/hdmi2/layer_lines.h"

#include "diagnostics.h"

namespace edid_composer {
namespace {

REPORTS_AS(report_offer);

constexpr u8 hdr_eotfs = HDMI2_EOTF_PQ | HDMI2_EOTF_HLG;
constexpr u8 wide_color_spaces = HDMI2_BT2020_RGB | HDMI2_BT2020_YCC;

void report_hdr_without_bt2020(const layer_inputs_t &inputs, const hdmi2_t &blocks) {
  constexpr i32 always = 1;
  if ((blocks.eotfs & hdr_eotfs) == 0 || (blocks.colorimetry & wide_color_spaces) != 0) return;
  const bool pq = (blocks.eotfs & HDMI2_EOTF_PQ) != 0;
  const bool hlg = (blocks.eotfs & HDMI2_EOTF_HLG) != 0;
  if (inputs.platform.hdr_pq == always || inputs.platform.hdr_hlg == always) {
    LOG_WARNING("HDR is offered without BT.2020 in RGB or YCbCr. Sources may not send it. PQ:%s HLG:%s",
                true_or_false(pq), true_or_false(hlg));
  } else {
    LOG_TRACE("HDR is offered without BT.2020 in RGB or YCbCr, as the sink has it. PQ:%s HLG:%s", true_or_false(pq),
              true_or_false(hlg));
  }
}

void report_forum_block(const offer_t &offer) {
  if (offer.depths_420.requires_30) {
    LOG_WARNING("36 bit in 4:2:0 is offered without 30 bit, which HDMI requires. Setting 30 bit support to true.");
  }
  if (offer.vrr.reason == COMPOSE_REASON_VRR_RANGE_INVALID) {
    LOG_WARNING(
        "The range of the variable refresh rate is not valid. Leaving it out. Minimum:%d Hz, expected 1 to 48 "
        "Maximum:%d Hz, expected 0 or at least 100",
        offer.vrr.range.minimum, offer.vrr.range.maximum);
  }
}

void trace_blocks(const offer_t &offer) {
  const hdmi2_t &blocks = offer.blocks;
  LOG_TRACE("\tRate on the link:%u MHz HDMI block:%u MHz HDMI Forum block:%u MHz", offer.rate,
            offer.tmds_clock.wanted_mhz, blocks.max_tmds_rate);
  LOG_TRACE("\tSCDC:%u Read request:%u Scrambling at or below 340 MHz:%u UHD VIC:%u", blocks.scdc, blocks.read_request,
            blocks.scramble_low, blocks.uhd_vic);
  LOG_TRACE("\t4:2:0: 30 bit:%u 36 bit:%u Only in it:%u modes Map:%u bytes", blocks.dc_30bit_420, blocks.dc_36bit_420,
            blocks.y420_count, blocks.y420_map_bytes);
  LOG_TRACE("\tALLM:%u VRR:%u (%u-%u Hz)", blocks.allm, blocks.vrr_present, blocks.vrr_min, blocks.vrr_max);
  LOG_TRACE("\tEOTFs:0x%02X Luminance values:%u Colorimetry:0x%02X", blocks.eotfs, blocks.luminance_count,
            blocks.colorimetry);
  LOG_TRACE("\tQuantization range selectable: RGB:%u YCbCr:%u", blocks.rgb_quantization, blocks.ycc_quantization);
  LOG_TRACE("\tData blocks end at byte %u of the extension.", offer.data_block_end);
}

}  // namespace

void report_modes(const layer_inputs_t &inputs, const link_rates_t &rates, const extended_modes_t &modes) {
  REPORTS_AS(report_modes);
  LOG_TRACE("HDMI 2: Rates: platform:%u MHz sink:%u MHz both:%u MHz", rates.platform, rates.sink, rates.both);
  if (!inputs.has_sink) LOG_TRACE("\tNo sink: the platform decides alone.");
  for (const extended_mode_t &mode : modes) {
    LOG_TRACE("\tVIC:%u %s %u kHz: %s", mode.vic(), extended_vic_string(mode.vic()), mode.timing->pixel_clock_khz,
              compose_reason_string(mode.reason));
  }
}

void report_offer(const layer_inputs_t &inputs, const offer_t &offer) {
  report_hdr_without_bt2020(inputs, offer.blocks);
  report_forum_block(offer);
  trace_blocks(offer);
}

}  // namespace edid_composer
