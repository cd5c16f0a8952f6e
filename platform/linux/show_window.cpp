#include "platform/linux/show_window.h"

#include <algorithm>
#include <iterator>
#include <string_view>

#include "platform/linux/gtk_actions.h"
#include "platform/text/case.h"

namespace desktop {

namespace {

/// Desktop entries of the programs that show in a window of its own, beside the one that they were in; the
/// others make that one full screen.
constexpr std::string_view kShowInAnotherWindow[] = {
    "libreoffice-impress",
    "org.kde.okular",
    "org.gnome.gThumb",
    "org.gnome.Shotwell",
};

bool showsInAnotherWindow(const Instance& instance) {
  return instance.program != nullptr &&
         std::find(std::begin(kShowInAnotherWindow), std::end(kShowInAnotherWindow),
                   instance.program->entry) != std::end(kShowInAnotherWindow);
}

bool isDocument(const Client& client, const Instance& instance) {
  return !client.isDialog && (instance.program == nullptr ||
                              text::equalIgnoringCase(client.className, instance.program->windowClass));
}

}  // namespace

Window showWindow(const Instance& instance) {
  const auto& windows = instance.windows;
  const auto show = std::find_if(windows.begin(), windows.end(), isFullScreen);
  if (show == windows.end()) return 0;
  if (showsInAnotherWindow(instance)) {
    const auto documents = documentWindows(instance);
    const bool another =
        std::any_of(documents.begin(), documents.end(), [&](Window document) { return document != *show; });
    return another ? *show : 0;
  }
  // GTK programs tell their ordinary full-screen mode.
  return actionState(instance, "win.fullscreen") == true ? 0 : *show;
}

std::vector<Window> documentWindows(const Instance& instance) {
  std::vector<Window> found;
  for (const Client& client : clients()) {
    const bool ours =
        std::find(instance.windows.begin(), instance.windows.end(), client.window) != instance.windows.end();
    if (ours && isDocument(client, instance)) found.push_back(client.window);
  }
  return found;
}

}  // namespace desktop
