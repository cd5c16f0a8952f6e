// The program that plays a role while one event is carried out.
#pragma once

#include <optional>
#include <vector>

#include "platform/linux/programs/running.h"

namespace linux::roles {

/// Settled once for each event and handed down, so that no event straddles two instances and nobody is asked
/// twice. Valid until takeInDesktop.
class Performer {
 public:
  explicit Performer(const programs::Instance& instance);

  const programs::Instance& instance() const { return *instance_; }
  /// Its row of the table; null for a program that is not in it.
  const programs::Program* program() const { return instance_->program; }

  /// Its player on the bus; throws tarnscript::Refusal when it has none.
  players::Player& player() const;
  /// The same; null when it has none.
  players::Player* playerIfAny() const { return player_; }

  /// Its channel's commands; null where it has no channel, or has not opened it.
  const players::ProgramChannel* channel() const;
  /// Who listens on it.
  system::Listener listener() const;

  /// Its windows as they look during this event, topmost first; where the bus alone tells of them one that
  /// nobody sees, without an id.
  const std::vector<windows::Window>& windows() const;
  /// The one that a person would type into; null when it has none.
  const windows::Window* keyboardWindow() const;

  /// The same program as if this window were its only one, so that keys go there.
  Performer in(const windows::Window& window) const;

 private:
  std::vector<windows::Window> lookAtWindows() const;

  const programs::Instance* instance_;
  players::Player* player_;
  mutable std::optional<std::vector<windows::Window>> windows_;
};

/// The program that stands first for the role; nothing when none runs.
std::optional<Performer> performerOf(programs::Role role);

}  // namespace linux::roles
