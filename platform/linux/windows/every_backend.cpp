#include "platform/linux/windows/every_backend.h"

#include "platform/linux/windows/cosmic/cosmic.h"
#include "platform/linux/windows/gnome/gnome.h"
#include "platform/linux/windows/kwin/kwin.h"
#include "platform/linux/windows/wlr/wlr.h"
#include "platform/linux/windows/x11/x11.h"

namespace linux::windows {

std::vector<const Backend*> everyBackend() {
  return {&wlr::kBackend, &kwin::kBackend, &cosmic::kBackend, &gnome::kBackend, &x11::kBackend};
}

}  // namespace linux::windows
