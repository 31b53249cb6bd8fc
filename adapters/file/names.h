// Names of a file's variables and attributes in errors.
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <vector>

namespace ambrix {

/// The first names, as many as an error may list; an empty one stands for all that follow.
std::vector<std::string> namesOf(std::size_t count,
                                 const std::function<std::string(std::size_t)>& nameOf);

/// "there is no variable "X"; the file has "A", "B" and others".
std::string missing(const char* kind, std::string_view name, const std::vector<std::string>& names);

}  // namespace ambrix
