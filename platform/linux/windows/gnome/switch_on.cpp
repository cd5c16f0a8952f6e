#include "platform/linux/windows/gnome/switch_on.h"

#include <chrono>
#include <string_view>

#include "platform/base/deadline.h"
#include "platform/base/subprocess.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/system/bus_values.h"

namespace linux::windows::gnome {

namespace {

const system::Callee kShell{"org.gnome.Shell", 0};
constexpr const char* kPath = "/org/gnome/Shell";
constexpr const char* kInterface = "org.gnome.Shell.Extensions";
constexpr const char* kExtension = "kvd@tarn.com";

/// It is installed, and neither on nor off since the shell has started.
constexpr double kInitialized = 6;

system::Slot sAsking;
bool sHasAnswered = false;

/// Whether the person has switched it off in an earlier session; true too when nobody can tell.
bool wasSwitchedOff() {
  constexpr std::size_t kLongestList = 1 << 16;
  base::Subprocess settings{.path = "/usr/bin/gsettings",
                            .arguments = {"gsettings", "get", "org.gnome.shell", "disabled-extensions"},
                            .discardsErrors = true};
  const auto said = base::runToEnd(std::move(settings), kLongestList, base::Deadline(system::kQueryLimit));
  return !said || said->status != 0 || said->output.find(kExtension) != std::string::npos;
}

int takeInformation(sd_bus_message* answer, void*, sd_bus_error*) {
  sAsking.reset();
  // While it starts it does not know yet.
  if (sd_bus_message_is_method_error(answer, nullptr) != 0) return 0;
  sHasAnswered = true;
  double state = 0;
  system::readDictionary(answer, [&](std::string_view key, std::string_view type) {
    if (key == "state") state = system::readNumber(answer, type).value_or(0);
  });
  if (state == kInitialized && !wasSwitchedOff()) {
    system::send(kShell, {kPath, kInterface, "EnableExtension"}, "s", kExtension);
  }
  return 0;
}

}  // namespace

void switchOn() {
  if (sHasAnswered || sAsking != nullptr) return;
  system::Message request = system::makeCall(kShell, {kPath, kInterface, "GetExtensionInfo"});
  if (request == nullptr || sd_bus_message_append(request.get(), "s", kExtension) < 0) return;
  sAsking = system::callLater(std::move(request), takeInformation, nullptr);
}

void forgetAnswer() {
  sAsking.reset();
  sHasAnswered = false;
}

}  // namespace linux::windows::gnome
