#include "tool/format/hidden_texts.h"

#include <filesystem>
#include <fstream>
#include <system_error>

#include "tool/format/file_header.h"
#include "tool/format/record_fields.h"

namespace ambrix::tool {
namespace {

constexpr std::uint32_t kChar = 51;
constexpr std::uint32_t kUchar = 52;
constexpr std::size_t kNumberBytes = 64;  // all numbers of a record are in its first bytes

/// Goes from record to record, as each names the next one.
class EntryWalk {
 public:
  EntryWalk(const std::string& path, const FileHeader& header)
      : file_(path, std::ios::binary), header_(header) {
    std::error_code error;
    const std::uintmax_t bytes = std::filesystem::file_size(path, error);
    bytes_ = error ? 0 : bytes;
    left_ = bytes_ / kSmallestRecord;
  }

  std::set<EntryNumbers> run() {
    for (std::uint64_t offset = header_.firstAttribute; offset != 0 && goesOn();)
      offset = readAttribute(offset);
    return found_;
  }

 private:
  static constexpr std::size_t kSmallestRecord = 40;

  /// No more records than there can be, lest a damaged file lead in a circle.
  bool goesOn() { return left_ > 0 && left_-- > 0; }

  /// The numbers behind the record's size and type.
  RecordFields fieldsAt(std::uint64_t offset) {
    RecordFields fields(readBytes(file_, offset, kNumberBytes));
    fields.skip(header_.offsetBytes + 4);
    return fields;
  }

  std::uint64_t readAttribute(std::uint64_t offset) {
    RecordFields fields = fieldsAt(offset);
    const std::uint64_t next = fields.next(header_.offsetBytes);
    const std::uint64_t firstEntry = fields.next(header_.offsetBytes);
    fields.skip(4);  // the scope
    const std::uint32_t attribute = fields.word();
    fields.skip(12);  // numbers of entries
    readEntries(firstEntry, {attribute, 0});
    readEntries(fields.next(header_.offsetBytes), {attribute, header_.rVariables});
    return next;
  }

  /// All entries of one kind, whose numbers begin at the given one.
  void readEntries(std::uint64_t offset, EntryNumbers first) {
    while (offset != 0 && goesOn()) {
      RecordFields fields = fieldsAt(offset);
      const std::uint64_t value = offset + 2 * header_.offsetBytes + 40;
      offset = fields.next(header_.offsetBytes);
      fields.skip(4);  // the attribute's number
      const std::uint32_t datatype = fields.word();
      const std::uint32_t number = fields.word();
      const bool isText = datatype == kChar || datatype == kUchar;
      const std::uint32_t elements = fields.word();
      if (!isText || elements > bytes_ || !hides(readBytes(file_, value, elements))) continue;
      found_.insert({first.attribute, first.entry + number});
    }
  }

  static bool hides(const std::string& text) {
    const std::size_t end = text.find('\0');
    return end != text.npos && text.find_first_not_of('\0', end) != text.npos;
  }

  std::ifstream file_;
  const FileHeader& header_;
  std::uintmax_t bytes_ = 0;
  std::uintmax_t left_ = 0;  // how many records may follow
  std::set<EntryNumbers> found_;
};

}  // namespace

std::optional<std::set<EntryNumbers>> findHiddenTexts(const std::string& path) {
  const auto header = readFileHeader(path);
  if (!header || header->kind != FileHeader::Kind::kCdf) return std::nullopt;
  return EntryWalk(path, *header).run();
}

}  // namespace ambrix::tool
