#include "platform/linux/roles/show_window.h"

#include <algorithm>
#include <optional>

#include "platform/linux/players/gtk_actions.h"
#include "platform/linux/players/mpris.h"
#include "platform/text/case.h"

namespace linux::roles {

namespace {

using programs::ShowStyle;
using windows::Window;

ShowStyle styleOf(const Performer& performer) {
  return performer.program() != nullptr ? performer.program()->show : ShowStyle::FullScreen;
}

bool isDocument(const Window& window, const Performer& performer) {
  const programs::Program* const program = performer.program();
  return !window.isDialog &&
         (program == nullptr || text::equalIgnoringCase(window.className, program->windowClass) ||
          text::equalIgnoringCase(window.applicationID, program->entry));
}

/// Some tell their show as a player's status: stopped is their ordinary window.
bool isStopped(const Performer& performer) {
  players::Player* const player = performer.playerIfAny();
  return player != nullptr && players::statusOf(*player) == players::PlaybackStatus::Stopped;
}

/// Whether a show runs, where an action tells.
std::optional<bool> toldByAction(const Performer& performer, const Window& window) {
  if (performer.program() == nullptr || *performer.program()->showAction == '\0') return std::nullopt;
  const auto told = players::describeAction(window, performer.program()->showAction);
  if (!told) return std::nullopt;
  switch (styleOf(performer)) {
    case ShowStyle::ActionState:
      return told->state;
    case ShowStyle::ActionDisabled:
      return !told->isEnabled;
    default:
      return true;
  }
}

}  // namespace

const Window* showWindow(const Performer& performer) {
  const Window* const front = performer.keyboardWindow();
  if (front == nullptr) return nullptr;
  if (const auto told = toldByAction(performer, *front)) return *told ? front : nullptr;
  const auto& windows = performer.windows();
  const auto show = std::ranges::find_if(
      windows, [](const Window& window) { return window.isFullScreen && window.isShown; });
  if (show == windows.end()) return nullptr;
  if (styleOf(performer) == ShowStyle::OwnWindow) {
    const auto documents = documentWindows(performer);
    const bool another =
        std::ranges::any_of(documents, [&](const Window* document) { return document != &*show; });
    return another ? &*show : nullptr;
  }
  // GTK programs tell their ordinary full-screen mode.
  const auto fullScreen = players::describeAction(*front, "win.fullscreen");
  return fullScreen && fullScreen->state == true ? nullptr : &*show;
}

std::vector<const Window*> documentWindows(const Performer& performer) {
  std::vector<const Window*> found;
  for (const Window& window : performer.windows()) {
    if (isDocument(window, performer)) found.push_back(&window);
  }
  return found;
}

bool showRuns(const Performer& performer) {
  return showWindow(performer) != nullptr && !isStopped(performer);
}

}  // namespace linux::roles
