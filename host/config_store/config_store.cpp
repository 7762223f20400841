#include "config_store.h"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <exception>
#include <memory>
#include <string>
#include <string_view>
#include <variant>

#include "current_tree.h"
#include "default_platform.h"
#include "toml_reader.h"

namespace edid_config_store {
namespace {

constexpr std::size_t max_document_size = std::size_t{1024} * 1024;

std::string &last_error() {
  static std::string error;
  return error;
}

bool refuse(std::string message) {
  last_error() = std::move(message);
  return false;
}

bool load(std::string_view document, const std::string &name) {
  if (document.size() > max_document_size) {
    return refuse(name + ": larger than 1 MiB");
  }
  auto result = read_toml(document, name);
  if (auto *refusal = std::get_if<refusal_t>(&result)) {
    return refuse(std::move(refusal->message));
  }
  replace_current_tree(std::get<config_tree_t>(std::move(result)));
  last_error().clear();
  return true;
}

bool load_file(const std::string &path) {
  const auto close = [](std::FILE *file) { std::fclose(file); };
  const std::unique_ptr<std::FILE, decltype(close)> file(std::fopen(path.c_str(), "rb"), close);
  if (file == nullptr) {
    return refuse(path + ": " + std::strerror(errno));
  }
  // One byte more than is allowed tells that there is more, without reading what may have no end.
  std::string document(max_document_size + 1, '\0');
  errno = 0;
  document.resize(std::fread(document.data(), 1, document.size(), file.get()));
  if (std::ferror(file.get()) != 0) {
    return refuse(path + ": " + std::strerror(errno));
  }
  return load(document, path);
}

/// Nothing may be thrown through the C interface. What can be is a failed allocation.
template <typename action_t>
bool without_exceptions(action_t action) {
  try {
    return action();
  } catch (const std::exception &exception) {
    return refuse(exception.what());
  }
}

}  // namespace
}  // namespace edid_config_store

using namespace edid_config_store;

bool config_store_load_file(const char *path) {
  return without_exceptions([path] { return path == nullptr ? refuse("no file name given") : load_file(path); });
}

bool config_store_load_text(const char *text, size_t length, const char *name) {
  return without_exceptions([text, length, name] {
    if (text == nullptr || name == nullptr) {
      return refuse("no text or no name given");
    }
    return load(std::string_view(text, length), name);
  });
}

bool config_store_load_default(void) {
  return without_exceptions([] { return load(default_platform_text, "default platform"); });
}

const char *config_store_default_text(void) {
  return default_platform_text;
}

const char *config_store_hdmi2_text(void) {
  return hdmi2_platform_text;
}

const char *config_store_error(void) {
  return last_error().c_str();
}

bool config_store_node_position(uint32_t node, unsigned *line, unsigned *column) {
  const auto position = current_tree().position(node);
  if (!position) {
    return false;
  }
  if (line != nullptr) {
    *line = position->line;
  }
  if (column != nullptr) {
    *column = position->column;
  }
  return true;
}
