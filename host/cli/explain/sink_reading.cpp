#include "explain/sink_reading.h"

#include <algorithm>
#include <iterator>

#include "edid_input/edid_file.h"
#include "explain/explained.h"
#include "text/hexadecimal.h"

namespace edid_cli {
namespace {

constexpr std::size_t first_descriptor = 54;
constexpr std::size_t descriptors = 4;
constexpr std::size_t descriptor_size = 18;
constexpr std::size_t timings_offset = 2;
constexpr std::size_t first_data_block = 4;
/// The last byte of a block is its checksum.
constexpr std::size_t checksum_offset = edid_block_size - 1;
constexpr u8 cta_tag = 0x02;
constexpr unsigned audio_tag = 1;
/// Where the detailed timings may begin at most for this library.
constexpr unsigned last_timings_offset = 110;

struct extension_kind_t {
  u8 tag;
  const char *name;
};

/// VESA E-EDID, table 2.7: extension tags.
constexpr extension_kind_t extension_kinds[] = {
    {cta_tag, "CEA-861 extension"},       {0x10, "video timing extension"},
    {0x20, "EDID 2.0 extension"},         {0x40, "display information extension"},
    {0x50, "localized string extension"}, {0x60, "digital packet video link extension"},
    {0x70, "DisplayID extension"},        {0xF0, "block map"},
    {0xFF, "maker's own extension"},
};

/// The sink's bytes; those that are not there read as 0.
class sink_bytes_t {
 public:
  explicit sink_bytes_t(const std::vector<u8> &bytes) : bytes_(bytes) {}

  unsigned operator[](std::size_t place) const { return place < bytes_.size() ? bytes_[place] : 0U; }
  std::size_t blocks() const { return bytes_.size() / edid_block_size; }
  bool has_clock(std::size_t place) const { return (*this)[place] != 0 || (*this)[place + 1] != 0; }

