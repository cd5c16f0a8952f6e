// What a script may cost. Every limit is refused with an error, never with a crash or a long wait.
#pragma once

#include <cstddef>
#include <cstdint>

namespace tarnscript {

/// Bytes of source. Real scripts are about a kilobyte; each byte may become a token and a node of about a
/// hundred bytes, so this keeps the compiled form in the low megabytes.
inline constexpr std::size_t kMaxSourceSize = std::size_t{64} * 1024;

/// Levels of blocks, and of expressions within one statement. Parser and evaluator recurse once a level; with
/// this many of both the stack stays under a megabyte, even with a sanitizer's larger frames.
inline constexpr int kMaxNesting = 200;

/// Units of work in one run: a node evaluated, a turn of a loop, an element copied, kBytesPerStep bytes of
/// text copied. A loop over the longest list fits, an endless one ends well within a second; and since memory
/// is only gained by copying, a run can never hold more than about a hundred megabytes.
inline constexpr std::size_t kMaxSteps = 1'000'000;
inline constexpr std::size_t kBytesPerStep = 64;

/// Elements of a list; more than any library has albums.
inline constexpr std::size_t kMaxListLength = 16'384;

/// Lists within lists. Comparing and destroying a list recurse, and a loop could wrap one without end.
inline constexpr int kMaxListDepth = 32;

/// Bytes of a text that a script builds; as long as the longest source, so that no literal passes it.
inline constexpr std::size_t kMaxTextLength = kMaxSourceSize;

}  // namespace tarnscript
