// The photo library: programs that show the photos of a directory, one after another.
//
// Their directories have no albums, and the scripts walk albums. So a list of albums is made up in which the
// current one always has a neighbour on either side; to select a neighbour is to go to the next or previous
// photo. The scripts for this generation send the first five albums on journeys of their own and stop at the
// last: the current one is the one between.

#include <cstdint>
#include <string>
#include <string_view>

#include "platform/linux/roles/deeds.h"
#include "platform/linux/players/gtk_actions.h"
#include "platform/linux/roles/own_words.h"
#include "platform/linux/roles/role_application.h"
#include "platform/linux/roles/show_window.h"
#include "platform/scripting/snapvale_dictionary.h"

namespace desktop {

namespace {

namespace snapvale = scripting::snapvale;
using tarnscript::Event;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

constexpr std::uint64_t kAlbums = 7;
constexpr std::uint64_t kCurrentAlbum = 6;

bool isProgram(const Instance& instance, std::string_view entry) {
  return instance.program != nullptr && instance.program->entry == entry;
}

/// Gwenview tells its show as a player's status: stopped is its ordinary window.
bool isStopped(const Instance& instance) {
  Player* const player = playerOf(instance);
  return player != nullptr && statusOf(*player) == PlaybackStatus::Stopped;
}

bool showRuns(const Instance& instance) {
  if (isProgram(instance, "org.gnome.eog")) return actionState(instance, "win.view-slideshow") == true;
  return showWindow(instance) != 0 && !isStopped(instance);
}

class PhotoLibrary final : public RoleApplication {
 public:
  PhotoLibrary() : RoleApplication(Role::PhotoLibrary) {}

  const tarnscript::Dictionary& dictionary() const override { return snapvale::dictionary(); }

  Value get(const ObjectRef& object, tarnscript::Code property) override {
    switch (property) {
      case snapvale::kSlideshowRunning:
        return showRuns(instance());
      case snapvale::kCurrentAlbum:
        return ObjectRef{this, snapvale::kAlbum, kCurrentAlbum};
      case snapvale::kName:
        return std::to_string(object.id);
      case snapvale::kID:
        return static_cast<std::int64_t>(object.id);
      default:
        return RoleApplication::get(object, property);
    }
  }

  std::vector<ObjectRef> elements(const ObjectRef& object, tarnscript::Code cls) override {
    if (cls != snapvale::kAlbum) return RoleApplication::elements(object, cls);
    std::vector<ObjectRef> albums;
    for (std::uint64_t id = 1; id <= kAlbums; ++id) albums.push_back({this, snapvale::kAlbum, id});
    return albums;
  }

  Value perform(const Event& event) override {
    switch (event.command) {
      case snapvale::kStartSlideshow:
        if (showRuns(instance())) return {};
        break;
      case snapvale::kStopSlideshow:
        if (!showRuns(instance())) return {};
        break;
      case snapvale::kSelect:
        select(event);
        return {};
      default:
        break;
    }
    return RoleApplication::perform(event);
  }

 private:
  void select(const Event& event) {
    const auto* const album = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
    if (album == nullptr || album->application != this || album->cls != snapvale::kAlbum) {
      throw Refusal{"only albums can be selected"};
    }
    const Instance& program = instance();
    for (std::uint64_t at = kCurrentAlbum; at < album->id; ++at) desktop::perform(program, words::kNextAlbum);
    for (std::uint64_t at = kCurrentAlbum; at > album->id; --at) {
      desktop::perform(program, words::kPreviousAlbum);
    }
  }
};

}  // namespace

tarnscript::Application& photoLibrary() {
  static PhotoLibrary thePhotoLibrary;
  return thePhotoLibrary;
}

}  // namespace desktop
