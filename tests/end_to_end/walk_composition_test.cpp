// Everything that a composition from a caller's own platform values says.
#include <cstring>

#include "diagnostics_walk.h"
#include "support/edid_builder.h"
#include "support/records.h"

namespace diagnostics_walk {
namespace {

using test_support::append;
using test_support::append_modes;
using test_support::bytes_t;
using test_support::scoped_values_t;

constexpr const char *pipeline = "compose_edid_internal";

row_t composer_error(const char *function, const std::string &message, std::function<void()> provoke) {
  return error("edid_composer", function, message, std::move(provoke));
}

/// What a row may change before the composition.
struct scene_t {
  scoped_values_t values;
  compose_cfg_t cfg = test_support::plain_settings();
  bytes_t sink;
  u32 new_edid_bytes = 256;
};

/// Composes once, from four modes and no sink, after @p change.
std::function<void()> composing(const std::function<void(scene_t &)> &change) {
  return [=] {
    scene_t scene;
    append_modes(scene.values->video_60_priority, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
    append_modes(scene.values->video_60_additional, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
    change(scene);
    bytes_t bytes(scene.new_edid_bytes);
    compose_edid_internal(scene.sink.empty() ? nullptr : scene.sink.data(), static_cast<u32>(scene.sink.size()),
                          bytes.data(), scene.new_edid_bytes, &scene.cfg, scene.values.get());
  };
}

std::function<void()> composing() {
  return composing([](scene_t &) {});
}

/// A sink with these data blocks, one detailed timing of @p vic and one standard timing.
bytes_t sink_with(u32 vic, const std::vector<bytes_t> &blocks) {
  test_support::extension_builder_t extension;
  for (const bytes_t &block : blocks)
    extension.block(block);
  return test_support::join(test_support::base_block_builder_t()
                                .descriptor(0, test_support::timing_descriptor(test_support::timing_of_vic(vic)))
                                .standard_timing(0, 0x81, 0x80)
                                .extensions(1)
                                .build(),
                            extension.build());
}

std::function<void()> composing_below(const bytes_t &sink) {
  return composing([=](scene_t &scene) { scene.sink = sink; });
}

bytes_t sink_at(u8 ab, u8 cd) {
  return sink_with(16, {test_support::hdmi_block({ab, cd})});
}

/// Turns an initialised list into an empty one of another type.
void make_foreign(ll_list_t &list) {
  ll_delete_list(&list);
  ll_init(&list, "int");
}

/// Leaves a single mode for the selection, of which nobody knows the timing.
void select_unknown_mode(scene_t &scene) {
  for (ll_list_t *list : {&scene.values->video_60_priority, &scene.values->video_60_additional}) {
    ll_delete_list(list);
    ll_init(list, "short_video_desc_t");
    append_modes(*list, {{100, 0}});
  }
}

std::vector<row_t> arguments() {
  static bytes_t bytes(256);
  static const compose_cfg_t cfg = test_support::plain_settings();
  return {
      trace(pipeline,
            "\"edid_block\" memory block parameter is NULL. Skipping edid reading and proceeding with creation. "
            "edid_block:(nil)",
            composing()),
      trace(pipeline,
            "Edid is not an valid value. edid_bytes=0 Range=(128-256) Skipping edid reading and proceeding with "
            "creation.",
            composing()),
      trace(pipeline, "Valid edid not available. Continuing composing edid. Passed in edid:(nil) size:0 bytes",
            composing()),
      composer_error(pipeline,
                     "\"new_edid_block\" memory block parameter is NULL. Unable to proceed. new_edid_block:(nil)",
                     [] { compose_edid(nullptr, 0, nullptr, 256, &cfg); }),
      composer_error(pipeline, "New EDID size is not an valid value. Unable to proceed. edid_bytes=257 Expected=256",
                     [] { compose_edid(nullptr, 0, bytes.data(), 257, &cfg); }),
      composer_error(pipeline, "cfg is NULL. Unable to proceed. cfg : (nil).",
                     [] { compose_edid(nullptr, 0, bytes.data(), 256, nullptr); }),
      composer_error(pipeline, "The passed in platform_values has not been initialized.",
                     [] {
                       const platform_values_t values{};
                       compose_edid_internal(nullptr, 0, bytes.data(), 256, &cfg, &values);
                     }),
  };
}

std::vector<row_t> stages() {
  const bytes_t sink = sink_with(16, {});
  bytes_t bad_extension = sink;
  bad_extension[128] = 0xF0;
  return {
      trace(pipeline, "Decode EDID Block 0", composing_below(sink)),
      trace(pipeline, "Decode EDID Block 1", composing_below(sink)),
      composer_error(pipeline, "Failed decoding the edid block 0. Continuing.", composing_below(bytes_t(128))),
      composer_error(pipeline, "Failed decoding the extension. Continuing.", composing_below(bad_extension)),
      composer_error(pipeline, "Failed filtering the video modes.",
                     [] {
                       scoped_values_t values;
                       const ll_list_t kept = values->video_60_additional;
                       values->video_60_additional.magic = 0;
                       bytes_t bytes(256);
                       const compose_cfg_t cfg = test_support::plain_settings();
                       compose_edid_internal(nullptr, 0, bytes.data(), 256, &cfg, values.get());
                       values->video_60_additional = kept;
                     }),
      composer_error(pipeline, "Failed populating the new edid.", composing(select_unknown_mode)),
      composer_error(pipeline, "Failed encoding the new edid.",
                     composing([](scene_t &scene) { scene.new_edid_bytes = 128; })),
      trace(pipeline, "New EDID...", composing()),
  };
}

std::vector<row_t> video_modes() {
  const char *const filter = "_filter_video_modes";
  const char *const native = "_determine_tv_native_refresh_rate";
  const bytes_t unknown_vic = sink_with(16, {test_support::video_block({100})});
  const auto limiting = [](const bytes_t &sink) {
    return composing([=](scene_t &scene) {
      scene.sink = sink;
      scene.values->geometry_limit = 1;
    });
  };
  const auto current_mode = [](const video_mode_t &mode) {
    return composing([=](scene_t &scene) {
      scene.values->current_mode_set_to_priority = 1;
      scene.cfg.hdmi_current_mode = mode;
    });
  };
  return {
      trace("_combine_lists", "Combine Lists:", composing()),
      trace("_combine_lists", "\tAdding video format:16 1920x1080p60Hz16x9 stereo:0x000", composing()),
      trace("_combine_lists", "\tList after combining:", composing()),
      composer_error(filter, "The list types don't match.",
                     composing([](scene_t &scene) { make_foreign(scene.values->video_60_priority); })),
      trace(filter, "Combining 60Hz lists:", composing()),
      trace(filter, "Combining 50Hz lists:", composing([](scene_t &scene) { scene.values->native_refresh_rate = 50; })),
      trace(filter, "\tPrioritization List:", composing()),
      trace(filter, "Prioritize the list of valid modes and remove duplicates. Modes:4 MasterList:4", composing()),
      trace(filter, "\tIgnoring hdmi_current_mode.", composing()),
      trace(filter, "\tAdding hdmi output mode as the priority mode:1280x720p50Hz16x9",
            current_mode({1280, 720, 0, 50})),
      composer_error(filter, "Could not obtain a valid hdmi mode. Continuing.", current_mode({1366, 768, 0, 60})),
      trace(filter, "\tNew EDID List of VICs:", composing()),
      trace(native, "Found DTD number: index #0 had a 60 Hz refresh rate. Using 60Hz as native rate.",
            composing_below(sink_with(16, {}))),
      trace(native, "Found DTD number: index #0 had a 50 Hz refresh rate. Using 50 as native rate.",
            composing_below(sink_with(31, {}))),
      trace(native, "Found a standard timing number: index #0 had a 60Hz refresh rate. Using 60 as native rate.",
            composing_below(sink_with(32, {}))),
      trace(
          native,
          "Unable to find a video mode that indicates the native refresh rate of the television. Reading the platform "
          "config file for native refresh rate.",
          composing()),
      trace(native, "Using 60Hz as native rate.", composing()),
      bug("edid_composer", native, "Expected to return only 50 or 60 here. Forcing value to 60. Val:55",
          composing([](scene_t &scene) { scene.values->native_refresh_rate = 55; })),
      bug("edid_composer", "_find_largest_height", "\tFailed converting VIC:100 to a DTD.", limiting(unknown_vic)),
      bug("edid_composer", "_remove_larger_height_modes", "\tFailed converting VIC:100 to a DTD.",
          limiting(unknown_vic)),
      trace("_find_largest_height", "Largest Height:720\n", limiting(sink_with(16, {test_support::video_block({4})}))),
  };
}

std::vector<row_t> modes_4k_x_2k() {
  const auto modes = composing([](scene_t &scene) {
    scene.values->modes_4k_x_2k_priority[0] = 4;
    scene.values->modes_4k_x_2k_addition[0] = 4;
  });
  return {
      trace("_filter_4k_modes", "Downstream 4k x 2k:", modes),
      trace("_filter_4k_modes", "Additional 4k x 2k:", modes),
      trace("_filter_4k_modes", "Priority 4k x 2k:", modes),
      trace("_filter_4k_modes", "\t4\t4096x2160p24Hz", modes),
      trace("_filter_4k_modes", "\tAdding 4k x 2k mode:4:4096x2160p24Hz", modes),
  };
}

std::vector<row_t> audio_formats() {
  const char *const filter = "_filter_audio_formats";
  const auto with_formats = composing([](scene_t &scene) {
    scene.values->audio_pass_through = 1;
    scene.cfg.audio_sink_filter = 1;
    for (const i32 format : {0x500715, 0x500715, 0xC0063D})
      append(scene.values->audio_list, format);
    scene.sink = sink_with(16, {test_support::audio_block({0x15, 0x07, 0x50, 0x57, 0x06, 0x00})});
  });
  const auto with_stereo = composing([](scene_t &scene) { append(scene.values->audio_list, i32{0x050709}); });
  return {
      trace(filter, "Create Audio mode list:", composing()),
      trace(filter, "\tExamining platform audio formats:", composing()),
      trace(filter, "\tSink Filter is turned OFF", composing()),
      trace(filter, "\tSink Filter is turned ON", with_formats),
      trace(filter, "\tPassThrough Mode:1", with_formats),
      trace(filter, "\tReading the platform audio modes:", composing()),
      warning("edid_composer", filter, "Failed decoding audio format. Val:0x123400",
              composing([](scene_t &scene) { append(scene.values->audio_list, i32{0x123400}); })),
      trace(filter, "\t\t", with_formats),
      trace(filter, "\t\tFormat is a duplicate. Ignoring.", with_formats),
      trace(filter, "\t\tFormat not in downstream as requested. Ignoring", with_formats),
      trace(filter, "\tExamining downstream audio formats:", with_formats),
      trace(filter, "\t\t -->Format is a duplicate. Ignoring.", with_formats),
      trace(filter, "\t\t -->Adding mode.\n", with_formats),
      trace("_filter_audio_list_with_mask", "\tMask:0x00000202", with_formats),
      trace("_filter_audio_list_with_mask", "_filter_audio_list_with_mask() - Printing reverse formats\n",
            with_formats),
      trace("_filter_audio_list_with_mask", "\t\tFormat:", with_formats),
      trace(filter, "\tEntry:2 Channels:6", with_formats),
      trace(filter, "\tFound a \"basic audio\" PCM 2-chan entry.", with_stereo),
      trace(filter, "\tNo \"basic audio\" PCM 2-chan entry found. Adding one.", with_formats),
      composer_error(filter, "The list types don't match.", composing([](scene_t &scene) {
                       ll_delete_list(&scene.values->audio_list);
                       ll_init(&scene.values->audio_list, "std_timing_t");
                     })),
  };
}

std::vector<row_t> population() {
  const char *const populate = "_populate_new_edid";
  const auto row = [=](const char *message, const std::function<void()> &provoke) {
    return trace(populate, message, provoke);
  };
  const auto television = composing([](scene_t &scene) { scene.values->is_tv = 1; });
  const auto no_modes = composing([](scene_t &scene) {
    ll_delete_list(&scene.values->video_60_priority);
    ll_init(&scene.values->video_60_priority, "short_video_desc_t");
  });
  const auto unknown_mode = composing(select_unknown_mode);
  return {
      row("Setting up the new EDID:", composing()),
      row("\tProduct Code    = 0x0", composing()),
      row("\tSerial Number   = 0x0", composing()),
      row("\tweek            = 1", composing()),
      row("\tyear            = 2012", composing()),
      row("\tManufacturer ID = YYY", composing()),
      row("\tMonitor Name    = ", composing()),
      row("\tIs a TV. Using root node. Address:1.0.0.0", television),
      row("\tNo hdmi specific downstream EDID available. Setting SPA to f.f.f.f", composing()),
      row("\tInvalid downstream EDID SPA starts with 0. Recieved:0.1.2.3", composing_below(sink_at(0x01, 0x23))),
      row("\tSetting address.b with port:1 Address:2.1.0.0", composing_below(sink_at(0x20, 0x00))),
      row("\tSetting address.c with port:1 Address:2.3.1.0", composing_below(sink_at(0x23, 0x00))),
      row("\tSetting address.d with port:1 Address:2.3.4.1", composing_below(sink_at(0x23, 0x40))),
      row("\tInvalid downstream EDID SPA starts with no room. Recieved: 2.3.4.5", composing_below(sink_at(0x23, 0x45))),
      row("\tdc_30bit = 0", composing()),
      row("\tdc_36bit = 0", composing()),
      warning("edid_composer", populate,
              "The HDMI standard requires 36bit Deep Color to be supported when 30bit or 48bit is supported. Please "
              "correct this in your platform configuration file. DC_30bit:true DC_36bit:false DC_48bit:false Setting "
              "36bit support to true.",
              composing([](scene_t &scene) { scene.values->dc_30bit = 1; })),
      bug("edid_composer", "_maximum_pixel_clock", "\tReceived a list that contains no entries. List:PTR", no_modes),
      bug("edid_composer", "_maximum_pixel_clock", "\tFailed converting VIC:100 to a DTD.", unknown_mode),
      row("\tspeaker = 3:0x00 2:0x00 1:0x01", composing()),
      composer_error(populate,
                     "The number of video formats to be encoded is less than 4! Padding until 4 is reached. Check the "
                     "platform configuration file is correct. Number in the video list:3",
                     no_modes),
      row("\tNew EDID List of VICs:", composing()),
      row("\tEncoding the video timings: Num:4", composing()),
      row("\tCreating the first 2 DTDs.", composing()),
      row("\t\tVIC:4 1280x720p60Hz16x9", composing()),
      composer_error(populate, "Error converting vic to dtd. Vic:100:Unknown Value", unknown_mode),
      row("\tEncoding the VIC list up to 31 modes. Total:4", composing()),
  };
}

std::vector<row_t> results() {
  // With tracing on, what was composed is decoded again; some of it does not survive that.
  const auto overflowing = composing([](scene_t &scene) {
    for (u32 vic = 3; vic <= 40; ++vic) {
      append_modes(scene.values->video_60_priority, {{vic, 7}});
      append_modes(scene.values->video_60_additional, {{vic, 7}});
    }
    scene.cfg.hdmi_3d_mode = 2;
  });
  row_t undecodable = warning("edid_composer", pipeline, "Failed decoding the new edid extension.", overflowing);
  undecodable.traced = true;
  return {undecodable};
}

WALK(ComposerArguments, arguments());
WALK(ComposerStages, stages());
WALK(ComposerVideoModes, video_modes());
WALK(Composer4kModes, modes_4k_x_2k());
WALK(ComposerAudioFormats, audio_formats());
WALK(ComposerPopulation, population());
WALK(ComposerResults, results());

}  // namespace
}  // namespace diagnostics_walk
