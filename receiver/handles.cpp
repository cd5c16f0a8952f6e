#include "receiver/handles.h"

#include <system_error>

namespace receiver {

Loop makeLoop() {
  sd_event* loop = nullptr;
  if (const int result = sd_event_new(&loop); result < 0)
    throw std::system_error(-result, std::generic_category());
  return Loop(loop);
}

}  // namespace receiver
