// The tables of programs and words, against the dictionaries and against the users' document.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <string>
#include <utility>
#include <vector>

#include "platform/linux/programs/casting.h"
#include "platform/linux/roles/deeds.h"
#include "platform/linux/roles/own_words.h"
#include "platform/scripting/keyhouse_dictionary.h"
#include "platform/scripting/lyrabox_dictionary.h"
#include "platform/scripting/movie_dictionaries.h"
#include "platform/scripting/slidewell_dictionary.h"
#include "platform/scripting/snapvale_dictionary.h"
#include "platform/scripting/spindle_dictionary.h"

namespace {

using desktop::Deed;
using desktop::Means;
using desktop::Role;
using tarnscript::Code;

struct Chapter {
  Role role;
  const char* title;
  /// Null where no script speaks to the role.
  const tarnscript::Dictionary* dictionary;
};

const Chapter kChapters[] = {
    {Role::Jukebox, "Music players", &scripting::lyrabox::dictionary()},
    {Role::DiscPlayer, "The disc player", &scripting::spindle::dictionary()},
    {Role::ClassicMovies, "The classic movie player", &scripting::movies::classicDictionary()},
    {Role::ModernMovies, "The modern movie player", &scripting::movies::modernDictionary()},
    {Role::Presentation, "Presentations", &scripting::slidewell::dictionary()},
    {Role::PhotoLibrary, "The photo library", &scripting::snapvale::dictionary()},
    {Role::ProfessionalPhotos, "Professional photos", nullptr},
};

/// Commands and properties in the dictionary's order; words for the same thing are joined.
std::vector<std::pair<Code, std::string>> wordsOf(const tarnscript::Dictionary& dictionary) {
  std::vector<std::pair<Code, std::string>> words;
  const auto add = [&](Code code, std::string_view text) {
    const auto known = std::ranges::find(words, code, &std::pair<Code, std::string>::first);
    if (known == words.end()) {
      words.emplace_back(code, text);
    } else if (known->second != text) {
      known->second.append(", ").append(text);
    }
  };
  for (const auto& command : dictionary.commands) add(command.code, command.words);
  for (const auto& property : dictionary.properties) add(property.code, property.words);
  return words;
}

std::string nameOf(const char* entry) {
  if (entry == nullptr) return "any other";
  const desktop::Program* const program = desktop::programByEntry(entry);
  return program != nullptr ? program->name : std::string("unknown program ") + entry;
}

std::string tell(const Deed& deed) {
  const std::string how = deed.how;
  switch (deed.means) {
    case Means::Mpris:
      return "MPRIS2 `" + how + "`";
    case Means::Mpv:
      return "mpv's channel: `" + how + "`";
    case Means::Rc:
      return "rc: `" + how + "`";
    case Means::Action:
      return "action `" + how + "`";
    case Means::Key:
      return "key " + how;
    case Means::Code:
      return how;
    case Means::Nothing:
      return "nothing: " + how;
  }
  return "?";
}

std::string programTable() {
  std::string text = "| role | identifier | programs |\n|---|---|---|\n";
  for (const Chapter& chapter : kChapters) {
    text += std::string("| ") + chapter.title + " | `" + desktop::bundleIdentifier(chapter.role) + "` | ";
    std::string separator;
    for (const desktop::Program& program : desktop::programs()) {
      if (program.role != chapter.role) continue;
      text += separator + program.name;
      separator = ", ";
    }
    text += " |\n";
  }
  return text;
}

std::string nameOf(Code word, const Chapter& chapter) {
  if (const char* const own = desktop::nameOfOwnWord(word)) return own;
  if (chapter.dictionary != nullptr) {
    for (const auto& [code, text] : wordsOf(*chapter.dictionary)) {
      if (code == word) return "`" + text + "`";
    }
  }
  return "unknown word";
}

std::string wordTable(const Chapter& chapter) {
  std::string text =
      std::string("### ") + chapter.title + "\n\n| word | on | what is done |\n|---|---|---|\n";
  for (const Deed& deed : desktop::deeds()) {
    if (deed.role != chapter.role) continue;
    text += "| " + nameOf(deed.word, chapter) + " | " + nameOf(deed.program) + " | " + tell(deed) + " |\n";
  }
  return text;
}

TEST(Tables, EveryWordOfEveryRoleHasARow) {
  for (const Chapter& chapter : kChapters) {
    if (chapter.dictionary == nullptr) continue;
    for (const auto& [code, words] : wordsOf(*chapter.dictionary)) {
      const bool told = std::ranges::any_of(desktop::deeds(), [&, wanted = code](const Deed& deed) {
        return deed.role == chapter.role && deed.word == wanted;
      });
      EXPECT_TRUE(told) << chapter.title << ": " << words;
    }
  }
}

TEST(Tables, AreInTheUsersDocument) {
  std::ifstream file(KVD_DOCUMENT);
  const std::string document(std::istreambuf_iterator<char>(file), {});
  EXPECT_NE(document.find(programTable()), std::string::npos) << programTable();
  for (const Chapter& chapter : kChapters) {
    EXPECT_NE(document.find(wordTable(chapter)), std::string::npos) << wordTable(chapter);
  }
}

TEST(Casting, GoesByBusNamesAndWindowClassesWithoutAnEntry) {
  struct {
    const char* busName;
    Role role;
  } const players[] = {
      {"strawberry", Role::Jukebox}, {"mpv.instance4711", Role::ClassicMovies},
      {"vlc", Role::DiscPlayer},     {"io.github.celluloid_player.Celluloid.instance-1", Role::ModernMovies},
      {"playerctld", Role::None},    {"firefox.instance_1_7", Role::None},
      {"headset", Role::None},
  };
  for (const auto& player : players) {
    EXPECT_EQ(desktop::castPlayer("", player.busName).role, player.role) << player.busName;
  }
  EXPECT_EQ(desktop::castWindow("", "soffice", "libreoffice-impress").role, Role::Presentation);
  EXPECT_EQ(desktop::castWindow("", "soffice", "libreoffice-writer").role, Role::None);
  EXPECT_EQ(desktop::castWindow("", "eog", "Eog").role, Role::PhotoLibrary);
}

TEST(Casting, IsDecidedByTheEntrysOwnKeyFirst) {
  const std::string home = testing::TempDir() + "kvd-casting";
  const std::string applications = home + "/applications";
  ASSERT_EQ(std::system(("rm -rf '" + home + "' && mkdir -p '" + applications + "'").c_str()), 0);
  const auto write = [&](const char* id, const char* lines) {
    std::ofstream(applications + "/" + id + ".desktop")
        << "[Desktop Entry]\nType=Application\nName=x\nExec=true %U --flag\n"
        << lines;
  };
  write("mpv", "X-Kvd-Application=com.tarn.Lyrabox\n");
  write("vlc", "X-Kvd-Application=none\n");
  write("firefox", "Categories=Network;WebBrowser;\nX-Kvd-Application=com.tarn.VistremePlayerX\n");
  write("newcomer", "Categories=AudioVideo;Audio;Player;\n");
  write("organiser", "Categories=Graphics;Photography;\n");
  setenv("XDG_DATA_HOME", home.c_str(), 1);
  setenv("XDG_DATA_DIRS", home.c_str(), 1);

  EXPECT_EQ(desktop::castPlayer("mpv", "mpv").role, Role::Jukebox);
  EXPECT_EQ(desktop::castPlayer("mpv", "mpv").program, nullptr) << "mpv's deeds are those of a movie player";
  EXPECT_EQ(desktop::castPlayer("vlc", "vlc").role, Role::None);
  EXPECT_EQ(desktop::castPlayer("firefox", "firefox.instance_1").role, Role::ModernMovies);
  EXPECT_EQ(desktop::castPlayer("newcomer", "newcomer").role, Role::Jukebox);
  EXPECT_EQ(desktop::castWindow("", "organiser", "Organiser").role, Role::ProfessionalPhotos);
}

}  // namespace
