#include "tests/core/script_texts.h"

#include <algorithm>
#include <fstream>
#include <regex>

namespace {

std::string nameOf(const std::string& text) {
  std::string name = text;
  for (const auto& [known, knownText] : scriptTexts()) {
    if (text == knownText) return known;
    if (known.ends_with(':') && text.starts_with(knownText + ' '))
      name = known + text.substr(knownText.size() + 1);
  }
  return name;
}

}  // namespace

const std::map<std::string, std::string>& scriptTexts() {
  static const auto sTexts = [] {
    std::map<std::string, std::string> texts;
    std::ifstream file(KVD_SCRIPT_TEXTS);
    for (std::string line; std::getline(file, line);) {
      const std::size_t sign = line.find(" = ");
      if (!line.starts_with('#')) texts.emplace(line.substr(0, sign), line.substr(sign + 3));
    }
    return texts;
  }();
  return sTexts;
}

std::string scriptText(const std::string& name) {
  const std::size_t colon = name.find(':') + 1;
  const auto found = scriptTexts().find(name);
  const std::string text = found != scriptTexts().end()
                               ? found->second
                               : scriptTexts().at(name.substr(0, colon)) + " " + name.substr(colon);
  return std::regex_replace(text, std::regex(R"( \\n )"), "\n");
}

std::string named(const std::string& sent) {
  // Blanks around line breaks are free.
  const std::string text = std::regex_replace(sent, std::regex("[ \t]*\n[ \t]*"), " \\n ");
  std::string result;
  for (std::size_t start = 0; start < text.size();) {
    const std::size_t end = std::min(text.find("; ", start), text.size());
    result += nameOf(text.substr(start, end - start)) + "; ";
    start = end + 2;
  }
  return result;
}
