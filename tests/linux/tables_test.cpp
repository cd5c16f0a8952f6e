// The users' document against what is done: each of its rows that names a deed is carried out on a program of
// that name, and what arrives there is what the row says.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "platform/linux/host/host.h"
#include "platform/linux/programs/own_words.h"
#include "platform/linux/programs/table.h"
#include "platform/linux/windows/keysyms.h"
#include "platform/scripting/identity.h"
#include "platform/scripting/lyrabox_dictionary.h"
#include "platform/scripting/movie_dictionaries.h"
#include "platform/scripting/slidewell_dictionary.h"
#include "platform/scripting/snapvale_dictionary.h"
#include "platform/scripting/spindle_dictionary.h"
#include "tests/linux/fake_session.h"
#include "tests/linux/fake_windows.h"

namespace {

using namespace linux::programs;
using Lines = std::vector<std::string>;
using tarnscript::Code;

const tarnscript::Dictionary kNoWords{};

struct Chapter {
  Role role;
  const char* title;
  std::string application;
  const tarnscript::Dictionary& words;
  /// Whom the words are for, where it is not the application.
  std::string object;
};

const Chapter kChapters[] = {
    {Role::Jukebox, "Music players", "Lyrabox", scripting::lyrabox::dictionary(), ""},
    {Role::DiscPlayer, "The disc player", "Spindle", scripting::spindle::dictionary(), ""},
    {Role::ClassicMovies, "The classic movie player", "VistremePlayer",
     scripting::movies::classicDictionary(), "front movie"},
    {Role::ModernMovies, "The modern movie player", "VistremePlayerX", scripting::movies::modernDictionary(),
     "front document"},
    {Role::Presentation, "Presentations", "Slidewell", scripting::slidewell::dictionary(), ""},
    {Role::PhotoLibrary, "The photo library", "Snapvale", scripting::snapvale::dictionary(), ""},
    {Role::ProfessionalPhotos, "Professional photos", "Lumbra", kNoWords, ""},
};

/// What the document calls a word that stands in no dictionary, and how it is said.
struct OwnWord {
  Code word;
  const char* name;
  const char* statement;
};

constexpr OwnWord kOwnWords[] = {
    {words::kShiftS, "key Shift+S", "key code 1 using shift down"},
    {words::kReturn, "key Return", "key code 36"},
    {words::kSpace, "key Space", "key code 49"},
    {words::kEscape, "key Escape", "key code 53"},
    {words::kRight, "key Right", "key code 124"},
    {words::kLeft, "key Left", "key code 123"},
    {words::kCommandEscape, "key Command+Escape", "key code 53 using command down"},
    {words::kNextAlbum, "`select` the next album", "select album 7"},
    {words::kPreviousAlbum, "`select` the previous album", "select album 5"},
};

/// Of these, and of no word, the rows in prose tell.
constexpr Code kToldInProse[] = {0,
                                 words::kNextChapter,
                                 words::kPreviousChapter,
                                 words::kFirstSlide,
                                 words::kLastSlide,
                                 words::kFreeze,
                                 words::kThaw};

struct Row {
  std::string word, on, text;
};

std::string document() {
  std::ifstream file(KVD_DOCUMENT);
  return {std::istreambuf_iterator<char>(file), {}};
}

/// The rows of a chapter's table.
std::vector<Row> rowsOf(const Chapter& chapter) {
  std::vector<Row> rows;
  const std::string text = document();
  const std::size_t start = std::min(text.find(std::string("\n### ") + chapter.title + "\n"), text.size());
  std::istringstream lines(text.substr(start, text.find("\n#", start + 1) - start));
  for (std::string line; std::getline(lines, line);) {
    const std::size_t on = line.find(" | ");
    const std::size_t deed = line.find(" | ", on + 3);
    if (!line.starts_with("| ")) continue;
    rows.push_back({line.substr(2, on - 2), line.substr(on + 3, deed - on - 3),
                    line.substr(deed + 3, line.size() - deed - 5)});
  }
  return rows;
}

std::string inBackticks(const std::string& text) {
  const std::size_t start = text.find('`') + 1;
  return text.substr(start, text.find('`', start) - start);
}

/// What arrives by a row; nothing for a row in prose.
std::optional<Lines> deedsOf(const Row& row, const std::string& window) {
  const std::string& text = row.text;
  const std::string quoted = inBackticks(text);
  if (text.starts_with("nothing: ")) return Lines();
  if (text.starts_with("MPRIS2 `") || text.starts_with("`")) return Lines{"program: " + quoted};
  if (text.starts_with("rc: `") || text.starts_with("mpv's channel: `"))
    return Lines{"program: channel: " + quoted};
  if (text.starts_with("action `")) {
    const std::size_t sign = quoted.find('=');
    if (sign == std::string::npos) return Lines{"program: Activate " + quoted + " of " + window};
    return Lines{"program: SetState " + quoted.substr(0, sign) + " " + quoted.substr(sign + 1) + " of " +
                 window};
  }
  if (!text.starts_with("key ")) return std::nullopt;
  Lines keys;
  std::istringstream names(text.substr(4));
  for (std::string name; names >> name;) {
    if (!linux::windows::parseKey(name)) return std::nullopt;
    keys.push_back("window " + window + ": key " + name);
  }
  return keys;
}

std::string scriptFor(const Chapter& chapter, const Row& row) {
  const bool isKey = row.word.starts_with("key ");
  std::string statement = inBackticks(row.word);
  for (const auto& term : chapter.words.properties) {
    if (statement == term.words) statement.insert(0, "get ");
  }
  for (const OwnWord& own : kOwnWords) {
    if (row.word == own.name) statement = own.statement;
  }
  const std::string object =
      isKey ? std::string("process id \"") + bundleIdentifier(chapter.role) + "\"" : chapter.object;
  if (!object.empty()) statement = "tell " + object + "\n" + statement + "\nend tell";
  return "tell application \"" + (isKey ? "Keyhouse" : chapter.application) + "\"\n" + statement +
         "\nend tell";
}

/// Starts the program that a row is about, with just the way open that the row goes; for "any other" one that
/// only its desktop entry tells of. It has a document open and, unless that is what is asked for, shows it.
void startFor(const Chapter& chapter, const Row& row, bool shows) {
  const auto found = std::ranges::find(programs(), row.on, &Program::name);
  const std::string entry = "other" + chapter.application;
  const Program other{.entry = entry.c_str(), .busName = "other", .windowClass = entry.c_str()};
  const Program& program = found != programs().end() ? *found : other;
  fake::writeEntry(entry, {std::string("X-Kvd-Application=") + bundleIdentifier(chapter.role)});
  Lines words{"playing", "url=dvd:///dev/sr0", "rc.title=1/3", "rc.chapter=1/9", "win.fullscreen=false"};
  words.push_back(std::string("DesktopEntry=") + program.entry);
  const bool byMethod = row.text.starts_with("`");
  if (byMethod) words.push_back("windows=1");
  if (*program.busName != '\0' && !byMethod)
    words.push_back(std::string("owns=org.mpris.MediaPlayer2.") + program.busName);
  if (row.text.find(": `") != std::string::npos) words.push_back("channel=channel");
  std::string state = shows ? "true" : program.show == ShowStyle::OwnWindow ? "none" : "false";
  if (shows && program.show == ShowStyle::ActionDisabled) state = "disabled";
  if (*program.showAction != '\0') words.push_back(program.showAction + ("=" + state));
  for (const Action& action : program.actions) {
    const std::string how = action.how;
    if (byMethod && action.means == Means::Method)
      words.push_back("owns=" + how.substr(0, how.find('%')) + "$PID");
  }
  if (scriptFor(chapter, row).find("get ") != std::string::npos) words.push_back("counts");
  fake::startProgram("program", *program.executable != '\0' ? program.executable : "other", words);
  const fake::Program& started = fake::program("program");
  for (const char* title : {"Show", "Document"}) {
    // Keys are for windows that tell of no actions.
    auto& window = fake::openWindow(title, started.process,
                                    row.text.starts_with("key ") ? std::string() : started.uniqueName);
    window.className = program.windowClass;
    window.isFullScreen = shows && window.title == "Show";
  }
  fake::takeJournal();
}

class Document : public testing::Test {
 protected:
  static void SetUpTestSuite() {
    fake::beginSession();
    linux::host::init({&fake::kWindows});
  }
  static void TearDownTestSuite() {
    linux::host::finish();
    fake::endSession();
  }
};

TEST_F(Document, NamesEveryProgram) {
  for (const Chapter& chapter : kChapters) {
    std::string row = std::string("| ") + chapter.title + " | `" + bundleIdentifier(chapter.role) + "` | ";
    for (const Program& program : programs()) {
      if (program.role == chapter.role) row += std::string(program.name) + ", ";
    }
    row.replace(row.size() - 2, 2, " |");
    EXPECT_NE(document().find(row), std::string::npos) << row;
  }
  const std::string text = document();
  const std::size_t takers = text.find("These take the remote themselves");
  for (const Program& program : programs()) {
    const std::size_t place = text.find(program.name, takers);
    EXPECT_EQ(program.takesRemote, program.role == Role::None) << program.name;
    EXPECT_TRUE(!program.takesRemote || place < text.find("\n\n", takers)) << program.name;
  }
}

TEST_F(Document, HasARowForEveryWordAndAction) {
  for (const Chapter& chapter : kChapters) {
    const std::vector<Row> rows = rowsOf(chapter);
    std::map<Code, std::string> names;
    const auto name = [&](const auto& term) {
      std::string& known = names[term.code];
      if (known.find(term.words) == std::string::npos)
        known += (known.empty() ? "" : ", ") + std::string(term.words);
    };
    std::ranges::for_each(chapter.words.commands, name);
    std::ranges::for_each(chapter.words.properties, name);
    for (auto& [code, words] : names) {
      words = "`" + words + "`";
      EXPECT_TRUE(std::ranges::count(rows, words, &Row::word)) << words;
    }
    for (const OwnWord& own : kOwnWords) names[own.word] = own.name;
    const auto expectRows = [&](std::span<const Action> actions, const std::string& on) {
      for (const Action& action : actions) {
        if (std::ranges::count(kToldInProse, action.word) > 0) continue;
        const auto isIts = [&](const Row& row) { return row.word == names[action.word] && row.on == on; };
        EXPECT_EQ(std::ranges::count_if(rows, isIts), std::ranges::count(actions, action.word, &Action::word))
            << names[action.word] << " on " << on;
      }
    };
    expectRows(commonActions(chapter.role), "any other");
    for (const Program& program : programs()) {
      if (program.role == chapter.role) expectRows(program.actions, program.name);
    }
  }
}

/// False for a row in prose.
bool expectWhatItSays(const Chapter& chapter, const Row& row) {
  const bool shows = row.word.find("start") == std::string::npos;
  const auto deeds = deedsOf(row, shows ? "Show" : "Document");
  if (!deeds) return false;
  SCOPED_TRACE(row.word + " on " + row.on + ": " + row.text);
  startFor(chapter, row, shows);
  const std::string script = scriptFor(chapter, row);
  const std::string told = fake::runScript(script);
  EXPECT_NE(told, "fails") << script;
  const Lines arrived = fake::takeJournal();
  const auto begins = [](const std::string& line, const std::string& deed) { return line.starts_with(deed); };
  const bool asks = script.find("get ") != std::string::npos;
  EXPECT_TRUE(asks ? std::ranges::count(arrived, deeds->front()) > 0
                   : std::ranges::equal(arrived, *deeds, begins))
      << testing::PrintToString(arrived);
  fake::endProgram("program");
  return true;
}

TEST_F(Document, SaysWhatIsDone) {
  int performed = 0;
  for (const Chapter& chapter : kChapters) {
    for (const Row& row : rowsOf(chapter)) performed += expectWhatItSays(chapter, row) ? 1 : 0;
  }
  EXPECT_GT(performed, 50);
}

}  // namespace
