// Where the library's keys stand in the host's configuration tree.
#pragma once

#include <cstddef>
#include <cstring>

#define CONFIGURATION_DOMAIN "platform.software.drivers.vorex.edid."

namespace edid_composer {

/// The full path of a key, cut to @p size - 1 characters. Copied, not printed: a composition makes some fifty of them.
template <std::size_t size>
class configuration_path_t {
 public:
  explicit configuration_path_t(const char *key) {
    if (key == nullptr) key = "(null)";  // as printf has it
    const std::size_t length = strnlen(key, size - domain_length - 1);
    std::memcpy(text_, CONFIGURATION_DOMAIN, domain_length);
    std::memcpy(text_ + domain_length, key, length);
    text_[domain_length + length] = '\0';
  }
  const char *text() const { return text_; }

 private:
  static constexpr std::size_t domain_length = sizeof CONFIGURATION_DOMAIN - 1;
  static_assert(size > domain_length);

  char text_[size];
};

}  // namespace edid_composer
