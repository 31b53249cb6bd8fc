// UTF-8 and UTF-16, where hosts meet narrow text.
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace ambrix::catalogue {

/// UTF-8 of the units; each unpaired surrogate becomes U+FFFD.
std::string toUtf8(std::u16string_view units);

/// UTF-8 of the units, or nothing when a surrogate is unpaired.
std::optional<std::string> toValidUtf8(std::u16string_view units);

/// UTF-16 of the bytes, or nothing when they are not valid UTF-8.
std::optional<std::u16string> toUtf16(std::string_view utf8);

}  // namespace ambrix::catalogue
