#include <algorithm>

#include "annotation.h"
#include "text_format.h"

namespace golden {
namespace {

/// The payload of the HDMI vendor-specific data block, field after field, as far as its length goes.
class hdmi_block_t {
 public:
  hdmi_block_t(annotated_hex_t &hex, std::size_t length) : hex_(hex), end_(hex.position() + length) {}

  void annotate() {
    hex_.field(3, "HDMI, OUI 00-0C-03");
    hex_.field(2, format("physical address %X.%X.%X.%X", hex_.next(0) >> 4U, hex_.next(0) & 0xFU, hex_.next(1) >> 4U,
                         hex_.next(1) & 0xFU));
    if (left()) annotate_colour();
    if (left()) annotate_clock();
    if (left()) annotate_presence();
  }

 private:
  bool left() const { return hex_.position() < end_; }

  void annotate_colour() {
    hex_.field(1, listed(set_bits(hex_.next(), {{0x80, "Supports_AI"},
                                                {0x40, "deep colour 48 bits"},
                                                {0x20, "deep colour 36 bits"},
                                                {0x10, "30 bits"},
                                                {0x08, "in YCbCr 4:4:4 too"},
                                                {0x01, "DVI dual link"}}),
                         "no deep colour"));
  }

  void annotate_clock() {
    const unsigned clock = hex_.next() * 5U;
    hex_.field(1, clock == 0 ? "TMDS clock not declared" : format("TMDS clock up to %u MHz", clock));
  }

  /// What follows, and the content types.
  void annotate_presence() {
    const u8 byte = hex_.next();
    const auto names = set_bits(byte, {{0x80, "latencies"},
                                       {0x40, "interlaced latencies"},
                                       {0x20, "HDMI video"},
                                       {0x01, "graphics"},
                                       {0x02, "photo"},
                                       {0x04, "cinema"},
                                       {0x08, "game"}});
    hex_.field(1, listed(names, "no latencies, no HDMI video, no content types"));
    if ((byte & 0x80) != 0) annotate_latencies("");
    if ((byte & 0xC0) == 0xC0) annotate_latencies("interlaced: ");
    if ((byte & 0x20) != 0) annotate_video();
  }

  static std::string latency(u8 byte) {
    if (byte == 0) return "not known";
    if (byte == 255) return "not supported";
    return format("%u ms", (byte - 1U) * 2);
  }

  void annotate_latencies(const char *label) {
    hex_.field(2, format("%svideo %s, audio %s", label, latency(hex_.next(0)).c_str(), latency(hex_.next(1)).c_str()));
  }

  void annotate_video() {
    const u8 byte = hex_.next();
    const bool has_3d = (byte & 0x80) != 0;
    hex_.field(1, format("%s, 3D_Multi_present %u, Image_Size %u", has_3d ? "3D: mandatory formats" : "no 3D",
                         byte >> 5U & 3U, byte >> 3U & 3U));
    const std::size_t vics = hex_.next() >> 5U;
    const std::size_t size_of_3d = hex_.next() & 0x1FU;
    hex_.field(1, format("%zu HDMI VIC%s, %zu bytes of 3D", vics, vics == 1 ? "" : "s", size_of_3d));
    for (std::size_t index = 0; index < vics; ++index)
      hex_.field(1, format("HDMI VIC %u, %s", hex_.next(), hdmi_vic_string(hex_.next())));

    const std::size_t end = std::min(end_, hex_.position() + size_of_3d);
    // Structures for all modes would stand first.
    if ((byte >> 5 & 3) == 0) annotate_3d_entries(end);
  }

  void annotate_3d_entries(std::size_t end) {
    static const char *const structures[] = {"frame packing",     "field alternative", "line alternative",
                                             "side-by-side full", "L + depth",         "L + depth + gfx",
                                             "top-and-bottom",    "reserved structure"};
    constexpr unsigned side_by_side_half = 8;
    while (hex_.position() < end) {
      const unsigned structure = hex_.next() & 0xFU;
      const bool has_detail = structure >= side_by_side_half;
      const char *name = structure == side_by_side_half ? "side-by-side half"
                         : has_detail                   ? "reserved structure"
                                                        : structures[structure];
      hex_.field(has_detail ? 2 : 1, format("video descriptor %u: %s", hex_.next() >> 4U, name));
    }
  }

  annotated_hex_t &hex_;
  std::size_t end_;
};

}  // namespace

void annotate_vendor_block(annotated_hex_t &hex, std::size_t length) {
  const bool is_hdmi = hex.next(0) == 0x03 && hex.next(1) == 0x0C && hex.next(2) == 0x00;
  if (is_hdmi && length >= 5) hdmi_block_t(hex, length).annotate();
}

}  // namespace golden
