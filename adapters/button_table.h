// Button tables: an adapter's buttons as data, one row a button.
#pragma once

#include <cstdint>
#include <span>

#include "daemon/kvd.h"
#include "routing/silence.h"

/// What a button does; the value is non-zero when it was pressed.
using ButtonAction = void (*)(std::int32_t value);

struct ButtonRow {
  UsageKey key;
  ButtonAction action;
  bool result;  ///< what the adapter's entry answers
};

/// Takes a button and does nothing.
inline void Swallow(std::int32_t) {}

/// Runs a command whatever the value.
template <void (*Command)()>
void Run(std::int32_t) {
  Command();
}

/// Silences every other application, then runs a command whatever the value.
template <AppCode Code, void (*Command)()>
void SilenceThen(std::int32_t) {
  SilenceAllBut(Code);
  Command();
}

/// Runs a command that tells the press from the release.
template <void (*Command)(bool pressed)>
void RunHeld(std::int32_t value) {
  Command(value != 0);
}

/// Acts by the row of this key and returns its result; false for a key without a row.
inline bool HandleButton(std::span<const ButtonRow> table, UsageKey key, std::int32_t value) {
  for (const ButtonRow& row : table) {
    if (row.key != key) continue;
    row.action(value);
    return row.result;
  }
  return false;
}
