#include "platform/linux/roles/show_window.h"

#include <algorithm>

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

}  // namespace

const Window* showWindow(const Performer& performer) {
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
  const Window* const front = performer.keyboardWindow();
  return players::actionState(*front, "win.fullscreen") == true ? nullptr : &*show;
}

std::vector<const Window*> documentWindows(const Performer& performer) {
  std::vector<const Window*> found;
  for (const Window& window : performer.windows()) {
    if (isDocument(window, performer)) found.push_back(&window);
  }
  return found;
}

bool showRuns(const Performer& performer) {
  if (styleOf(performer) == ShowStyle::ActionState) {
    const Window* const front = performer.keyboardWindow();
    if (front == nullptr) return false;
    const auto told = players::actionState(*front, performer.program()->showAction);
    if (told) return *told;
  }
  return showWindow(performer) != nullptr && !isStopped(performer);
}

}  // namespace linux::roles
