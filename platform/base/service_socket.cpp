#include "platform/base/service_socket.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

#include "platform/base/failure.h"
#include "platform/base/service_directory.h"
#include "platform/base/sockets.h"

namespace base {
namespace {

/// A socket file that this process made.
struct BoundFile {
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
/// None where somebody else has it; who may only read a directory may keep it locked for ever.
FileDescriptor lockDirectory(const std::string& directory) {
  FileDescriptor lock(open(directory.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
  if (lock && flock(lock.get(), LOCK_EX | LOCK_NB) != 0) return FileDescriptor();
  return lock;
}

/// Needs no lock: while this process lives its socket answers, and nobody else takes the place.
void removeBoundFiles() {
  for (const BoundFile& file : boundFiles()) {
    if (file.maker != getpid()) continue;
    struct stat now {};
    if (lstat(file.path.c_str(), &now) != 0) continue;
    if (now.st_dev == file.device && now.st_ino == file.inode) unlink(file.path.c_str());
  }
}

/// Makes the path free: removes the socket of a process that is gone, and never anything else.
kern_return_t clearPath(const sockaddr_un& address) {
  struct stat there {};
  if (lstat(address.sun_path, &there) != 0) return errno == ENOENT ? KERN_SUCCESS : KERN_FAILURE;
  if (!S_ISSOCK(there.st_mode)) {
    errno = EEXIST;
    return KERN_FAILURE;
  }
  if (connectedSocket(address)) return BOOTSTRAP_SERVICE_ACTIVE;
  return errno == ECONNREFUSED && unlink(address.sun_path) == 0 ? KERN_SUCCESS : KERN_FAILURE;
}

kern_return_t cannotBind(const std::string& path) {
  noteFailure("cannot make the socket " + path + ": " + std::strerror(errno));
  return KERN_FAILURE;
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
  const auto directory = serviceDirectory(Side::Receives);
  const auto address = directory ? serviceAddress(*directory, service) : std::nullopt;
  if (!address) return KERN_FAILURE;
  const std::string path = address->sun_path;
  const FileDescriptor lock = lockDirectory(*directory);
  if (!lock) {
    noteFailure("cannot lock " + *directory + ": " + std::strerror(errno) +
                "; if another kvd is starting there, try again");
    return KERN_FAILURE;
  }
  FileDescriptor socket = datagramSocket();
  if (!socket) return cannotBind(path);
  const kern_return_t cleared = clearPath(*address);
  if (cleared == BOOTSTRAP_SERVICE_ACTIVE) {
    noteFailure("another kvd listens on " + path + "; 'kvremote quit' ends it");
    return cleared;
  }
  if (cleared != KERN_SUCCESS) return cannotBind(path);

  // Registered first: where no handler can be had, no file is left behind.
  static const bool removedAtExit = std::atexit(removeBoundFiles) == 0;
  struct stat made {};
  if (!removedAtExit || !bindPrivately(socket.get(), *address)) return cannotBind(path);
  if (lstat(path.c_str(), &made) != 0) return cannotBind(path);
  boundFiles().push_back({path, made.st_dev, made.st_ino, getpid()});
  bound = std::move(socket);
  return KERN_SUCCESS;
}

}  // namespace base
