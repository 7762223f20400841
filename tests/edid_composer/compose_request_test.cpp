// A composition as one request: what is refused, what the result says, and what becomes of the sink's bytes.
#include <gtest/gtest.h>

#include <cstddef>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include "edid_composer/composer_lines.h"
#include "support/failing_allocation.h"
#include "support/memory_image.h"
#include "support/output_capture.h"
#include "support/records.h"
#include "support/request.h"

namespace {

using composer_lines::error;
using test_support::base_block_builder_t;
using test_support::bytes_t;
using test_support::extension_builder_t;
using test_support::image_of;
using test_support::join;
using test_support::output_of;

constexpr const char *operation = "compose_edid_request";

/// What a caller of the first version has; members were appended since.
constexpr u32 first_request_size = offsetof(compose_request_t, configuration_observer);

bytes_t base_block(u8 extensions = 0) {
  return base_block_builder_t().extensions(extensions).build();
}

class ComposeRequest : public testing::Test {
 protected:
  ComposeRequest() {
    test_support::append_modes(values_->video_60_priority, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
    test_support::append_modes(values_->video_60_additional, {{16, 0}, {4, 0}, {2, 0}, {1, 0}});
  }
  std::unique_ptr<test_support::request_t> request_for(const bytes_t &sink) {
    return std::make_unique<test_support::request_t>(sink, test_support::plain_settings(), values_.get());
  }

  test_support::scoped_values_t values_;
};

TEST_F(ComposeRequest, ThatIsMissingIsRefusedBeforeItsResult) {
  EXPECT_EQ(output_of([] { EXPECT_FALSE(compose_edid_request(nullptr, nullptr)); }),
            error(operation, "\"request\" parameter is NULL. request:(nil)"));
  const auto request = request_for({});
  EXPECT_EQ(output_of([&] { EXPECT_FALSE(compose_edid_request(&request->request, nullptr)); }),
            error(operation, "\"result\" parameter is NULL. result:(nil)"));
  EXPECT_EQ(request->new_edid, bytes_t(256, 0xA5));
}

TEST_F(ComposeRequest, ThatIsTooSmallIsRefusedAndNothingWritten) {
  const auto refusal = [](const std::string &name, std::size_t size, u32 received) {
    return error(operation, "The size of the " + name + " is too small. Expected at least:" + std::to_string(size) +
                                " Received:" + std::to_string(received));
  };
  for (const u32 size : {0U, 4U, first_request_size - 1}) {
    const auto request = request_for({});
    request->request.size = size;
    const std::string result = image_of(request->result);
    EXPECT_EQ(output_of([&] { EXPECT_FALSE(request->compose()); }), refusal("request", first_request_size, size));
    EXPECT_EQ(image_of(request->result), result);
    EXPECT_EQ(request->new_edid, bytes_t(256, 0xA5));
  }
  for (const u32 size : {0U, 4U, static_cast<u32>(sizeof(compose_result_t)) - 1}) {
    const auto request = request_for({});
    std::memset(&request->result, 0xA5, sizeof request->result);
    request->result.size = size;
    const std::string result = image_of(request->result);
    EXPECT_EQ(output_of([&] { EXPECT_FALSE(request->compose()); }), refusal("result", sizeof(compose_result_t), size));
    EXPECT_EQ(image_of(request->result), result);
    EXPECT_EQ(request->new_edid, bytes_t(256, 0xA5));
    EXPECT_EQ(request->spa_offset, 0xA5);
  }
}

TEST_F(ComposeRequest, OfALaterVersionIsServedAndItsFurtherMembersLeftAlone) {
  struct later_request_t {
    compose_request_t request;
    u8 further[64];
  };
  struct later_result_t {
    compose_result_t result;
    u8 further[64];
  };
  const auto of_this_version = request_for(base_block());
  ASSERT_TRUE(of_this_version->compose());
  bytes_t new_edid(256, 0xA5);
  later_request_t request{of_this_version->request, {}};
  later_result_t result{};
  std::memset(request.further, 0xA5, sizeof request.further);
  std::memset(result.further, 0xA5, sizeof result.further);
  request.request.size = sizeof request;
  request.request.new_edid = new_edid.data();
  result.result.size = sizeof result;
  EXPECT_TRUE(compose_edid_request(&request.request, &result.result));
  EXPECT_EQ(new_edid, of_this_version->new_edid);
  EXPECT_EQ(result.result.bytes_written, 256U);
  EXPECT_EQ(bytes_t(std::begin(result.further), std::end(result.further)), bytes_t(64, 0xA5));
}

TEST_F(ComposeRequest, ComposesAsTheInternalOperation) {
  const auto request = request_for(join(base_block(1), extension_builder_t()
                                                           .block(test_support::video_block({16, 4}))
                                                           .block(test_support::hdmi_block({0x10, 0x00}))
                                                           .build()));
  bytes_t expected(256);
  ASSERT_TRUE(
      compose_edid_internal(request->sink.data(), 256, expected.data(), 256, &request->settings, values_.get()));
  const u8 spa_offset = request->spa_offset;
  ASSERT_TRUE(request->compose());
  EXPECT_EQ(request->new_edid, expected);
  EXPECT_EQ(request->result.bytes_written, 256U);
  EXPECT_EQ(request->result.physical_address_offset, spa_offset);
  // 1.1.0.0: the first input of a platform at 1.0.0.0.
  EXPECT_EQ(expected.at(spa_offset), 0x11);
  EXPECT_EQ(expected.at(spa_offset + 1U), 0x00);
}

TEST_F(ComposeRequest, ReturnsTheOffsetAlsoWhereTheSettingsDontAskForIt) {
  const auto request = request_for({});
  ASSERT_TRUE(request->compose());
  request->settings.spa_offset = nullptr;
  request->result.physical_address_offset = 0;
  ASSERT_TRUE(request->compose());
  EXPECT_EQ(request->result.physical_address_offset, request->spa_offset);
}

TEST_F(ComposeRequest, ThatFailsReturnsNothingWritten) {
  const auto expect_failure = [&](u32 sink_status, const auto &spoil) {
    const auto request = request_for(base_block());
    spoil(request.get());
    std::memset(&request->result, 0xA5, sizeof request->result);
    request->result.size = sizeof request->result;
    output_of([&] { EXPECT_FALSE(request->compose()); });
    EXPECT_EQ(request->result.bytes_written, 0U);
    EXPECT_EQ(request->result.physical_address_offset, 0U);
    EXPECT_EQ(request->result.sink_status, sink_status);
    EXPECT_EQ(request->result.sink_malformed_at, 0U);
    EXPECT_EQ(request->result.sink_blocks_unread, 0U);
  };
  using request_t = test_support::request_t;
  expect_failure(0, [](request_t *request) { request->request.new_edid = nullptr; });
  expect_failure(0, [](request_t *request) { request->request.settings = nullptr; });
  // Refused by the encoder, after everything else.
  expect_failure(COMPOSE_SINK_READ, [](request_t *request) { request->request.new_edid_bytes = 255; });
}

// What became of the sink's bytes.

struct sink_reading_t {
  u32 status;
  u32 extension_status;
  u32 malformed_at;
  u32 blocks_unread;

