// latency_player NAME: a player on the session bus (MPRIS 2.2) that plays
// nothing.
//
// Writes a line "MEMBER NANOSECONDS" for every method call that it gets, with the time of its arrival on
// CLOCK_MONOTONIC. A line on its standard input makes it play, which it announces as players do, and is
// answered with "playing" once the announcement has been sent. Ends with its standard input.
#include <poll.h>
#include <systemd/sd-bus.h>
#include <unistd.h>

#include <cinttypes>
#include <cstdint>
#include <cstdio>
#include <ctime>
#include <string>
#include <string_view>

namespace {

constexpr char kPath[] = "/org/mpris/MediaPlayer2";
constexpr char kPlayerInterface[] = "org.mpris.MediaPlayer2.Player";

const char* name = "";
const char* status = "Playing";

void setStatus(sd_bus* bus, const char* value) {
  status = value;
  sd_bus_emit_properties_changed(bus, kPath, kPlayerInterface, "PlaybackStatus", nullptr);
}

int onCall(sd_bus_message* call, void*, sd_bus_error*) {
  timespec now = {};
  clock_gettime(CLOCK_MONOTONIC, &now);
  const std::string_view member = sd_bus_message_get_member(call);
  std::printf("%s %" PRId64 "\n", member.data(), std::int64_t{now.tv_sec} * 1'000'000'000 + now.tv_nsec);
  const bool plays = status == std::string_view("Playing");
  if (member == "Play" || (member == "PlayPause" && !plays)) {
    setStatus(sd_bus_message_get_bus(call), "Playing");
  } else if (member == "Stop") {
    setStatus(sd_bus_message_get_bus(call), "Stopped");
  } else if (plays && member.starts_with("P")) {
    setStatus(sd_bus_message_get_bus(call), "Paused");
  }
  return sd_bus_reply_method_return(call, "");
}

int getStatus(sd_bus*, const char*, const char*, const char*, sd_bus_message* reply, void*, sd_bus_error*) {
  return sd_bus_message_append(reply, "s", status);
}

int getName(sd_bus*, const char*, const char*, const char*, sd_bus_message* reply, void*, sd_bus_error*) {
  return sd_bus_message_append(reply, "s", name);
}

int getTrue(sd_bus*, const char*, const char*, const char*, sd_bus_message* reply, void*, sd_bus_error*) {
  return sd_bus_message_append(reply, "b", 1);
}

int getOne(sd_bus*, const char*, const char*, const char*, sd_bus_message* reply, void*, sd_bus_error*) {
  return sd_bus_message_append(reply, "d", 1.0);
}

int getPosition(sd_bus*, const char*, const char*, const char*, sd_bus_message* reply, void*, sd_bus_error*) {
  return sd_bus_message_append(reply, "x", std::int64_t{0});
}

int getMetadata(sd_bus*, const char*, const char*, const char*, sd_bus_message* reply, void*, sd_bus_error*) {
  return sd_bus_message_append(reply, "a{sv}", 1, "mpris:trackid", "o", "/track/1");
}

constexpr std::uint64_t kChanges = SD_BUS_VTABLE_PROPERTY_EMITS_CHANGE;

const sd_bus_vtable kApplication[] = {
    SD_BUS_VTABLE_START(0),
    SD_BUS_PROPERTY("Identity", "s", getName, 0, 0),
    SD_BUS_PROPERTY("DesktopEntry", "s", getName, 0, 0),
    SD_BUS_VTABLE_END,
};

const sd_bus_vtable kPlayer[] = {
    SD_BUS_VTABLE_START(0),
    SD_BUS_METHOD("Play", "", "", onCall, SD_BUS_VTABLE_UNPRIVILEGED),
    SD_BUS_METHOD("Pause", "", "", onCall, SD_BUS_VTABLE_UNPRIVILEGED),
    SD_BUS_METHOD("PlayPause", "", "", onCall, SD_BUS_VTABLE_UNPRIVILEGED),
    SD_BUS_METHOD("Stop", "", "", onCall, SD_BUS_VTABLE_UNPRIVILEGED),
    SD_BUS_PROPERTY("PlaybackStatus", "s", getStatus, 0, kChanges),
    SD_BUS_PROPERTY("Rate", "d", getOne, 0, 0),
    SD_BUS_PROPERTY("Volume", "d", getOne, 0, 0),
    SD_BUS_PROPERTY("Position", "x", getPosition, 0, 0),
    SD_BUS_PROPERTY("MinimumRate", "d", getOne, 0, 0),
    SD_BUS_PROPERTY("MaximumRate", "d", getOne, 0, 0),
    SD_BUS_PROPERTY("Metadata", "a{sv}", getMetadata, 0, 0),
    SD_BUS_PROPERTY("CanPlay", "b", getTrue, 0, 0),
    SD_BUS_PROPERTY("CanPause", "b", getTrue, 0, 0),
    SD_BUS_PROPERTY("CanSeek", "b", getTrue, 0, 0),
    SD_BUS_PROPERTY("CanControl", "b", getTrue, 0, 0),
    SD_BUS_VTABLE_END,
};

bool appear(sd_bus*& bus) {
  const std::string busName = std::string("org.mpris.MediaPlayer2.") + name;
  return sd_bus_open_user(&bus) >= 0 &&
         sd_bus_add_object_vtable(bus, nullptr, kPath, "org.mpris.MediaPlayer2", kApplication, nullptr) >=
             0 &&
         sd_bus_add_object_vtable(bus, nullptr, kPath, kPlayerInterface, kPlayer, nullptr) >= 0 &&
         sd_bus_request_name(bus, busName.c_str(), 0) >= 0;
}

/// False once the input has ended.
bool takeLine(sd_bus* bus) {
  char line[64];
  if (read(STDIN_FILENO, line, sizeof line) <= 0) return false;
  setStatus(bus, "Playing");
  // The bus takes messages in order: once it has answered, the announcement is on its way to everybody.
  if (sd_bus_call_method(bus, "org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus",
                         "GetId", nullptr, nullptr, "") < 0) {
    return false;
  }
  std::puts("playing");
  return true;
}

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    std::fputs("Usage: latency_player NAME\n", stderr);
    return 2;
  }
  name = argv[1];
  std::setvbuf(stdout, nullptr, _IOLBF, 0);
  sd_bus* bus = nullptr;
  if (!appear(bus)) {
    std::fprintf(stderr, "latency_player: cannot be %s on the session bus\n", name);
    return 1;
  }
  std::puts("ready");
  pollfd sources[] = {{sd_bus_get_fd(bus), POLLIN, 0}, {STDIN_FILENO, POLLIN, 0}};
  for (;;) {
    int processed;
    while ((processed = sd_bus_process(bus, nullptr)) > 0) {
    }
    if (processed < 0) return 1;
    sd_bus_flush(bus);
    poll(sources, 2, -1);
    if (sources[1].revents != 0 && !takeLine(bus)) return 0;
  }
}
