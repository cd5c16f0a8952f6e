#include "platform/base/subprocess.h"

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/mman.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <string_view>
#include <utility>

#include "platform/base/file_descriptor.h"
#include "platform/base/signal_set.h"

namespace base {
namespace {

/// A file in memory, to be read from its beginning; none when it cannot be had.
FileDescriptor fileWith(std::string_view text) {
  FileDescriptor file(memfd_create("input", MFD_CLOEXEC));
  if (!file || !writeAll(file, text) || lseek(file.get(), 0, SEEK_SET) != 0) return FileDescriptor();
  return file;
}

/// The child's number, 0 when it could not be started.
pid_t start(Subprocess& program, const FileDescriptor& input, const FileDescriptor& output) {
  std::vector<char*> arguments;
  for (std::string& argument : program.arguments) arguments.push_back(argument.data());
  arguments.push_back(nullptr);

  posix_spawn_file_actions_t files;
  posix_spawn_file_actions_init(&files);
  posix_spawn_file_actions_adddup2(&files, input.get(), STDIN_FILENO);
  posix_spawn_file_actions_adddup2(&files, output.get(), STDOUT_FILENO);
  if (program.discardsErrors)
    posix_spawn_file_actions_addopen(&files, STDERR_FILENO, "/dev/null", O_WRONLY, 0);

  // A child inherits what is blocked and what is ignored.
  const sigset_t none = signalSet({});
  const sigset_t pipes = signalSet({SIGPIPE});
  posix_spawnattr_t attributes;
  posix_spawnattr_init(&attributes);
  posix_spawnattr_setsigmask(&attributes, &none);
  posix_spawnattr_setsigdefault(&attributes, &pipes);
  posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);

  pid_t child = 0;
  if (posix_spawn(&child, program.path.c_str(), &files, &attributes, arguments.data(), environ) != 0)
    child = 0;
  posix_spawnattr_destroy(&attributes);
  posix_spawn_file_actions_destroy(&files);
  return child;
}

/// Reads what comes. False when that is too much or takes too long.
bool readToEnd(const FileDescriptor& output, std::size_t most, const Deadline& deadline, std::string& text) {
  std::array<char, 65'536> part{};
  // One that never pauses is not waited for, and runs out of time all the same.
  while (text.size() <= most && !deadline.hasPassed() && waitFor(output.get(), POLLIN, deadline)) {
    const ssize_t count = read(output.get(), part.data(), part.size());
    if (count == 0) return true;
    if (count < 0 && errno != EINTR) return false;
    if (count > 0) text.append(part.data(), static_cast<std::size_t>(count));
  }
  return false;
}

/// A child may go on when it has closed its output.
bool endsInTime(pid_t child, const Deadline& deadline) {
  // glibc 2.36 declares pidfd_open() for C alone.
  const FileDescriptor process(static_cast<int>(syscall(SYS_pidfd_open, child, 0)));
  return process && waitFor(process.get(), POLLIN, deadline);
}

/// Its status as waitpid() tells it.
int reap(pid_t child) {
  int status = 0;
  while (waitpid(child, &status, 0) < 0 && errno == EINTR) {
  }
  return status;
}

}  // namespace

std::optional<SubprocessResult> runToEnd(Subprocess program, std::size_t mostOutput,
                                         const Deadline& deadline) {
  const FileDescriptor input = fileWith(program.input);
  Pipe output = makePipe();
  if (!input || !output.reading) return std::nullopt;
  const pid_t child = start(program, input, output.writing);
  if (child == 0) return std::nullopt;
  // The end is seen when the child alone had held the writing end.
  output.writing = FileDescriptor();

  SubprocessResult result;
  const bool ended =
      readToEnd(output.reading, mostOutput, deadline, result.output) && endsInTime(child, deadline);
  if (!ended) kill(child, SIGKILL);
  const int status = reap(child);
  if (ended && WIFEXITED(status)) result.status = WEXITSTATUS(status);
  return result;
}

}  // namespace base
