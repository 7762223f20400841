#include "toml_reader.h"

#include <algorithm>
#include <limits>
#include <optional>
#include <sstream>
#include <vector>

// Errors come back as results: what is thrown by the parser would have to be caught at the C interface.
#define TOML_EXCEPTIONS 0
// The parser asserts what a malformed document can break ("[="), and reports it after that as it should. The
// assertions would end the process, or with NDEBUG have the compiler assume that it cannot be: neither may be.
#undef NDEBUG
#define TOML_ASSERT(expression) static_assert(true)
#include <toml++/toml.h>

#include "document_limits.h"

namespace edid_config_store {
namespace {

/// No lookup of the library is longer: it cuts paths there.
constexpr std::size_t max_path_length = 255;
/// No platform needs more, and the library reads each of them at every composition.
constexpr std::size_t most_entries = 1000;

/// A control character would break the error's line, or mean something to a terminal.
std::string printable(std::string_view text) {
  std::ostringstream result;
  for (const char character : text) {
    const auto byte = static_cast<unsigned char>(character);
    if (byte == '\n') {
      result << "\\n";
    } else if (byte < 0x20 || byte == 0x7F) {
      result << '?';
    } else {
      result << character;
    }
  }
  return result.str();
}

std::string at_position(std::string_view name, const toml::source_position &position) {
  std::ostringstream result;
  result << name << ':' << position.line << ':' << position.column << ": ";
  return result.str();
}

node_position_t position_of(const toml::source_position &position) {
  return {position.line, position.column};
}

const char *type_name(toml::node_type type) {
  switch (type) {
    case toml::node_type::floating_point:
      return "a floating-point number";
    case toml::node_type::date:
      return "a date";
    case toml::node_type::time:
      return "a time";
    case toml::node_type::date_time:
      return "a date and time";
    default:
      return "a value of unknown type";
  }
}

/// Copies a parsed document into a tree, up to the first thing that a tree cannot hold.
class copier_t {
 public:
  explicit copier_t(std::string_view document_name) : document_name_(document_name) {}

  std::variant<config_tree_t, refusal_t> copy(const toml::table &table) && {
    copy_children(table, root_handle, 0);
    if (refusal_) {
      return *std::move(refusal_);
    }
    tree_.build_index();
    return std::move(tree_);
  }

 private:
  void copy_children(const toml::table &table, node_handle_t parent, int depth) {
    for (const auto &[key, value] : in_file_order(table)) {
      if (refusal_) {
        return;
      }
      const std::string_view name = key->str();
      if (const char *problem = problem_of_key(name); problem != nullptr) {
        refuse(key->source().begin, parent, name, problem);
        return;
      }
      copy_value(*value, parent, name, key->source().begin, depth);
    }
  }

  void copy_children(const toml::array &array, node_handle_t parent, int depth) {
    for (std::size_t index = 0; index < array.size() && !refusal_; ++index) {
      copy_value(array[index], parent, std::to_string(index), array[index].source().begin, depth);
    }
  }

  void copy_value(const toml::node &value, node_handle_t parent, std::string_view name,
                  const toml::source_position &position, int depth) {
    if (path_of(parent, name).size() > max_path_length) {
      refuse(position, parent, name, "the path is longer than 255 characters");
    } else if (const auto *table = value.as_table(); table != nullptr) {
      copy_branch(*table, parent, name, position, depth);
    } else if (const auto *array = value.as_array(); array != nullptr && array->size() > most_entries) {
      refuse(position, parent, name, "a list of " + std::to_string(array->size()) + " entries, which has 1000 at most");
    } else if (array != nullptr) {
      copy_branch(*array, parent, name, position, depth);
    } else if (const auto *integer = value.as_integer(); integer != nullptr) {
      copy_integer(integer->get(), parent, name, position, value.source().begin);
    } else if (const auto *boolean = value.as_boolean(); boolean != nullptr) {
      tree_.add_integer(parent, name, position_of(position), boolean->get() ? 1 : 0);
    } else if (const auto *text = value.as_string(); text != nullptr) {
      copy_text(text->get(), parent, name, position, value.source().begin);
    } else {
      refuse(value.source().begin, parent, name,
             std::string(type_name(value.type())) +
                 " cannot be stored; use an integer, a string, a boolean, an array or a table");
    }
  }

