#include "platform/terminal/screen.h"

#include <unistd.h>

#include <algorithm>
#include <limits>
#include <memory>

#include "platform/base/run_loop.h"
#include "platform/stage/desktop.h"
#include "platform/stage/live.h"
#include "platform/terminal/brush.h"
#include "platform/terminal/controls.h"
#include "platform/terminal/paint.h"
#include "platform/terminal/state.h"
#include "platform/terminal/terminal.h"

namespace terminal {

namespace {

using base::Source;

/// A source that is on the run loop as long as it lives.
class OnLoop {
 public:
  explicit OnLoop(Source* source) : source_(source) {
    HostRunLoopAddSource(HostRunLoopCurrent(), source_, HostRunLoopMode::Default);
  }
  ~OnLoop() {
    HostRunLoopRemoveSource(HostRunLoopCurrent(), source_, HostRunLoopMode::Default);
    HostRelease(source_);
  }
  OnLoop(const OnLoop&) = delete;
  OnLoop& operator=(const OnLoop&) = delete;

 private:
  const HostSourceRef source_;
};

void endRun() { HostRunLoopStop(HostRunLoopCurrent()); }

/// A size or a stop comes before anything else.
constexpr std::int32_t kSignalsOrder = std::numeric_limits<std::int32_t>::min();

/// Takes one key, so that what it sends is done before the next. False when there was none.
bool takeKey(Terminal& terminal, State& state) {
  const std::optional<Keypress> key = terminal.read();
  if (key) handle(state, *key);
  return key.has_value();
}

void draw(State& state) {
  state.lessons.observe(stage::desktop());
  paint(state, stage::desktop());
}

bool somethingHangs() {
  return std::ranges::any_of(stage::desktop().installed,
                             [](const auto& application) { return application->hangsUntil > stage::now(); });
}

}  // namespace

std::optional<int> play() {
  const std::unique_ptr<Terminal> terminal = Terminal::open();
  if (terminal == nullptr) return std::nullopt;
  chooseColors();
  State state;
  bool ends = false;
  const auto obeySignals = [&] {
    if (terminal->obeySignals()) return;
    ends = true;
    endRun();
  };
  const OnLoop signals(new Source(terminal->signals(), kSignalsOrder, obeySignals));
  bool tookKey = false;
  return stage::playLive({
      .show =
          [&](const stage::JournalLine& line) {
            state.journal.add(line);
            state.target.note(line);
          },
      .input =
          [&] {
            if (!takeKey(*terminal, state) && terminal->hungUp()) endRun();
          },
      .between = [&] { state.target.settle(); },
      .idle =
          [&] {
            // Of an Escape that began no key the rest was read already, which the descriptor does not tell.
            tookKey = takeKey(*terminal, state);
            draw(state);
          },
      .asleep =
          [&] {
            obeySignals();
            draw(state);
            return !ends;
          },
      .wakeUp = [&]() -> std::optional<stage::Nanoseconds> {
        if (tookKey) return stage::now();
        // What plays moves its position, what hangs counts down.
        if (stage::nextDesktopChange() || somethingHangs()) return stage::now() + stage::kSecond;
        return std::nullopt;
      },
  });
}

}  // namespace terminal
