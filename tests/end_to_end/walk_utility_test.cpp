// Everything that conversions, printers, getters and platform values say.
#include <cstring>

#include "diagnostics_walk.h"
#include "support/configuration_tree.h"
#include "support/edid_builder.h"
#include "support/records.h"

namespace diagnostics_walk {
namespace {

using test_support::configuration_tree_t;
using test_support::scoped_edid_t;
using test_support::timing_of_vic;

row_t utility_error(const char *function, const char *message, std::function<void()> provoke) {
  return error("utility", function, message, std::move(provoke));
}

/// Converts VIC 3's timing after @p change, below a monitor of this size.
std::function<void()> converting(const std::function<void(detailed_timing_t *)> &change, u8 h_size_cm, u8 v_size_cm) {
  return [=] {
    scoped_edid_t edid;
    edid->h_size_cm = h_size_cm;
    edid->v_size_cm = v_size_cm;
    detailed_timing_t timing = timing_of_vic(3);
    change(&timing);
    u32 vic = 0;
    convert_dtd_to_vic(edid.get(), &timing, &vic);
  };
}

void without_size(detailed_timing_t *timing) {
  timing->h_image_size = timing->v_image_size = 0;
}

std::function<void()> converting_standard(std_timing_t timing) {
  return [=] {
    u32 vic = 0;
    convert_std_to_vic(scoped_edid_t().get(), &timing, &vic);
  };
}

std::vector<row_t> conversions() {
  return {
      utility_error("convert_geo_to_ratio", "\"ratio\" parameter is NULL. ratio=(nil)",
                    [] { convert_geo_to_ratio(4, 3, nullptr); }),
      trace("convert_geo_to_ratio", "Got a set of values that didn't match an aspect ratio. width=720 height=480",
            [] {
              u32 ratio = 0;
              convert_geo_to_ratio(720, 480, &ratio);
            }),
      utility_error("convert_vic_to_dtd", "\"timing\" parameter is NULL. timing:(nil)",
                    [] { convert_vic_to_dtd(0, nullptr); }),
      warning("utility", "convert_vic_to_dtd",
              "Invalid vic requested for conversion to a DTD. Requested VIC:65 Range:0-64",
              [] {
                detailed_timing_t timing{};
                convert_vic_to_dtd(65, &timing);
              }),
      utility_error("convert_dtd_to_vic", "\"vic\" parameter is NULL. vic:(nil)",
                    [] { convert_dtd_to_vic(nullptr, nullptr, nullptr); }),
      utility_error("convert_dtd_to_vic", "\"edid\" parameter is NULL. edid:(nil)",
                    [] {
                      u32 vic = 0;
                      convert_dtd_to_vic(nullptr, nullptr, &vic);
                    }),
      utility_error("convert_dtd_to_vic", "\"timing\" parameter is NULL. timing:(nil)",
                    [] {
                      u32 vic = 0;
                      convert_dtd_to_vic(scoped_edid_t().get(), nullptr, &vic);
                    }),
      trace("convert_dtd_to_vic", "Unable to match timing size to an aspect ratio. H pixels:100 V pixels:99",
            converting(
                [](detailed_timing_t *timing) {
                  timing->h_image_size = 100;
                  timing->v_image_size = 99;
                },
                0, 0)),
      trace("convert_dtd_to_vic",
            "Timings image size is zeroed as is the EDID monitor size. Unable to match to a timing.",
            converting(without_size, 0, 0)),
      trace("convert_dtd_to_vic", "Unable to match image size to an aspect ratio. H pixels:100 V pixels:99",
            converting(without_size, 100, 99)),
      trace("convert_dtd_to_vic", "Unable to match Detailed Timing Description.", converting(without_size, 0, 0)),
      trace("convert_dtd_to_vic", "\tH image size:    0 mm (0 in)", converting(without_size, 0, 0)),
      trace("convert_dtd_to_vic", "\tV sync:          Negative", converting(without_size, 0, 0)),
      utility_error("mode_to_vic", "Parameter \"mode\" is NULL. mode:(nil)", [] { mode_to_vic(nullptr, nullptr); }),
      utility_error("mode_to_vic", "Parameter \"vic\" is NULL. vic:(nil)",
                    [] {
                      const video_mode_t mode{};
                      mode_to_vic(&mode, nullptr);
                    }),
      trace("mode_to_vic", "\tMode is 1920x1080i60. Attempting to find a match.",
            [] {
              const video_mode_t mode{1920, 1080, 1, 60};
              u32 vic = 0;
              mode_to_vic(&mode, &vic);
            }),
      utility_error("convert_std_to_vic", "\"vic\" parameter is NULL. vic:(nil)",
                    [] { convert_std_to_vic(nullptr, nullptr, nullptr); }),
      utility_error("convert_std_to_vic", "\"edid\" parameter is NULL. edid:(nil)",
                    [] {
                      u32 vic = 0;
                      convert_std_to_vic(nullptr, nullptr, &vic);
                    }),
      utility_error("convert_std_to_vic", "\"timing\" parameter is NULL. timing:(nil)",
                    [] {
                      u32 vic = 0;
                      convert_std_to_vic(scoped_edid_t().get(), nullptr, &vic);
                    }),
      trace("convert_std_to_vic",
            "Aspect ratio of the standard timing is not a short video mode supported ratio. ratio:1:1",
            converting_standard({640, 0, 60})),
      trace("convert_std_to_vic", "Failed converting mode to vic. WxH=(1280,2275) Refresh:60",
            converting_standard({1280, 3, 60})),
      trace("convert_std_to_vic", "Unable to match Standard Timing. Hactive:1280 Aspect Ratio:16:9 Refresh Rate:60",
            converting_standard({1280, 3, 60})),
  };
}

std::vector<row_t> printers() {
  const char *const no_string = "\"string\" parameter is NULL. string:(nil)";
  const char *const short_string = "\"string_len\" invalid. string_len:16 minimum:17";
  return {
      utility_error("audio_freq_string", no_string, [] { audio_freq_string(1, nullptr, 0); }),
      utility_error("audio_freq_string", short_string,
                    [] {
                      char text[16];
                      audio_freq_string(1, text, sizeof text);
                    }),
      utility_error("audio_pcm_bits_string", no_string, [] { audio_pcm_bits_string(1, nullptr, 0); }),
      utility_error("audio_pcm_bits_string", short_string,
                    [] {
                      char text[16];
                      audio_pcm_bits_string(1, text, sizeof text);
                    }),
      utility_error("print_audio_structure", "\"audio\" parameter is NULL. str:(nil)",
                    [] { print_audio_structure(nullptr); }),
      bug("utility", "print_est_man_type", "string_func is:(nil)", [] { print_est_man_type(1, nullptr, nullptr); }),
      bug("utility", "print_est_man_type", "str ptr is NULL or 0 length:(nil)",
          [] { print_est_man_type(1, est_timing_1_string, nullptr); }),
      bug("utility", "print_est_man_type", "str ptr is NULL or 0 length:PTR",
          [] { print_est_man_type(1, est_timing_1_string, ""); }),
  };
}

const std::string year_path = "platform.software.drivers.vorex.edid.year";

/// Reads a signed number between -10 and 10, of which the configuration holds @p value.
std::function<void()> getting(i32 value) {
  return [=] {
    configuration_tree_t tree;
    tree.set("year", value);
    get_pc_int("year", -10, 10, 0, true);
  };
}

std::vector<row_t> getters() {
  const std::string smaller = " is smaller than the minimum value. Setting to minimum.";
  const std::string larger = " is larger than the maximum value. Setting to maximum.";
  const std::string path = "The value for platform path:" + year_path;
  return {
      warning("utility", "get_pc_str",
              "Error trying to read \"" + year_path + "\" from the platform config. Using:none",
              [] {
                const configuration_tree_t tree;
                char text[8]{};
                get_pc_str("year", text, sizeof text, "none", true);
              }),
      warning("utility", "get_pc_int", "Unable to find the platform path:" + year_path + " Defaulting to:-3",
              [] {
                const configuration_tree_t tree;
                get_pc_int("year", -10, 10, -3, true);
              }),
      warning("utility", "get_pc_uint", "Unable to find the platform path:" + year_path + " Defaulting to:-1",
              [] {
                const configuration_tree_t tree;
                get_pc_uint("year", 0, 0xFFFFFFFF, 0xFFFFFFFF, true);
              }),
      warning("utility", "get_pc_int", path + smaller + " Min:-10 Val:-11 Max:10", getting(-11)),
      warning("utility", "get_pc_int", path + larger + " Min:-10 Val:11 Max:10", getting(11)),
      warning("utility", "get_pc_uint", path + smaller + " Min:5 Val:4 Max:9",
              [] {
                configuration_tree_t tree;
                tree.set("year", 4);
                get_pc_uint("year", 5, 9, 5, true);
              }),
      warning("utility", "get_pc_uint", path + larger + " Min:5 Val:-1 Max:9",
              [] {
                configuration_tree_t tree;
                tree.set("year", -1);
                get_pc_uint("year", 5, 9, 5, true);
              }),
      trace("get_pc_int", "Platform config read. Path:" + year_path + " val:7", getting(7)),
      trace("get_pc_uint", "Platform config read. Path:" + year_path + " val:7",
            [] {
              configuration_tree_t tree;
              tree.set("year", 7);
              get_pc_uint("year", 0, 9, 0, true);
            }),
  };
}

/// Destroys platform values of which one list is corrupt, and what is left of them.
std::function<void()> destroying_corrupt(ll_list_t platform_values_t::*list) {
  return [=] {
    platform_values_t values;
    platform_values_init(&values);
    (values.*list).size = 1;
    platform_values_destroy(&values);
    (values.*list).size = 0;
    for (ll_list_t *left : {&values.audio_list, &values.video_50_priority, &values.video_50_additional,
                            &values.video_60_priority, &values.video_60_additional, &values.std_timings}) {
      if (ll_is_initialized(left)) ll_delete_list(left);
    }
  };
}

std::vector<row_t> platform_values() {
  const auto failure = [](const char *message, ll_list_t platform_values_t::*list) {
    return bug("utility", "platform_values_destroy", message, destroying_corrupt(list));
  };
  return {
      failure("Failed removing platform audio_list", &platform_values_t::audio_list),
      failure("Failed removing platform video_50_priority", &platform_values_t::video_50_priority),
      failure("Failed removing platform video_50_additional", &platform_values_t::video_50_additional),
      failure("Failed removing platform video_60_priority", &platform_values_t::video_60_priority),
      failure("Failed removing platform video_60_additional", &platform_values_t::video_60_additional),
      failure("Failed removing platform values standard timings", &platform_values_t::std_timings),
  };
}

WALK(Conversions, conversions());
WALK(Printers, printers());
WALK(Getters, getters());
WALK(PlatformValues, platform_values());

}  // namespace
}  // namespace diagnostics_walk
