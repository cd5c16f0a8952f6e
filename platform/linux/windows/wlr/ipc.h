// What the languages of compositors have in common: a socket, and JSON in answer.
#pragma once

#include <sys/types.h>

#include <cstddef>
#include <nlohmann/json.hpp>
#include <string>

#include "platform/base/deadline.h"
#include "platform/base/file_descriptor.h"

namespace linux::windows::wlr {

/// Hundreds of windows are less than that, in bytes.
inline constexpr std::size_t kLongestAnswer = 1 << 20;

/// Connects to the socket at that path if it is this process that listens.
base::FileDescriptor connectTo(const std::string& path, pid_t compositor);

/// Sends a question whole; one so short that it always has room in a socket that is new.
bool ask(const base::FileDescriptor& socket, std::string_view question);

/// Reads until the answer has so many bytes. False when no more come, and when the time is up.
bool readUpTo(std::size_t size, const base::FileDescriptor& socket, const base::Deadline& deadline,
              std::string& answer);

/// A member of an object; the type's nothing where there is none of that type.
template <typename T>
T valueIn(const nlohmann::json& object, const char* member) {
  const auto found = object.find(member);
  if (found == object.end()) return T();
  const T* const value = found->template get_ptr<const T*>();
  return value != nullptr ? *value : T();
}

}  // namespace linux::windows::wlr
