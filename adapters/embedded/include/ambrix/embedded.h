// A host inside a C++ program: all headers except those for files (ambrix/file.h).
//
// clang-format off
//   ambrix::Module module;
//   const auto file = module.call("open", {ambrix::Array::fromUtf8("a.cdf")});
//   const auto facts = module.call("inquire", {file[0]});
//   module.call("close", {file[0]});
// clang-format on
#pragma once

#include "ambrix/array.h"
#include "ambrix/array_view.h"
#include "ambrix/error.h"
#include "ambrix/memory.h"
#include "ambrix/module.h"
#include "ambrix/visit.h"
