// What kvd-entries finds, and what kvd makes of what it is told.

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <sstream>

#include "platform/base/subprocess.h"
#include "platform/linux/programs/entry.h"
#include "tests/temporary_directory.h"

namespace {

using namespace linux::programs;
using Words = std::vector<std::string>;

TEST(Entries, AnyRecordIsReadOrPassedOver) {
  for (const char* line :
       {"", "{", "[]", "5", "{}", R"({"id":5})", R"({"id":"a","command":[5]})", "\x1f\x1e"}) {
    EXPECT_FALSE(fromRecord(line)) << line;
  }
  Entry odd;
  odd.id = "a\x1f\x1e\n\"b";
  odd.windowClass = "\x1f";
  odd.role = Role::Jukebox;
  odd.command = {"", "c\n"};
  const std::string record = toRecord(odd);
  EXPECT_EQ(record.find('\n'), record.size() - 1);
  const auto read = fromRecord(record);
  ASSERT_TRUE(read);
  EXPECT_EQ(read->id, odd.id);
  EXPECT_EQ(read->windowClass, odd.windowClass);
  EXPECT_EQ(read->role, odd.role);
  EXPECT_EQ(read->command, odd.command);
  EXPECT_FALSE(fromRecord(record.substr(0, record.size() - 3))) << "cut short";
}

TEST(Entries, FieldCodesAreLeftOut) {
  EXPECT_EQ(withoutFieldCodes({"player", "%U", "--file=%f", "100%%", "%%f", "%", "${i}"}),
            (Words{"player", "100%", "%f", "${i}"}));
}

TEST(Entries, FilesThatAreNoEntriesDoNotHideTheOthers) {
  const TemporaryDirectory directory;
  const auto applications = directory.path / "applications";
  std::filesystem::create_directories(applications / "kde");
  std::filesystem::create_directories(directory.path / "system/applications");
  const auto write = [&](const std::string& file, const std::string& rest) {
    std::ofstream(directory.path / file)
        << "[Desktop Entry]\nType=Application\nName=x\nExec=true\nCategories=Audio;Player;\n"
        << rest << "\n";
  };
  ASSERT_EQ(mkfifo((applications / "pipe.desktop").c_str(), 0600), 0);
  write("applications/large.desktop", "X-Large=" + std::string(300'000, 'x'));
  write("applications/plain.desktop", "");
  write("applications/gone.desktop", "Hidden=true");
  write("applications/kde/inner.desktop", "StartupWMClass=\x1f");
  write("system/applications/gone.desktop", "");
  write("system/applications/plain.desktop", "X-Kvd-Application=none");
  write("system/applications/other.desktop", "");
  setenv("XDG_DATA_HOME", directory.path.c_str(), 1);
  setenv("XDG_DATA_DIRS", (directory.path / "system").c_str(), 1);
  const std::string program = std::filesystem::read_symlink("/proc/self/exe").parent_path() / "kvd-entries";
  const auto said = base::runToEnd({.path = program, .arguments = {program}}, 1 << 20,
                                   base::Deadline(std::chrono::minutes(1)));
  ASSERT_TRUE(said && said->status == 0);
  std::istringstream report(said->output);
  Words found;
  for (std::string line; std::getline(report, line);) {
    const auto entry = fromRecord(line);
    ASSERT_TRUE(entry && entry->role == Role::Jukebox && !entry->cast) << line;
    found.push_back(entry->id);
  }
  std::ranges::sort(found);
  EXPECT_EQ(found, (Words{"kde-inner", "other", "plain"}));
}

}  // namespace
