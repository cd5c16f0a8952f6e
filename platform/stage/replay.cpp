#include "platform/stage/replay.h"

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>

#include "platform/base/sockets.h"
#include "platform/stage/clock.h"

namespace stage {

namespace {

using base::FileDescriptor;

/// The play of a whole day takes a moment; one that takes longer than this never ends.
constexpr Nanoseconds kLongestPlay = 30 * kSecond;

/// A file in memory, to be read from its beginning.
FileDescriptor fileOf(const std::string& text) {
  FileDescriptor file(memfd_create("commands", MFD_CLOEXEC));
  for (std::size_t written = 0; file && written < text.size();) {
    const ssize_t count = write(file.get(), text.data() + written, text.size() - written);
    if (count <= 0) return FileDescriptor();
    written += static_cast<std::size_t>(count);
  }
  if (file) lseek(file.get(), 0, SEEK_SET);
  return file;
}

/// This program once more; it takes what it reads for a transcript, its input being no terminal. −1 when it
/// cannot be started.
pid_t startAgain(const FileDescriptor& input, const FileDescriptor& output) {
  posix_spawn_file_actions_t files;
  posix_spawn_file_actions_init(&files);
  posix_spawn_file_actions_adddup2(&files, input.get(), STDIN_FILENO);
  posix_spawn_file_actions_adddup2(&files, output.get(), STDOUT_FILENO);
  posix_spawn_file_actions_addopen(&files, STDERR_FILENO, "/dev/null", O_WRONLY, 0);

  // The run loop has the ending signals blocked, which a child inherits.
  sigset_t none;
  sigemptyset(&none);
  posix_spawnattr_t attributes;
  posix_spawnattr_init(&attributes);
  posix_spawnattr_setsigmask(&attributes, &none);
  posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETSIGMASK);

  char name[] = "kvd-stage";
  char* const arguments[] = {name, nullptr};
  pid_t child = -1;
  if (posix_spawn(&child, "/proc/self/exe", &files, &attributes, arguments, environ) != 0) child = -1;
  posix_spawnattr_destroy(&attributes);
  posix_spawn_file_actions_destroy(&files);
  return child;
}

/// All that comes until the end; nothing when the end does not come in time.
std::optional<std::string> readAll(const FileDescriptor& pipe) {
  const Nanoseconds deadline = now() + kLongestPlay;
  std::string text;
  for (;;) {
    const Nanoseconds left = deadline - now();
    pollfd output{pipe.get(), POLLIN, 0};
    if (left <= 0 || poll(&output, 1, static_cast<int>(left / 1'000'000) + 1) == 0) return std::nullopt;
    char bytes[65'536];
    const ssize_t count = read(pipe.get(), bytes, sizeof bytes);
    if (count == 0) return text;
    if (count < 0 && errno != EINTR && errno != EAGAIN) return std::nullopt;
    if (count > 0) text.append(bytes, static_cast<std::size_t>(count));
  }
}

/// True when it ended by itself; a command of a transcript that was wrong is no failure of the play.
bool waitFor(pid_t child) {
  int status = 0;
  while (waitpid(child, &status, 0) < 0 && errno == EINTR) {
  }
  return WIFEXITED(status) && WEXITSTATUS(status) <= 1;
}

}  // namespace

std::optional<std::string> playAgain(const std::string& commands) {
  const FileDescriptor input = fileOf(commands);
  int ends[2];
  if (!input || pipe2(ends, O_CLOEXEC) != 0) return std::nullopt;
  const FileDescriptor reading(ends[0]);
  FileDescriptor writing(ends[1]);
  const pid_t child = startAgain(input, writing);
  if (child < 0) return std::nullopt;
  writing = FileDescriptor();

  std::optional<std::string> transcript = readAll(reading);
  if (!transcript) kill(child, SIGKILL);
  if (!waitFor(child)) return std::nullopt;
  return transcript;
}

}  // namespace stage
