#include "platform/terminal/brush.h"

#include <algorithm>
#include <cstdlib>
#include <string>

#include "platform/terminal/text.h"

namespace terminal {

namespace {

bool sHasColors = false;

struct Pair {
  Color color;
  short foreground;
};

constexpr Pair kPairs[] = {
    {Color::Green, COLOR_GREEN}, {Color::Cyan, COLOR_CYAN},       {Color::Yellow, COLOR_YELLOW},
    {Color::Red, COLOR_RED},     {Color::Magenta, COLOR_MAGENTA},
};

}  // namespace

void chooseColors() {
  const char* const unwanted = std::getenv("NO_COLOR");
  if (has_colors() == FALSE || (unwanted != nullptr && *unwanted != '\0')) return;
  start_color();
  use_default_colors();
  constexpr short kDefaultBackground = -1;
  for (const Pair& pair : kPairs)
    init_pair(static_cast<short>(pair.color), pair.foreground, kDefaultBackground);
  sHasColors = true;
}

attr_t colored(Color color, attr_t otherwise) {
  return sHasColors ? static_cast<attr_t>(COLOR_PAIR(static_cast<int>(color))) : otherwise;
}

int put(const Box& box, int row, int column, std::wstring_view text, attr_t attributes) {
  if (row >= box.rows || column >= box.columns) return column;
  const std::wstring shown = clip(text, box.columns - column);
  attr_set(attributes & ~static_cast<attr_t>(A_COLOR),
           static_cast<short>(PAIR_NUMBER(static_cast<int>(attributes))), nullptr);
  mvaddnwstr(box.top + row, box.left + column, shown.c_str(), static_cast<int>(shown.size()));
  attr_set(A_NORMAL, 0, nullptr);
  return column + width(shown);
}

void putHeading(const Box& box, std::wstring_view name) {
  const int end = put(box, 0, 0, L"── " + std::wstring(name) + L" ", A_BOLD);
  put(box, 0, end, std::wstring(static_cast<std::size_t>(std::max(0, box.columns - end)), L'─'), A_DIM);
}

}  // namespace terminal
