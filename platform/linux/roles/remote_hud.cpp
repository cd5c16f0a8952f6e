#include "platform/linux/roles/remote_hud.h"

#include <cstdio>
#include <string>

#include "platform/linux/players/mpris.h"
#include "platform/tarnscript/tarnscript.h"

namespace linux::roles {

namespace {

/// How long a notification stays, in milliseconds.
constexpr std::int32_t kShown = 2000;

/// The notification that the next one takes the place of; 0 when there has been none.
std::uint32_t sShown = 0;

/// "3:05", and "1:03:05" from an hour on.
std::string timeText(std::int64_t microseconds) {
  constexpr std::int64_t kSecond = 1'000'000;
  const std::int64_t seconds = microseconds / kSecond;
  char text[40];
  if (seconds >= 3600) {
    std::snprintf(text, sizeof text, "%lld:%02d:%02d", static_cast<long long>(seconds / 3600),
                  static_cast<int>(seconds / 60 % 60), static_cast<int>(seconds % 60));
  } else {
    std::snprintf(text, sizeof text, "%d:%02d", static_cast<int>(seconds / 60),
                  static_cast<int>(seconds % 60));
  }
  return text;
}

std::string place(const players::PlayerState& state) {
  return timeText(state.position) + (state.length ? " / " + timeText(*state.length) : std::string());
}

int takeNumber(sd_bus_message* answer, void*, sd_bus_error*) {
  std::uint32_t number = 0;
  if (sd_bus_message_is_method_error(answer, nullptr) == 0 && sd_bus_message_read(answer, "u", &number) > 0) {
    sShown = number;
  }
  return 0;
}

void notify(const std::string& summary, const std::string& body, const std::string& entry) {
  const system::Callee desk{"org.freedesktop.Notifications", 0};
  const system::Message request =
      system::makeCall(desk, {"/org/freedesktop/Notifications", "org.freedesktop.Notifications", "Notify"});
  if (request == nullptr) return;
  // Desktops have it started by its first message.
  sd_bus_message_set_auto_start(request.get(), 1);
  if (sd_bus_message_append(request.get(), "susssasa{sv}i", "kvd", sShown, entry.c_str(), summary.c_str(),
                            body.c_str(), 0, 2, "transient", "b", 1, "desktop-entry", "s", entry.c_str(),
                            kShown) < 0) {
    return;
  }
  sd_bus_call_async(system::bus(), nullptr, request.get(), takeNumber, nullptr,
                    static_cast<std::uint64_t>(system::kCommandLimit.count()));
}

}  // namespace

void showRemoteHUD(const Performer& performer) {
  players::Player* const player = performer.playerIfAny();
  if (player == nullptr) return;
  try {
    const players::PlayerState state = players::stateOf(*player);
    std::string title = state.title;
    if (title.empty()) title = performer.program() != nullptr ? performer.program()->name : player->name;
    const players::ProgramChannel* const channel = performer.channel();
    const bool shown = channel != nullptr && channel->showText != nullptr &&
                       channel->showText(performer.listener(), title + "\n" + place(state));
    if (!shown) notify(title, place(state), performer.instance().entry);
  } catch (const tarnscript::Refusal&) {
    // A player that does not answer has nothing to show.
  }
}

}  // namespace linux::roles
