// Values as a JSON object, whose data are lists of lists with the first index innermost.
#include <fmt/format.h>

#include "tool/dump/dump.h"
#include "tool/json/value.h"
#include "tool/output/text.h"

namespace ambrix::tool {
namespace {

std::string asJsonText(std::string_view bytes) {
  std::string json;
  appendMessage(json, bytes);
  return json;
}

class JsonFormat : public DumpFormat {
 public:
  JsonFormat(const Variable& variable, const RecordRange& range)
      : variable_(variable), range_(range) {}

  std::string begin() override {
    return fmt::format(
        "{{\n  \"variable\": {},\n  \"datatype\": \"{}\",\n  \"dimensions\": [{}],\n"
        "  \"firstRecord\": {},\n  \"records\": {},\n  \"data\": [",
        asJsonText(variable_.name), datatypeName(variable_.datatype),
        fmt::join(variable_.sizes, ", "), range_.first, range_.end - range_.first);
  }

  /// Opens a list for each dimension that begins with the value, and closes those that end.
  void append(std::string& json, std::size_t record, const std::vector<std::size_t>& indices,
              const ValueView& value) override {
    const std::size_t opening = leading(indices, [](std::size_t, std::size_t i) { return i == 0; });
    const std::size_t closing =
        leading(indices, [](std::size_t size, std::size_t i) { return i + 1 == size; });
    if (record != range_.first || opening != indices.size()) json += ',';
    if (opening == indices.size()) json += "\n    ";
    json.append(opening, '[');
    if (value.isText) {
      appendMessage(json, value.text);
    } else {
      json += value.text;
    }
    json.append(closing, ']');
  }

  std::string end() override { return "\n  ]\n}\n"; }

 private:
  /// How many dimensions, from the first on, are at such an index.
  template <typename Condition>
  std::size_t leading(const std::vector<std::size_t>& indices, Condition condition) const {
    std::size_t count = 0;
    while (count < indices.size() && condition(variable_.sizes[count], indices[count]))
      ++count;
    return count;
  }

  const Variable& variable_;
  RecordRange range_;
};

}  // namespace

std::unique_ptr<DumpFormat> makeJsonFormat(const Variable& variable, const RecordRange& range) {
  return std::make_unique<JsonFormat>(variable, range);
}

}  // namespace ambrix::tool
