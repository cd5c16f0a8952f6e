// What the applications are called. The core has identifiers of its own: nothing below the seam sees them.
#pragma once

#include <algorithm>
#include <functional>
#include <iterator>
#include <string_view>

#include "platform/text/case.h"

namespace scripting {

/// The two ways to name an application.
struct Identity {
  /// Its bundle identifier.
  const char* identifier;
  /// Its name on the screen.
  const char* name;
};

inline constexpr Identity kLyrabox{"com.tarn.Lyrabox", "Lyrabox"};
inline constexpr Identity kSpindle{"com.tarn.Spindle", "Spindle"};
inline constexpr Identity kVistremePlayer{"com.tarn.vistremeplayer", "VistremePlayer"};
inline constexpr Identity kVistremePlayerX{"com.tarn.VistremePlayerX", "VistremePlayerX"};
inline constexpr Identity kSlidewell{"com.tarn.Officra.Slidewell", "Slidewell"};
inline constexpr Identity kSnapvale{"com.tarn.Snapvale", "Snapvale"};
inline constexpr Identity kLumbra{"com.tarn.Lumbra", "Lumbra"};
/// The keystroke helper.
inline constexpr Identity kKeyhouse{"com.tarn.Keyhouse", "Keyhouse"};

/// Where in a range the application is that a script means by this text: the first that is called so, else
/// the first that is called so but for the case of letters; the range's end when there is none. `identityOf`
/// tells the identity of an item.
template <typename Applications, typename IdentityOf>
auto findNamed(const Applications& applications, std::string_view text, IdentityOf identityOf) {
  const auto find = [&](auto same) {
    return std::find_if(std::begin(applications), std::end(applications), [&](const auto& application) {
      const Identity identity = std::invoke(identityOf, application);
      return same(identity.identifier, text) || same(identity.name, text);
    });
  };
  const auto exact = find(std::equal_to<>());
  return exact != std::end(applications) ? exact : find(text::equalIgnoringCase);
}

}  // namespace scripting
