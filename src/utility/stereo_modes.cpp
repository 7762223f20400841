// The 3D structures and modes that HDMI names (HDMI 1.4a, sections 8.2.3 and 8.3.2).
#include "edid_composer.h"

// kept: bit 15 means side-by-side (half), as bit 8 does.
constinit const u32 _3d_struct_all_array[16] = {
    STEREO_FRAME_PACKING,
    STEREO_FIELD_ALTERNATIVE,
    STEREO_LINE_ALTERNATIVE,
    STEREO_SIDE_BY_SIDE_FULL,
    STEREO_L_DEPTH,
    STEREO_L_DEPTH_GRAPHICS,
    STEREO_TOP_AND_BOTTOM,
    0,
    STEREO_SIDE_BY_SIDE_HALF,
    0,
    0,
    0,
    0,
    0,
    0,
    STEREO_SIDE_BY_SIDE_HALF,
};

constinit const short_video_desc_t _3d_man_modes[5] = {
    {0, 32, STEREO_FRAME_PACKING | STEREO_TOP_AND_BOTTOM},
    {0, 4, STEREO_FRAME_PACKING | STEREO_TOP_AND_BOTTOM},
    {0, 5, STEREO_SIDE_BY_SIDE_HALF},
    {0, 19, STEREO_FRAME_PACKING | STEREO_TOP_AND_BOTTOM},
    {0, 20, STEREO_SIDE_BY_SIDE_HALF},
};
