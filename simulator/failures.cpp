#include "simulator/failures.h"

#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <iostream>
#include <thread>

#include "platform/stage/desktop.h"
#include "platform/stage/transcript.h"

namespace simulator {

namespace {

constexpr int kTold = 1;

/// Prints a failure and the transcript of its commands, which the desktop plays once more.
void tell(const Failure& failure) {
  std::printf("BROKEN: %s\n", failure.what.c_str());
  std::fflush(stdout);
  const pid_t player = fork();
  if (player == 0) {
    std::FILE* const commands = std::tmpfile();
    for (const std::string& command : failure.commands) std::fprintf(commands, "%s\n", command.c_str());
    std::rewind(commands);
    stage::setUpDesktop();
    stage::playTranscript(fileno(commands), std::cout);
    std::cout.flush();
    _exit(0);
  }
  waitpid(player, nullptr, 0);
}

/// A part's process: what it played goes into the pipe.
[[noreturn]] void work(int results, const std::function<std::optional<Failure>()>& run) {
  int status = 0;
  {
    const RuntimeDirectory directory;
    if (auto failure = run()) {
      tell(*failure);
      status = kTold;
    }
  }
  const std::uint64_t count = played();
  if (write(results, &count, sizeof count) != sizeof count) status = kTold;
  std::fflush(nullptr);
  _exit(status);
}

}  // namespace

std::size_t workerCount() { return std::max(1U, std::thread::hardware_concurrency()); }

std::optional<std::uint64_t> inParallel(std::size_t parts,
                                        const std::function<std::optional<Failure>(std::size_t)>& run) {
  int ends[2];
  if (pipe(ends) != 0) return std::nullopt;
  std::fflush(nullptr);
  for (std::size_t part = 0; part < parts; ++part) {
    if (fork() == 0) work(ends[1], [&] { return run(part); });
  }
  close(ends[1]);
  bool well = true;
  int status = 0;
  for (std::size_t part = 0; part < parts; ++part) well = wait(&status) > 0 && status == 0 && well;
  std::uint64_t sum = 0;
  for (std::uint64_t count = 0; read(ends[0], &count, sizeof count) == sizeof count;) sum += count;
  close(ends[0]);
  return well ? std::optional(sum) : std::nullopt;
}

Failure shortest(Failure failure) {
  std::size_t size = std::max<std::size_t>(failure.commands.size() / 2, 1);
  for (std::size_t at = 0; !failure.commands.empty();) {
    std::vector<std::string> fewer = failure.commands;
    const auto from = fewer.begin() + static_cast<std::ptrdiff_t>(at);
    fewer.erase(from, from + static_cast<std::ptrdiff_t>(std::min(size, fewer.size() - at)));
    if (auto still = rehearse(fewer)) {
      failure = *std::move(still);
    } else {
      at += size;
    }
    if (at < failure.commands.size()) continue;
    if (size == 1) break;
    size /= 2;
    at = 0;
  }
  return failure;
}

}  // namespace simulator
