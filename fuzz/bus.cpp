#include "fuzz/bus.h"

#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "fuzz/fuzz.h"
#include "platform/linux/system/bus.h"

namespace {

using fuzz::require;
using linux::system::Message;
using linux::system::Slot;

struct Line {
  std::string_view member;
  std::string_view rest;
};

/// What is said unasked.
struct Unasked {
  std::string_view member;
  const char* sender;
  const char* path;
  const char* interface;
  bool isSignal;
};

// clang-format off
constexpr Unasked kUnasked[] = {
    {"NameOwnerChanged", "org.freedesktop.DBus", "/org/freedesktop/DBus", "org.freedesktop.DBus", true},
    {"PropertiesChanged", fuzz::kProgram, "/org/mpris/MediaPlayer2", "org.freedesktop.DBus.Properties", true},
    {"Tell", fuzz::kProgram, "/windows", "com.tarn.kvd.Windows", false},
};
// clang-format on

using Bus = std::unique_ptr<sd_bus, decltype([](sd_bus* bus) { sd_bus_close_unref(bus); })>;

/// What kvd is called on the bus.
constexpr char kUs[] = ":1.1";

Bus sOurs, sTheirs;
unsigned sGeneration = 0;
std::vector<Line> sLines;
/// What has not been said yet of what is said unasked.
std::vector<Line> sUnsaid;

// ---- Values

/// Takes the next word, which may be in quotes of either kind.
std::string takeWord(std::string_view& rest) {
  rest.remove_prefix(std::min(rest.find_first_not_of(' '), rest.size()));
  const char quote = rest.starts_with('"') || rest.starts_with('\'') ? rest.front() : ' ';
  if (quote != ' ') rest.remove_prefix(1);
  const std::size_t end = std::min(rest.find(quote), rest.size());
  std::string word(rest.substr(0, end));
  rest.remove_prefix(std::min(end + 1, rest.size()));
  return word;
}

/// The length of the first complete type; none where it is malformed.
std::size_t lengthOf(std::string_view types) {
  if (types.starts_with('a')) return 1 + lengthOf(types.substr(1));
  std::size_t depth = 0;
  for (std::size_t i = 0; i < types.size(); ++i) {
    if (types[i] == '(' || types[i] == '{') ++depth;
    if ((types[i] == ')' || types[i] == '}') && depth > 0) --depth;
    if (depth == 0) return i + 1;
  }
  return types.size();
}

bool append(sd_bus_message* message, const std::string& types, std::string_view& words);

bool appendContainer(sd_bus_message* message, char type, const std::string& content, std::int64_t count,
                     std::string_view& words) {
  if (sd_bus_message_open_container(message, type, content.c_str()) < 0) return false;
  for (; count > 0 && !words.empty(); --count) {
    if (!append(message, content, words)) return false;
  }
  return sd_bus_message_close_container(message) >= 0;
}

/// A single complete type.
bool appendOne(sd_bus_message* message, const std::string& type, std::string_view& words) {
  if (type[0] == '(') return appendContainer(message, 'r', type.substr(1, type.size() - 2), 1, words);
  if (type[0] == '{') return appendContainer(message, 'e', type.substr(1, type.size() - 2), 1, words);
  const std::string word = takeWord(words);
  if (type[0] == 'v') return appendContainer(message, 'v', word, 1, words);
  const std::int64_t number = std::strtoll(word.c_str(), nullptr, 0);
  switch (type[0]) {
    case 'a':
      return appendContainer(message, 'a', type.substr(1), number, words);
    case 's':
    case 'o':
    case 'g':
      return sd_bus_message_append_basic(message, type[0], word.c_str()) >= 0;
    case 'd':
      return sd_bus_message_append(message, "d", std::strtod(word.c_str(), nullptr)) >= 0;
    case 'x':
    case 't':
      return sd_bus_message_append(message, type.c_str(), number) >= 0;
    case 'h':
      return false;
    default:
      return sd_bus_message_append(message, type.c_str(), static_cast<int>(number)) >= 0;
  }
}

bool append(sd_bus_message* message, const std::string& types, std::string_view& words) {
  for (std::size_t at = 0; at < types.size();) {
    const std::size_t length = lengthOf(std::string_view(types).substr(at));
    if (!appendOne(message, types.substr(at, length), words)) return false;
    at += length;
  }
  return true;
}

bool fillIn(sd_bus_message* message, std::string_view words) {
  const std::string types = takeWord(words);
  return append(message, types, words);
}

// ---- The program

/// The answer to a call, not yet sealed; null where the program has none.
Message answerTo(sd_bus_message* call) {
  const auto line = std::ranges::find(sLines, sd_bus_message_get_member(call), &Line::member);
  if (line == sLines.end()) return nullptr;
  const std::string_view words = line->rest;
  if (std::ranges::count(sLines, line->member, &Line::member) > 1) sLines.erase(line);
  sd_bus_message* made = nullptr;
  if (sd_bus_message_new_method_return(call, &made) < 0) return nullptr;
  Message answer(made);
  return fillIn(made, words) ? std::move(answer) : nullptr;
}

int takeCall(sd_bus_message* call, void*, sd_bus_error*) {
  if (sd_bus_message_is_method_call(call, nullptr, nullptr) <= 0) return 0;
  if (sd_bus_message_is_method_call(call, nullptr, "Hello") > 0)
    return sd_bus_reply_method_return(call, "s", kUs);
  if (sd_bus_message_is_method_call(call, nullptr, "AddMatch") > 0)
    return sd_bus_reply_method_return(call, "");
  const Message answer = answerTo(call);
  if (answer == nullptr) return sd_bus_reply_method_errorf(call, "org.freedesktop.DBus.Error.Failed", "no");
  return sd_bus_send(nullptr, answer.get(), nullptr) < 0 ? 0 : 1;
}

/// Says what the line says, if that is something to say unasked.
void speak(const Line& line) {
  const auto* const said = std::ranges::find(kUnasked, line.member, &Unasked::member);
  if (said == std::end(kUnasked)) return;
  const std::string member(line.member);
  sd_bus_message* made = nullptr;
  const int result = said->isSignal ? sd_bus_message_new_signal(sTheirs.get(), &made, said->path,
                                                                said->interface, member.c_str())
                                    : sd_bus_message_new_method_call(sTheirs.get(), &made, kUs, said->path,
                                                                     said->interface, member.c_str());
  const Message message(made);
  require(result >= 0 && sd_bus_message_set_sender(made, said->sender) >= 0, "there is something to say");
  if (fillIn(made, line.rest)) sd_bus_send(nullptr, made, nullptr);
}

/// Lets both ends handle what has come. Whether there was something.
bool passOn() {
  bool any = false;
  for (bool more = true; more; any = any || more) {
    more = sd_bus_process(sOurs.get(), nullptr) > 0;
    more = sd_bus_process(sTheirs.get(), nullptr) > 0 || more;
  }
  return any;
}

/// The same, and the program says what it says unasked: kvd listens now.
bool passAllOn() {
  bool any = passOn();
  for (const Line& line : std::exchange(sUnsaid, {})) {
    speak(line);
    any = passOn() || any;
  }
  return any;
}

Bus makeEnd(int socket) {
  sd_bus* made = nullptr;
  require(sd_bus_new(&made) >= 0 && sd_bus_set_fd(made, socket, socket) >= 0, "there is an end of a bus");
  return Bus(made);
}

}  // namespace

