#include "receiver/monitor.h"

#include <cstdio>
#include <string>

#include "receiver/names.h"

namespace receiver {
namespace {

void show(const std::string& line) {
  std::printf("%s\n", line.c_str());
  std::fflush(stdout);
}

}  // namespace

void Monitor::opened(const Node& node) const {
  if (on_) show(nameOf(node) + " is read: " + std::string(reason(node.verdict)));
}

void Monitor::refused(const Node& node, std::string_view why) const {
  if (on_) show(nameOf(node) + ": " + std::string(why));
}

void Monitor::closed(const Node& node) const {
  if (on_) show(nameOf(node) + " is no longer read");
}

void Monitor::changed(const Node& node, const Change& change, const remote::Button* button,
                      std::string_view outcome) const {
  if (!on_) return;
  std::string line = nameOf(node) + " " + nameOf(change.key) + (change.down ? " down" : " up");
  if (button != nullptr) line += ": " + nameOf(*button) + (button->held ? ", may be held" : "");
  if (!outcome.empty()) line += ": " + std::string(outcome);
  show(line);
}

void Monitor::sent(const remote::Button& button, std::int32_t value, bool listened) const {
  if (!on_) return;
  show("  " + std::string(listened ? "sent: " : "not sent, nobody listens: ") + nameOf(button) +
       (value == remote::kReleased ? " released" : " pressed"));
}

void Monitor::session(bool active) const {
  if (on_)
    show(active ? "the session is the active one" : "the session is not the active one: no remote is read");
}

void Monitor::taken(const std::string& program) const {
  if (!on_) return;
  show(program.empty() ? "kvd has the remotes again" : program + " is in front and has the remotes");
}

void Monitor::locked(bool locked) const {
  if (on_) show(locked ? "the screen is locked" : "the screen is unlocked");
}

}  // namespace receiver