 private:
  const std::vector<u8> &bytes_;
};

std::string extension_kind(unsigned tag) {
  const auto *const found = std::find_if(std::begin(extension_kinds), std::end(extension_kinds),
                                         [tag](const auto &kind) { return kind.tag == tag; });
  return found != std::end(extension_kinds) ? found->name : "extension of unknown kind " + hex_number(tag, 2);
}

bool is_extension_read(const compose_result_t &result) {
  return result.sink_extension_status == COMPOSE_EXTENSION_READ ||
         result.sink_extension_status == COMPOSE_EXTENSION_MALFORMED;
}

/// Whether HDMI 2 reads a block: a CTA-861 extension of revision 3 with a right checksum.
bool is_read_by_hdmi2(const sink_bytes_t &sink, std::size_t number) {
  constexpr unsigned revision = 3;
  constexpr std::size_t most_timings_offset = edid_block_size - 1;
  const std::size_t begin = number * edid_block_size;
  unsigned sum = 0;
  for (std::size_t offset = begin; offset < begin + edid_block_size; ++offset) {
    sum += sink[offset];
  }
  return sink[begin] == cta_tag && sink[begin + 1] == revision && sink[begin + 2] <= most_timings_offset &&
         sum % 256 == 0;
}

/// The numbers of the blocks after the base block that HDMI 2 reads.
std::vector<std::size_t> blocks_of_hdmi2(const sink_bytes_t &sink) {
  constexpr std::size_t most_extensions = 8;
  constexpr std::size_t count_offset = 126;
  std::vector<std::size_t> numbers;
  for (std::size_t number = 1; number < sink.blocks() && number <= sink[count_offset]; ++number) {
    if (numbers.size() < most_extensions && is_read_by_hdmi2(sink, number)) {
      numbers.push_back(number);
    }
  }
  return numbers;
}

std::vector<sink_block_t> blocks_of(const sink_bytes_t &sink, const composition_t &composition) {
  const compose_result_t &result = composition.result;
  const bool is_base_read = result.sink_status == COMPOSE_SINK_READ;
  std::vector<std::size_t> read;
  if (has_hdmi2(composition)) {
    read = is_base_read ? blocks_of_hdmi2(sink) : read;
  } else if (is_extension_read(result)) {
    read = {1};
  }
  std::vector<sink_block_t> blocks;
  for (std::size_t number = 0; number < sink.blocks(); ++number) {
    const bool is_base = number == 0;
    const bool is_read = is_base ? is_base_read : std::find(read.begin(), read.end(), number) != read.end();
    blocks.push_back({number, is_base ? "base block" : extension_kind(sink[number * edid_block_size]), is_read});
  }
  return blocks;
}

/// "descriptor 3 (tag 0xFC)": the first with a byte that this library expects to be 0.
std::string malformed_descriptor(const sink_bytes_t &sink) {
  constexpr unsigned range_limits = 0xFD;
  for (std::size_t number = 0; number < descriptors; ++number) {
    const std::size_t place = first_descriptor + number * descriptor_size;
    if (!sink.has_clock(place) && (sink[place + 2] != 0 || sink[place + 4] != 0)) {
      return "its descriptor " + std::to_string(number + 1) + " (tag " + hex_number(sink[place + 3], 2) +
             ") has bytes 2 and 4 of " + hex_number(sink[place + 2], 2) + " and " + hex_number(sink[place + 4], 2) +
             ", where this library takes 0 only" +
             (sink[place + 3] == range_limits && sink[place + 2] == 0 ? "; EDID 1.4 allows byte 4 in range limits"
                                                                      : "");
    }
  }
  return "a descriptor of it is malformed";
}

/// Why the base block was not read; empty when it was.
std::string base_gap(const sink_bytes_t &sink, u32 status) {
  const std::string refused = "The sink's base block was not read: ";
  switch (status) {
    case COMPOSE_SINK_NONE:
    case COMPOSE_SINK_READ:
      return "";
    case COMPOSE_SINK_HEADER_INVALID:
      return refused + "its first 8 bytes are not the header of an EDID.";
    case COMPOSE_SINK_CHECKSUM_INVALID:
      return refused + "its 128 bytes do not add up to 0, so at least one is damaged.";
    case COMPOSE_SINK_VERSION_UNSUPPORTED:
      return refused + "it is EDID " + std::to_string(sink[18]) + "." + std::to_string(sink[19]) +
             ", and this library reads 1.3 and later revisions of version 1 only.";
    case COMPOSE_SINK_DESCRIPTOR_INVALID:
      return "The sink's base block was read in part: " + malformed_descriptor(sink) +
             ". What follows it was not read, and neither was the extension.";
    default:
      return refused + std::string(compose_sink_status_string(status)) + ".";
  }
}

std::string unread_kind(const sink_bytes_t &sink) {
  const std::string text = "The sink's block 1 was not read: it is a " + extension_kind(sink[edid_block_size]) +
                           ", which is legal, but this library looks for a CEA-861 extension there only";
  for (std::size_t number = 2; number < sink.blocks(); ++number) {
    if (sink[number * edid_block_size] == cta_tag) {
      return text + "; block " + std::to_string(number) + " is one.";
    }
  }
  return text + ".";
}

/// Why block 1 was not read, or not to its end; empty when it was, or when there is none.
std::string extension_gap(const sink_bytes_t &sink, const compose_result_t &result) {
  const std::string refused = "The sink's extension (block 1) was not read: ";
  switch (result.sink_extension_status) {
    case COMPOSE_EXTENSION_NOT_LOOKED_AT:
    case COMPOSE_EXTENSION_NOT_ANNOUNCED:
    case COMPOSE_EXTENSION_READ:
      return "";
    case COMPOSE_EXTENSION_MISSING:
      return "The sink announces an extension, but only its base block was given.";
    case COMPOSE_EXTENSION_NOT_CEA:
      return unread_kind(sink);
    case COMPOSE_EXTENSION_REVISION_UNSUPPORTED:
      return refused + "it is of revision " + std::to_string(sink[edid_block_size + 1]) +
             ", which is legal, but this library reads revision 3 only.";
    case COMPOSE_EXTENSION_CHECKSUM_INVALID:
      return refused + "its 128 bytes do not add up to 0, so at least one is damaged.";
    case COMPOSE_EXTENSION_OFFSET_UNSUPPORTED: {
      const unsigned offset = sink[edid_block_size + timings_offset];
      return refused + "its detailed timings begin at byte " + std::to_string(offset) +
             (offset <= checksum_offset ? ", which is legal, but this library reads them up to byte " +
                                              std::to_string(last_timings_offset) + " only."
                                        : ", outside of the block.");
    }
    case COMPOSE_EXTENSION_MALFORMED:
      return "The sink's extension (block 1) was read up to byte " + std::to_string(result.sink_malformed_at) +
             " only: the data block there is longer than the collection that holds it.";
    default:
      return refused + std::string(compose_extension_status_string(result.sink_extension_status)) + ".";
  }
}

std::string missing_part(const compose_result_t &result) {
  switch (result.sink_status) {
    case COMPOSE_SINK_NONE:
      return "";
    case COMPOSE_SINK_READ:
      break;
    case COMPOSE_SINK_DESCRIPTOR_INVALID:
      return "most of the sink's EDID was not read";
    default:
      return "the sink's EDID was not read";
  }
  switch (result.sink_extension_status) {
    case COMPOSE_EXTENSION_NOT_ANNOUNCED:
    case COMPOSE_EXTENSION_READ:
      return "";
    case COMPOSE_EXTENSION_MALFORMED:
      return "the sink's extension was read in part";
    default:
      return "the sink's extension was not read";
  }
}

std::size_t timings_of_base_block(const sink_bytes_t &sink) {
  std::size_t count = 0;
  for (std::size_t number = 0; number < descriptors; ++number) {
    count += sink.has_clock(first_descriptor + number * descriptor_size) ? 1 : 0;
  }
  return count;
}

std::size_t timings_of_extension(const sink_bytes_t &sink) {
  std::size_t count = 0;
  for (std::size_t place = sink[edid_block_size + timings_offset]; place + descriptor_size <= checksum_offset;
       place += descriptor_size) {
    count += sink.has_clock(edid_block_size + place) ? 1 : 0;
  }
  return count;
}

/// The payloads of the data blocks of one kind, one after the other (CEA-861, section 7.5.1).
std::vector<u8> payloads(const sink_bytes_t &sink, unsigned tag) {
  const std::size_t end =
      edid_block_size + std::min<std::size_t>(sink[edid_block_size + timings_offset], checksum_offset);
  std::vector<u8> bytes;
  for (std::size_t place = edid_block_size + first_data_block; place < end;) {
    const std::size_t next = place + 1 + (sink[place] & 0x1FU);
    if (next > end) {
      break;
    }
    for (std::size_t byte = place + 1; sink[place] >> 5 == tag && byte < next; ++byte) {
      bytes.push_back(static_cast<u8>(sink[byte]));
    }
    place = next;
  }
  return bytes;
}

std::vector<u32> short_audio_descriptors(const std::vector<u8> &bytes) {
  std::vector<u32> descriptors_found;
  for (std::size_t place = 0; place + 3 <= bytes.size(); place += 3) {
    descriptors_found.push_back(bytes[place] | static_cast<u32>(bytes[place + 1]) << 8 |
                                static_cast<u32>(bytes[place + 2]) << 16);
  }
  return descriptors_found;
}

void add_gap(std::vector<std::string> &gaps, const std::string &gap) {
  if (!gap.empty()) {
    gaps.push_back(gap);
  }
}

/// A sentence for all blocks after the first extension that are not read.
std::string later_blocks_gap(const std::vector<sink_block_t> &blocks, bool with_hdmi2) {
  std::string names;
  for (const sink_block_t &block : blocks) {
    if (block.number > 1 && !block.is_read) {
      names += (names.empty() ? "block " : ", block ") + std::to_string(block.number) + " (" + block.kind + ")";
    }
  }
  return names.empty() ? ""
                       : "Not read of the sink: " + names +
                             (with_hdmi2 ? ". This library reads CTA-861 extensions of revision 3."
                                         : ". This library reads one extension.");
}

}  // namespace

std::vector<u8> sink_of_stages(const std::vector<u8> &sink, const composition_t &composition) {
  const sink_bytes_t bytes(sink);
  const std::vector<std::size_t> read = has_hdmi2(composition) ? blocks_of_hdmi2(bytes) : std::vector<std::size_t>{};
  if (read.empty() || read.front() == 1) {
    return sink;
  }
  std::vector<u8> stages(sink.begin(), sink.begin() + edid_block_size);
  const auto begin = sink.begin() + static_cast<std::ptrdiff_t>(read.front() * edid_block_size);
  stages.insert(stages.end(), begin, begin + edid_block_size);
  return stages;
}

sink_reading_t sink_reading(const std::vector<u8> &original, const composition_t &composition) {
  const std::vector<u8> sink = sink_of_stages(original, composition);
  const compose_result_t &result = composition.result;
  sink_reading_t reading;
  reading.is_given = !sink.empty();
  reading.base_status = result.sink_status;
  reading.extension_status = result.sink_extension_status;
  if (!reading.is_given) {
    return reading;
  }
  const sink_bytes_t bytes(sink);
  reading.blocks = blocks_of(sink_bytes_t(original), composition);
  reading.missing_part = missing_part(result);
  add_gap(reading.gaps, base_gap(bytes, result.sink_status));
  if (result.sink_status == COMPOSE_SINK_READ) {
    add_gap(reading.gaps, extension_gap(bytes, result));
    add_gap(reading.gaps, later_blocks_gap(reading.blocks, has_hdmi2(composition)));
  }
  reading.base_timings = timings_of_base_block(bytes);
  reading.detailed_timings = reading.base_timings;
  if (is_extension_read(result)) {
    reading.detailed_timings += timings_of_extension(bytes);
    reading.short_audio = short_audio_descriptors(payloads(bytes, audio_tag));
  }
  return reading;
}

}  // namespace edid_cli
