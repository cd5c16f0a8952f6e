#include "platform/linux/players/mpv.h"

#include <algorithm>
#include <nlohmann/json.hpp>
#include <string>

#include "platform/tarnscript/tarnscript.h"

namespace linux::players {

namespace {

using Json = nlohmann::json;

/// On a connection of its own every request may have the same number.
constexpr int kRequest = 1;

constexpr int kTextMilliseconds = 2000;

/// Sends a command, a list of words and numbers, and waits until mpv has carried it out. False where it
/// cannot.
bool request(const system::Listener& listener, Json command, system::Limit limit) {
  system::Channel channel(listener, limit);
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
  if (channel.timedOut()) system::noteTimeout(listener.process);
  return false;
}

void carryOut(const system::Listener& listener, std::string_view command) {
  Json words = Json::array();
  while (!command.empty()) {
    const std::size_t length = std::min(command.find(' '), command.size());
    if (length > 0) words.push_back(std::string(command.substr(0, length)));
    command.remove_prefix(std::min(length + 1, command.size()));
  }
  if (!request(listener, std::move(words), system::kCommandLimit)) {
    throw tarnscript::Refusal{"mpv cannot do that"};
  }
}

bool showText(const system::Listener& listener, std::string_view text) {
  return request(listener, Json::array({"show-text", std::string(text), kTextMilliseconds}),
                 system::kQueryLimit);
}

}  // namespace

const ProgramChannel kMpvChannel{
    .command = carryOut,
    .showText = showText,
    .title = nullptr,
    .chapter = nullptr,
    .goToChapter = nullptr,
    .goToTitle = nullptr,
};

}  // namespace linux::players
