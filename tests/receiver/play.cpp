// Plays a file of what remotes send, in virtual time, and prints it with what is said to the daemon below
// each line. Lines at the margin are read again, what is indented is not. Times are in milliseconds.
//
//     remote NUMBER infrared|cec|avrcp|hid [volume]    a remote, with keys for the volume or without
//     TIME NUMBER KEY down|up [SCAN]                   a key changes; SCAN is what MSC_SCAN tells, in
//     hexadecimal TIME NUMBER gone                                 the remote is unplugged TIME end the
//     receiver ends, or the machine goes to sleep keys NUMBER KEY...                               which
//     buttons these are, without pressing them
#include <libevdev/libevdev.h>

#include <cstdlib>
#include <iostream>
#include <map>
#include <sstream>
#include <string>

#include "receiver/holds.h"
#include "receiver/keymap.h"

namespace {

using receiver::Road;
using receiver::Time;

const std::map<std::string, Road> kRoads = {
    {"infrared", Road::Infrared}, {"cec", Road::CEC}, {"avrcp", Road::AVRCP}, {"hid", Road::HID}};

std::map<int, receiver::Keyboard> sRemotes;
Time sNow{0};

receiver::Holds sHolds([](const remote::Button& button, std::int32_t value) {
  std::cout << "  " << sNow / std::chrono::milliseconds(1) << " " << button.name
            << (value != 0 ? " down" : " up") << "\n";
});

std::uint16_t keyCalled(const std::string& name) {
  const int code = libevdev_event_code_from_name(EV_KEY, ("KEY_" + name).c_str());
  if (code >= 0) return static_cast<std::uint16_t>(code);
  std::cerr << "no key " << name << "\n";
  std::exit(1);
}

void goTo(Time time) {
  while (const auto due = sHolds.due()) {
    if (*due > time) break;
    sHolds.advance(sNow = *due);
  }
  sNow = time;
}

void change(int number, const std::string& name, std::istream& rest) {
  std::string way;
  std::optional<std::uint32_t> scan;
  if (std::uint32_t told = 0; rest >> way >> std::hex >> told) scan = told;
  const receiver::Keyboard& remote = sRemotes[number];
  const receiver::Key key{number, keyCalled(name)};
  const remote::Button* const button = receiver::buttonOf(key.code, scan, remote);
  if (way == "up") return sHolds.release(key, sNow);
  if (button != nullptr)
    sHolds.press(key, *button, sNow, remote.road == Road::HID || remote.road == Road::AVRCP);
}

void play(std::istream& line) {
  std::string word;
  int number = 0;
  line >> word >> number;
  if (word == "remote") {
    std::string road, volume;
    line >> road >> volume;
    sRemotes[number] = {kRoads.at(road), volume == "volume"};
  } else if (word == "keys") {
    std::cout << " ";
    while (line >> word) {
      const auto* const button = receiver::buttonOf(keyCalled(word), std::nullopt, sRemotes[number]);
      std::cout << " " << (button != nullptr ? button->name : "-");
    }
    std::cout << "\n";
  } else {
    goTo(std::chrono::milliseconds(std::stoi(word)));
    if (!line) return sHolds.releaseAll();
    line >> word;
    word == "gone" ? sHolds.releaseDevice(number) : change(number, word, line);
  }
}

}  // namespace

int main() {
  for (std::string text; std::getline(std::cin, text);) {
    if (text.starts_with(' ')) continue;
    std::cout << text << "\n";
    std::istringstream line(text);
    if (!text.empty() && text[0] != '#') play(line);
  }
}
