// What remotes send, as the receiver takes it: which devices are remotes, which buttons their keys are, what
// is held. An input has lines as tests/receiver/play.cpp plays them ("remote 1 hid volume", "900 1 PLAY down
// c00b0", "950 1 gone", "990 end"); a remote may be marked, named, a keyboard, a mouse or usb1, and have
// sound, besides.

#include <libevdev/libevdev.h>

#include <algorithm>
#include <map>
#include <sstream>
#include <string>
#include <vector>

#include "fuzz/fuzz.h"
#include "receiver/holds.h"
#include "receiver/keymap.h"
#include "receiver/verdict.h"

namespace {

using fuzz::require;
using receiver::Node;
using receiver::Road;
using receiver::Time;

constexpr std::size_t kRemotes = 4;

struct Stand {
  std::vector<Node> nodes = std::vector<Node>(kRemotes);
  /// How often each button is down.
  std::map<const remote::Button*, int> down;
  Time now{0};
  receiver::Holds holds{[this](const remote::Button& button, std::int32_t value) { say(button, value); }};

  void say(const remote::Button& button, std::int32_t value) {
    require(value == remote::kPressed || value == remote::kReleased, "a button goes down or up");
    int& times = down[&button];
    times += value == remote::kPressed ? 1 : -1;
    require(times >= 0, "no button is released that is not pressed");
    if (remote::tapValues(button).size() == 1) times = 0;
  }

  void goTo(Time time) {
    for (std::optional<Time> due; (due = holds.due()) && *due <= time;) {
      holds.advance(now = *due);
      require(holds.due() != due, "a release that is due is said");
    }
    now = time;
  }

  void plugIn(Node& node, const std::string& line) {
    const auto says = [&](const char* word) { return line.find(word) != std::string::npos; };
    node.road = says("hid")     ? Road::HID
                : says("cec")   ? Road::CEC
                : says("avrcp") ? Road::AVRCP
                                : Road::Infrared;
    node.keys = {KEY_PLAY, says("volume") ? std::uint16_t{KEY_VOLUMEUP} : std::uint16_t{KEY_STOP}};
    node.physical = says("usb1") ? "usb1" : "";
    node.keyboard = says("keyboard");
    node.mouse = says("mouse");
    node.sound = says("sound");
    node.marked = says("marked");
    node.named = says("named");
    receiver::judge(nodes);
    for (const Node& each : nodes) {
      require(!receiver::reason(each.verdict).empty(), "a verdict has a reason");
      require(!each.named || receiver::isRemote(each.verdict), "a device that was named is a remote");
    }
  }

  void change(unsigned number, const std::string& name, std::istream& words) {
    const int code = libevdev_event_code_from_name(EV_KEY, ("KEY_" + name).c_str());
    const receiver::Key key{static_cast<int>(number), static_cast<std::uint16_t>(std::max(code, 0))};
    std::string way;
    std::optional<std::uint32_t> scan;
    if (std::uint32_t told = 0; words >> way >> std::hex >> told) scan = told;
    if (way == "up") return holds.release(key, now);
    const Node& node = nodes[number];
    const remote::Button* const button = receiver::buttonOf(key.code, scan, {node.road, node.volumeKeys});
    if (button == nullptr) return;
    require(receiver::isButton(key.code), "no other key is a button");
    holds.press(key, *button, now, node.road == Road::HID || node.road == Road::AVRCP);
  }

  void end() {
    holds.releaseAll();
    require(!holds.due(), "nothing is due at the end");
    for (const auto& [button, times] : down) require(times == 0, "no button stays pressed");
  }

  void play(const std::string& line) {
    std::istringstream words(line);
    std::string word;
    unsigned time = 0;
    unsigned number = 0;
    if (line.starts_with("remote ") && words >> word >> number) return plugIn(nodes[number % kRemotes], line);
    if (!(words >> time)) return;
    goTo(std::chrono::milliseconds(time));
    if (!(words >> number >> word)) return end();
    number %= kRemotes;
    word == "gone" ? holds.releaseDevice(static_cast<int>(number)) : change(number, word, words);
  }
};

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  Stand stand;
  std::istringstream lines(std::string(fuzz::textOf(data, size)));
  for (std::string line; std::getline(lines, line);) stand.play(line);
  stand.end();
  return 0;
}
