#include "edid_text/hdmi2_fields.h"

#include <algorithm>

#include "edid_text/hdmi2_texts.h"
#include "edid_text/mode_names.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

using values_t = std::vector<std::string>;

/// A field of a data block, by the member that says whether the block is there.
template <auto present, auto member>
values_t yes_or_no(const edid_records_t &records) {
  return records.hdmi2.*present == 0 ? values_t{} : values_t{records.hdmi2.*member != 0 ? "yes" : "no"};
}

template <auto present, auto member, std::string (*text_of)(u32)>
values_t text(const edid_records_t &records) {
  return records.hdmi2.*present == 0 ? values_t{} : values_t{text_of(records.hdmi2.*member)};
}

template <auto present, auto member, texts_t (*texts_of)(u32)>
values_t list(const edid_records_t &records) {
  return records.hdmi2.*present == 0 ? values_t{} : texts_of(records.hdmi2.*member);
}

std::string number_text(u32 number) {
  return std::to_string(number);
}

std::string scan_of_preferred(u32 code) {
  return scan_text(code, scan_as_other_timings);
}

std::string scan_of_others(u32 code) {
  return scan_text(code, scan_unsupported);
}

/// The color spaces but for those that have fields of their own.
texts_t wide_color_spaces(u32 bits) {
  return color_space_texts(bits & ~u32{HDMI2_XVYCC601 | HDMI2_XVYCC709});
}

/// The modes of all extensions that the record of the first one doesn't have.
values_t further_modes(const edid_records_t &records) {
  std::vector<u32> known;
  for (const ll_entry_t *entry = records.edid.video_list.head; entry != nullptr; entry = entry->next) {
    known.push_back(vic_of(*static_cast<const short_video_desc_t *>(entry->data)));
  }
  values_t values;
  const hdmi2_t &hdmi2 = records.hdmi2;
  for (u32 index = 0; index < hdmi2.svd_count; ++index) {
    const u32 vic = decoded_svd(hdmi2.svds[index]).vic;
    if (std::find(known.begin(), known.end(), vic) == known.end()) {
      values.push_back(video_mode_name(vic));
    }
  }
  return values;
}

bool is_marked(const hdmi2_t &hdmi2, u32 index) {
  const bool marks_all = hdmi2.y420_map_present != 0 && hdmi2.y420_map_bytes == 0;
  return marks_all ||
         (index / 8 < hdmi2.y420_map_bytes && (static_cast<u32>(hdmi2.y420_map[index / 8]) >> index % 8 & 1U) != 0);
}

values_t modes_420_too(const edid_records_t &records) {
  values_t values;
  for (u32 index = 0; index < records.hdmi2.svd_count; ++index) {
    if (is_marked(records.hdmi2, index)) {
      values.push_back(video_mode_name(decoded_svd(records.hdmi2.svds[index]).vic));
    }
  }
  return values;
}

values_t modes_420_only(const edid_records_t &records) {
  values_t values;
  for (u32 index = 0; index < records.hdmi2.y420_count; ++index) {
    values.push_back(video_mode_name(decoded_svd(records.hdmi2.y420_vics[index]).vic));
  }
  return values;
}

template <u32 index>
values_t luminance(const edid_records_t &records) {
  constexpr u32 minimum = 2;
  const hdmi2_t &hdmi2 = records.hdmi2;
  if (hdmi2.hdr_static_present == 0 || index >= hdmi2.luminance_count) {
    return {};
  }
  return {index == minimum ? minimum_luminance_text(hdmi2.luminance[0], hdmi2.luminance[index])
                           : luminance_text(hdmi2.luminance[index])};
}

template <auto member>
values_t block_bytes(const edid_records_t &records) {
  const hdmi2_block_t &block = records.hdmi2.*member;
  return block.length == 0 ? values_t{} : values_t{hex_bytes({block.payload, block.length}, " ", letters_t::capital)};
}

constexpr auto forum = &hdmi2_t::forum_present;
constexpr auto capability = &hdmi2_t::video_capability_present;
constexpr auto colorimetry = &hdmi2_t::colorimetry_present;
constexpr auto hdr = &hdmi2_t::hdr_static_present;

constexpr edid_field_t fields[] = {
    {"further video mode", further_modes},
    {"mode in YCbCr 4:2:0 too", modes_420_too},
    {"mode in YCbCr 4:2:0 only", modes_420_only},
    {"HDMI Forum version", text<forum, &hdmi2_t::forum_version, number_text>},
    {"highest TMDS rate", text<forum, &hdmi2_t::max_tmds_rate, tmds_rate_text>},
    {"SCDC", yes_or_no<forum, &hdmi2_t::scdc>},
    {"SCDC read request", yes_or_no<forum, &hdmi2_t::read_request>},
    {"scrambling at or below 340 MHz", yes_or_no<forum, &hdmi2_t::scramble_low>},
    {"fixed rate link", text<forum, &hdmi2_t::frl_rate, fixed_rate_link_text>},
    {"VICs of the modes that have an HDMI_VIC", yes_or_no<forum, &hdmi2_t::uhd_vic>},
    {"deep colour in 4:2:0, 48 bits", yes_or_no<forum, &hdmi2_t::dc_48bit_420>},
    {"deep colour in 4:2:0, 36 bits", yes_or_no<forum, &hdmi2_t::dc_36bit_420>},
    {"deep colour in 4:2:0, 30 bits", yes_or_no<forum, &hdmi2_t::dc_30bit_420>},
    {"auto low-latency mode", yes_or_no<&hdmi2_t::allm_present, &hdmi2_t::allm>},
    {"lowest variable refresh rate", text<&hdmi2_t::vrr_present, &hdmi2_t::vrr_min, lowest_variable_rate_text>},
    {"highest variable refresh rate", text<&hdmi2_t::vrr_present, &hdmi2_t::vrr_max, highest_variable_rate_text>},
    {"RGB quantization selectable", yes_or_no<capability, &hdmi2_t::rgb_quantization>},
    {"YCC quantization selectable", yes_or_no<capability, &hdmi2_t::ycc_quantization>},
    {"scan of the preferred timing", text<capability, &hdmi2_t::preferred_scan, scan_of_preferred>},
    {"scan of IT timings", text<capability, &hdmi2_t::it_scan, scan_of_others>},
    {"scan of CE timings", text<capability, &hdmi2_t::ce_scan, scan_of_others>},
    {"wide colour space", list<colorimetry, &hdmi2_t::colorimetry, wide_color_spaces>},
    {"gamut metadata", list<colorimetry, &hdmi2_t::gamut_metadata, gamut_texts>},
    {"transfer function", list<hdr, &hdmi2_t::eotfs, eotf_texts>},
    {"static metadata", list<hdr, &hdmi2_t::metadata_types, metadata_type_texts>},
    {"highest luminance", luminance<0>},
    {"highest average luminance", luminance<1>},
    {"lowest luminance", luminance<2>},
    {"HDR dynamic metadata", block_bytes<&hdmi2_t::hdr_dynamic>},
    {"HDR10+", block_bytes<&hdmi2_t::hdr10plus>},
    {"Dolby Vision", block_bytes<&hdmi2_t::dolby_vision>},
    {"FreeSync", block_bytes<&hdmi2_t::freesync>},
};

}  // namespace

std::span<const edid_field_t> hdmi2_fields() {
  return fields;
}

}  // namespace edid_cli
