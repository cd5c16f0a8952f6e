#include "platform/stage/desktop.h"

#include <algorithm>
#include <memory>
#include <string>

#include "platform/scripting/identity.h"
#include "platform/scripting/movie_dictionaries.h"
#include "platform/stage/journal.h"
#include "platform/stage/keyhouse.h"
#include "platform/stage/lumbra.h"
#include "platform/stage/lyrabox.h"
#include "platform/stage/movie_player.h"
#include "platform/stage/script_world.h"
#include "platform/stage/slidewell.h"
#include "platform/stage/snapvale.h"
#include "platform/stage/spindle.h"

namespace stage {

namespace {

scripting::Identity identityOf(const std::unique_ptr<Application>& application) {
  return {application->identifier.c_str(), application->name.c_str()};
}

}  // namespace

Desktop& desktop() {
  static Desktop instance;
  return instance;
}

void setUpDesktop() {
  auto& installed = desktop().installed;
  installed.push_back(std::make_unique<Lyrabox>());
  installed.push_back(std::make_unique<Spindle>());
  installed.push_back(std::make_unique<MoviePlayer>(scripting::kVistremePlayer, "7.6",
                                                    scripting::movies::classicDictionary(), 256));
  installed.push_back(std::make_unique<MoviePlayer>(scripting::kVistremePlayerX, "10.0",
                                                    scripting::movies::modernDictionary(), 1));
  installed.push_back(std::make_unique<Slidewell>());
  installed.push_back(std::make_unique<Snapvale>());
  installed.push_back(std::make_unique<Lumbra>());
  installed.push_back(std::make_unique<Keyhouse>());
  letScriptsFindApplications();
}

Application* findApplication(std::string_view identifierOrName) {
  const auto& installed = desktop().installed;
  const auto found = scripting::findNamed(installed, identifierOrName, identityOf);
  return found != installed.end() ? found->get() : nullptr;
}

Application* findOrInstallApplication(std::string_view identifierOrName) {
  const std::size_t lastDot = identifierOrName.rfind('.');
  const bool isIdentifier = lastDot != std::string_view::npos && lastDot + 1 < identifierOrName.size();
  // Identifiers that differ in case alone are different applications to the desktop, whatever scripts make of
  // them.
  for (const auto& application : desktop().installed) {
    if (application->identifier == identifierOrName) return application.get();
  }
  if (!isIdentifier) return findApplication(identifierOrName);
  desktop().installed.push_back(std::make_unique<Application>(
      std::string(identifierOrName), std::string(identifierOrName.substr(lastDot + 1)), "1.0"));
  return desktop().installed.back().get();
}

const Process* findProcess(const HostProcessSerialNumber& serialNumber) {
  const auto& running = desktop().running;
  const auto found = std::find_if(running.begin(), running.end(), [&](const Process& process) {
    return process.serialNumber == serialNumber;
  });
  return found != running.end() ? &*found : nullptr;
}

void openApplication(Application& application) {
  static std::uint32_t sLastProcess = 0x1000;
  const Process process{{0, ++sLastProcess}, &application};
  desktop().running.push_back(process);
  ++desktop().applicationListSeed;
  const bool first = application.instances.empty();
  application.instances.push_back(process.serialNumber);
  record(Entry::Change, application.name + (first ? " starts" : " starts once more"));
  if (first) application.started();
}

void quitApplication(Application& application) {
  if (application.instances.empty()) return;
  const HostProcessSerialNumber oldest = application.instances.front();
  application.instances.erase(application.instances.begin());
  std::erase_if(desktop().running, [&](const Process& process) { return process.serialNumber == oldest; });
  ++desktop().applicationListSeed;
  record(Entry::Change, application.name + " quits");
  if (desktop().front && desktop().front->serialNumber == oldest) desktop().front.reset();
  if (!application.instances.empty()) return;
  application.ended();
  giveDisplayBack(application);
}

void bringToFront(Application& application) {
  if (application.instances.empty()) return;
  const HostProcessSerialNumber oldest = application.instances.front();
  if (desktop().front && desktop().front->serialNumber == oldest) return;
  desktop().front = Process{oldest, &application};
  record(Entry::Change, application.name + " comes to the front");
}

void clearFront() { desktop().front.reset(); }

void takeDisplay(const Application& application) {
  if (desktop().displays.empty()) return;
  desktop().displays.front().holders.push_back(&application);
  record(Entry::Change, application.name + " takes the display");
}

void giveDisplayBack(const Application& application) {
  bool held = false;
  for (Display& display : desktop().displays) {
    held = std::erase(display.holders, &application) > 0 || held;
  }
  if (held) record(Entry::Change, application.name + " gives the display back");
}

void setOutputVolume(int volume) {
  const int previous = desktop().outputVolume;
  desktop().outputVolume = std::clamp(volume, 0, 100);
  if (desktop().outputVolume != previous) {
    record(Entry::Change,
           "output volume " + std::to_string(previous) + " → " + std::to_string(desktop().outputVolume));
  }
}

void setOutputMuted(bool muted) {
  if (desktop().outputMuted == muted) return;
  desktop().outputMuted = muted;
  record(Entry::Change, muted ? "output muted" : "output no longer muted");
}

std::optional<Nanoseconds> nextDesktopChange() {
  std::optional<Nanoseconds> next;
  for (const auto& application : desktop().installed) next = earlier(next, application->nextChange());
  return next;
}

void advanceDesktop() {
  for (const auto& application : desktop().installed) application->advance();
}

}  // namespace stage
