// film COLUMNS ROWS: plays keys on the rehearsal desktop, in virtual time, and writes what its screen shows
// as an animated SVG.
//
// Each line of standard input is a time in seconds and the key that is pressed so long after the one before:
// a character, or Space, Enter, Escape, Up, Down, Left or Right; "end" holds the last screen. Lines that
// begin with # are comments.

#include <curses.h>
#include <locale.h>
#include <stdlib.h>
#include <unistd.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <iostream>
#include <map>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

#include "platform/base/run_loop.h"
#include "platform/stage/commands.h"
#include "platform/stage/desktop.h"
#include "platform/stage/director.h"
#include "platform/terminal/brush.h"
#include "platform/terminal/controls.h"
#include "platform/terminal/paint.h"
#include "platform/text/utf8.h"

namespace {

using stage::kSecond;
using stage::Nanoseconds;

// ---- Keys ----

struct Press {
  Nanoseconds time;
  terminal::Keypress key;
};

const std::map<std::string, terminal::Keypress> kNamed{
    {"Space", {L' '}},
    {"Enter", {0, terminal::Special::Enter}},
    {"Escape", {0, terminal::Special::Escape}},
    {"Up", {0, terminal::Special::Up}},
    {"Down", {0, terminal::Special::Down}},
    {"Left", {0, terminal::Special::Left}},
    {"Right", {0, terminal::Special::Right}},
    {"end", {}},
};

std::vector<Press> readPresses() {
  std::vector<Press> presses;
  Nanoseconds time = stage::kVirtualStart;
  for (std::string line; std::getline(std::cin, line);) {
    double seconds = 0;
    std::string word;
    if (line.empty() || line.front() == '#') continue;
    const auto named = (std::istringstream(line) >> seconds >> word) ? kNamed.find(word) : kNamed.end();
    if (seconds < 0 || word.empty() || (word.size() > 1 && named == kNamed.end())) {
      std::cerr << "film: not a time and a key: " << line << '\n';
      std::exit(2);
    }
    time += static_cast<Nanoseconds>(seconds * kSecond);
    presses.push_back(
        {time, named != kNamed.end() ? named->second : terminal::Keypress{static_cast<wchar_t>(word[0])}});
  }
  return presses;
}

// ---- Frames ----

struct Cell {
  char32_t character;
  attr_t attributes;
  short pair;
};

/// When a row begins to look like this.
struct Look {
  Nanoseconds since;
  std::string markup;
};

std::vector<std::vector<Look>> sRows;

constexpr int kCellWidth = 8;
constexpr int kCellHeight = 18;
constexpr int kMargin = 12;

std::string escaped(char32_t character) {
  if (character == U'<') return "&lt;";
  if (character == U'&') return "&amp;";
  std::string text;
  text::appendUTF8(text, character);
  return text;
}

/// Bold, dim and reverse as b, d and r, the colours of terminal::Color as c1 to c5.
std::string classesOf(const Cell& cell) {
  std::string classes;
  if ((cell.attributes & A_BOLD) != 0) classes += "b ";
  if ((cell.attributes & A_DIM) != 0) classes += "d ";
  if ((cell.attributes & A_REVERSE) != 0) classes += "r ";
  if (cell.pair != 0) classes += "c" + std::to_string(cell.pair) + " ";
  if (!classes.empty()) classes.pop_back();
  return classes;
}

Cell cellAt(int row, int column) {
  cchar_t complex{};
  wchar_t characters[CCHARW_MAX + 1] = {};
  Cell cell{U' ', A_NORMAL, 0};
  mvin_wch(row, column, &complex);
  getcchar(&complex, characters, &cell.attributes, &cell.pair, nullptr);
  if (characters[0] != 0) cell.character = static_cast<char32_t>(characters[0]);
  return cell;
}

/// A run of cells that look alike. Its length is said, so that every font keeps the columns.
std::string runMarkup(int row, int column, int count, const std::string& text, const std::string& classes) {
  std::ostringstream markup;
  const int y = kMargin + row * kCellHeight;
  if (classes.find('r') != std::string::npos) {
    markup << "<rect x=\"" << kMargin + column * kCellWidth << "\" y=\"" << y << "\" width=\""
           << count * kCellWidth << "\" height=\"" << kCellHeight << "\"/>";
  }
  markup << "<text x=\"" << kMargin + column * kCellWidth << "\" y=\"" << y + kCellHeight - 5
         << "\" textLength=\"" << count * kCellWidth << '"';
  if (!classes.empty()) markup << " class=\"" << classes << '"';
  markup << '>' << text << "</text>";
  return markup.str();
}

std::string rowMarkup(int row) {
  std::string markup;
  for (int column = 0; column < COLS;) {
    const std::string classes = classesOf(cellAt(row, column));
    const int begin = column;
    int end = column;
    std::string text;
    std::string shown;
    for (; column < COLS && classesOf(cellAt(row, column)) == classes; ++column) {
      const char32_t character = cellAt(row, column).character;
      text += escaped(character);
      if (character == U' ' && classes.find('r') == std::string::npos) continue;
      shown = text;
      end = column + 1;
    }
    if (end > begin) markup += runMarkup(row, begin, end - begin, shown, classes);
  }
  return markup;
}

void takeFrame() {
  sRows.resize(static_cast<std::size_t>(LINES));
  for (int row = 0; row < LINES; ++row) {
    std::vector<Look>& looks = sRows[static_cast<std::size_t>(row)];
    std::string markup = rowMarkup(row);
    if (looks.empty() || looks.back().markup != markup) looks.push_back({stage::now(), std::move(markup)});
  }
}

// ---- The play ----

void play(const std::vector<Press>& presses) {
  terminal::State state;
  std::size_t next = 0;
  const auto draw = [&] {
    state.lessons.observe(stage::desktop());
    terminal::paint(state, stage::desktop());
    takeFrame();
  };
  const auto wait = [&](std::optional<Nanoseconds> deadline) {
    state.target.settle();
    draw();
    if (next == presses.size()) return stage::terminateDaemon();
    Nanoseconds until = std::min(presses[next].time, stage::now() + kSecond);
    until = *stage::earlier(stage::earlier(until, deadline), stage::nextDesktopChange());
    stage::advanceTo(until);
    stage::advanceDesktop();
    if (stage::now() < presses[next].time) return;
    handle(state, presses[next++].key);
  };
  const auto sleep = [&](Nanoseconds duration) {
    draw();
    stage::pass(duration);
  };
  stage::useVirtualTime();
  stage::setUpDesktop();
  stage::beginRehearsal({stage::now, wait, sleep}, [&](const stage::JournalLine& line) {
    state.journal.add(line);
    state.target.note(line);
  });
  stage::runDaemon();
}

// ---- The picture ----

constexpr char kStyle[] =
    "text{font:13.29px 'DejaVu Sans Mono',Menlo,Consolas,monospace;fill:#d8dee9}"
    ".b{font-weight:bold}.d{opacity:.55}rect{fill:#d8dee9}.r{fill:#1d232e}"
    ".c1{fill:#8fd694}.c2{fill:#7fc8e8}.c3{fill:#ecc66a}.c4{fill:#f08a8a}.c5{fill:#d79be0}";

/// In hundredths of a percent of the whole time, which is exact enough for a minute.
std::string percent(Nanoseconds time, Nanoseconds length) {
  std::ostringstream text;
  text << static_cast<double>((time - stage::kVirtualStart) * 10000 / length) / 100 << '%';
  return text.str();
}

void write(int columns, int rows, Nanoseconds length) {
  const int width = 2 * kMargin + columns * kCellWidth;
  const int height = 2 * kMargin + rows * kCellHeight;
  std::ostringstream style;
  std::ostringstream body;
  int animations = 0;
  for (const std::vector<Look>& looks : sRows) {
    for (std::size_t i = 0; i < looks.size(); ++i) {
      if (looks[i].markup.empty()) continue;
      if (looks.size() == 1) {
        body << looks[i].markup << '\n';
        continue;
      }
      const std::string name = "a" + std::to_string(animations++);
      style << "@keyframes " << name << "{0%{visibility:hidden}" << percent(looks[i].since, length)
            << "{visibility:visible}";
      if (i + 1 < looks.size()) style << percent(looks[i + 1].since, length) << "{visibility:hidden}";
      style << "}#" << name << "{animation-name:" << name << "}\n";
      body << "<g id=\"" << name << "\">" << looks[i].markup << "</g>\n";
    }
  }
  std::cout << "<svg xmlns=\"http://www.w3.org/2000/svg\" xml:space=\"preserve\" viewBox=\"0 0 " << width
            << ' ' << height << "\" width=\"" << width << "\" height=\"" << height << "\">\n<style>" << kStyle
            << "g{visibility:hidden;animation:" << static_cast<double>(length / (kSecond / 100)) / 100
            << "s step-end infinite}\n"
            << style.str()
            << "</style>\n<rect width=\"100%\" height=\"100%\" rx=\"8\" style=\"fill:#1d232e\"/>\n"
            << body.str() << "</svg>\n";
}

}  // namespace

