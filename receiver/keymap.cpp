#include "receiver/keymap.h"

#include <linux/input-event-codes.h>

#include <algorithm>
#include <array>

namespace receiver {
namespace {

/// Usage page and usage as MSC_SCAN carries them: page << 16 | usage.
using Usage = std::uint32_t;

constexpr Usage kNone = 0;
constexpr Usage kAppMenu = 0x10086;
constexpr Usage kSelect = 0x10089;
constexpr Usage kRight = 0x1008A;
constexpr Usage kLeft = 0x1008B;
constexpr Usage kUp = 0x1008C;
constexpr Usage kDown = 0x1008D;
constexpr Usage kMenu = 0xC0040;
constexpr Usage kMenuUp = 0xC0042;
constexpr Usage kMenuDown = 0xC0043;
constexpr Usage kPlay = 0xC00B0;
constexpr Usage kPause = 0xC00B1;
constexpr Usage kForward = 0xC00B3;
constexpr Usage kRewind = 0xC00B4;
constexpr Usage kNext = 0xC00B5;
constexpr Usage kPrevious = 0xC00B6;
constexpr Usage kStop = 0xC00B7;
constexpr Usage kPlayPause = 0xC00CD;
constexpr Usage kVolumeUp = 0xC00E9;
constexpr Usage kVolumeDown = 0xC00EA;

struct Row {
  std::uint16_t key;
  Usage usual;
  Usage onCEC;
  Usage onHID;
};

// Of the arrows, Left and Right are those that every application takes. Up and Down turn the volume outside
// of menus, which a remote with keys for the volume does not want of them: rows of their own, below.
// clang-format off
constexpr auto kKeys = std::to_array<Row>({
    // key                  usual        on CEC       on HID
    {KEY_PLAY,              kPlay,       kPlay,       kPlay},
    {KEY_PLAYCD,            kPlay,       kPlay,       kPlay},
    {KEY_PAUSE,             kPause,      kPause,      kPause},
    {KEY_PAUSECD,           kPause,      kPause,      kPause},
    {KEY_PLAYPAUSE,         kPlayPause,  kPlayPause,  kPlayPause},
    {KEY_STOP,              kStop,       kStop,       kNone},       // a browser's
    {KEY_STOPCD,            kStop,       kStop,       kStop},
    {KEY_NEXT,              kNext,       kNext,       kNext},
    {KEY_NEXTSONG,          kNext,       kNext,       kNext},
    {KEY_FORWARD,           kNone,       kNext,       kNone},       // a browser's
    {KEY_PREVIOUS,          kPrevious,   kNone,       kPrevious},   // on CEC the previous channel
    {KEY_PREVIOUSSONG,      kPrevious,   kPrevious,   kPrevious},
    {KEY_FASTFORWARD,       kForward,    kForward,    kForward},
    {KEY_REWIND,            kRewind,     kRewind,     kRewind},
    {KEY_FASTREVERSE,       kRewind,     kRewind,     kRewind},
    {KEY_VOLUMEUP,          kVolumeUp,   kVolumeUp,   kVolumeUp},
    {KEY_VOLUMEDOWN,        kVolumeDown, kVolumeDown, kVolumeDown},
    {KEY_UP,                kMenuUp,     kMenuUp,     kMenuUp},
    {KEY_DOWN,              kMenuDown,   kMenuDown,   kMenuDown},
    {KEY_LEFT,              kLeft,       kLeft,       kLeft},
    {KEY_RIGHT,             kRight,      kRight,      kRight},
    {KEY_OK,                kSelect,     kSelect,     kSelect},
    {KEY_SELECT,            kSelect,     kSelect,     kSelect},
    {KEY_ENTER,             kSelect,     kSelect,     kSelect},
    {KEY_KPENTER,           kSelect,     kSelect,     kSelect},
    {KEY_MENU,              kAppMenu,    kAppMenu,    kAppMenu},
    {KEY_ROOT_MENU,         kAppMenu,    kAppMenu,    kAppMenu},
    {KEY_MEDIA_TOP_MENU,    kAppMenu,    kAppMenu,    kAppMenu},
    {KEY_TITLE,             kAppMenu,    kAppMenu,    kAppMenu},
    {KEY_DVD,               kAppMenu,    kAppMenu,    kAppMenu},
    {KEY_PROG1,             kAppMenu,    kAppMenu,    kAppMenu},
    {KEY_EXIT,              kMenu,       kMenu,       kMenu},
    {KEY_ESC,               kMenu,       kMenu,       kMenu},
    {KEY_BACK,              kMenu,       kPrevious,   kMenu},
});

constexpr auto kWithoutVolumeKeys = std::to_array<Row>({
    {KEY_UP,                kUp,         kUp,         kUp},
    {KEY_DOWN,              kDown,       kDown,       kDown},
});

struct HIDRow {
  Usage usage;
  std::uint16_t key;
};

// Which key the kernel's HID driver makes of a usage, unless somebody has remapped it.
constexpr auto kKernelsOwn = std::to_array<HIDRow>({
    {kAppMenu, KEY_PROG1},
    {kSelect, KEY_SELECT},
    {kRight, KEY_RIGHT},
    {kLeft, KEY_LEFT},
    {kUp, KEY_UP},
    {kDown, KEY_DOWN},
    {kMenu, KEY_MENU},
    {0xC0041, KEY_SELECT},
    {kMenuUp, KEY_UP},
    {kMenuDown, KEY_DOWN},
    {0xC0044, KEY_LEFT},
    {0xC0045, KEY_RIGHT},
    {kPlay, KEY_PLAY},
    {kPause, KEY_PAUSE},
    {kForward, KEY_FASTFORWARD},
    {kRewind, KEY_REWIND},
    {kNext, KEY_NEXTSONG},
    {kPrevious, KEY_PREVIOUSSONG},
    {kStop, KEY_STOPCD},
    {kPlayPause, KEY_PLAYPAUSE},
    {kVolumeUp, KEY_VOLUMEUP},
    {kVolumeDown, KEY_VOLUMEDOWN},
});
// clang-format on

template <std::size_t size>
const Row* rowOf(const std::array<Row, size>& rows, std::uint16_t key) {
  const auto* const row = std::ranges::find(rows, key, &Row::key);
  return row == rows.end() ? nullptr : row;
}

Usage usageOf(std::uint16_t key, const Keyboard& keyboard) {
  const Row* row = keyboard.volumeKeys ? nullptr : rowOf(kWithoutVolumeKeys, key);
  if (row == nullptr) row = rowOf(kKeys, key);
  if (row == nullptr) return kNone;
  switch (keyboard.road) {
    case Road::CEC:
      return row->onCEC;
    case Road::HID:
      return row->onHID;
    default:
      return row->usual;
  }
}

bool isKernelsOwn(Usage usage, std::uint16_t key) {
  const auto* const row = std::ranges::find(kKernelsOwn, usage, &HIDRow::usage);
  return row != kKernelsOwn.end() && row->key == key;
}

}  // namespace

const remote::Button* buttonOf(std::uint16_t key, std::optional<std::uint32_t> scan,
                               const Keyboard& keyboard) {
  const bool told = keyboard.road == Road::HID && scan && isKernelsOwn(*scan, key);
  const Usage usage = told ? *scan : usageOf(key, keyboard);
  return remote::findButton(static_cast<std::uint16_t>(usage >> 16), static_cast<std::uint16_t>(usage));
}

bool isButton(std::uint16_t key) { return rowOf(kKeys, key) != nullptr; }

}  // namespace receiver
