// Scripts, the registry and whole buttons on the rehearsal desktop, with all seven applications running and
// nobody listening to the journal.

#include <benchmark/benchmark.h>

#include "bench/script_texts.h"
#include "platform/stage/clock.h"
#include "platform/stage/desktop.h"
#include "platform/stage/script_world.h"
#include "registry/bridge.h"
#include "registry/registry.h"
#include "routing/dispatcher.h"

namespace {

constexpr PackedHIDEvent kPlayPause = PackHIDEvent({0x0C, 0xCD, 0});
constexpr PackedHIDEvent kVolumeUp = PackHIDEvent({0x0C, 0xE9, 0});

/// Starts all installed applications anew, nobody in front, and lets the registry know them.
void startSeven() {
  for (const auto& application : stage::desktop().installed) {
    stage::quitApplication(*application);
    stage::openApplication(*application);
  }
  stage::clearFront();
  gApplicationListSeed = HostGetApplicationListSeed(kHostDefaultSession);
  refreshCachedASNs();
}

/// Most words of the presentation application only mean something during a slideshow.
constexpr char kShowSlides[] = R"(tell application id "com.tarn.Officra.Slidewell"
start slideshow
show slide switcher
end tell)";

/// Compiles and runs one text by the engine alone; an error of the script is the benchmark's label. The
/// model changes under the script, so the figure is a mean over the ways it takes, mostly the last one.
void compileAndRun(benchmark::State& state, const std::string& text) {
  startSeven();
  stage::runScript(kShowSlides);
  tarnscript::Outcome outcome;
  for (auto _ : state) outcome = stage::runScript(text);
  if (outcome.error) state.SetLabel(outcome.error->message);
  state.counters["bytes"] = static_cast<double>(text.size());
}

/// The same as the daemon does it: host objects, release scope and the journal's line with it.
void handleScript(benchmark::State& state, const std::string& text) {
  startSeven();
  for (auto _ : state) HandleScript(text.c_str());
}

void refresh(benchmark::State& state) {
  startSeven();
  for (auto _ : state) refreshCachedASNs();
}

/// Play/Pause: the target is sought among all, and everybody else is silenced.
void buttonPlay(benchmark::State& state) {
  startSeven();
  for (auto _ : state) DispatchHIDEvent(kPlayPause, 1, false);
}

/// The same when some application came or went since the last button.
void buttonPlayAfterChange(benchmark::State& state) {
  startSeven();
  for (auto _ : state) {
    --gApplicationListSeed;
    DispatchHIDEvent(kPlayPause, 1, false);
  }
}

/// Volume up, pressed, the one before still repeating; at the top the player's own volume is raised too.
void buttonVolume(benchmark::State& state, int outputVolume) {
  startSeven();
  for (auto _ : state) {
    stage::setOutputVolume(outputVolume);
    DispatchHIDEvent(kVolumeUp, 1, false);
  }
}

BENCHMARK(refresh);
BENCHMARK(buttonPlay);
BENCHMARK(buttonPlayAfterChange);
BENCHMARK_CAPTURE(buttonVolume, middle, 50);
BENCHMARK_CAPTURE(buttonVolume, top, 100);

}  // namespace

int main(int argc, char** argv) {
  stage::useVirtualTime();
  stage::setUpDesktop();
  const std::vector<ScriptText> scripts = scriptTexts();
  for (const auto& script : scripts) {
    benchmark::RegisterBenchmark(("script/" + script.place).c_str(), compileAndRun, script.text);
  }
  const auto longest = std::max_element(scripts.begin(), scripts.end(), [](const auto& a, const auto& b) {
    return a.text.size() < b.text.size();
  });
  benchmark::RegisterBenchmark("handleLongest", handleScript, longest->text);
  benchmark::Initialize(&argc, argv);
  if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
  benchmark::RunSpecifiedBenchmarks();
  benchmark::Shutdown();
}
