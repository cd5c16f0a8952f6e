#include "remote/session.h"

#include <dlfcn.h>
#include <pwd.h>
#include <unistd.h>

#include <cstdlib>
#include <optional>

#include "remote/words.h"

namespace remote {
namespace {

// The user of the session in front on the first seat. The library that knows is loaded for root alone: it and
// those that it needs would be most of the time that a button takes.
std::optional<uid_t> userAtScreen() {
  void* const library = dlopen("libsystemd.so.0", RTLD_LAZY);
  if (library == nullptr) return std::nullopt;
  using GetActive = int (*)(const char* seat, char** session, uid_t* user);
  const auto getActive = reinterpret_cast<GetActive>(dlsym(library, "sd_seat_get_active"));
  uid_t user = 0;
  if (getActive == nullptr || getActive("seat0", nullptr, &user) < 0) return std::nullopt;
  return user;
}

uid_t userCalled(const std::string& name) {
  const passwd* const found = getpwnam(name.c_str());
  if (found == nullptr) throw UsageError("no user is called " + inQuotes(name));
  return found->pw_uid;
}

}  // namespace

void chooseSession(const std::string& user) {
  std::optional<uid_t> chosen;
  if (!user.empty()) {
    chosen = userCalled(user);
  } else if (geteuid() == 0 && std::getenv("XDG_RUNTIME_DIR") == nullptr) {
    chosen = userAtScreen();
  }
  if (chosen) setenv("XDG_RUNTIME_DIR", ("/run/user/" + std::to_string(*chosen)).c_str(), 1);
}

}  // namespace remote
