#include "platform/linux/roles/photo_library.h"

#include <cstdint>
#include <string>

#include "platform/linux/programs/own_words.h"
#include "platform/linux/roles/perform.h"
#include "platform/linux/roles/role_application.h"
#include "platform/linux/roles/show_window.h"
#include "platform/scripting/snapvale_dictionary.h"

namespace linux::roles {

namespace {

namespace snapvale = scripting::snapvale;
namespace words = programs::words;
using tarnscript::Event;
using tarnscript::ObjectRef;
using tarnscript::Refusal;
using tarnscript::Value;

constexpr std::uint64_t kAlbums = 7;
constexpr std::uint64_t kCurrentAlbum = 6;

class PhotoLibrary final : public RoleApplication {
 public:
  PhotoLibrary() : RoleApplication(programs::Role::PhotoLibrary) {}

  const tarnscript::Dictionary& dictionary() const override { return snapvale::dictionary(); }

 protected:
  Value getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) override;
  std::vector<ObjectRef> elementsBy(const Performer& performer, const ObjectRef& object,
                                    tarnscript::Code cls) override;
  Value performBy(const Performer& performer, const Event& event) override;

 private:
  void select(const Performer& performer, const Event& event) const;
};

Value PhotoLibrary::getBy(const Performer& performer, const ObjectRef& object, tarnscript::Code property) {
  switch (property) {
    case snapvale::kSlideshowRunning:
      return showRuns(performer);
    case snapvale::kCurrentAlbum:
      return ObjectRef{this, snapvale::kAlbum, kCurrentAlbum};
    case snapvale::kName:
      return std::to_string(object.id);
    case snapvale::kID:
      return static_cast<std::int64_t>(object.id);
    default:
      return RoleApplication::getBy(performer, object, property);
  }
}

std::vector<ObjectRef> PhotoLibrary::elementsBy(const Performer& performer, const ObjectRef& object,
                                                tarnscript::Code cls) {
  if (cls != snapvale::kAlbum) return RoleApplication::elementsBy(performer, object, cls);
  std::vector<ObjectRef> albums;
  for (std::uint64_t id = 1; id <= kAlbums; ++id) albums.push_back({this, snapvale::kAlbum, id});
  return albums;
}

Value PhotoLibrary::performBy(const Performer& performer, const Event& event) {
  switch (event.command) {
    case snapvale::kStartSlideshow:
      if (showRuns(performer)) return {};
      break;
    case snapvale::kStopSlideshow:
      if (!showRuns(performer)) return {};
      return RoleApplication::performBy(performer.in(*showWindow(performer)), event);
    case snapvale::kSelect:
      select(performer, event);
      return {};
    default:
      break;
  }
  return RoleApplication::performBy(performer, event);
}

void PhotoLibrary::select(const Performer& performer, const Event& event) const {
  const auto* const album = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
  if (album == nullptr || album->application != this || album->cls != snapvale::kAlbum) {
    throw Refusal{"only albums can be selected"};
  }
  for (std::uint64_t at = kCurrentAlbum; at < album->id; ++at) roles::perform(performer, words::kNextAlbum);
  for (std::uint64_t at = kCurrentAlbum; at > album->id; --at)
    roles::perform(performer, words::kPreviousAlbum);
}

}  // namespace

tarnscript::Application& photoLibrary() {
  static PhotoLibrary application;
  return application;
}

}  // namespace linux::roles
