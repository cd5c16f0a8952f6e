#include "simulator/promises.h"

#include <unistd.h>

#include <algorithm>
#include <array>
#include <cstring>
#include <iterator>
#include <span>
#include <string_view>

#include "daemon/kvd.h"
#include "daemon/lifecycle.h"
#include "messages/kvd_messages.h"
#include "platform/base/port.h"
#include "platform/base/run_loop.h"
#include "platform/stage/desktop.h"
#include "platform/stage/script_world.h"
#include "registry/registry.h"
#include "routing/retrigger.h"
#include "routing/target.h"
#include "simulator/operations.h"

namespace simulator {

namespace {

using stage::Application;
using stage::desktop;
using stage::Entry;
using stage::kSecond;
using stage::Nanoseconds;

std::optional<std::string> sBroken;
bool sTrueDesktop = true;

void expect(bool kept, const std::string& otherwise) {
  if (!kept && !sBroken) sBroken = otherwise;
}

// ---- The desktop, as anybody can see it ----

struct Player {
  const char* identifier;
  AppCode code;
  /// Whether it plays, in its own words; the photo application for professionals has none.
  const char* plays;
  /// Keeps an idle daemon while it is in front.
  bool keepsDaemon;
};

// A jukebox that scans is not playing, by its own words: it is left alone.
constexpr Player kPlayers[] = {
    {Bundle::Lyrabox, App::Lyra, "player state is playing", true},
    {Bundle::Snapvale, App::Snap, "slideshow running", true},
    {Bundle::Lumbra, App::Lumb, nullptr, false},
    {Bundle::Spindle, App::Spin, "dvd state is playing", true},
    {Bundle::VistremePlayer, App::Vist, "playing of front movie", true},
    {Bundle::VistremePlayerX, App::VstX, "playing of front document", true},
    {Bundle::Slidewell, App::Slid, "playing", true},
};

const Application& modelOf(const Player& player) { return *stage::findApplication(player.identifier); }

bool plays(const Player& player) {
  const Application& model = modelOf(player);
  if (!model.running()) return false;
  if (player.plays == nullptr) return model.describe().starts_with("slideshow");
  const std::string source =
      "tell application id \"" + model.identifier + "\" to return " + std::string(player.plays);
  return stage::describe(stage::runScript(source).value) == "true";
}

const Player* frontPlayer() {
  if (!desktop().front) return nullptr;
  const auto* const found = std::ranges::find_if(kPlayers, [](const Player& player) {
    return desktop().front->application->identifier == player.identifier;
  });
  return found != std::end(kPlayers) ? found : nullptr;
}

/// Whether one of the displays that the daemon looks at is captured, and it can see that.
bool captureIsSeen() {
  constexpr std::size_t kSeen = 8;
  const auto& displays = desktop().displays;
  const auto end = displays.begin() + static_cast<std::ptrdiff_t>(std::min(kSeen, displays.size()));
  return !desktop().broken.displayQuery &&
         std::any_of(displays.begin(), end, [](const stage::Display& display) { return display.captured(); });
}

// ---- The event in progress, or the last one ----

struct Button {
  UsageKey key;
  AppCode front = App::None;
  bool captureSeen = false;
  bool slidesShown = false;
};
std::optional<Button> sButton;
/// Not yet judged.
bool sDispatched = false;
/// Its target, which its repeats share: the button itself or the first repeat that asked for it.
AppCode sTarget = App::Nval;
std::uint64_t sButtons = 0;

Nanoseconds sLastButton = stage::kVirtualStart;
bool sAskedToEnd = false;
bool sHasEnded = false;

// What the photo library's version, asked at each of its buttons, leaves behind by design.
std::size_t sKeptNumbers = 0;
std::size_t sKeptPieces = 0;
std::size_t sKeptLists = 0;

// ---- A held button ----

std::uint64_t sHoldOf = 0;  ///< the number of the button that began it
Nanoseconds sHoldBegin = 0;
constexpr Nanoseconds kVolumePeriod = kSecond / 10;
constexpr Nanoseconds kVolumeLimit = 10 * kSecond;

bool sourceIsOnLoop() {
  const auto* const source = base::as<base::Source>(gServicePortSource);
  return source != nullptr && source->onLoop;
}

Nanoseconds holdPeriod() { return base::as<base::Timer>(sRetriggerTimer)->period; }

/// Whether somebody made, or makes, the daemon wait during the hold.
bool hangsDelayHold() {
  return std::ranges::any_of(desktop().installed,
                             [](const auto& model) { return model->hangsUntil > sHoldBegin; });
}

// ---- One player at a time ----

enum class When { Always, NoCaptureSeen, NoSlidesShown };

/// The buttons after which nobody else plays, by the application they go to; unused places are
/// Key::Undefined.
struct Silencing {
  AppCode target;
  When when;
  std::array<UsageKey, 6> keys;
};

// clang-format off
constexpr Silencing kSilencing[] = {
    {App::Lyra, When::Always, {Key::SystemMenuSelect, Key::MenuPick, Key::Play, Key::PlayPause}},
    {App::Spin, When::Always, {Key::SystemMenuSelect, Key::SystemAppMenu, Key::Play}},
    {App::VstX, When::Always, {Key::SystemMenuSelect, Key::Play, Key::PlayPause}},
    {App::Vist, When::Always, {Key::SystemMenuSelect, Key::Play, Key::PlayPause}},
    {App::Slid, When::NoSlidesShown, {Key::SystemMenuSelect, Key::Play, Key::PlayPause}},
    {App::Snap, When::NoCaptureSeen, {Key::SystemMenuSelect, Key::Menu, Key::Play, Key::Pause, Key::Stop, Key::PlayPause}},
    {App::Lumb, When::NoCaptureSeen, {Key::SystemMenuSelect, Key::PlayPause}},
};
// clang-format on

bool silences(const Button& button) {
  if (button.key == Key::Undefined) return false;
  return std::ranges::any_of(kSilencing, [&](const Silencing& row) {
    if (row.target != sTarget || std::ranges::find(row.keys, button.key) == row.keys.end()) return false;
    return row.when == When::Always ||
           (row.when == When::NoCaptureSeen ? !button.captureSeen : !button.slidesShown);
  });
}

/// A show that a key ends is out of reach where the daemon does not see it or cannot find its process.
bool canBeSilenced(const Player& player, const Button& button) {
  if (modelOf(player).manner != stage::Manner::Obeys) return false;
  return player.code != App::Lumb || (button.captureSeen && !desktop().broken.processLookUp);
}

// ---- Judgements ----

/// The keys that never reach the photo library.
bool isVolumeKey(UsageKey key) {
  return key == Key::SystemMenuUp || key == Key::SystemMenuDown || key == Key::VolumeIncrement ||
         key == Key::VolumeDecrement;
}

void countWhatTheVersionKeeps() {
  if (sTarget != App::Snap || isVolumeKey(sButton->key)) return;
  const std::string& version = stage::findApplication(Bundle::Snapvale)->version;
  ++sKeptNumbers;
  if (version.empty()) return;
  ++sKeptLists;
  sKeptPieces += 1 + static_cast<std::size_t>(std::ranges::count(version, '.'));
}

void judgeButton() {
  if (!sDispatched) return;
  sDispatched = false;
  sTarget = sTargetApplication;
  countWhatTheVersionKeeps();
  expect(!sRetriggerTimer || sHoldOf == sButtons, "a hold outlives the next button");
  if (!sTrueDesktop) return;
  expect(sTarget == App::Nval || sButton->front == App::None || sTarget == sButton->front,
         "a button does not go to the application in front");
  if (!silences(*sButton)) return;
  for (const Player& player : kPlayers) {
    expect(player.code == sTarget || !canBeSilenced(player, *sButton) || !plays(player),
           modelOf(player).name + " still plays");
  }
}

void judgeWhatGoesOut(const stage::JournalLine& line) {
  expect(!sourceIsOnLoop() || sRetriggerTimer, "nobody pressed a button, yet: " + line.text);
  if (!sourceIsOnLoop() || !sRetriggerTimer) return;
  expect(sTarget == App::Nval || sTarget == sTargetApplication, "a repeat goes elsewhere than its button");
  expect(holdPeriod() != kVolumePeriod || line.time <= sHoldBegin + kVolumeLimit || hangsDelayHold(),
         "a hold goes on after its limit");
}

/// By design the repeats of a hold stay with their target even when it has quit; a script fails there.
void judgeScript(const std::string& source) {
  if (sourceIsOnLoop()) return;
  constexpr std::string_view kAddress = "application id \"";
  for (std::size_t at = 0; (at = source.find(kAddress, at)) != std::string::npos;) {
    at += kAddress.size();
    const std::string_view rest = std::string_view(source).substr(at);
    const std::string_view name = rest.substr(0, rest.find('"'));
    const Application* const addressed = stage::findApplication(name);
    expect(addressed != nullptr && addressed->running(),
           std::string(name) + ", which does not run, is sent: " + source);
  }
}

/// The daemon ends with the first check, of which there is one every ten minutes, after two hours without a
/// button, unless a player in front keeps it. On a host that fails, nobody may seem to be in front.
void judgeIdleTime(bool ended) {
  static const Application* sFront = nullptr;
  static Nanoseconds sFrontSince = 0;
  const Application* const front = desktop().front ? desktop().front->application : nullptr;
  if (front != sFront) sFrontSince = stage::now();
  sFront = front;
  const Nanoseconds idleFrom = sLastButton + 7200 * kSecond;
  const Player* const player = frontPlayer();
  const bool kept = player != nullptr && player->keepsDaemon;
  expect(!ended || (stage::now() > idleFrom && (!kept || !sTrueDesktop)), "the daemon ends by itself");
  expect(kept || !sTrueDesktop || stage::now() <= std::max(idleFrom, sFrontSince) + 600 * kSecond,
         "the daemon stays, though nobody needs it");
}

/// The serial numbers that the registry holds.
std::size_t cachedNumbers() {
  static const auto kKnown = [] {
    std::array<HostStringRef, std::size(kPlayers) + 1> known{HostGetConstantString(Bundle::Daemon)};
    std::ranges::transform(kPlayers, known.begin() + 1,
                           [](const Player& player) { return HostGetConstantString(player.identifier); });
    return known;
  }();
  return static_cast<std::size_t>(
      std::ranges::count_if(kKnown, [](HostStringRef name) { return bool(getASNForBundleID(name)); }));
}

/// Counts of live objects are exact on a true desktop; elsewhere they are the most there may be, and an event
/// that could not be sent keeps its two descriptors.
void judgeLiveObjects(bool ended) {
  using base::Kind;
  std::array<std::size_t, base::kKindCount> accounted{};
  const auto of = [&](Kind kind) -> std::size_t& { return accounted.at(static_cast<std::size_t>(kind)); };
  of(Kind::Source) = of(Kind::Port) = 1;
  of(Kind::Timer) = (ended ? 0U : 1U) + (sRetriggerTimer ? 1U : 0U);
  of(Kind::String) = sKeptPieces;
  of(Kind::List) = sKeptLists;
  of(Kind::SerialNumber) = sKeptNumbers + cachedNumbers();
  const auto alive = base::aliveByKind();
  // Made at the first key and kept.
  of(Kind::EventSource) = std::min<std::size_t>(1, alive.at(static_cast<std::size_t>(Kind::EventSource)));
  if (!sTrueDesktop) of(Kind::EventContents) = 2;
  for (std::size_t i = 0; i < alive.size(); ++i) {
    expect(alive[i] == accounted[i] || (!sTrueDesktop && alive[i] < accounted[i]),
           "alive are " + std::to_string(alive[i]) + " of kind " +
               std::string(base::kindName(static_cast<Kind>(i))) + " instead of " +
               std::to_string(accounted[i]));
  }
  expect(base::openScopes() == 0, "a release scope stays open");
}

// ---- Messages ----

template <typename Request>
std::optional<Request> requestIn(std::span<const std::byte> message) {
  Request request;
  if (message.size() != sizeof request) return std::nullopt;
  std::memcpy(&request, message.data(), sizeof request);
  const bool complex = (request.Head.msgh_bits & MACH_MSGH_BITS_COMPLEX) != 0;
  return complex ? std::nullopt : std::optional(request);
}

void noteButton(const kvd_handlehidevent_request_t& request) {
  judgeButton();
  const bool swapped = request.NDR.int_rep != NDR_record.int_rep;
  const auto page = swapped ? __builtin_bswap16(request.usagePage) : request.usagePage;
  const auto usage = swapped ? __builtin_bswap16(request.usage) : request.usage;
  const Player* const front = frontPlayer();
  sButton = {UsageKeyOf(page, usage), front != nullptr ? front->code : App::None, captureIsSeen(),
             stage::findApplication(Bundle::Slidewell)->describe() != "shows no slides"};
  sDispatched = true;
  sTarget = App::Nval;
  sLastButton = stage::now();
  ++sButtons;
}

void noteMessage(std::span<const std::byte> message) {
  mach_msg_header_t header;
  std::memcpy(&header, message.data(), sizeof header);
  if (header.msgh_id == kKVDHandleHIDEventID) {
    if (const auto button = requestIn<kvd_handlehidevent_request_t>(message)) noteButton(*button);
  } else if (header.msgh_id == kKVDTerminateID && requestIn<kvd_terminate_request_t>(message)) {
    sAskedToEnd = true;
  }
}

}  // namespace

void watchMessages() {
  base::setMessageObserver([](std::span<const std::byte> message, pid_t) { noteMessage(message); });
}

void watchJournal(const stage::JournalLine& line) {
  switch (line.kind) {
    case Entry::Script:
      judgeWhatGoesOut(line);
      if (!line.source.ends_with(" to launch")) judgeScript(line.source);
      break;
    case Entry::Event:
    case Entry::Key:
    case Entry::SoundKey:
      judgeWhatGoesOut(line);
      break;
    case Entry::Change:
      expect(sourceIsOnLoop() || !line.text.ends_with(" starts") || !gScreenLocked,
             "behind a locked screen " + line.text);
      break;
    case Entry::Timer:
      if (!sRetriggerTimer || !line.text.ends_with(" starts")) break;
      sHoldOf = sButtons;
      sHoldBegin = line.time;
      break;
    case Entry::Notification:
      if (line.text.find("terminated") == std::string::npos) break;
      sHasEnded = true;
      if (!sAskedToEnd) judgeIdleTime(true);
      break;
    default:
      break;
  }
}

void keyIsPosted(const HostProcessSerialNumber& process) {
  expect(stage::findProcess(process) != nullptr, "a key goes to a process that does not run");
}

std::int32_t eventIsSent(std::int32_t result) {
  expect(result == 0, "an event goes to nobody");
  return result;
}

void checkAtRest() {
  judgeButton();
  if (sTarget == App::Nval) sTarget = sTargetApplication;
  judgeLiveObjects(false);
  judgeIdleTime(false);
  expect(sourceIsOnLoop() || !sTrueDesktop, "the daemon does not listen");
  expect(!sRetriggerTimer || holdPeriod() != kVolumePeriod || hangsDelayHold() ||
             stage::now() <= sHoldBegin + kVolumeLimit + kVolumePeriod,
         "a hold has no end");
}

void checkAtEnd(int status) {
  if (status != 0) return expect(!sTrueDesktop, "the daemon does not start");
  judgeButton();
  expect(sHasEnded, "the daemon does not say that it ends");
  judgeLiveObjects(true);
}

bool daemonListens() { return sourceIsOnLoop(); }

void expectTrueDesktop(bool expected) { sTrueDesktop = expected; }

void expectPlaying(const std::string& name) {
  for (const Player& player : kPlayers) {
    if (&modelOf(player) == stage::findApplication(name)) expect(plays(player), name + " does not play");
  }
}

std::optional<std::string> brokenPromise() { return sBroken; }

}  // namespace simulator
