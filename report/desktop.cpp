#include "report/desktop.h"

#include <algorithm>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "platform/base/failure.h"
#include "platform/linux/players/mpris.h"
#include "platform/linux/programs/casting.h"
#include "platform/linux/programs/own_remote.h"
#include "platform/linux/programs/running.h"
#include "platform/linux/sound/sound.h"
#include "platform/linux/system/bus.h"
#include "platform/linux/windows/session.h"
#include "platform/linux/windows/windows.h"
#include "platform/tarnscript/tarnscript.h"
#include "report/names.h"
#include "report/service.h"

namespace report {

namespace {

namespace players = linux::players;
namespace programs = linux::programs;
namespace windows = linux::windows;
using programs::Ground;
using programs::Instance;
using programs::Role;

/// What tells which desktop this is, and where it listens.
constexpr const char* kVariables[] = {"XDG_CURRENT_DESKTOP", "XDG_SESSION_TYPE", "WAYLAND_DISPLAY",
                                      "DISPLAY"};

// ---- The session

Object describeHere() {
  Object here = Object::object();
  for (const char* const variable : kVariables) {
    if (const char* const value = std::getenv(variable)) here[variable] = value;
  }
  return here;
}

Object describeServiceManager() {
  const auto environment = windows::serviceManagerEnvironment();
  if (!environment) return nullptr;
  Object there = Object::object();
  for (const std::string_view variable : kVariables) {
    for (const std::string_view assignment : *environment) {
      if (!assignment.starts_with(variable) || assignment.substr(variable.size(), 1) != "=") continue;
      there[std::string(variable)] = assignment.substr(variable.size() + 1);
    }
  }
  return there;
}

Object describeBackends() {
  Object list = Object::array();
  for (const windows::Backend* const backend : windows::backends()) {
    const bool open = backend->open();
    list.push_back({{"name", backend->name},
                    {"open", open},
                    {"tells_front", backend->knowsFront()},
                    {"obstacle", backend->obstacle()}});
  }
  return list;
}

// ---- Programs

const char* wordsFor(Ground ground) {
  switch (ground) {
    case Ground::OwnWord:
      return "X-Kvd-Application in its desktop entry";
    case Ground::BusName:
      return "its bus name (table of programs)";
    case Ground::DesktopEntry:
      return "its desktop entry (table of programs)";
    case Ground::WindowClass:
      return "its window's class (table of programs)";
    case Ground::Categories:
      return "the categories of its desktop entry";
    case Ground::BusWindows:
      return "its windows on the bus (table of programs)";
    default:
      return "";
  }
}

/// Why somebody with this casting plays no role.
std::string whyNone(const programs::Casting& casting, bool isPlayer) {
  switch (casting.ground) {
    case Ground::Bystander:
      return isPlayer ? "it speaks for others" : "a browser, which counts while it has something to play";
    case Ground::OwnWord:
      return "X-Kvd-Application in its desktop entry says so";
    case Ground::Unknown:
      return "neither the table of programs nor a desktop entry gives it one";
    default:
      return isPlayer ? "it has nothing to play, or speaks for a browser that speaks for itself"
                      : "it shows a document of another kind, or its program is counted by another window";
  }
}

double seconds(std::int64_t microseconds) { return static_cast<double>(microseconds) / 1e6; }

const char* wordsFor(players::PlaybackStatus status) {
  switch (status) {
    case players::PlaybackStatus::Playing:
      return "playing";
    case players::PlaybackStatus::Paused:
      return "paused";
    default:
      return "stopped";
  }
}

/// What a player plays; null without a player.
Object describePlayback(players::Player* player) {
  if (player == nullptr) return nullptr;
  Object object{{"bus_name", player->name}};
  try {
    const players::PlayerState state = players::stateOf(*player);
    object["status"] = wordsFor(state.status);
    object["title"] = state.title;
    object["position"] = seconds(state.position);
    object["length"] = state.length ? Object(seconds(*state.length)) : Object(nullptr);
  } catch (const tarnscript::Refusal&) {
    object["status"] = "does not answer";
  }
  return object;
}

Object describeWindows(const Instance& instance) {
  Object list = Object::array();
  for (const windows::Window& window : windows::look(instance.windows)) {
    list.push_back({{"title", window.title},
                    {"class", window.className.empty() ? window.applicationID : window.className},
                    {"full_screen", window.isFullScreen && window.isShown}});
  }
  return list;
}

Object describe(const Instance& instance) {
  return {{"program", nameOf(instance)},
          {"process", instance.process},
          {"role", report::wordsFor(instance.role)},
          {"identifier", programs::bundleIdentifier(instance.role)},
          {"recognised", wordsFor(instance.ground)},
          {"in_front", &instance == programs::frontInstance()},
          {"player", describePlayback(programs::playerOf(instance))},
          {"windows", describeWindows(instance)}};
}

/// In the order in which a button would find those of a role.
Object describePrograms() {
  Object list = Object::array();
  for (const Role role : programs::kRoles) {
    for (const Instance* const instance : programs::rankedInstances(role))
      list.push_back(describe(*instance));
  }
  return list;
}

bool anyOwns(windows::ID window) {
  return std::ranges::any_of(programs::instances(), [&](const Instance& instance) {
    return std::ranges::find(instance.windows, window) != instance.windows.end();
  });
}

/// The players and windows that play no role.
Object describeOthers() {
  Object list = Object::array();
  for (const players::Player& player : players::list()) {
    const std::string& owner = player.callee.name;
    if (std::ranges::find(programs::instances(), owner, &Instance::owner) != programs::instances().end())
      continue;
    const auto casting = programs::castPlayer(player.desktopEntry, player.name);
    list.push_back({{"kind", "player"},
                    {"name", player.name},
                    {"class", ""},
                    {"process", player.callee.process},
                    {"why", whyNone(casting, true)}});
  }
  for (const windows::Window& window : windows::list()) {
    if (anyOwns(window.id)) continue;
    const auto looked = windows::look(std::span(&window.id, 1));
    list.push_back({{"kind", "window"},
                    {"name", looked.empty() ? window.title : looked.front().title},
                    {"class", window.className.empty() ? window.applicationID : window.className},
                    {"process", window.process},
                    {"why", whyNone(programs::castWindow(window), false)}});
  }
  return list;
}

// ---- The rest

/// Null where nobody is in front.
Object describeFront() {
  const windows::Window* const front = windows::front();
  if (front == nullptr) return nullptr;
  const auto looked = windows::look(std::span(&front->id, 1));
  const Instance* const instance = programs::frontInstance();
  return {{"title", looked.empty() ? front->title : looked.front().title},
          {"class", front->className.empty() ? front->applicationID : front->className},
          {"process", front->process},
          {"program", instance != nullptr ? Object(nameOf(*instance)) : Object(nullptr)},
          {"role", instance != nullptr ? Object(report::wordsFor(instance->role)) : Object(nullptr)}};
}

Object describeOutputs() {
  Object list = Object::array();
  for (const windows::Output& output : windows::outputs()) {
    list.push_back({{"x", output.area.x},
                    {"y", output.area.y},
                    {"width", output.area.width},
                    {"height", output.area.height},
                    {"captured", windows::isCaptured(output.id)}});
  }
  return list;
}

Object describeSound() {
  const std::string server = linux::sound::serverName();
  if (server.empty()) return nullptr;
  Object object{{"server", server}, {"volume", nullptr}, {"muted", nullptr}};
  if (const auto state = linux::sound::soundState()) {
    object["volume"] = state->volume;
    object["muted"] = state->muted;
  }
  return object;
}

}  // namespace

Object describeDesktop() {
  Object object{{"version", KVD_VERSION}};
  // Before the window systems, which take in what the service manager knows better.
  const Object here = describeHere();
  const bool onBus = linux::system::bus() != nullptr;
  object["session"] = {{"here", here},
                       {"service_manager", describeServiceManager()},
                       {"bus", onBus},
                       {"obstacle", onBus ? "" : base::lastFailure()}};
  object["window_systems"] = describeBackends();
  programs::takeInDesktop();
  object["front"] = describeFront();
  const std::string taker = programs::takerOfRemote();
  object["has_remote"] = taker.empty() ? "kvd" : taker;
  object["programs"] = describePrograms();
  object["others"] = describeOthers();
  object["outputs"] = describeOutputs();
  object["sound"] = describeSound();
  object["service"] = describeService();
  return object;
}

}  // namespace report
