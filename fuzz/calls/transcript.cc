#include "fuzz/calls/transcript.h"

#include <cstdint>
#include <cstdio>
#include <fstream>
#include <span>
#include <string_view>

namespace ambrix_fuzz {
namespace {

std::ofstream& transcript() {
  static std::ofstream file;
  return file;
}

/// A number that differs for bytes that differ (FNV-1a).
std::uint64_t digest(std::span<const std::byte> bytes) {
  std::uint64_t number = 0xcbf29ce484222325;
  for (const std::byte byte : bytes)
    number = (number ^ static_cast<std::uint64_t>(byte)) * 0x100000001b3;
  return number;
}

void write(ambrix::ArrayView array) {
  std::ofstream& file = transcript();
  if (!array) {
    file << " unset";
    return;
  }
  file << ' ' << array.className();
  for (const std::size_t size : array.size())
    file << ' ' << size;
  if (array.classId() == ambrix::ClassId::kCell) {
    for (std::size_t i = 0; i < array.elementCount(); ++i)
      write(array.element(i));
  } else if (array.classId() != ambrix::ClassId::kUint64) {  // which only identifiers are
    file << " #" << digest(array.bytes());
  }
}

void finish(const std::vector<ambrix::MessageId>& warnings) {
  for (const ambrix::MessageId& warning : warnings)
    transcript() << " warning " << ambrix::Error(warning).what();
  transcript() << std::endl;  // a child that crashes leaves all that it has done
}

}  // namespace

void openTranscript(const std::string& path) {
  transcript().open(path, std::ios::binary);
}

bool isTranscribed() {
  return transcript().is_open();
}

void transcribe(const std::string& command, const std::vector<ambrix::Array>& results,
                const std::vector<ambrix::MessageId>& warnings) {
  if (!isTranscribed()) return;
  transcript() << command << " ->";
  for (const ambrix::Array& result : results)
    write(result);
  finish(warnings);
}

void transcribe(const std::string& command, const std::string& error,
                const std::vector<ambrix::MessageId>& warnings) {
  if (!isTranscribed()) return;
  transcript() << command << " !> " << error;
  finish(warnings);
}

}  // namespace ambrix_fuzz
