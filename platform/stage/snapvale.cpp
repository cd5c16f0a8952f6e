#include "platform/stage/snapvale.h"

#include <algorithm>
#include <cstdlib>
#include <iterator>

#include "platform/host.h"
#include "platform/scripting/snapvale_dictionary.h"
#include "platform/stage/desktop.h"

namespace stage {

namespace {

namespace words = scripting::snapvale;
using tarnscript::ObjectRef;
using tarnscript::Value;

struct Album {
  std::int64_t id;
  const char* name;
};

constexpr Album kAlbums[] = {
    {101, "Events"},      {102, "Faces"},   {103, "Places"}, {104, "Photos"},
    {105, "Last Import"}, {201, "Harbour"}, {202, "Summer"},
};

/// How the source list shows the albums from top to bottom, by their place in kAlbums.
constexpr std::size_t kDisplayOrder[] = {0, 3, 1, 2, 4, 5, 6};

}  // namespace

Snapvale::Snapvale() : Application(scripting::kSnapvale, "8.1.2") {}

const tarnscript::Dictionary& Snapvale::dictionary() const { return words::dictionary(); }

void Snapvale::ended() {
  slideshow_.stop();
  album_ = 0;
  sourceListHasFocus_ = false;
}

std::string Snapvale::describe() const {
  const std::string album = std::string("album \"") + kAlbums[album_].name + '"';
  return slideshow_.running ? album + ", " + slideshow_.describe() : album;
}

std::string Snapvale::details() const { return version.empty() ? "no version" : "version " + version; }

void Snapvale::select(std::size_t album) {
  album_ = album;
  changed(describe());
}

void Snapvale::selectAbove() {
  const auto* const here = std::find(std::begin(kDisplayOrder), std::end(kDisplayOrder), album_);
  if (sourceListHasFocus_ && here != std::begin(kDisplayOrder)) select(*(here - 1));
}

void Snapvale::startSlideshow() {
  if (slideshow_.running) return;
  slideshow_.start();
  if (std::atoi(version.c_str()) < 8) takeDisplay(*this);
  changed(describe());
}

void Snapvale::stopSlideshow() {
  if (!slideshow_.running) return;
  slideshow_.stop();
  giveDisplayBack(*this);
  changed(describe());
}

void Snapvale::receiveKey(std::uint16_t virtualKey, bool) {
  switch (virtualKey) {
    case HostVirtualKey::Return:
    case HostVirtualKey::Escape:
      return stopSlideshow();
    case HostVirtualKey::Tab:
      sourceListHasFocus_ = !sourceListHasFocus_;
      return;
    case HostVirtualKey::UpArrow:
      return selectAbove();
    default:
      if (slideshow_.receiveKey(virtualKey)) changed(describe());
  }
}

Value Snapvale::read(const ObjectRef& object, tarnscript::Code property) {
  if (object.cls == words::kAlbum) {
    const Album& album = kAlbums[object.id];
    if (property == words::kName) return std::string(album.name);
    return album.id;
  }
  if (property == words::kSlideshowRunning) return slideshow_.running;
  if (property == words::kCurrentAlbum) return ObjectRef{this, words::kAlbum, album_};
  return Application::read(object, property);
}

std::vector<ObjectRef> Snapvale::list(const ObjectRef& object, tarnscript::Code cls) {
  if (object.cls != tarnscript::kApplicationClass || cls != words::kAlbum)
    return Application::list(object, cls);
  std::vector<ObjectRef> albums;
  for (std::size_t album = 0; album < std::size(kAlbums); ++album)
    albums.push_back({this, words::kAlbum, album});
  return albums;
}

Value Snapvale::obey(const tarnscript::Event& event) {
  switch (event.command) {
    case words::kSelect: {
      const auto* const album = event.direct ? std::get_if<ObjectRef>(&*event.direct) : nullptr;
      if (album == nullptr || album->application != this || album->cls != words::kAlbum) {
        throw tarnscript::Refusal{"only albums can be selected"};
      }
      select(album->id);
      break;
    }
    case words::kStartSlideshow:
      startSlideshow();
      break;
    case words::kStopSlideshow:
      stopSlideshow();
      break;
    default:
      return Application::obey(event);
  }
  return {};
}

}  // namespace stage
