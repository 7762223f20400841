#include "platform/unknown_keys.h"

#include <algorithm>
#include <optional>
#include <string>

#include "platform/nearest_name.h"
#include "platform/platform_keys.h"

namespace edid_cli {
namespace {

/// Every key that is read, relative to the library's table.
std::vector<std::string> known_keys() {
  std::vector<std::string> keys;
  for (const configuration_key_t *key : platform_keys()) {
    if (key->kind != CONFIGURATION_AUDIO_FORMATS) {
      keys.emplace_back(key->name);
    }
  }
  const std::vector<std::string> entries = audio_entry_keys();
  keys.insert(keys.end(), entries.begin(), entries.end());
  return keys;
}

std::string last_name(const std::string &key) {
  return key.substr(key.rfind('.') + 1);
}

/// The key that a name is nearest to: as it stands, or by its last name in another table.
std::optional<std::string> suggestion_for(const std::string &key, const std::vector<std::string> &known) {
  if (auto nearest = nearest_name(key, known)) {
    return nearest;
  }
  std::vector<std::string> names;
  std::transform(known.begin(), known.end(), std::back_inserter(names), last_name);
  const auto nearest = nearest_name(last_name(key), names);
  return nearest ? std::optional(
                       known[static_cast<std::size_t>(std::find(names.begin(), names.end(), *nearest) - names.begin())])
                 : std::nullopt;
}

/// The tables that the library's stands in, from the root on: the empty path, "platform" and so on.
std::vector<std::string> tables_around() {
  const std::string domain = platform_domain;
  std::vector<std::string> tables{""};
  for (std::size_t dot = 0; (dot = domain.find('.', dot)) != std::string::npos; ++dot) {
    tables.push_back(domain.substr(0, dot));
  }
  return tables;
}

class search_t {
 public:
  findings_t run() && {
    search_table(*configuration_node_t::find(platform_domain), "");
    for (const std::string &table : tables_around()) {
      search_around(*configuration_node_t::find(table));
    }
    return std::move(findings_);
  }

 private:
  bool is_known(const std::string &key) const { return std::find(known_.begin(), known_.end(), key) != known_.end(); }

  void search_table(const configuration_node_t &table, const std::string &prefix) {
    for (const configuration_node_t &child : table.children()) {
      const std::string key = prefix + child.name();
      if (is_inner_table(key) && child.is_branch()) {
        search_table(child, key + ".");
      } else if (!is_known(key)) {
        const auto suggestion = is_inner_table(key) ? std::nullopt : suggestion_for(key, known_and_tables());
        findings_.push_back(
            {severity_t::warning, child.position(), key,
             "nobody reads this key" + (suggestion ? ": did you mean " + *suggestion + "?" : std::string())});
      }
    }
  }

  void search_around(const configuration_node_t &table) {
    for (const configuration_node_t &child : table.children()) {
      const std::string name = child.name();
      const bool is_one =
          std::any_of(known_.begin(), known_.end(), [&name](const std::string &key) { return last_name(key) == name; });
      if (is_one) {
        findings_.push_back({severity_t::warning, child.position(), name,
                             "nobody reads this key here: it belongs into the table " + std::string(platform_domain)});
      }
    }
  }

  std::vector<std::string> known_and_tables() const {
    std::vector<std::string> names = known_;
    names.insert(names.end(), std::begin(inner_tables), std::end(inner_tables));
    return names;
  }

  const std::vector<std::string> known_ = known_keys();
  findings_t findings_;
};

}  // namespace

findings_t find_unknown_keys() {
  return search_t().run();
}

findings_t find_missing_table() {
  if (configuration_node_t::find(platform_domain)) {
    return {};
  }
  finding_t finding{severity_t::error,
                    {},
                    "",
                    std::string("the table ") + platform_domain + " is missing: every value is the default"};
  std::vector<std::string> tables = tables_around();
  tables.emplace_back(platform_domain);
  // The first of the domain's names that is not there is the one that may be misspelt.
  for (std::size_t depth = 1; depth < tables.size(); ++depth) {
    if (configuration_node_t::find(tables[depth])) {
      continue;
    }
    const std::string wanted = last_name(tables[depth]);
    for (const configuration_node_t &child : configuration_node_t::find(tables[depth - 1])->children()) {
      if (nearest_name(child.name(), std::vector<std::string>{wanted})) {
        finding.position = child.position();
        finding.text += " (" + child.name() + ": did you mean " + wanted + "?)";
        break;
      }
    }
    break;
  }
  return {finding};
}

}  // namespace edid_cli