int main(int argc, char** argv) {
  const int columns = argc == 3 ? std::atoi(argv[1]) : 0;
  const int rows = argc == 3 ? std::atoi(argv[2]) : 0;
  if (columns < 40 || rows < 12) {
    std::fputs("Usage: film COLUMNS ROWS < KEYS > SVG, of 40 columns and 12 rows or more\n", stderr);
    return 2;
  }
  const std::vector<Press> presses = readPresses();
  setenv("COLUMNS", argv[1], 1);
  setenv("LINES", argv[2], 1);
  unsetenv("NO_COLOR");
  setlocale(LC_CTYPE, "C.UTF-8");
  std::FILE* const nowhere = std::fopen("/dev/null", "r+");
  SCREEN* const screen = newterm("xterm-256color", nowhere, nowhere);
  if (screen == nullptr || presses.empty()) {
    std::fputs("film: no keys, or no description of the terminal xterm-256color\n", stderr);
    return 1;
  }
  terminal::chooseColors();
  std::string directory = std::filesystem::temp_directory_path() / "film-XXXXXX";
  if (mkdtemp(directory.data()) == nullptr) return 1;
  setenv("XDG_RUNTIME_DIR", directory.c_str(), 1);
  play(presses);
  endwin();
  std::filesystem::remove_all(directory);
  write(columns, rows, presses.back().time - stage::kVirtualStart);
  return 0;
}