  template <typename container_t>
  void copy_branch(const container_t &children, node_handle_t parent, std::string_view name,
                   const toml::source_position &position, int depth) {
    if (depth == max_depth) {
      refuse(position, parent, name, "tables and arrays are nested more than 64 deep");
      return;
    }
    copy_children(children, tree_.add_branch(parent, name, position_of(position)), depth + 1);
  }

  void copy_integer(std::int64_t number, node_handle_t parent, std::string_view name,
                    const toml::source_position &position, const toml::source_position &value_position) {
    if (number < std::numeric_limits<std::int32_t>::min() || number > std::numeric_limits<std::uint32_t>::max()) {
      refuse(value_position, parent, name,
             std::to_string(number) + " does not fit 32 bits (-2147483648 to 4294967295)");
      return;
    }
    tree_.add_integer(parent, name, position_of(position),
                      static_cast<std::int32_t>(static_cast<std::uint32_t>(number)));
  }

  void copy_text(const std::string &text, node_handle_t parent, std::string_view name,
                 const toml::source_position &position, const toml::source_position &value_position) {
    if (text.find('\0') != std::string::npos) {
      refuse(value_position, parent, name, "the string holds a NUL character");
      return;
    }
    tree_.add_text(parent, name, position_of(position), text);
  }

  /// The parser keeps tables sorted by key; what was written first stands at the smaller position.
  static std::vector<std::pair<const toml::key *, const toml::node *>> in_file_order(const toml::table &table) {
    std::vector<std::pair<const toml::key *, const toml::node *>> entries;
    entries.reserve(table.size());
    for (auto entry = table.cbegin(); entry != table.cend(); ++entry) {
      entries.emplace_back(&entry->first, &entry->second);
    }
    std::sort(entries.begin(), entries.end(), [](const auto &left, const auto &right) {
      return left.first->source().begin < right.first->source().begin;
    });
    return entries;
  }

  static const char *problem_of_key(std::string_view name) {
    if (name.empty()) {
      return "an empty key cannot be looked up";
    }
    if (name.find('.') != std::string_view::npos) {
      return "a key with a dot in it cannot be looked up, since dots separate the names of a path";
    }
    const auto is_control = [](char character) {
      return static_cast<unsigned char>(character) < 0x20 || character == 0x7F;
    };
    if (std::any_of(name.begin(), name.end(), is_control)) {
      return "a key with a control character in it cannot be looked up";
    }
    return nullptr;
  }

  std::string path_of(node_handle_t parent, std::string_view name) const {
    std::string path(*tree_.path(parent));
    if (!path.empty()) {
      path += '.';
    }
    return path.append(name);
  }

  void refuse(const toml::source_position &position, node_handle_t parent, std::string_view name,
              const std::string &problem) {
    refusal_ = refusal_t{at_position(document_name_, position) + printable(path_of(parent, name)) + ": " + problem};
  }

  std::string_view document_name_;
  config_tree_t tree_;
  std::optional<refusal_t> refusal_;
};

}  // namespace

std::variant<config_tree_t, refusal_t> read_toml(std::string_view document, std::string_view name) {
  if (const auto problem = find_beyond_limits(document)) {
    return refusal_t{at_position(name, {problem->position.line, problem->position.column}) + problem->text};
  }
  const toml::parse_result parsed = toml::parse(document, name);
  if (!parsed) {
    const toml::parse_error &error = parsed.error();
    return refusal_t{at_position(name, error.source().begin) + printable(error.description())};
  }
  return copier_t(name).copy(parsed.table());
}

}  // namespace edid_config_store
