#include "platform/linux/players/mpv_channel.h"

#include <algorithm>
#include <iterator>
#include <nlohmann/json.hpp>

#include "platform/linux/system/channel.h"
#include "platform/linux/system/process.h"
#include "platform/tarnscript/tarnscript.h"

namespace desktop {

namespace {

using Json = nlohmann::json;

/// Programs that are mpv, or have it inside and open its channel when it is told to.
constexpr std::string_view kExecutables[] = {"mpv", "celluloid"};

/// On a connection of its own every request may have the same number.
constexpr int kRequest = 1;

constexpr int kTextMilliseconds = 2000;

std::string_view executableOf(pid_t process) {
  const std::string name = executableName(process);
  const auto* const known = std::find(std::begin(kExecutables), std::end(kExecutables), name);
  return known != std::end(kExecutables) ? *known : kExecutables[0];
}

/// Sends a command, a list of words and numbers, and waits until mpv has carried it out. False where it
/// cannot.
bool request(pid_t process, Json command, Microseconds limit) {
  Channel channel(process, executableOf(process), limit);
  const Json message = {{"command", std::move(command)}, {"request_id", kRequest}};
  if (!channel.isOpen() ||
      !channel.write(message.dump(-1, ' ', false, Json::error_handler_t::replace) + "\n")) {
    return false;
  }
  while (const auto line = channel.readLine()) {
    const Json answer = Json::parse(*line, nullptr, false);
    // Events come on the same connection, and have no such number.
    if (!answer.is_object() || !answer.contains("request_id") || answer["request_id"] != kRequest) continue;
    return answer.contains("error") && answer["error"] == "success";
  }
  if (channel.timedOut()) noteTimeout(process);
  return false;
}

}  // namespace

bool hasMpvChannel(pid_t process) { return !channelPath(process, executableOf(process)).empty(); }

void mpvCommand(pid_t process, std::string_view command) {
  Json words = Json::array();
  while (!command.empty()) {
    const std::size_t length = std::min(command.find(' '), command.size());
    if (length > 0) words.push_back(std::string(command.substr(0, length)));
    command.remove_prefix(std::min(length + 1, command.size()));
  }
  if (!request(process, std::move(words), kCommandLimit)) throw tarnscript::Refusal{"mpv cannot do that"};
}

bool showMpvText(pid_t process, std::string_view text) {
  return request(process, Json::array({"show-text", std::string(text), kTextMilliseconds}), kQueryLimit);
}

}  // namespace desktop
