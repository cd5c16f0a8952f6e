#include "fuzz/child.h"

#include <sys/mman.h>
#include <sys/prctl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <csignal>

#include "fuzz/fuzz.h"

// Where clang counts what is covered; there is no such place in a program that is built without that.
extern "C" {
[[gnu::weak]] extern std::uint8_t covered[] __asm__("__start___sancov_cntrs");
[[gnu::weak]] extern std::uint8_t coveredEnd[] __asm__("__stop___sancov_cntrs");
}

namespace fuzz {

namespace {

/// What a child hands back.
struct Shared {
  std::uint8_t covered[1 << 18];
  char text[1 << 22];
  std::size_t length;
};

/// In kilobytes, of which the sanitizers' own are most.
constexpr long kMostMemory = 1 << 20;

}  // namespace

std::string inChild(const std::function<std::string()>& play) {
  static void* const memory =
      mmap(nullptr, sizeof(Shared), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
  require(memory != MAP_FAILED, "there is memory to share");
  Shared& shared = *static_cast<Shared*>(memory);
  const std::size_t size = covered != nullptr ? static_cast<std::size_t>(coveredEnd - covered) : 0;
  require(size <= sizeof shared.covered, "what is covered fits");
  const pid_t child = fork();
  if (child == 0) {
    // An input that hangs is reported by the parent, which ends with it.
    prctl(PR_SET_PDEATHSIG, SIGKILL);
    const std::string text = play();
    require(text.size() <= sizeof shared.text, "the text fits");
    shared.length = text.copy(shared.text, sizeof shared.text);
    std::copy_n(covered, size, shared.covered);
    _exit(0);
  }
  int status = 0;
  rusage usage{};
  // libFuzzer's alarm interrupts.
  while (wait4(child, &status, 0, &usage) < 0) require(errno == EINTR, "there is a child");
  require(status == 0, "the child came to its end");
  require(usage.ru_maxrss < kMostMemory, "the child had memory enough");
  std::copy_n(shared.covered, size, covered);
  return {shared.text, shared.length};
}

}  // namespace fuzz
