#include "explain/hdmi2_reason_table.h"

namespace edid_cli {
namespace {

constexpr const char *limit_key = "hdmi2.tmds_limit";

constexpr reason_text_t rows[] = {
    {COMPOSE_REASON_ONLY_IN_420,
     "Offered in YCbCr 4:2:0 only, where it needs {1:k}: otherwise it needs {0:k}, and the link takes {2:k}.",
     {limit_key, "hdmi2.y420"}},
    {COMPOSE_REASON_ABOVE_RATE, "It needs {0:k}, and {link} {1:k}.", {limit_key}},
    {COMPOSE_REASON_SINK_HAS_IT_IN_420,
     "The sink has it in YCbCr 4:2:0 only, and hdmi2.y420 = {0} does not offer that.",
     {"hdmi2.y420"}},
    {COMPOSE_REASON_OFF, "{key} = {0} does not offer it{though}."},
    {COMPOSE_REASON_BOX_ITSELF, "{key} = {0}: the box does it itself."},
    {COMPOSE_REASON_AS_SINK, "{key} = {0}: as the sink, which has it."},
    {COMPOSE_REASON_SINK_WITHOUT,
     "{key} = {0}: as the sink, which does not have it.",
     {},
     nullptr,
     sink_part_t::none,
     "{key} = {0}: as the sink, but {missing}."},
    {COMPOSE_REASON_VRR_RANGE_INVALID,
     "The box and the sink together have {vrr_range}, which no source may use: the lowest rate must be 1 to 48 Hz, the "
     "highest 100 Hz or more, or without a limit.",
     {"hdmi2.vrr_min", "hdmi2.vrr_max"}},
    {COMPOSE_REASON_TMDS_OF_LINK, "It is the most that this block declares; the HDMI Forum block declares {0} MHz."},
    {COMPOSE_REASON_TMDS_OF_EXTENDED_MODES, "Modes above VIC 64 need it: the fastest takes {0:k} on the link."},
    {COMPOSE_REASON_TMDS_LIMITED,
     "{0} MHz would be declared, but the box, the sink or the modes limit it to {1} MHz.",
     {limit_key}},
    {COMPOSE_REASON_PASSED_ON, "{key} = 1: the sink's block is passed on, {0} bytes."},
    {COMPOSE_REASON_RATE_BELOW_BLOCK,
     "The sink's block announces a mode that needs {0} MHz, and the link takes {1} MHz.",
     {limit_key}},
    {COMPOSE_REASON_VRR_CHANGED,
     "The sink's block has its range of refresh rates, and that is not offered unchanged.",
     {"hdmi2.vrr"}},
    {COMPOSE_REASON_LINK_RATE_OF_BOX, "The box's receiver takes {0} MHz, the sink {1} MHz."},
    {COMPOSE_REASON_LINK_RATE_OF_SINK,
     "The sink takes {1} MHz, the box's receiver {0} MHz.",
     {},
     nullptr,
     sink_part_t::none,
     "The box's receiver takes {0} MHz. What the sink takes is not known: {missing}."},
    {COMPOSE_REASON_LINK_RATE_OF_ADDED_MODES,
     "Modes that the box makes itself need it. The box's receiver takes {0} MHz, the sink {1} MHz."},
    {COMPOSE_REASON_NO_MODE_IN_420, "{key} = {0}, but no mode that is offered can be sent in it."},
    {COMPOSE_REASON_RATE_BELOW_DEPTH, "No mode in 4:2:0 leaves room for it: the link takes {0} MHz.", {limit_key}},
    {COMPOSE_REASON_DEEP_COLOR_420_REQUIRED, "HDMI requires 30 bits where 36 bits are offered."},
    {COMPOSE_REASON_UHD_VIC_OF_MODES, "A 4Kx2K mode is offered both by its HDMI VIC and by its VIC."},
    {COMPOSE_REASON_NO_UHD_VIC, "No 4Kx2K mode is offered both by its HDMI VIC and by its VIC."},
    {COMPOSE_REASON_NO_FORUM_BLOCK, "It would be declared in the HDMI Forum block, which nothing else calls for."},
    {COMPOSE_REASON_FIRST_EXTENDED_MODE, "It is the first offered mode above VIC 64 that a detailed timing can hold."},
    {COMPOSE_REASON_NO_EXTENDED_TIMING, "No mode above VIC 64 is offered that a detailed timing can hold."},
};

}  // namespace

std::span<const reason_text_t> hdmi2_reason_texts() {
  return rows;
}

}  // namespace edid_cli
