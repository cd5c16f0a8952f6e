#include "receiver/list.h"

#include <chrono>
#include <cstdio>
#include <string>
#include <system_error>

#include "receiver/cec.h"
#include "receiver/device.h"
#include "receiver/devices.h"
#include "receiver/front.h"
#include "receiver/holders.h"
#include "receiver/names.h"
#include "receiver/pass_through.h"
#include "receiver/pass_through/protocol.h"

namespace receiver {
namespace {

/// A helper is started within a fraction of this.
constexpr std::chrono::milliseconds kPatience{2000};

/// The keys that kvd does nothing with and the desktop does not get either, while a device is grabbed.
std::string lostKeys(const Node& node, bool helper) {
  constexpr int kMostNames = 8;
  std::string names;
  int count = 0;
  const Keyboard keyboard{node.road, node.volumeKeys};
  for (const std::uint16_t key : node.keys) {
    if (buttonOf(key, std::nullopt, keyboard) != nullptr || (helper && pass_through::handsOn(key))) continue;
    if (++count <= kMostNames) names += (names.empty() ? "" : ", ") + nameOf(key);
  }
  return count > kMostNames ? names + " and " + std::to_string(count - kMostNames) + " more" : names;
}

/// The line of a udev rule that makes a remote of a device, and gives it to whoever sits at the screen.
std::string ruleFor(const Node& node) {
  return "this line in /etc/udev/rules.d/62-my-remotes.rules:\n"
         "    SUBSYSTEM==\"input\", KERNEL==\"event*\", ATTRS{id/vendor}==\"" +
         node.vendor + "\", ATTRS{id/product}==\"" + node.product + "\", ENV{ID_REMOTE_CONTROL}=\"1\"";
}

std::string advice(const Node& node) {
  const std::string option = "if it is a remote: --device " + node.path;
  return node.verdict == Verdict::Virtual ? option : option + ", or " + ruleFor(node);
}

std::string permission(const Node& node) {
  const std::string none = "no permission: ";
  if (node.marked) return none + "udev gives it to whoever sits at the screen";
  if (node.road == Road::HID) return none + "it takes " + ruleFor(node);
  return none +
         "the rule 61-kvd-remotes.rules gives it to whoever sits at the screen, once it is plugged in again";
}

/// What keeps a remote from being read; empty when nothing does.
std::string obstacle(const Node& node) {
  const Loop loop = makeLoop();
  try {
    Device device(loop.get(), node.path, {});
    return device.setGrabbed(true) ? "" : "somebody else has grabbed it" + holdersOf(node.path);
  } catch (const std::system_error& error) {
    return error.code() == std::errc::permission_denied ? permission(node) : error.code().message();
  }
}

void print(const Node& node, const Arguments& arguments, bool helper) {
  std::printf("%s\n", nameOf(node).c_str());
  const std::string why(reason(node.verdict));
  if (!isRemote(node.verdict)) {
    std::printf("  no remote: %s\n", why.c_str());
    std::printf("  %s\n", advice(node).c_str());
    return;
  }
  std::printf("  a remote: %s\n", why.c_str());
  if (const std::string what = obstacle(node); !what.empty()) std::printf("  %s\n", what.c_str());
  if (!arguments.grab) return;
  if (const std::string keys = lostKeys(node, helper); !keys.empty()) {
    std::printf("  lost while kvd has it: %s\n", keys.c_str());
  }
}

}  // namespace

int list(const Arguments& arguments) {
  PassThrough passThrough(arguments.passThrough);
  const bool helper = passThrough.open() && passThrough.serves(kPatience);
  bool any = false;
  bool anyRemote = false;
  for (const Node& node : findDevices(arguments.devices)) {
    if (node.verdict == Verdict::NoButtons) continue;
    print(node, arguments, helper);
    any = true;
    anyRemote |= isRemote(node.verdict);
  }
  if (!any) std::puts("No input device has a button that kvd knows.");
  if (const std::string taker = anyRemote ? takerNow() : ""; !taker.empty()) {
    std::printf("%s is in front and has the remotes; kvd has them when another window is.\n", taker.c_str());
  }
  for (const std::string& line : adaptersWithoutKeys()) std::puts(line.c_str());
  if (arguments.grab && !helper) {
    std::printf(
        "Nobody hands keys on to the desktop: the helper on %s is not installed, or serves another user.\n",
        arguments.passThrough.c_str());
  }
  if (std::fflush(stdout) == 0 && std::ferror(stdout) == 0) return 0;
  std::perror("kvd-receiver: standard output");
  return 1;
}

}  // namespace receiver
