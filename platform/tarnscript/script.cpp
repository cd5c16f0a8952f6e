// The engine as others see it: source to tokens to program, and a program run.
#include <utility>

#include "platform/tarnscript/evaluator.h"
#include "platform/tarnscript/lexer.h"
#include "platform/tarnscript/limits.h"
#include "platform/tarnscript/parser.h"
#include "platform/tarnscript/tarnscript.h"

namespace tarnscript {

Script::Script(std::unique_ptr<Program> program) : program_(std::move(program)) {}

Script::~Script() = default;

std::unique_ptr<Script> Script::compile(std::string_view source, World& world, Error& error) {
  if (source.size() > kMaxSourceSize) {
    error = Error{"the script is too long", 1};
    return nullptr;
  }
  try {
    const std::vector<Token> tokens = tokenize(source);
    auto program = std::make_unique<Program>(Parser(tokens, world).parse());
    return std::unique_ptr<Script>(new Script(std::move(program)));
  } catch (Error& found) {
    error = std::move(found);
    return nullptr;
  }
}

Outcome Script::run(World& world) const { return Evaluator(*program_, world).run(); }

}  // namespace tarnscript
