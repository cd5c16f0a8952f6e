#include "platform/linux/windows/wayland/toplevels.h"

#include <algorithm>
#include <memory>

namespace linux::windows::wayland {

namespace {

std::vector<std::unique_ptr<Toplevel>> sToplevels;
std::uint64_t sLastNumber = 0;
unsigned sChanges = 0;

/// Whether those are still told of that were open before, and the ages of the oldest and the youngest.
bool sIsBeginning = true;
std::int64_t sOldest = 0;
std::int64_t sYoungest = 0;

auto find(const Toplevel& toplevel) {
  return std::ranges::find(sToplevels, &toplevel, &std::unique_ptr<Toplevel>::get);
}

void leave(Description& description, const wl_output* output) { std::erase(description.outputs, output); }

}  // namespace

void beginToplevels() { sIsBeginning = true; }

void noteAllAreKnown() {
  sIsBeginning = false;
  std::stable_partition(sToplevels.begin(), sToplevels.end(),
                        [](const auto& each) { return each->description.isActive; });
}

Toplevel& addToplevel(void* handle) {
  auto toplevel = std::make_unique<Toplevel>();
  toplevel->number = ++sLastNumber;
  toplevel->handle = handle;
  toplevel->age = sIsBeginning ? --sOldest : ++sYoungest;
  return **sToplevels.insert(sIsBeginning ? sToplevels.end() : sToplevels.begin(), std::move(toplevel));
}

void completeToplevel(Toplevel& toplevel) {
  const Description& before = toplevel.description;
  const Description& now = toplevel.next;
  if (!toplevel.isComplete || before.isActive != now.isActive || before.isDialog != now.isDialog ||
      before.applicationID != now.applicationID) {
    ++sChanges;
  }
  if (now.isActive && !before.isActive && !sIsBeginning) {
    const auto place = find(toplevel);
    std::rotate(sToplevels.begin(), place, place + 1);
  }
  toplevel.description = toplevel.next;
  toplevel.isComplete = true;
}

void removeToplevel(const Toplevel& toplevel) {
  if (toplevel.isComplete) ++sChanges;
  sToplevels.erase(find(toplevel));
}

void forgetToplevels(void (*last)(const Toplevel& toplevel)) {
  while (!sToplevels.empty()) {
    last(*sToplevels.back());
    removeToplevel(*sToplevels.back());
  }
}

std::vector<Toplevel*> toplevels() {
  std::vector<Toplevel*> complete;
  for (const auto& toplevel : sToplevels) {
    if (toplevel->isComplete) complete.push_back(toplevel.get());
  }
  return complete;
}

Toplevel* findToplevel(std::uint64_t number) {
  const auto found = std::ranges::find(sToplevels, number, [](const auto& each) { return each->number; });
  return found != sToplevels.end() ? found->get() : nullptr;
}

unsigned toplevelChanges() { return sChanges; }

void leaveOutput(wl_output* output) {
  for (const auto& toplevel : sToplevels) {
    leave(toplevel->description, output);
    leave(toplevel->next, output);
  }
}

}  // namespace linux::windows::wayland
