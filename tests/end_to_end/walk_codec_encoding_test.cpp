// Everything that the encoder and the report say.
#include <cstring>
#include <utility>

#include "diagnostics_walk.h"
#include "support/edid_builder.h"
#include "support/records.h"

namespace diagnostics_walk {
namespace {

using test_support::append;
using test_support::append_modes;
using test_support::scoped_edid_t;
using test_support::scoped_values_t;
using test_support::timing_of_vic;

constexpr const char *encoder = "encode_edid";

row_t codec_error(const char *function, const char *message, std::function<void()> provoke) {
  return error("edid_decode_encode", function, message, std::move(provoke));
}

/// Encodes a record with two detailed timings, after @p change.
std::function<void()> encoding(const std::function<void(edid_t *)> &change) {
  return [=] {
    scoped_edid_t edid;
    scoped_values_t values;
    append(edid->dtd_list, timing_of_vic(16));
    append(edid->dtd_list, timing_of_vic(4));
    change(edid.get());
    std::vector<u8> bytes(256);
    encode_edid(bytes.data(), 256, edid.get(), nullptr, values.get());
  };
}

/// Encodes a record with these two detailed timings.
std::function<void()> encoding_timings(detailed_timing_t first, detailed_timing_t second) {
  return [=] {
    scoped_edid_t edid;
    scoped_values_t values;
    append(edid->dtd_list, first);
    append(edid->dtd_list, second);
    std::vector<u8> bytes(256);
    encode_edid(bytes.data(), 256, edid.get(), nullptr, values.get());
  };
}

/// Encodes a record with 3D and one mode of this mask.
std::function<void()> encoding_3d(u32 stereo) {
  return encoding([=](edid_t *edid) {
    edid->hdmi_video_present = edid->hdmi_3d_present = 1;
    append_modes(edid->video_list, {{16, stereo}});
  });
}

std::function<void()> encoding_audio(u32 type, std::size_t count) {
  return encoding([=](edid_t *edid) {
    for (std::size_t i = 0; i < count; ++i)
      append(edid->audio_list, short_audio_desc_t{type, 2, 7, 0, 0, 0, 0});
  });
}

/// 31 modes and ten formats, with latencies, 3D of three structures for each mode and a serial number.
void fill_to_overflow(edid_t *edid) {
  edid->hdmi_video_present = edid->hdmi_3d_present = 1;
  edid->i_video_latency = 10;
  std::strcpy(edid->serial_string, "SERIAL");
  for (u32 vic = 1; vic <= 31; ++vic)
    append_modes(edid->video_list, {{vic, 7}});
  for (int i = 0; i < 10; ++i)
    append(edid->audio_list, short_audio_desc_t{2, 2, 7, 0, 0, 0, 0});
}

std::vector<row_t> arguments() {
  static std::vector<u8> bytes(256);
  return {
      codec_error(encoder, "Function called with edid_blocks set to NULL.",
                  [] { encode_edid(nullptr, 0, nullptr, nullptr, nullptr); }),
      codec_error(encoder, "Function called with edid set to NULL.",
                  [] { encode_edid(bytes.data(), 0, nullptr, nullptr, nullptr); }),
      codec_error(encoder, "Function called with values set to NULL.",
                  [] { encode_edid(bytes.data(), 0, scoped_edid_t().get(), nullptr, nullptr); }),
      codec_error(encoder, "Function called with an unsupported block size. val:128 expected:256",
                  [] { encode_edid(bytes.data(), 128, scoped_edid_t().get(), nullptr, scoped_values_t().get()); }),
      trace("encode_edid_latency_value", "latency = 501 exceed 500ms", [] { encode_edid_latency_value(501); }),
  };
}

std::vector<row_t> encodings() {
  detailed_timing_t invalid = timing_of_vic(16);
  invalid.valid = 0;
  detailed_timing_t slow = timing_of_vic(1);
  slow.pixel_clock = 25174999;
  return {
      codec_error(encoder, "The function expects there to be at least 2 DTDs. Total DTDs:0",
                  [] {
                    std::vector<u8> bytes(256);
                    encode_edid(bytes.data(), 256, scoped_edid_t().get(), nullptr, scoped_values_t().get());
                  }),
      bug("edid_decode_encode", encoder, "This function is only designed to handle up to 2 DTDs. num of dtds:3",
          encoding([](edid_t *edid) { append(edid->dtd_list, timing_of_vic(1)); })),
      codec_error("_encode_edid_dtd", "Called encode DTD with an invalid timing structure.",
                  encoding_timings(invalid, timing_of_vic(1))),
      codec_error("_encode_edid_dtd", "Called encode DTD with an invalid pixel clock:25174999",
                  encoding_timings(timing_of_vic(1), slow)),
      codec_error(encoder, "Failed encoding DTD. index:1 Len:2", encoding_timings(timing_of_vic(1), slow)),
      warning("edid_decode_encode", encoder,
              "Requested too many short video descriptions. Truncating to the maximum allowed. Max:32 Requested:32",
              encoding([](edid_t *edid) {
                for (u32 vic = 1; vic <= 32; ++vic)
                  append_modes(edid->video_list, {{vic, 0}});
              })),
      warning("edid_decode_encode", encoder,
              "Requested too many short audio descriptions. Truncating to the maximum allowed. Max:10 Requested:11",
              encoding_audio(2, 11)),
      codec_error("_encode_edid_short_audio", "Audio type is not recognied. Type:15", encoding_audio(15, 1)),
      codec_error("_encode_edid_short_audio", "Invalid extended audio type:0", encoding_audio(19, 1)),
      codec_error(encoder, "Failed encoding short audio. Index:0 Type:19", encoding_audio(19, 1)),
      codec_error(encoder, "The CEA extension needs*", encoding(fill_to_overflow)),
      trace(encoder, "order[0] FP, 00", encoding_3d(0x01)),
      trace(encoder, "order[0] FA, 01", encoding_3d(0x08)),
      trace(encoder, "order[0] LA, 02", encoding_3d(0x10)),
      trace(encoder, "order[0] SBSF, 03", encoding_3d(0x20)),
      trace(encoder, "order[0] LD, 04", encoding_3d(0x40)),
      trace(encoder, "order[0] LDGD, 05", encoding_3d(0x80)),
      trace(encoder, "order[0] SBSH, 08, 00", encoding_3d(0x02)),
      trace(encoder, "order[0] TBH, 06", encoding_3d(0x04)),
  };
}

/// Prints a record of which one list holds elements of another type, none of them.
std::function<void()> printing_foreign(ll_list_t edid_t::*list, u8 brief) {
  return [=] {
    scoped_edid_t edid;
    edid->valid = 1;
    ll_delete_list(&(edid.get()->*list));
    ll_init(&(edid.get()->*list), "int");
    print_edid_struct(edid.get(), brief, "Title");
  };
}

std::vector<row_t> reports() {
  const char *const mismatch = "The list types don't match.";
  return {
      codec_error("print_edid_struct", mismatch, printing_foreign(&edid_t::video_list, 1)),
      codec_error("print_edid_struct", mismatch, printing_foreign(&edid_t::std_timings, 0)),
      codec_error("print_edid_struct", mismatch, printing_foreign(&edid_t::dtd_list, 0)),
      codec_error("print_edid_struct", mismatch, printing_foreign(&edid_t::audio_list, 0)),
  };
}

std::vector<row_t> inspections() {
  const auto printing = [](std::vector<u8> edid) {
    return [=] { print_edid(edid.data(), static_cast<u32>(edid.size()), 0, "Title"); };
  };
  const std::vector<u8> base = test_support::base_block_builder_t().extensions(1).build();
  return {
      error("edid_composer", "print_edid", "\"edid_block\" memory block parameter is NULL. Exiting. edid_block:(nil)",
            [] { print_edid(nullptr, 5, 0, "Title"); }),
      error("edid_composer", "print_edid", "Edid size is not an valid value. edid_bytes=200 Range=(128-256)",
            printing(std::vector<u8>(200))),
      error("edid_composer", "print_edid", "Failed decoding EDID block 0.", printing(std::vector<u8>(128))),
      error("edid_composer", "print_edid", "Failed decoding EDID block 1.",
            printing(test_support::join(base, std::vector<u8>(128)))),
  };
}

WALK(EncoderArguments, arguments());
WALK(Encodings, encodings());
WALK(Reports, reports());
WALK(Inspections, inspections());

}  // namespace
}  // namespace diagnostics_walk
