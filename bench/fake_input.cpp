// A library to preload, under which every descriptor is an input device that has one key, Play/Pause: what a
// FIFO lacks to be the node of one. Reading it takes one system call, as it does with a real one.
#include <dlfcn.h>
#include <linux/input.h>

#include <cstdarg>
#include <cstring>

namespace {

/// What the kernel answers, 0 and up, for EVIOC… requests; bits that are asked for are written to `bits`.
int answer(unsigned long request, unsigned char* bits) {
  const auto setBit = [bits](int bit) { bits[bit / 8] = static_cast<unsigned char>(1 << bit % 8); };
  if (_IOC_DIR(request) != _IOC_READ) return 0;
  std::memset(bits, 0, _IOC_SIZE(request));
  if (_IOC_NR(request) == _IOC_NR(EVIOCGBIT(0, 0))) setBit(EV_KEY);
  if (_IOC_NR(request) == _IOC_NR(EVIOCGBIT(EV_KEY, 0))) setBit(KEY_PLAYPAUSE);
  return static_cast<int>(_IOC_SIZE(request));
}

}  // namespace

extern "C" int ioctl(int descriptor, unsigned long request, ...) noexcept {
  va_list arguments;
  va_start(arguments, request);
  void* const argument = va_arg(arguments, void*);
  va_end(arguments);
  if (_IOC_TYPE(request) == 'E') return answer(request, static_cast<unsigned char*>(argument));
  using Ioctl = int (*)(int, unsigned long, void*);
  static const auto next = reinterpret_cast<Ioctl>(dlsym(RTLD_NEXT, "ioctl"));
  return next(descriptor, request, argument);
}