  bool operator==(const sink_reading_t &) const = default;
};

std::ostream &operator<<(std::ostream &out, const sink_reading_t &reading) {
  return out << compose_sink_status_string(reading.status) << "; "
             << compose_extension_status_string(reading.extension_status) << " at " << reading.malformed_at << "; "
             << reading.blocks_unread << " unread";
}

class SinkStatus : public ComposeRequest {
 protected:
  sink_reading_t reading_of(const bytes_t &sink, u32 size) {
    const auto request = request_for(sink);
    request->request.sink_bytes = size;
    output_of([&] { EXPECT_TRUE(request->compose()); });
    const compose_result_t &result = request->result;
    return {result.sink_status, result.sink_extension_status, result.sink_malformed_at, result.sink_blocks_unread};
  }
  sink_reading_t reading_of(const bytes_t &sink) { return reading_of(sink, static_cast<u32>(sink.size())); }
  sink_reading_t reading_of_extension(const bytes_t &extension) {
    const sink_reading_t reading = reading_of(join(base_block(1), extension));
    EXPECT_EQ(reading.status, static_cast<u32>(COMPOSE_SINK_READ));
    return reading;
  }
};

constexpr sink_reading_t refused_with(compose_sink_status status) {
  return {status, COMPOSE_EXTENSION_NOT_LOOKED_AT, 0, 0};
}

constexpr sink_reading_t read_with(compose_extension_status status, u32 malformed_at = 0, u32 blocks_unread = 0) {
  return {COMPOSE_SINK_READ, status, malformed_at, blocks_unread};
}

TEST_F(SinkStatus, OfNoSink) {
  EXPECT_EQ(reading_of({}, 0), refused_with(COMPOSE_SINK_NONE));
  EXPECT_EQ(reading_of({}, 256), refused_with(COMPOSE_SINK_NONE));
  EXPECT_EQ(reading_of({}, 5), refused_with(COMPOSE_SINK_NONE));
  EXPECT_EQ(reading_of(base_block(), 0), refused_with(COMPOSE_SINK_NONE));
}

TEST_F(SinkStatus, OfALengthThatIsNoMultipleOf128) {
  for (const u32 size : {1U, 127U, 129U, 255U})
    EXPECT_EQ(reading_of(bytes_t(256), size), refused_with(COMPOSE_SINK_LENGTH_INVALID)) << size;
}

TEST_F(SinkStatus, OfABaseBlockThatIsRefused) {
  const bytes_t extension = extension_builder_t().build();
  for (u32 byte = 0; byte < 8; ++byte) {
    const bytes_t block = base_block_builder_t().byte(byte, 0x11).extensions(1).build();
    EXPECT_EQ(reading_of(join(block, extension)), refused_with(COMPOSE_SINK_HEADER_INVALID)) << byte;
  }
  bytes_t block = base_block(1);
  ++block[127];
  EXPECT_EQ(reading_of(join(block, extension)), refused_with(COMPOSE_SINK_CHECKSUM_INVALID));
  for (const auto &[version, revision] : {std::pair<u8, u8>{0, 3}, {2, 3}, {1, 2}, {1, 0}}) {
    EXPECT_EQ(reading_of(base_block_builder_t().byte(18, version).byte(19, revision).extensions(1).build()),
              refused_with(COMPOSE_SINK_VERSION_UNSUPPORTED));
  }
  EXPECT_EQ(reading_of(base_block_builder_t().byte(19, 4).build()), read_with(COMPOSE_EXTENSION_NOT_ANNOUNCED));
  EXPECT_EQ(reading_of(bytes_t(128)), refused_with(COMPOSE_SINK_HEADER_INVALID));
}

TEST_F(SinkStatus, OfAMalformedDescriptor) {
  bytes_t malformed(18);
  malformed[2] = 1;
  for (u32 slot = 0; slot < 4; ++slot) {
    EXPECT_EQ(reading_of(base_block_builder_t().descriptor(slot, malformed).extensions(1).build()),
              refused_with(COMPOSE_SINK_DESCRIPTOR_INVALID));
  }
}

TEST_F(SinkStatus, OfAnExtensionThatIsNotThere) {
  EXPECT_EQ(reading_of(base_block()), read_with(COMPOSE_EXTENSION_NOT_ANNOUNCED));
  EXPECT_EQ(reading_of(join(base_block(), extension_builder_t().build())), read_with(COMPOSE_EXTENSION_NOT_ANNOUNCED));
  EXPECT_EQ(reading_of(base_block(1)), read_with(COMPOSE_EXTENSION_MISSING));
  EXPECT_EQ(reading_of(base_block(255)), read_with(COMPOSE_EXTENSION_MISSING));
}

TEST_F(SinkStatus, OfAnExtensionThatIsRefused) {
  EXPECT_EQ(reading_of_extension(extension_builder_t().byte(0, 0x70).build()), read_with(COMPOSE_EXTENSION_NOT_CEA));
  for (const u8 revision : {u8{0}, u8{1}, u8{2}, u8{4}}) {
    EXPECT_EQ(reading_of_extension(extension_builder_t().byte(1, revision).build()),
              read_with(COMPOSE_EXTENSION_REVISION_UNSUPPORTED));
  }
  EXPECT_EQ(reading_of_extension(extension_builder_t().byte(127, 0x5A).build()),
            read_with(COMPOSE_EXTENSION_CHECKSUM_INVALID));
  EXPECT_EQ(reading_of_extension(extension_builder_t().byte(2, 111).build()),
            read_with(COMPOSE_EXTENSION_OFFSET_UNSUPPORTED));
  EXPECT_EQ(reading_of_extension(extension_builder_t().byte(2, 110).build()), read_with(COMPOSE_EXTENSION_READ));
}

TEST_F(SinkStatus, OfADataBlockThatOverrunsIsItsPlace) {
  EXPECT_EQ(reading_of_extension(extension_builder_t().block({0x47}).build()),
            read_with(COMPOSE_EXTENSION_MALFORMED, 4));
  EXPECT_EQ(reading_of_extension(extension_builder_t().block(test_support::video_block({16, 4})).block({0x21}).build()),
            read_with(COMPOSE_EXTENSION_MALFORMED, 7));
  EXPECT_EQ(reading_of_extension(extension_builder_t().block(test_support::video_block({16, 4})).block({0x20}).build()),
            read_with(COMPOSE_EXTENSION_READ));
}

TEST_F(SinkStatus, CountsTheBlocksThatAreAnnouncedAndGivenButNotRead) {
  const bytes_t extension = extension_builder_t().build();
  const auto sink = [&](u8 announced, u32 given) {
    bytes_t bytes = base_block(announced);
    for (u32 i = 0; i < given; ++i)
      bytes = join(bytes, extension);
    return bytes;
  };
  EXPECT_EQ(reading_of(sink(1, 1)), read_with(COMPOSE_EXTENSION_READ));
  EXPECT_EQ(reading_of(sink(3, 3)), read_with(COMPOSE_EXTENSION_READ, 0, 2));
  EXPECT_EQ(reading_of(sink(3, 2)), read_with(COMPOSE_EXTENSION_READ, 0, 1));
  EXPECT_EQ(reading_of(sink(3, 1)), read_with(COMPOSE_EXTENSION_READ));
  EXPECT_EQ(reading_of(sink(1, 3)), read_with(COMPOSE_EXTENSION_READ));
  EXPECT_EQ(reading_of(sink(0, 3)), read_with(COMPOSE_EXTENSION_NOT_ANNOUNCED));
  EXPECT_EQ(reading_of(sink(255, 7)), read_with(COMPOSE_EXTENSION_READ, 0, 6));
  // Also after one that is refused.
  EXPECT_EQ(reading_of(join(join(base_block(2), extension_builder_t().byte(0, 0x70).build()), extension)),
            read_with(COMPOSE_EXTENSION_NOT_CEA, 0, 1));
}

TEST_F(SinkStatus, OfASinkThatThereIsNoMemoryFor) {
  const auto reading_without_memory = [&](const bytes_t &sink) {
    const test_support::failing_allocation_t failing(1);
    const sink_reading_t reading = reading_of(sink);
    EXPECT_TRUE(failing.happened());
    return reading;
  };
  const bytes_t timing = test_support::timing_descriptor(test_support::timing_of_vic(16));
  EXPECT_EQ(reading_without_memory(base_block_builder_t().standard_timing(0, 0x81, 0x80).extensions(1).build()),
            refused_with(COMPOSE_SINK_OUT_OF_MEMORY));
  EXPECT_EQ(reading_without_memory(base_block_builder_t().descriptor(0, timing).extensions(1).build()),
            refused_with(COMPOSE_SINK_OUT_OF_MEMORY));
  for (const bytes_t &block : {test_support::video_block({16}), test_support::audio_block({0x09, 0x07, 0x07})}) {
    EXPECT_EQ(reading_without_memory(join(base_block(1), extension_builder_t().block(block).build())),
              read_with(COMPOSE_EXTENSION_OUT_OF_MEMORY));
  }
}

}  // namespace
