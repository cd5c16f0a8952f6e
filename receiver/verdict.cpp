#include "receiver/verdict.h"

#include <linux/input-event-codes.h>

#include <algorithm>
#include <array>

namespace receiver {
namespace {

struct Row {
  Verdict verdict;
  bool remote;
  std::string_view reason;
};

// clang-format off
constexpr auto kReasons = std::to_array<Row>({
    {Verdict::Infrared,       true,  "an infrared receiver"},
    {Verdict::CEC,            true,  "an HDMI-CEC adapter"},
    {Verdict::AVRCP,          true,  "the buttons of a Bluetooth player (AVRCP)"},
    {Verdict::Marked,         true,  "udev says so (ID_REMOTE_CONTROL=1)"},
    {Verdict::Named,          true,  "the command line says so (--device)"},
    {Verdict::Alone,          true,  "it has buttons, and no keyboard, mouse or sound card beside it"},
    {Verdict::NoButtons,      false, "it has no button that kvd knows"},
    {Verdict::Virtual,        false, "it belongs to no USB or Bluetooth device"},
    {Verdict::Keyboard,       false, "it is a keyboard"},
    {Verdict::Mouse,          false, "it is a mouse"},
    {Verdict::BesideKeyboard, false, "its device is a keyboard too"},
    {Verdict::BesideMouse,    false, "its device is a mouse too"},
    {Verdict::BesideSound,    false, "its device is a sound card too"},
});
// clang-format on

const Row& rowOf(Verdict verdict) { return *std::ranges::find(kReasons, verdict, &Row::verdict); }

bool sends(const Node& node, std::uint16_t key) {
  return std::ranges::find(node.keys, key) != node.keys.end();
}

Verdict judged(const Node& node, const std::vector<const Node*>& beside) {
  if (!std::ranges::any_of(node.keys, isButton)) return Verdict::NoButtons;
  if (node.named) return Verdict::Named;
  if (node.road == Road::Infrared) return Verdict::Infrared;
  if (node.road == Road::CEC) return Verdict::CEC;
  if (node.road == Road::AVRCP) return Verdict::AVRCP;
  if (node.marked) return Verdict::Marked;
  if (node.keyboard) return Verdict::Keyboard;
  if (node.mouse) return Verdict::Mouse;
  if (node.physical.empty()) return Verdict::Virtual;
  const auto any = [&beside](bool Node::*what) {
    return std::ranges::any_of(beside, [what](const Node* other) { return other->*what; });
  };
  if (any(&Node::keyboard)) return Verdict::BesideKeyboard;
  if (any(&Node::mouse)) return Verdict::BesideMouse;
  if (any(&Node::sound)) return Verdict::BesideSound;
  return Verdict::Alone;
}

}  // namespace

bool isRemote(Verdict verdict) { return rowOf(verdict).remote; }

std::string_view reason(Verdict verdict) { return rowOf(verdict).reason; }

void judge(std::vector<Node>& nodes) {
  const auto together = [&nodes](const Node& node) {
    std::vector<const Node*> beside;
    for (const Node& other : nodes) {
      if (&other == &node || (!node.physical.empty() && other.physical == node.physical))
        beside.push_back(&other);
    }
    return beside;
  };
  for (Node& node : nodes) node.verdict = judged(node, together(node));
  for (Node& node : nodes) {
    node.volumeKeys = std::ranges::any_of(together(node), [](const Node* other) {
      return isRemote(other->verdict) && sends(*other, KEY_VOLUMEUP);
    });
  }
}

}  // namespace receiver
