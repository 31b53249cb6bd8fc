// The arguments of one call, each made to suit those before it.
#pragma once

#include <string_view>
#include <vector>

#include "fuzz/calls/choices.h"
#include "fuzz/calls/values.h"
#include "fuzz/calls/world.h"
#include "tests/support/command_signatures.h"

namespace ambrix_fuzz {

using ambrix_test::Command;

/// Makes arguments that a careful user would give, as far as the world knows.
class ArgumentMaker {
 public:
  ArgumentMaker(Choices& choices, World& world) : choices_(choices), world_(world) {}

  std::vector<Array> argumentsOf(const Command& command);

 private:
  using Maker = Array (ArgumentMaker::*)();
  static Maker makerOf(std::string_view kind);
  Array makeArgument(std::string_view kind);

  Array file();
  Array path();
  Array variable();
  Array variableName();
  Array attributeName();
  Array newName();
  Array constantName();
  Array attribute();
  Array datatype();
  Array numberOfElements();
  Array dimensions();
  Array recordVariance();
  Array dimensionVariances();
  Array indices();
  Array counts();
  Array intervals();
  Array recordCount();
  Array value();
  Array record();
  Array slab();
  Array entryValue();
  Array compressionType();
  Array compressionParameter();
  Array timeComponents();
  Array time16Components();
  Array times();
  Array times16();
  Array timeTt2000Components();
  Array timesTt2000();

  std::size_t valueElements() const;
  Array variableData(std::size_t values);
  Array text(const std::string& text) const { return Array::fromNarrow(text); }

  Choices& choices_;
  World& world_;
  OpenFile* file_ = nullptr;
  Variable variable_;   // that the call is about
  long datatype_ = 22;  // that the call has named
  long compression_ = 0;
  std::size_t dimensions_ = 0;
  std::vector<std::size_t> start_;
  std::size_t slabValues_ = 1;
  std::size_t slabRecords_ = 1;
};

}  // namespace ambrix_fuzz
