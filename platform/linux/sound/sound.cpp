#include "platform/linux/sound/sound.h"

#include <pulse/context.h>
#include <pulse/introspect.h>
#include <pulse/operation.h>
#include <pulse/volume.h>

#include <algorithm>
#include <cstdint>
#include <functional>
#include <memory>
#include <string>

#include "platform/base/run_loop.h"
#include "platform/linux/sound/pulse_loop.h"
#include "platform/linux/system/turn.h"

namespace linux::sound {

namespace {

using base::Deadline;

/// What every server takes for the sink that is the default one at that moment.
constexpr char kDefaultSink[] = "@DEFAULT_SINK@";

constexpr int kFullVolume = 100;

struct ContextReleaser {
  void operator()(pa_context* context) const {
    pa_context_disconnect(context);
    pa_context_unref(context);
  }
};
using Context = std::unique_ptr<pa_context, ContextReleaser>;

Context sContext;
/// The turn in which a connection was last made or tried.
std::optional<std::uint64_t> sTried;

// ---- The connection

bool isGood(const pa_context* context) {
  return context != nullptr && PA_CONTEXT_IS_GOOD(pa_context_get_state(context));
}

bool isReady(const pa_context* context) { return pa_context_get_state(context) == PA_CONTEXT_READY; }

/// A connection that is ready; null when there is no server, or none that answers before the deadline.
pa_context* connection(const Deadline& deadline) {
  // A server that has gone is seen by reading what it left.
  if (isGood(sContext.get())) servePulse();
  if (isGood(sContext.get())) return sContext.get();
  sContext.reset();
  if (sTried == base::turn()) return nullptr;
  sTried = base::turn();

  Context context(pa_context_new(&pulseLoop(), "kvd"));
  if (context == nullptr || pa_context_connect(context.get(), nullptr, PA_CONTEXT_NOAUTOSPAWN, nullptr) < 0) {
    return nullptr;
  }
  servePulse([&] { return isReady(context.get()) || !isGood(context.get()); }, deadline);
  if (!isReady(context.get())) return nullptr;
  sContext = std::move(context);
  return sContext.get();
}

/// Leaves a server that has let a wait run out alone for the rest of the turn.
void giveUp() {
  sContext.reset();
  sTried = base::turn();
}

// ---- Operations

enum class Result { Pending, Failed, Done };

/// Starts an operation whose callback sets the result.
using Operation = std::function<pa_operation*(pa_context* context, Result& result)>;

/// Runs an operation on the server to its end, a second time on a new connection where the first was lost.
bool run(const Operation& operation, const Deadline& deadline) {
  while (pa_context* const context = connection(deadline)) {
    Result result = Result::Pending;
    pa_operation* const running = operation(context, result);
    if (running == nullptr) return false;
    servePulse([&] { return result != Result::Pending || !isGood(context); }, deadline);
    // The callback would write to what is gone.
    pa_operation_cancel(running);
    pa_operation_unref(running);
    if (result != Result::Pending) return result == Result::Done;
    if (isGood(context)) {
      giveUp();
      return false;
    }
  }
  return false;
}

void noteSuccess(pa_context*, int success, void* result) {
  *static_cast<Result*>(result) = success != 0 ? Result::Done : Result::Failed;
}

struct Sink {
  Result* result = nullptr;
  std::uint32_t index = 0;
  std::string name;
  pa_cvolume volume{};
  bool muted = false;
};

/// Called with the sink and then, or instead, with the end of the list or an error.
void noteSink(pa_context*, const pa_sink_info* info, int end, void* data) {
  auto& sink = *static_cast<Sink*>(data);
  if (info == nullptr) {
    if (*sink.result == Result::Pending || end < 0) *sink.result = Result::Failed;
    return;
  }
  sink.index = info->index;
  sink.name = info->name;
  sink.volume = info->volume;
  sink.muted = info->mute != 0;
  *sink.result = Result::Done;
}

std::optional<Sink> defaultSink(const Deadline& deadline) {
  Sink sink;
  const Operation ask = [&](pa_context* context, Result& result) {
    sink.result = &result;
    return pa_context_get_sink_info_by_name(context, kDefaultSink, noteSink, &sink);
  };
  if (!run(ask, deadline)) return std::nullopt;
  return sink;
}

// ---- Volume

int toPercent(pa_volume_t volume) {
  return static_cast<int>((std::uint64_t{volume} * kFullVolume + PA_VOLUME_NORM / 2) / PA_VOLUME_NORM);
}

pa_volume_t fromPercent(int percent) {
  const std::uint64_t scaled = static_cast<std::uint64_t>(std::max(percent, 0)) * PA_VOLUME_NORM;
  return static_cast<pa_volume_t>(
      std::min<std::uint64_t>((scaled + kFullVolume / 2) / kFullVolume, PA_VOLUME_MAX));
}

/// The channels with the loudest of them at `loudest`. Silence has no proportions: those that the sink had
/// before it was turned all the way down are kept here.
pa_cvolume scaled(const Sink& sink, pa_volume_t loudest) {
  static std::string sName;
  static pa_cvolume sProportions{};
  const bool silent = pa_cvolume_max(&sink.volume) == PA_VOLUME_MUTED;
  const bool known = sName == sink.name && sProportions.channels == sink.volume.channels;
  pa_cvolume volume = silent && known ? sProportions : sink.volume;
  if (!silent) {
    sName = sink.name;
    sProportions = sink.volume;
  }
  pa_cvolume_scale(&volume, loudest);
  return volume;
}

}  // namespace

void finish() { sContext.reset(); }

std::string serverName() {
  struct Told {
    Result* result = nullptr;
    std::string name;
  } told;
  const Operation ask = [&](pa_context* context, Result& result) {
    told.result = &result;
    const auto note = [](pa_context*, const pa_server_info* info, void* data) {
      auto& taker = *static_cast<Told*>(data);
      if (info != nullptr) taker.name = info->server_name;
      *taker.result = Result::Done;
    };
    return pa_context_get_server_info(context, note, &told);
  };
  run(ask, Deadline(system::kQueryLimit));
  return told.name;
}

std::optional<SoundState> soundState() {
  const auto sink = defaultSink(Deadline(system::kQueryLimit));
  if (!sink) return std::nullopt;
  return SoundState{toPercent(pa_cvolume_max(&sink->volume)), sink->muted};
}

bool setOutputVolume(int percent) {
  const Deadline deadline(system::kCommandLimit);
  const auto sink = defaultSink(deadline);
  if (!sink) return false;
  const pa_cvolume volume = scaled(*sink, fromPercent(percent));
  return run(
      [&](pa_context* context, Result& result) {
        return pa_context_set_sink_volume_by_index(context, sink->index, &volume, noteSuccess, &result);
      },
      deadline);
}

bool setOutputMuted(bool muted) {
  return run(
      [&](pa_context* context, Result& result) {
        return pa_context_set_sink_mute_by_name(context, kDefaultSink, muted ? 1 : 0, noteSuccess, &result);
      },
      Deadline(system::kCommandLimit));
}

}  // namespace linux::sound
