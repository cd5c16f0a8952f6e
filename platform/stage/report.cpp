#include "platform/stage/report.h"

#include "platform/base/object.h"

namespace stage {

std::string aliveText() {
  const auto counts = base::aliveByKind();
  std::string text;
  for (std::size_t i = 0; i < counts.size(); ++i) {
    if (counts[i] == 0) continue;
    if (!text.empty()) text += ", ";
    text += std::string(base::kindName(static_cast<base::Kind>(i))) + " ×" + std::to_string(counts[i]);
  }
  return text.empty() ? "nothing" : text;
}

}  // namespace stage
