#include "report/text.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <string_view>
#include <vector>

#include "platform/text/utf8.h"

namespace report {

namespace {

std::size_t sColumns = 100;
/// What programs have written is cut there.
constexpr std::size_t kLongestText = 500;
/// What titles may take of a line.
constexpr std::size_t kLongestTitle = 40;
constexpr std::size_t kIndent = 2;
/// Where the text behind a label begins.
constexpr std::size_t kLabel = 22;

/// What others have written, without what a terminal would obey, and not longer than this.
std::string plain(std::string_view text, std::size_t most = kLongestText) {
  std::string result;
  std::size_t count = 0;
  while (!text.empty() && count < most) {
    auto character = text::takeCharacter(text);
    if (!character) text.remove_prefix(1);
    const bool control = character && (*character < 0x20 || (*character >= 0x7F && *character < 0xA0));
    text::appendUTF8(result, !character ? U'\uFFFD' : control ? U' ' : *character);
    ++count;
  }
  return text.empty() ? result : result + "…";
}

std::string plain(const Object& text, std::size_t most = kLongestText) {
  return text.is_string() ? plain(text.get<std::string_view>(), most) : text.dump();
}

std::string quoted(const Object& title) { return '"' + plain(title, kLongestTitle) + '"'; }

/// The text in lines, broken at blanks, the later ones indented; a word that is longer than a line stays
/// whole.
std::string wrapped(const std::string& text, std::size_t first, std::size_t indent) {
  std::string result;
  std::size_t column = first;
  std::size_t at = 0;
  while (at < text.size()) {
    const std::size_t end = std::min(text.find(' ', at), text.size());
    const std::string word = text.substr(at, end - at);
    const std::size_t width = text::characterCount(word);
    if (at > 0 && column + 1 + width > sColumns) {
      result += "\n" + std::string(indent, ' ');
      column = indent;
    } else if (at > 0) {
      result += ' ';
      ++column;
    }
    result += word;
    column += width;
    at = end + 1;
  }
  return result + "\n";
}

std::string padded(const std::string& text, std::size_t width) {
  const std::size_t count = text::characterCount(text);
  return text + std::string(count < width ? width - count : 1, ' ');
}

/// "  label               text", wrapped.
std::string row(const std::string& label, const std::string& text) {
  const std::string head = std::string(kIndent, ' ') + padded(label, kLabel);
  return head + wrapped(text, text::characterCount(head), kIndent + kLabel);
}

std::string title(const std::string& text) { return "\n" + text + "\n"; }

std::string program(const Object& object) {
  const std::string name = plain(object["program"], kLongestTitle);
  return object["process"] == 0 ? name : name + " (" + object["process"].dump() + ")";
}

std::string time(double seconds) {
  const auto whole = static_cast<long long>(std::floor(seconds));
  char text[48];
  if (whole >= 3600) {
    std::snprintf(text, sizeof text, "%lld:%02lld:%02lld", whole / 3600, whole / 60 % 60, whole % 60);
  } else {
    std::snprintf(text, sizeof text, "%lld:%02lld", whole / 60, whole % 60);
  }
  return text;
}

// ---- The desktop

std::string sessionText(const Object& session) {
  std::string text = title("Session");
  if (!session["bus"]) text += row("session bus", plain(session["obstacle"]));
  const Object& here = session["here"];
  const Object& there = session["service_manager"];
  std::vector<std::string> names;
  for (const Object* side : {&here, &there}) {
    if (side->is_null()) continue;
    for (const auto& [name, value] : side->items()) {
      if (std::ranges::find(names, name) == names.end()) names.push_back(name);
    }
  }
  const auto valueOn = [](const Object& side, const std::string& name) {
    return side.contains(name) ? plain(side[name], kLongestTitle) : std::string("not set");
  };
  for (const std::string& name : names) {
    std::string value = valueOn(here, name);
    if (!there.is_null() && valueOn(there, name) != value) {
      value += " here, " + valueOn(there, name) + " at the service manager";
    }
    text += row(name, value);
  }
  if (names.empty()) text += row("desktop", "none of the variables that tell of one is set");
  return text + row("service manager", there.is_null() ? "not on the session bus" : "on the session bus");
}

std::string windowSystemsText(const Object& systems) {
  std::string text = title("Window systems");
  for (const Object& system : systems) {
    const std::string obstacle = plain(system["obstacle"]);
    const std::string state = system["open"] ? "open" : "not open";
    text += row(plain(system["name"]), obstacle.empty() ? state : state + ": " + obstacle);
  }
  return text;
}

std::string frontText(const Object& front, const Object& systems, const Object& taker) {
  const bool isKvd = taker == "kvd";
  std::string text =
      title("In front") + row("has the remote", isKvd ? "kvd" : plain(taker) + ", which reads it itself");
  const bool told =
      std::ranges::any_of(systems, [](const Object& each) { return each["tells_front"] == true; });
  if (!told) return text + row("window", "nobody tells which one is in front");
  if (front.is_null()) return text + row("window", "none");
  text += row("window", quoted(front["title"]) + ", of class " + plain(front["class"], kLongestTitle));
  const bool known = !front["program"].is_null();
  return text + row("program", known ? program(front) + ", " + plain(front["role"]) : "one without a role");
}

std::string playback(const Object& player) {
  if (player.is_null()) return {};
  std::string text = ", " + plain(player["status"]);
  if (!player.contains("position")) return text;
  if (player["title"] != "") text += " " + quoted(player["title"]);
  text += " at " + time(player["position"]);
  return player["length"].is_null() ? text : text + " of " + time(player["length"]);
}

std::string programsText(const Object& programs) {
  std::string text = title("Programs with a role");
  for (const Object& each : programs) {
    text += row(program(each),
                plain(each["role"]) + playback(each["player"]) + (each["in_front"] ? ", in front" : ""));
    text += row("", "known by " + plain(each["recognised"]));
    for (const Object& window : each["windows"]) {
      text += row("", "window " + quoted(window["title"]) + (window["full_screen"] ? ", full screen" : ""));
    }
  }
  return programs.empty() ? text + row("none", "neither a player nor a window is known to play one") : text;
}

std::string othersText(const Object& others) {
  if (others.empty()) return {};
  std::string text = title("Players and windows without a role");
  for (const Object& each : others) {
    const bool isPlayer = each["kind"] == "player";
    std::string what = isPlayer ? plain(each["name"], kLongestTitle) : quoted(each["name"]);
    if (!isPlayer) what += ", of class " + plain(each["class"], kLongestTitle);
    text += row(plain(each["kind"]), what + ": " + plain(each["why"]));
  }
  return text;
}

std::string outputsText(const Object& outputs) {
  std::string text = title("Outputs");
  for (const Object& each : outputs) {
    const std::string size = each["width"].dump() + "x" + each["height"].dump();
    text += row(size + " at " + each["x"].dump() + "," + each["y"].dump(),
                each["captured"] ? "captured by a full-screen window" : "not captured");
  }
  return outputs.empty() ? text + row("none", "nobody tells of any") : text;
}

std::string soundText(const Object& sound) {
  std::string text = title("Sound");
  if (sound.is_null()) return text + row("server", "none answers");
  text += row("server", plain(sound["server"]));
  if (sound["volume"].is_null()) return text + row("volume", "there is no output");
  return text + row("volume", sound["volume"].dump() + " %" + (sound["muted"] ? ", muted" : ""));
}

std::string serviceText(const Object& service) {
  std::string text = title("Service");
  if (service["socket"].is_null()) return text + row("socket", plain(service["obstacle"]));
  text += row("socket", plain(service["socket"]));
  const auto isCalled = [](const char* name) {
    return [name](const Object& each) { return each["name"] == name; };
  };
  const Object& listeners = service["listeners"];
  if (std::ranges::any_of(listeners, isCalled("systemd")) &&
      std::ranges::none_of(listeners, isCalled("kvd"))) {
    text += row("kvd", "does not run; the service manager starts it at the first button");
  }
  for (const Object& each : listeners) {
    text += row("listens", plain(each["name"]) + " (" + each["process"].dump() + ")");
  }
  return listeners.empty() ? text + row("listens", "nobody: buttons get lost") : text;
}

std::string remotesText(const Object& remotes) {
  std::string text = title("Remotes");
  if (remotes.is_null()) return text + row("kvd-receiver", "is not installed beside kvd-report");
  for (const Object& each : remotes) {
    const std::string line = plain(each);
    // What is there to be copied stays whole.
    const bool isRule = line.find("==") != std::string::npos;
    text += std::string(kIndent, ' ') + (isRule ? line + "\n" : wrapped(line, kIndent, 2 * kIndent));
  }
  return text;
}

// ---- A button

std::string deedsText(const Object& deeds) {
  std::string text;
  for (const Object& deed : deeds) {
    std::string words = plain(deed["words"]);
    const char* separator = ": by ";
    for (const Object& way : deed["ways"]) {
      words += separator + plain(way);
      separator = ", else by ";
    }
    text += row(program(deed), words);
  }
  return text;
}

}  // namespace

void setColumns(std::size_t columns) { sColumns = columns; }

std::string desktopText(const Object& desktop) {
  std::string text = "kvd " + plain(desktop["version"]) + "\n" + sessionText(desktop["session"]) +
                     windowSystemsText(desktop["window_systems"]) +
                     frontText(desktop["front"], desktop["window_systems"], desktop["has_remote"]) +
                     programsText(desktop["programs"]) + othersText(desktop["others"]) +
                     outputsText(desktop["outputs"]) + soundText(desktop["sound"]) +
                     serviceText(desktop["service"]);
  return desktop.contains("remotes") ? text + remotesText(desktop["remotes"]) : text;
}

std::string buttonText(const Object& button) {
  std::string text = "What the button " + plain(button["button"]) + " would do now\n\n";
  const std::string why = plain(button["why"]);
  if (!button.contains("told")) return text + row("goes to", "nobody: " + why);
  const Object& target = button["target"];
  if (!target.is_null()) {
    text += row("goes to", program(target) + ", " + plain(target["role"]) + ": " + why);
  } else if (button["reason"] == "volume") {
    text += row("goes to", "the sound: " + why);
  } else {
    text += row("goes to", "nobody: " + why);
  }
  if (!button["silenced"].empty()) text += title("Silenced first") + deedsText(button["silenced"]);
  text += title("Told") + deedsText(button["told"]);
  if (button["told"].empty()) text += row("nobody", "nothing is done");
  if (!button["released"].empty()) text += title("Told when it is released") + deedsText(button["released"]);
  if (button["repeats"]) text += title("Held down it is repeated.");
  for (const Object& remark : button["remarks"]) text += "\n" + wrapped(plain(remark), 0, 0);
  return text;
}

}  // namespace report
