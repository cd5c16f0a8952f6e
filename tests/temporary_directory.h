#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>

/// A directory of a test's own, removed with all that is in it; it serves as the runtime directory too.
class TemporaryDirectory {
 public:
  TemporaryDirectory() {
    std::string name = (std::filesystem::temp_directory_path() / "kvd-test-XXXXXX").string();
    EXPECT_NE(mkdtemp(name.data()), nullptr);
    path = name;
    setenv("XDG_RUNTIME_DIR", path.c_str(), 1);
  }
  ~TemporaryDirectory() { std::filesystem::remove_all(path); }

  std::filesystem::path path;
};
