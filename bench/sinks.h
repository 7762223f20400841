// The sinks that are measured: files, and made ones that take the library as long as possible.
#pragma once

#include <string>
#include <vector>

#include "support/edid_builder.h"

namespace bench {

using test_support::bytes_t;

struct sink_t {
  std::string name;
  bytes_t bytes;
};

/// The EDIDs of a folder, by name: raw ones (.bin) and hexadecimal texts (.txt).
std::vector<sink_t> sinks_of(const std::string &folder);

/// The one of that name in a folder. Throws std::runtime_error when it is not there.
sink_t sink_of(const std::string &folder, const std::string &name);

/// An extension that is filled with one pattern.
struct hostile_family_t {
  const char *name;
  const char *what;   ///< What the pattern is, in words.
  u8 timings_offset;  ///< Byte 2. Below 4, data blocks run through all the bytes there are.
  bytes_t begin;      ///< Stands once before the pattern.
  bytes_t pattern;
};

const std::vector<hostile_family_t> &hostile_families();

/// A sink of @p size bytes, a multiple of 128 and at least 256.
bytes_t hostile_sink(const hostile_family_t &family, std::size_t size);

}  // namespace bench
