// TarnScript: a small engine for the scripts that drive applications.
//
// The engine knows the language and no application. The words that an application adds ("player state", "fast
// forward", "front document") come from its Dictionary, and what they do from its Application. A script is
// compiled against the dictionaries of the applications it names, whether they run or not, and then
// evaluated.
#pragma once

#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace tarnscript {

/// A four-character code, first character in the most significant byte.
using Code = std::uint32_t;

constexpr Code code(const char (&text)[5]) {
  Code value = 0;
  for (int i = 0; i < 4; ++i) value = value << 8 | static_cast<unsigned char>(text[i]);
  return value;
}

/// The class of an application itself, the outermost object that its words can be about.
inline constexpr Code kApplicationClass = code("capp");

// ---- Values
// --------------------------------------------------------------------------------------------------

class Application;
struct Value;

/// An enumerated constant of an application.
struct Constant {
  Code code = 0;
  friend bool operator==(const Constant&, const Constant&) = default;
};

/// One object of an application: its class and a number that only the application understands. The
/// application itself is of kApplicationClass and has the number 0.
struct ObjectRef {
  Application* application = nullptr;
  Code cls = 0;
  std::uint64_t id = 0;
  friend bool operator==(const ObjectRef&, const ObjectRef&) = default;
};

/// Lists and records are shared and never changed once made.
using List = std::shared_ptr<const std::vector<Value>>;
using Record = std::shared_ptr<const std::map<Code, Value>>;

/// What an expression yields; std::monostate is no value at all.
struct Value : std::variant<std::monostate, bool, std::int64_t, double, std::string, Constant, ObjectRef,
                            List, Record> {
  using variant::variant;
};

/// The value as a signed 32-bit integer: a boolean is 1 or 0, a real loses its fraction, what does not fit is
/// held at the nearest bound; everything else is 0.
std::int32_t toInt32(const Value& value);
/// The four-character code of a constant; 0 for every other value.
Code toTypeCode(const Value& value);

// ---- Dictionaries
// --------------------------------------------------------------------------------------------

/// What kind of value a property or parameter holds.
enum class Type { Boolean, Integer, Real, Text, Constant, Object };

/// A class of objects, in the singular and the plural.
struct ClassTerm {
  std::string_view words;
  std::string_view plural;
  Code code;
};

/// A property of the objects of one class. A value set is made its type first: integers become reals, reals
/// lose their fraction, numbers become texts; what else does not fit is an error of the script.
struct PropertyTerm {
  Code owner;
  std::string_view words;
  Code code;
  Type type;
};

/// A command; one that takes a direct parameter may be written with an object or value behind it.
struct CommandTerm {
  std::string_view words;
  Code code;
  bool takesDirect;
};

/// A named parameter of a command ("using" …); a boolean one may be written "with P" and "without P".
struct ParameterTerm {
  Code command;
  std::string_view words;
  Code code;
  Type type;
};

/// A word for an enumerated constant.
struct ConstantTerm {
  std::string_view words;
  Code code;
};

/// An application's words as tables, matched longest first and without regard to case. Words are one blank
/// apart and never "the", which scripts may write anywhere. The tables must outlive it.
struct Dictionary {
  std::span<const ClassTerm> classes;
  std::span<const PropertyTerm> properties;
  std::span<const CommandTerm> commands;
  std::span<const ParameterTerm> parameters;
  std::span<const ConstantTerm> constants;
};

// ---- Applications
// --------------------------------------------------------------------------------------------

/// A command on its way to an application.
struct Event {
  Code command = 0;
  /// What the innermost tell block is about; for the commands of the additions, the additions themselves.
  ObjectRef target;
  /// The direct parameter, where one was written.
  std::optional<Value> direct;
  std::map<Code, Value> parameters;
};

/// What went wrong and on which line of the source (1 is the first).
struct Error {
  std::string message;
  int line = 0;
};

/// Thrown by an Application that refuses; the engine adds the line.
struct Refusal {
  std::string message;
};

/// What the engine asks of an application. Every function may throw Refusal.
class Application {
 public:
  virtual ~Application() = default;

  virtual const Dictionary& dictionary() const = 0;
  virtual bool running() const = 0;
  /// Starts it if it does not run.
  virtual void launch() = 0;
  /// Starts it if it does not run and brings it to the front.
  virtual void activate() = 0;
  /// Called before each event (get, set, elements, perform) reaches a running application; takes as long as
  /// the application takes to answer when the script waits for replies.
  virtual void deliver(bool waitsForReply) = 0;

  virtual Value get(const ObjectRef& object, Code property) = 0;
  virtual void set(const ObjectRef& object, Code property, const Value& value) = 0;
  /// The elements of one class inside an object, in the application's order (front first).
  virtual std::vector<ObjectRef> elements(const ObjectRef& object, Code cls) = 0;
  /// The element with this id ("process id …"); throws when there is none.
  virtual ObjectRef elementWithID(const ObjectRef& object, Code cls, const Value& id) = 0;
  virtual Value perform(const Event& event) = 0;
};

/// The applications that scripts can name, and the commands that need none.
class World {
 public:
  virtual ~World() = default;
  /// The application with this identifier or name: an exact match first, then one without regard to case;
  /// null when it is not installed.
  virtual Application* find(std::string_view identifierOrName) = 0;
  /// The commands that belong to no application ("get volume settings", "set volume"), usable everywhere.
  virtual Application& additions() = 0;
};

// ---- Scripts
// -------------------------------------------------------------------------------------------------

struct Program;

/// A result, or the error that ended the script; what was done before it stays done.
struct Outcome {
  Value value;
  std::optional<Error> error;
};

/// A compiled script.
class Script {
 public:
  /// Compiles a source text. Null, with the error filled in, when the grammar cannot go on or a limit is
  /// passed.
  static std::unique_ptr<Script> compile(std::string_view source, World& world, Error& error);
  ~Script();
  Outcome run(World& world) const;

 private:
  explicit Script(std::unique_ptr<Program> program);
  std::unique_ptr<Program> program_;
};

}  // namespace tarnscript
