// kvd-pass-through: presses the keys that kvd has no use for, for the receiver that has grabbed the remote.
// The service manager starts one for each connection, which is its standard input.

#include <unistd.h>

#include <cstdio>
#include <exception>

#include "receiver/pass_through/serve.h"

int main() {
  try {
    receiver::pass_through::serve(STDIN_FILENO, "/dev/uinput");
    return 0;
  } catch (const std::exception& error) {
    std::fprintf(stderr, "kvd-pass-through: %s\n", error.what());
    return 1;
  }
}
