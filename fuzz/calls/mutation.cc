#include "fuzz/calls/mutation.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "fuzz/calls/mode.h"
#include "fuzz/calls/transcript.h"
#include "tests/support/command_signatures.h"

namespace ambrix_fuzz {
namespace {

/// The argument that will be wrong; null when there is none.
Array* victim(Choices& choices, CallInput& input) {
  if (input.arguments.empty()) return nullptr;
  return &input.arguments[choices.below(input.arguments.size())];
}

void spoilValue(Choices& choices, const World&, CallInput& input) {
  if (Array* argument = victim(choices, input)) *argument = anyArray(choices);
}

void spoilNumber(Choices& choices, const World&, CallInput& input) {
  Array* argument = victim(choices, input);
  const bool numbers = argument != nullptr && argument->classId() == ClassId::kDouble;
  if (!numbers || argument->elementCount() == 0) return;
  argument
      ->mutableData<double>()[choices.below(std::min<std::size_t>(argument->elementCount(), 256))] =
      anyNumber(choices);
}

/// The same values, one more or one fewer.
void spoilLength(Choices& choices, const World&, CallInput& input) {
  Array* argument = victim(choices, input);
  if (argument == nullptr || argument->classId() == ClassId::kCell) return;
  const std::size_t count = argument->elementCount();
  const std::size_t wanted = choices.oneIn(2) && count > 0 ? count - 1 : count + 1;
  Array other = Array::zeros(argument->classId(), {1, wanted});
  const auto bytes = argument->bytes();
  auto* place = const_cast<std::byte*>(other.bytes().data());
  std::copy_n(bytes.data(), std::min(bytes.size(), other.bytes().size()), place);
  *argument = std::move(other);
}

void spoilText(Choices& choices, const World&, CallInput& input) {
  for (Array& argument : input.arguments) {
    if (argument.classId() != ClassId::kChar) continue;
    argument = Array::text(anyText(choices));
    return;
  }
}

constexpr std::uint64_t kNoFile = 1;

void spoilFile(Choices& choices, const World& world, CallInput& input) {
  const bool takesFile =
      !input.arguments.empty() && input.arguments[0].classId() == ClassId::kUint64;
  if (!takesFile) return;
  const bool reuse = !world.closedIds().empty() && !choices.oneIn(4);
  std::uint64_t id =
      reuse ? world.closedIds()[choices.below(world.closedIds().size())] : choices.word();
  // The library may have given it to another file, which depends on the memory of the program.
  if (isTranscribed() && world.openIds().contains(id)) id = kNoFile;
  input.arguments[0] = Array::scalar(id);
}

void spoilCount(Choices& choices, const World&, CallInput& input) {
  if (choices.oneIn(2) && !input.arguments.empty()) {
    input.arguments.pop_back();
  } else {
    input.arguments.push_back(anyArray(choices));
  }
}

void spoilName(Choices& choices, const World&, CallInput& input) {
  if (!isExtended() && choices.oneIn(4)) {
    input.name = Array::fromNarrow(choices.pick(ambrix_test::extendedCommands()).name);
  } else {
    input.name = choices.oneIn(3) ? anyArray(choices) : Array::text(anyText(choices));
  }
}

void disguise(Choices& choices, const World&, CallInput& input) {
  if (!input.arguments.empty()) input.disguised = choices.below(input.arguments.size());
}

void takeMemory(Choices& choices, const World&, CallInput& input) {
  input.failingAllocation = 1 + choices.below(6);
}

void wantFewer(Choices& choices, const World&, CallInput& input) {
  input.outputs = choices.below(8);
}

using Spoiler = void (*)(Choices&, const World&, CallInput&);
constexpr Spoiler kSpoilers[] = {spoilValue,  spoilValue,  spoilNumber, spoilNumber, spoilNumber,
                                 spoilLength, spoilLength, spoilText,   spoilFile,   spoilCount,
                                 spoilName,   disguise,    takeMemory,  wantFewer};

/// The number, or 0 if no long holds it: the scripted library takes anything.
long asLong(double number) {
  constexpr double kEnd = 9223372036854775808.0;
  return number >= -kEnd && number < kEnd ? static_cast<long>(number) : 0;
}

std::vector<long> asLongs(ArrayView array) {
  std::vector<long> numbers;
  if (array.classId() != ClassId::kDouble) return numbers;
  for (const double number : array.data<double>())
    numbers.push_back(asLong(number));
  return numbers;
}

long asLong(ArrayView array) {
  return asLong(array.data<double>()[0]);
}

template <typename Element>
void eraseAt(std::vector<Element>& elements, long place) {
  if (place >= 0 && place < std::ssize(elements)) elements.erase(elements.begin() + place);
}

/// Commands that change what a file holds.
void applyToContents(std::string_view command, const std::vector<Array>& arguments,
                     Contents& contents) {
  if (command == "createVar") {
    contents.variables.push_back(
        {asLong(arguments[2]), asLong(arguments[3]), asLongs(arguments[4])});
  } else if (command == "deleteVar") {
    eraseAt(contents.variables, asLong(arguments[1]));
  } else if (command == "createAttr") {
    ++contents.attributes;
  } else if (command == "deleteAttr" && contents.attributes > 0) {
    --contents.attributes;
  }
}

}  // namespace

void CallInput::apply(std::string_view command, const std::vector<Array>& results,
                      World& world) const {
  const bool takesFile = !arguments.empty() && arguments[0].classId() == ClassId::kUint64;
  if (command == "create" || command == "open") {
    if (!results.empty()) world.opened(results[0].data<std::uint64_t>()[0], arguments[0].utf8());
    return;
  }
  OpenFile* file = takesFile ? world.find(arguments[0].data<std::uint64_t>()[0]) : nullptr;
  if (file == nullptr) return;
  if (command == "close") return world.closed(file->id);
  if (command == "delete") return world.deleted(file->id);
  applyToContents(command, arguments, file->contents);
}

void spoil(Choices& choices, const World& world, CallInput& input) {
  if (choices.oneIn(3)) choices.pick(kSpoilers)(choices, world, input);
}

std::string shown(const CallInput& input) {
  std::string text = shown(input.name) + " (";
  for (std::size_t i = 0; i < input.arguments.size(); ++i)
    text += (i == 0 ? "" : ", ") + shown(input.arguments[i]) +
            (i == input.disguised ? " as a struct" : "");
  text += ')';
  if (input.failingAllocation > 0) {
    text += ", allocation " + std::to_string(input.failingAllocation) + " fails";
  }
  return text;
}

}  // namespace ambrix_fuzz
