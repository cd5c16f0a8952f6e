// Every script text of the daemon, as its sources have it.
#pragma once

#include <string>
#include <vector>

struct ScriptText {
  std::string place;  ///< file:line, relative to the repository's root
  std::string text;
};

/// The texts of adapters/ and routing/, read from the sources, in the order of their places.
std::vector<ScriptText> scriptTexts();
