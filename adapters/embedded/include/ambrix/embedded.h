// A host inside a C++ program: everything there is to include.
//
//   ambrix::Module module;
//   const std::vector<ambrix::Array> file = module.call("open",
//   {ambrix::Array::fromUtf8("a.cdf")}); const std::vector<ambrix::Array> facts =
//   module.call("inquire", {file[0]}); module.call("close", {file[0]});
#pragma once

#include "ambrix/array.h"
#include "ambrix/array_view.h"
#include "ambrix/error.h"
#include "ambrix/memory.h"
#include "ambrix/module.h"