void fuzz::beginBus(std::string_view lines) {
  sLines.clear();
  while (!lines.empty()) {
    std::string_view line = lines.substr(0, lines.find('\n'));
    lines.remove_prefix(std::min(line.size() + 1, lines.size()));
    const std::size_t end = std::min(line.find(' '), line.size());
    sLines.push_back({line.substr(0, end), line.substr(end)});
  }
  std::array<int, 2> ends{};
  require(socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0, ends.data()) == 0,
          "there are sockets");
  sOurs = makeEnd(ends[0]);
  sTheirs = makeEnd(ends[1]);
  ++sGeneration;
  require(sd_bus_set_server(sTheirs.get(), 1, sd_id128_t{}) >= 0 && sd_bus_start(sTheirs.get()) >= 0 &&
              sd_bus_add_filter(sTheirs.get(), nullptr, takeCall, nullptr) >= 0,
          "there is a bus");
  require(sd_bus_set_bus_client(sOurs.get(), 1) >= 0 && sd_bus_start(sOurs.get()) >= 0, "it is connected to");
  while (sd_bus_is_ready(sOurs.get()) == 0) passOn();
  require(sd_bus_is_ready(sOurs.get()) > 0, "it lets in");
  sUnsaid = sLines;
}

namespace linux::system {

sd_bus* bus() { return sOurs.get(); }

void closeBus() { sOurs.reset(); }

unsigned busGeneration() { return sGeneration; }

void takeInBus() { passAllOn(); }

bool waitForBus(const base::Deadline&) { return passAllOn(); }

Message makeCall(const Callee& callee, const Method& method) {
  sd_bus_message* request = nullptr;
  sd_bus_message_new_method_call(bus(), &request, callee.name.c_str(), method.path, method.interface,
                                 method.member);
  return Message(request);
}

/// Answered here and now: handlers of messages call too.
Message call(const Callee&, Message request, Limit) {
  if (request == nullptr || sd_bus_message_seal(request.get(), 1, 0) < 0) return nullptr;
  Message answer = answerTo(request.get());
  if (answer == nullptr || sd_bus_message_seal(answer.get(), 2, 0) < 0) return nullptr;
  sd_bus_message_rewind(answer.get(), 1);
  return answer;
}

bool send(Message request) { return request != nullptr && sd_bus_send(nullptr, request.get(), nullptr) >= 0; }

Slot callLater(Message request, sd_bus_message_handler_t take, void* context) {
  sd_bus_slot* slot = nullptr;
  if (request != nullptr) sd_bus_call_async(bus(), &slot, request.get(), take, context, UINT64_MAX);
  return Slot(slot);
}

bool nameHasOwner(const char*) { return true; }

}  // namespace linux::system
