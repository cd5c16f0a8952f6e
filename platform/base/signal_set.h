// Sets of signals.
#pragma once

#include <csignal>
#include <initializer_list>

namespace base {

/// The set of these signals; they must exist.
sigset_t signalSet(std::initializer_list<int> signals);

}  // namespace base
