// A directory of a target's own.
#pragma once

#include <cstdlib>
#include <filesystem>
#include <string>

#include "fuzz/fuzz.h"

namespace fuzz {

/// Made empty, and removed with all that is in it.
class Directory {
 public:
  Directory() {
    std::string name = (std::filesystem::temp_directory_path() / "kvd-fuzz-XXXXXX").string();
    require(mkdtemp(name.data()) != nullptr, "there is a place for files");
    path = name;
  }
  Directory(const Directory&) = delete;
  Directory& operator=(const Directory&) = delete;
  ~Directory() { std::filesystem::remove_all(path); }

  std::filesystem::path path;
};

}  // namespace fuzz
