#include "bench/script_texts.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>

namespace {

namespace fs = std::filesystem;

/// Every text between one of these openings and its closing is a script: nothing else in the core is a raw
/// string, and the volume scripts, which are not, begin with words of their own.
constexpr struct {
  const char* opening;
  const char* closing;
  std::size_t kept;  ///< characters of the opening that belong to the text
} kForms[] = {{"R\"(", ")\"", 0}, {"\"output ", "\")", 7}, {"\"set volume ", "\")", 11}};

void addTexts(const fs::path& file, std::vector<ScriptText>& texts) {
  std::ifstream stream(file);
  const std::string source{std::istreambuf_iterator<char>(stream), {}};
  for (const auto& form : kForms) {
    const std::string opening = form.opening;
    for (std::size_t at = 0; (at = source.find(opening, at)) != std::string::npos;) {
      const std::size_t end = source.find(form.closing, at + opening.size());
      const std::size_t start = at + opening.size() - form.kept;
      const auto line =
          1 + std::count(source.begin(), source.begin() + static_cast<std::ptrdiff_t>(at), '\n');
      texts.push_back({file.lexically_relative(KVD_SOURCES).string() + ":" + std::to_string(line),
                       source.substr(start, end - start)});
      at = end;
    }
  }
}

}  // namespace

std::vector<ScriptText> scriptTexts() {
  std::vector<fs::path> files;
  for (const char* folder : {"adapters", "routing"}) {
    for (const auto& entry : fs::directory_iterator(fs::path(KVD_SOURCES) / folder))
      files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  std::vector<ScriptText> texts;
  for (const fs::path& file : files) addTexts(file, texts);
  return texts;
}
