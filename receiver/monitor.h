// What --monitor shows.
#pragma once

#include <string>
#include <string_view>

#include "receiver/device.h"
#include "receiver/verdict.h"
#include "remote/buttons.h"

namespace receiver {

/// Writes lines to standard output as things happen; nothing where it is switched off.
class Monitor {
 public:
  explicit Monitor(bool on) : on_(on) {}

  void opened(const Node& node) const;
  void refused(const Node& node, std::string_view why) const;
  void closed(const Node& node) const;

  /// A key changed; `button` is null where kvd has no use for it, `outcome` what happens instead of sending.
  void changed(const Node& node, const Change& change, const remote::Button* button,
               std::string_view outcome) const;

  /// A message went out, or waits for a daemon.
  void sent(const remote::Button& button, std::int32_t value, bool listened) const;

  void session(bool active) const;
  /// The program in front takes the remote itself; none does when the name is empty.
  void taken(const std::string& program) const;
  void locked(bool locked) const;

 private:
  bool on_;
};

}  // namespace receiver
