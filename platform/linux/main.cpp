#include "daemon/lifecycle.h"
#include "platform/base/run_loop.h"
#include "platform/linux/host/host.h"
#include "platform/linux/windows/x11/x11.h"

int main() {
  base::endLoopOnSignals();
  linux::host::init({&linux::windows::x11::kBackend});
  const int status = KVDMain();
  linux::host::finish();
  return status;
}
