// The registry and the bridge on the rehearsal desktop.

#include "registry/registry.h"

#include <gtest/gtest.h>

#include <fstream>

#include "platform/base/values.h"
#include "platform/stage/journal.h"
#include "platform/stage/report.h"
#include "registry/bridge.h"
#include "routing/target.h"
#include "tests/core/rehearsal.h"
#include "tests/temporary_directory.h"

namespace {
/// Whether who is in front has ended by the time that it is asked about.
bool sEndsMeanwhile = false;
}  // namespace

// The linker puts this between the core and the host (--wrap).
extern "C" {
HostDictionaryRef
    __real__Z30HostCopyApplicationInformationi10HostHandleI20HostSerialNumberKindES_I14HostStringKindE(
        HostSessionID, HostSerialNumberRef, HostStringRef);
HostDictionaryRef
__wrap__Z30HostCopyApplicationInformationi10HostHandleI20HostSerialNumberKindES_I14HostStringKindE(
    HostSessionID session, HostSerialNumberRef application, HostStringRef key) {
  if (sEndsMeanwhile) return nullptr;
  return __real__Z30HostCopyApplicationInformationi10HostHandleI20HostSerialNumberKindES_I14HostStringKindE(
      session, application, key);
}
}

namespace {

constexpr const char* kIdentifiers[] = {
    Bundle::Lyrabox,        Bundle::Snapvale,        Bundle::Lumbra,    Bundle::Spindle,
    Bundle::VistremePlayer, Bundle::VistremePlayerX, Bundle::Slidewell, Bundle::Daemon,
};

/// One mark an application: R when it runs, r when its slot cannot be found, s when only that is filled, -
/// otherwise.
std::string slots() {
  bool (*const kRunning[])() = {LyraboxIsRunning,   SnapvaleIsRunning,       LumbraIsRunning,
                                SpindleIsRunning,   VistremePlayerIsRunning, VistremePlayerXIsRunning,
                                SlidewellIsRunning, DaemonIsRunning};
  std::string marks;
  for (std::size_t i = 0; i < std::size(kIdentifiers); ++i) {
    const bool filled(getASNForBundleID(HostGetConstantString(kIdentifiers[i])));
    marks += kRunning[i]() ? filled ? "R" : "r" : filled ? "s" : "-";
  }
  return marks;
}

TEST(Registry, KnowsWhatRanAtTheLastRefresh) {
  EXPECT_EQ(inChild([] {
              std::string marks = slots() + " ";
              for (const char* identifier : kIdentifiers) set(std::string("open ") + identifier);
              marks += slots() + " ";
              refreshCachedASNs();
              marks += slots() + " ";
              set("close com.tarn.Spindle; close com.tarn.vistremeplayer");
              marks += slots() + " ";
              refreshCachedASNs();
              marks += slots() + " ";
              marks += getASNForBundleID(HostGetConstantString("com.tarn.spindle")) ? "?" : "no ";
              return marks + stage::aliveText();
            }),
            "-------- -------- RRRRRRRR RRRssRRR RRR--RRR no serial number ×6");
}

TEST(Registry, TakesTheFirstOfSeveralInstances) {
  EXPECT_EQ(inChild([] {
              set("open lyrabox; open lyrabox again");
              refreshCachedASNs();
              const auto instance = [] {
                const HostSerialNumberRef cached = getASNForBundleID(HostGetConstantString(Bundle::Lyrabox));
                return base::as<base::SerialNumber>(cached)->process.low & 0xF;
              };
              std::string answers = std::to_string(instance());
              set("close lyrabox");
              answers += LyraboxIsRunning() ? "R" : "s";
              refreshCachedASNs();
              return answers + std::to_string(instance()) + (LyraboxIsRunning() ? "R" : "s");
            }),
            "1s2R");
}

TEST(Registry, TellsTheFrontmostApplication) {
  const std::pair<const char*, const char*> rows[] = {
      {Bundle::Lyrabox, "Lyra"},   {Bundle::Snapvale, "Snap"},        {Bundle::Lumbra, "Lumb"},
      {Bundle::Spindle, "Spin"},   {Bundle::VistremePlayerX, "VstX"}, {Bundle::VistremePlayer, "Vist"},
      {Bundle::Slidewell, "Slid"}, {Bundle::Daemon, "none"},          {"com.tarn.lumbra", "none"},
  };
  for (const auto& [identifier, code] : rows) {
    EXPECT_EQ(inChild([identifier = identifier] {
                const std::string nobody = codeText(FrontProcessID());
                set(std::string("open ") + identifier + "; front " + identifier);
                const std::string front = codeText(FrontProcessID());
                sEndsMeanwhile = true;
                const std::string gone = codeText(FrontProcessID());
                return nobody + " " + front + " " + gone + " " + stage::aliveText();
              }),
              "none " + std::string(code) + " none nothing");
  }
  for (AppCode (*const front)() : {FrontProcessID, FrontApplication}) {
    EXPECT_EQ(inChild([&] {
                set("open lyrabox; front lyrabox");
                stage::setJournalListener([](const stage::JournalLine& line) {
                  if (line.kind == stage::Entry::Question) set("close lyrabox");
                });
                const std::string code = codeText(front());
                return code + " " + stage::aliveText();
              }),
              "none nothing")
        << "it quits while one asks";
  }
}

TEST(Registry, ReadsTheMajorVersion) {
  const std::pair<const char*, std::int32_t> rows[] = {
      {"8.1.2", 8},     {"7", 7},     {"9", 9},
      {"none", 0},      {".5", 0},    {"beta", 0},
      {"12beta.1", 12}, {"-3.1", -3}, {"99999999999.0", 2147483647},
  };
  for (const auto& [version, major] : rows) {
    EXPECT_EQ(inChild([version = version] {
                const std::int32_t absent = getSnapvaleVersion();
                set(std::string("open snapvale; version snapvale ") + version);
                return std::to_string(absent) + " " + std::to_string(getSnapvaleVersion());
              }),
              "0 " + std::to_string(major));
  }
  // The copy of the serial number and the pieces of the version stay, on purpose; the information does not.
  EXPECT_EQ(inChild([] {
              set("open com.tarn.Snapvale");
              getSnapvaleVersion();
              return stage::aliveText();
            }),
            "string ×3, list ×1, serial number ×1");
}

TEST(Registry, ReadsThePropertyListsOfABundle) {
  EXPECT_EQ(inChild([] {
              const TemporaryDirectory directory;
              std::ofstream(directory.path / "keys.plist") << "<plist><dict/></plist>";
              std::ofstream(directory.path / "huge.plist");
              std::filesystem::resize_file(directory.path / "huge.plist", 1 << 30);
              const HostBundleRef bundle = HostCreateBundle(directory.path.c_str());
              std::string read;
              for (const char* name : {"keys", "huge", "absent"}) {
                const HostDictionaryRef dictionary =
                    CreateDictionaryFromPList(bundle, HostGetConstantString(name));
                if (dictionary) read += name + std::string(", ");
                HostRelease(dictionary);
              }
              HostRelease(bundle);
              return read + stage::aliveText();
            }),
            "keys, nothing");
}

TEST(Bridge, TurnsResultsIntoNumbersAndCodes) {
  struct Row {
    const char* source;
    std::intptr_t integer;
    const char* code;
  };
  const std::string none(4, '.');
  const Row rows[] = {
      {nullptr, 0, "...."},
      {"", 0, "...."},
      {"\xFF\xFE", 0, "...."},
      {"true", 1, "...."},
      {"1 = 2", 0, "...."},
      {"-7", -7, "...."},
      {"7 / 2", 3, "...."},
      {"-7 / 2", -3, "...."},
      {"if then", 0, "...."},
      {"neverSet + 1", 0, "...."},
      {"tell application id \"com.tarn.Lyrabox\" to get player state", 0, "kPSS"},
      {"tell application id \"com.tarn.Lyrabox\" to get sound volume", 60, "...."},
      {"tell application id \"com.tarn.Nobody\" to launch", 0, "...."},
  };
  for (const Row& row : rows) {
    EXPECT_EQ(inChild([&] {
                set("open lyrabox");
                HandleScript(row.source);
                return std::to_string(HandleScriptWithIntegerResult(row.source)) + " " +
                       codeText(HandleScriptWithOSTypeResult(row.source)) + " " + stage::aliveText();
              }),
              std::to_string(row.integer) + " " + row.code + " nothing")
        << (row.source != nullptr ? row.source : "null");
  }
  EXPECT_EQ(inChild([] {
              const HostDescriptorRef result = HandleScriptWithResult("42");
              const std::string alive = stage::aliveText();
              HostRelease(result);
              return alive + ", then " + stage::aliveText();
            }),
            "descriptor ×1, then nothing");
}

TEST(Bridge, SendsEventsToCachedInstancesOnly) {
  const auto eventTo = [](const char* identifier) {
    HandleTarnEventWithCode(HostGetConstantString(identifier), FourCC("hook"), FourCC("RSel"));
    return sent() + "|";
  };
  EXPECT_EQ(inChild([&] {
              set("open lyrabox; open com.example.Editor");
              std::string answers = eventTo(Bundle::Lyrabox);
              refreshCachedASNs();
              answers += eventTo(Bundle::Lyrabox);
              answers += eventTo("com.example.Editor");
              answers += stage::aliveText() + "|";
              set("close lyrabox");
              answers += eventTo(Bundle::Lyrabox);
              return answers + stage::aliveText();
            }),
            "|event 'hook'/'RSel' to Lyrabox; ||serial number ×1||serial number ×1, event contents ×2")
      << "what a failed send leaves behind stays, on purpose";
}

}  // namespace
