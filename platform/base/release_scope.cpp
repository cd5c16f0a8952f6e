// Temporary objects belong to the innermost scope that is open when they are made.
#include <algorithm>
#include <vector>

#include "platform/base/object.h"

namespace base {
namespace {

struct ReleaseScope;
std::vector<ReleaseScope*> open;

struct ReleaseScope final : HostObject {
  static constexpr Kind kKind = Kind::ReleaseScope;
  ReleaseScope() : HostObject(kKind) { open.push_back(this); }
  ~ReleaseScope() override {
    std::erase(open, this);
    for (HostObject* object : temporaries) HostRelease(object);
  }

  std::vector<HostObject*> temporaries;
};

}  // namespace

HostObject* makeTemporary(HostObject* object) {
  if (object != nullptr && !open.empty()) open.back()->temporaries.push_back(object);
  return object;
}

std::size_t openScopes() { return open.size(); }

}  // namespace base

HostReleaseScopeRef HostOpenReleaseScope() { return HostReleaseScopeRef(new base::ReleaseScope); }

void HostCloseReleaseScope(HostReleaseScopeRef scope) {
  // A handle closed twice points at nothing any more: it is only compared until it is found among the open.
  if (std::find(base::open.begin(), base::open.end(), scope.object) == base::open.end()) return;
  for (bool closed = false; !closed;) {
    base::ReleaseScope* innermost = base::open.back();
    closed = innermost == scope.object;
    base::open.pop_back();
    HostRelease(innermost);
  }
}
