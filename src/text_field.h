// Text fields of records: they end at their NUL or, without one, at their size.
#pragma once

#include <cstddef>
#include <cstring>

namespace edid_composer {

/// A copy of a text field that ends with a NUL in any case, for printing.
template <std::size_t size>
class text_field_t {
 public:
  explicit text_field_t(const char (&field)[size]) { std::memcpy(text_, field, size); }
  const char *c_str() const { return text_; }
  bool empty() const { return text_[0] == '\0'; }

 private:
  char text_[size + 1] = {};
};

}  // namespace edid_composer
