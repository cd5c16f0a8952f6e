// The rehearsal desktop: which applications are installed and run, which is in front, the output volume.
#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

#include "platform/host.h"
#include "platform/stage/application.h"

namespace stage {

/// One running instance, or one that has run.
struct Process {
  HostProcessSerialNumber serialNumber;
  Application* application;
};

struct Display {
  HostDisplayID id = 0;
  /// Captured by nobody in particular, as a command said.
  bool capturedByHand = false;
  /// The applications that have it for themselves.
  std::vector<const Application*> holders;

  bool captured() const { return capturedByHand || !holders.empty(); }
};

/// What of the desktop does not work.
struct Broken {
  bool windowServer = false;
  bool displayQuery = false;
  bool processLookUp = false;
  bool eventRecords = false;
};

struct Desktop {
  std::vector<std::unique_ptr<Application>> installed;
  /// In the order they were started.
  std::vector<Process> running;
  std::optional<Process> front;
  /// The one whose answer a script, and with it everybody, waits for just now.
  const Application* waitedFor = nullptr;
  /// Changes whenever `running` does.
  std::uint32_t applicationListSeed = 1;

  int outputVolume = 50;  ///< 0 to 100
  bool outputMuted = false;

  /// The first is the one that slideshows take.
  std::vector<Display> displays = std::vector<Display>(1, Display{1, false, {}});

  Broken broken;
};

Desktop& desktop();

/// Installs the model applications and lets scripts find them.
void setUpDesktop();

/// The installed application with this identifier or name: an exact match first, then one without regard to
/// case; null when there is none.
Application* findApplication(std::string_view identifierOrName);
/// As findApplication, but an identifier (a name with dots) that is not installed becomes an application of
/// its own.
Application* findOrInstallApplication(std::string_view identifierOrName);

/// The running process with this serial number, null when there is none.
const Process* findProcess(const HostProcessSerialNumber& serialNumber);

/// Starts one more instance, behind the others.
void openApplication(Application& application);
/// Ends the oldest instance, if one runs.
void quitApplication(Application& application);
/// Brings the oldest instance to the front, if one runs.
void bringToFront(Application& application);
/// Leaves nobody in front.
void clearFront();

/// The first display becomes the application's own, or anybody's again.
void takeDisplay(const Application& application);
void giveDisplayBack(const Application& application);

/// Sets the output volume, held between 0 and 100.
void setOutputVolume(int volume);
void setOutputMuted(bool muted);

/// When some model next changes by itself.
std::optional<Nanoseconds> nextDesktopChange();
/// Brings every model to the present.
void advanceDesktop();

}  // namespace stage
