// What the store's tests share.
#pragma once

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <vector>

#include "config_store.h"
#include "edid_composer.h"

namespace host_test {

/// What errors call the documents of these tests.
inline constexpr const char *document_name = "test.toml";

bool load(const std::string &document);

/// Loads what has to be refused and returns the error.
std::string refusal_of(const std::string &document);

/// What the store delivers for a path; nothing when it delivers nothing.
std::optional<i32> integer_at(const std::string &path);
std::optional<std::string> text_at(const std::string &path);

/// The names of a node's children, in order. The empty path is the root.
std::vector<std::string> children_of(const std::string &path);

/// Begins every test with an empty tree.
class ConfigStore : public testing::Test {
 protected:
  void SetUp() override { ASSERT_TRUE(load("")) << config_store_error(); }
};

}  // namespace host_test
