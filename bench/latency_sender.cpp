// latency_sender NAME...: sends one press of Play/Pause for each line of its standard input, and writes the
// time at which it set out, in nanoseconds on CLOCK_MONOTONIC. The line tells how: "call" calls the players
// over a connection to the session bus that is open, "button" sends to kvd's port, which is open too, "random
// COUNT SEED" sends so many buttons there, "key DESCRIPTOR" writes what the kernel tells of the press of a
// key, and any other line is a program and its arguments, separated by tabs, which is started and waited for.
#include <linux/input.h>
#include <spawn.h>
#include <sys/wait.h>
#include <systemd/sd-bus.h>
#include <unistd.h>

#include <algorithm>
#include <cinttypes>
#include <cstdint>
#include <cstdio>
#include <ctime>
#include <iostream>
#include <random>
#include <sstream>
#include <string>
#include <vector>

#include "platform/mach.h"
#include "remote/buttons.h"
#include "remote/kvd_client.h"

namespace {

bool call(sd_bus* bus, const char* player) {
  sd_bus_message* message = nullptr;
  const bool sent = sd_bus_message_new_method_call(bus, &message, player, "/org/mpris/MediaPlayer2",
                                                   "org.mpris.MediaPlayer2.Player", "PlayPause") >= 0 &&
                    sd_bus_message_set_expect_reply(message, 0) >= 0 &&
                    sd_bus_send(bus, message, nullptr) >= 0;
  sd_bus_message_unref(message);
  return sent;
}

bool press(mach_port_t port) {
  constexpr std::uint16_t kConsumerPage = 0x0C;
  constexpr std::uint16_t kPlayPause = 0xCD;
  return kvd_handlehidevent(port, kConsumerPage, kPlayPause, 0, 1) == MACH_MSG_SUCCESS;
}

bool pressAtRandom(mach_port_t port, const std::string& line) {
  int count = 0;
  unsigned seed = 0;
  std::sscanf(line.c_str(), "random %d %u", &count, &seed);
  std::mt19937 random(seed);
  const auto buttons = remote::buttons();
  for (int i = 0; i < count; ++i) {
    const remote::Button& button = buttons[random() % buttons.size()];
    const auto value = static_cast<std::int32_t>(random() % 3) - 1;
    if (kvd_handlehidevent(port, button.usagePage, button.usage, 0, value) != MACH_MSG_SUCCESS) return false;
  }
  return true;
}

bool pressKey(const std::string& line) {
  timespec now = {};
  clock_gettime(CLOCK_BOOTTIME, &now);
  input_event frame[2] = {};
  for (input_event& event : frame) {
    event.input_event_sec = now.tv_sec;
    event.input_event_usec = now.tv_nsec / 1000;
  }
  frame[0].type = EV_KEY;
  frame[0].code = KEY_PLAYPAUSE;
  frame[0].value = 1;
  return write(std::stoi(line.substr(line.find(' '))), frame, sizeof frame) == sizeof frame;
}

bool run(const std::string& line) {
  std::vector<std::string> words;
  std::istringstream stream(line);
  for (std::string word; std::getline(stream, word, '\t');) words.push_back(word);
  std::vector<char*> arguments;
  arguments.reserve(words.size() + 1);
  for (std::string& word : words) arguments.push_back(word.data());
  arguments.push_back(nullptr);
  pid_t child = 0;
  int status = 0;
  return posix_spawnp(&child, arguments[0], nullptr, nullptr, arguments.data(), environ) == 0 &&
         waitpid(child, &status, 0) == child && status == 0;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc < 2) {
    std::fputs("Usage: latency_sender NAME...\n", stderr);
    return 2;
  }
  sd_bus* bus = nullptr;
  // The first one is called last, as kvd plays when it has silenced the others.
  std::vector<std::string> players;
  for (int i = argc - 1; i > 0; --i) players.push_back(std::string("org.mpris.MediaPlayer2.") + argv[i]);
  const auto callPlayer = [&bus](const std::string& player) { return call(bus, player.c_str()); };
  const char* unique = nullptr;
  mach_port_t port = MACH_PORT_NULL;
  // A connection is open, and sends at once, when it knows its name.
  if (sd_bus_open_user(&bus) < 0 || sd_bus_get_unique_name(bus, &unique) < 0 ||
      kvd_look_up(&port) != KVD_SENT) {
    std::fputs("latency_sender: no session bus, or nobody is behind kvd's port\n", stderr);
    return 1;
  }
  for (std::string line; std::getline(std::cin, line);) {
    timespec start = {};
    clock_gettime(CLOCK_MONOTONIC, &start);
    const bool sent = line == "call"                ? std::ranges::all_of(players, callPlayer)
                      : line == "button"            ? press(port)
                      : line.starts_with("key ")    ? pressKey(line)
                      : line.starts_with("random ") ? pressAtRandom(port, line)
                                                    : run(line);
    if (!sent) {
      std::fprintf(stderr, "latency_sender: could not send by %s\n", line.c_str());
      return 1;
    }
    std::printf("%" PRId64 "\n", std::int64_t{start.tv_sec} * 1'000'000'000 + start.tv_nsec);
    std::fflush(stdout);
  }
}
