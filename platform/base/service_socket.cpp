#include "platform/base/service_socket.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <string>
#include <vector>

#include "platform/base/service_directory.h"
#include "platform/base/sockets.h"

namespace base {
namespace {

/// A socket file that this process made.
struct BoundFile {
  std::string directory;
  std::string path;
  dev_t device;
  ino_t inode;
  /// Forked children run the exit handlers too.
  pid_t maker;
};

std::vector<BoundFile>& boundFiles() {
  static auto& files = *new std::vector<BoundFile>;
  return files;
}

/// The directory, locked while the descriptor is open: nobody else is between test, removal and bind then.
FileDescriptor lockDirectory(const std::string& directory) {
  FileDescriptor lock(open(directory.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  while (lock && flock(lock.get(), LOCK_EX) != 0) {
    if (errno != EINTR) return FileDescriptor();
  }
  return lock;
}

void removeBoundFiles() {
  for (const BoundFile& file : boundFiles()) {
    if (file.maker != getpid()) continue;
    const FileDescriptor lock = lockDirectory(file.directory);
    struct stat now {};
    if (lstat(file.path.c_str(), &now) != 0) continue;
    if (now.st_dev == file.device && now.st_ino == file.inode) unlink(file.path.c_str());
  }
}

/// Makes the path free: removes the socket of a process that is gone, and never anything else.
kern_return_t clearPath(const sockaddr_un& address) {
  struct stat there {};
  if (lstat(address.sun_path, &there) != 0) return errno == ENOENT ? KERN_SUCCESS : KERN_FAILURE;
  if (!S_ISSOCK(there.st_mode)) return KERN_FAILURE;
  if (connectedSocket(address)) return BOOTSTRAP_SERVICE_ACTIVE;
  return errno == ECONNREFUSED && unlink(address.sun_path) == 0 ? KERN_SUCCESS : KERN_FAILURE;
}

/// Binds with a mode that lets only the owner reach the socket.
bool bindPrivately(int socket, const sockaddr_un& address) {
  const mode_t before = umask(0177);
  const int result = bind(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address);
  umask(before);
  return result == 0;
}

}  // namespace

kern_return_t bindServiceSocket(std::string_view service, FileDescriptor& bound) {
  const auto directory = serviceDirectory(true);
  const auto address = directory ? serviceAddress(*directory, service) : std::nullopt;
  if (!address) return KERN_FAILURE;
  const FileDescriptor lock = lockDirectory(*directory);
  FileDescriptor socket = datagramSocket();
  if (!lock || !socket) return KERN_FAILURE;
  if (const kern_return_t cleared = clearPath(*address); cleared != KERN_SUCCESS) return cleared;

  // Registered first: where no handler can be had, no file is left behind.
  static const bool removedAtExit = std::atexit(removeBoundFiles) == 0;
  struct stat made {};
  if (!removedAtExit || !bindPrivately(socket.get(), *address)) return KERN_FAILURE;
  if (lstat(address->sun_path, &made) != 0) return KERN_FAILURE;
  boundFiles().push_back({*directory, address->sun_path, made.st_dev, made.st_ino, getpid()});
  bound = std::move(socket);
  return KERN_SUCCESS;
}

}  // namespace base
