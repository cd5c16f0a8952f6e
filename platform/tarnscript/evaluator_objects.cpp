// The part of the evaluator that deals with applications: properties, elements, commands.
#include <utility>

#include "platform/tarnscript/evaluator.h"
#include "platform/text/case.h"

namespace tarnscript {

namespace {

Failure noProperty(std::string_view words, const Value& container) {
  return Failure{std::string(kindName(container)) + " has no property '" + std::string(words) + "' here"};
}

Failure noElement(const Element& node, bool byApplication) {
  return Failure{"there is no such " + std::string(node.cls->words), byApplication};
}

}  // namespace

const ObjectRef& Evaluator::told() const {
  if (told_.empty()) throw Failure{"no application is told here"};
  return told_.back();
}

const PropertyTerm* Evaluator::findProperty(const ObjectRef& object, std::string_view words) {
  for (const PropertyTerm& term : object.application->dictionary().properties) {
    if (term.owner == object.cls && text::equalIgnoringCase(term.words, words)) return &term;
  }
  return nullptr;
}

const ObjectRef* Evaluator::findOwner(std::string_view words) const {
  for (auto object = told_.rbegin(); object != told_.rend(); ++object) {
    if (object->application != told_.back().application) break;
    if (findProperty(*object, words) != nullptr) return &*object;
  }
  return nullptr;
}

Value Evaluator::compute(const It& /*node*/) { return told(); }

Value Evaluator::compute(const Property& node) {
  if (node.container != kNone) return getProperty(evaluate(node.container), node.term->words);
  if (const ObjectRef* const owner = findOwner(node.term->words))
    return getProperty(*owner, node.term->words);
  if (node.constant != nullptr) return Constant{node.constant->code};
  return getProperty(told(), node.term->words);
}

Value Evaluator::getProperty(const Value& container, std::string_view words) {
  if (const auto* object = std::get_if<ObjectRef>(&container)) {
    const PropertyTerm* const term = findProperty(*object, words);
    if (term == nullptr) throw noProperty(words, container);
    Application& application = *object->application;
    Value value = ask(application, [&] { return application.get(*object, term->code); });
    budget_.chargeCopy(value);
    return value;
  }
  if (const auto* list = std::get_if<List>(&container)) {
    std::vector<Value> values;
    values.reserve(elementsOf(*list).size());
    for (const Value& element : elementsOf(*list)) values.push_back(getProperty(element, words));
    return makeList(std::move(values), budget_);
  }
  const auto* record = std::get_if<Record>(&container);
  if (record == nullptr || *record == nullptr) throw noProperty(words, container);
  return getField(*record, words);
}

/// A field is named by a property of the additions or of the application that is told.
Value Evaluator::getField(const Record& record, std::string_view words) {
  const auto fieldIn = [&](const Dictionary& dictionary) -> const Value* {
    for (const PropertyTerm& term : dictionary.properties) {
      const auto field = record->find(term.code);
      if (field != record->end() && text::equalIgnoringCase(term.words, words)) return &field->second;
    }
    return nullptr;
  };
  const Value* field = told_.empty() ? nullptr : fieldIn(told().application->dictionary());
  if (field == nullptr) field = fieldIn(additions_.dictionary());
  if (field == nullptr) throw noProperty(words, record);
  budget_.chargeCopy(*field);
  return *field;
}

void Evaluator::setProperty(const Value& container, std::string_view words, const Value& value) {
  if (const auto* list = std::get_if<List>(&container)) {
    for (const Value& element : elementsOf(*list)) setProperty(element, words, value);
    return;
  }
  const auto* object = std::get_if<ObjectRef>(&container);
  const PropertyTerm* const term = object == nullptr ? nullptr : findProperty(*object, words);
  if (term == nullptr) throw noProperty(words, container);
  budget_.chargeCopy(value);
  const Value coerced = coerce(value, term->type);
  Application& application = *object->application;
  ask(application, [&] { application.set(*object, term->code, coerced); });
}

std::optional<bool> Evaluator::isNamed(const Value& left, ExpressionRef right) {
  const auto* property = std::get_if<Property>(&program_.expressions[right]);
  if (property == nullptr || property->container != kNone) return std::nullopt;
  if (const auto* constant = std::get_if<Constant>(&left)) {
    if (property->constant == nullptr) return std::nullopt;
    return constant->code == property->constant->code;
  }
  const auto* object = std::get_if<ObjectRef>(&left);
  if (object == nullptr) return std::nullopt;
  const PropertyTerm* const term = findProperty(*object, property->term->words);
  if (term == nullptr || term->type != Type::Boolean) return std::nullopt;
  return truth(getProperty(left, term->words));
}

Value Evaluator::compute(const Element& node) {
  const Value container = node.container == kNone ? Value(told()) : evaluate(node.container);
  const bool wantsItem = node.cls->code == kItemClass;
  if (const auto* list = std::get_if<List>(&container); list != nullptr && wantsItem) {
    return selectFrom(*list, node);
  }
  if (const auto* object = std::get_if<ObjectRef>(&container); object != nullptr && !wantsItem) {
    return selectFrom(*object, node);
  }
  throw Failure{std::string(kindName(container)) + " has no elements of the class '" +
                std::string(node.cls->words) + "'"};
}

std::optional<std::size_t> Evaluator::indexOf(const Element& node, std::size_t count) {
  const auto size = static_cast<std::int64_t>(count);
  std::int64_t index = 1;
  if (node.selection == Selection::Last) index = size;
  if (node.selection == Selection::Index) index = evaluateWhole(node.selector);
  if (index < 0) index += size + 1;
  if (index < 1 || index > size) return std::nullopt;
  return static_cast<std::size_t>(index - 1);
}

Value Evaluator::selectFrom(const List& list, const Element& node) {
  if (node.selection == Selection::Every) return list;
  const auto elements = elementsOf(list);
  const auto index = node.selection == Selection::ID ? std::nullopt : indexOf(node, elements.size());
  if (!index) throw noElement(node, false);
  budget_.chargeCopy(elements[*index]);
  return elements[*index];
}

Value Evaluator::selectFrom(const ObjectRef& container, const Element& node) {
  Application& application = *container.application;
  const Code cls = node.cls->code;
  if (node.selection == Selection::ID) {
    const Value id = evaluatePresent(node.selector);
    return ask(application, [&] { return application.elementWithID(container, cls, id); });
  }
  const auto objects = ask(application, [&] { return application.elements(container, cls); });
  budget_.charge(objects.size());
  if (node.selection == Selection::Every) {
    return makeList(std::vector<Value>(objects.begin(), objects.end()), budget_);
  }
  const auto index = indexOf(node, objects.size());
  if (!index) throw noElement(node, true);
  return objects[*index];
}

Value Evaluator::compute(const Command& node) {
  Event event;
  event.command = node.term->code;
  event.target = node.addition ? ObjectRef{&additions_, kApplicationClass, 0} : told();
  if (node.direct != kNone) event.direct = evaluatePresent(node.direct);
  for (std::uint32_t i = 0; i < node.argumentCount; ++i) {
    const auto& [term, value] = program_.arguments[node.firstArgument + i];
    event.parameters[term->code] = coerce(evaluateAs(value, term->type), term->type);
  }
  Application& application = *event.target.application;
  Value value = ask(application, [&] { return application.perform(event); });
  budget_.chargeCopy(value);
  return value;
}

Evaluator::Flow Evaluator::execute(const Start& node) {
  const Value target = node.application == kNone ? Value(told()) : evaluate(node.application);
  const auto* object = std::get_if<ObjectRef>(&target);
  if (object == nullptr) throw Failure{"cannot start " + std::string(kindName(target))};
  try {
    node.activates ? object->application->activate() : object->application->launch();
  } catch (const Refusal& refusal) {
    throw Failure{refusal.message, true};
  }
  return Flow::Next;
}

}  // namespace tarnscript
