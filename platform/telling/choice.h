// Why a button went where it went, told from what the core asked the host on its way.
#pragma once

#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <string_view>

#include "daemon/kvd.h"

namespace telling {

/// The rule that settled who gets a button.
enum class Reason : std::uint8_t { Nobody, InFront, Plays, ChosenLast, RunsFirst };

/// In words: "it is in front". A disc player counts as playing while it shows a menu.
std::string_view wordsFor(Reason reason, AppCode target);

/// One choice after another. The core keeps its choice, not the reason; but it asks who is in front once for
/// each choice, and about the application that it will choose once or twice more: whether it runs, to hear
/// whether it plays, and again when nothing plays. Applications are known by their bundle identifiers.
class Choice {
 public:
  /// The core asked who is in front; empty for nobody. A choice begins.
  void begin(std::string_view front);
  /// It asked whether this one runs.
  void noteAsked(std::string_view application);
  /// It has chosen this one; empty for none.
  Reason conclude(std::string_view target);

 private:
  Reason reasonFor(std::string_view target) const;

  std::string front_;
  /// How often it asked whether they run, since the choice began.
  std::map<std::string, int, std::less<>> asked_;
  /// The last target that was in front or played; empty since a choice fell back on the first that runs.
  std::string remembered_;
};

}  // namespace telling
