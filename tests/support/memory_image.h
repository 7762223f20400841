// Records byte for byte, to see that nobody wrote to them.
#pragma once

#include <cstring>
#include <string>

#include "edid_composer.h"

namespace test_support {

/// The bytes of an object, padding included.
template <typename object_t>
std::string image_of(const object_t &object) {
  std::string image(sizeof(object_t), '\0');
  std::memcpy(image.data(), &object, sizeof(object_t));
  return image;
}

/// The bytes of a list's entries and their payloads, which are @p payload_size bytes each.
std::string image_of_entries(const ll_list_t &list, std::size_t payload_size);

/// The bytes of the record, of all entries of its lists and of their payloads without padding.
std::string image_of_all(const platform_values_t &values);

}  // namespace test_support
