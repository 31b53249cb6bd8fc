// Reading all that is in a file.
#include <algorithm>
#include <filesystem>
#include <functional>
#include <optional>
#include <system_error>

#include "tool/check/check.h"
#include "tool/content/failure.h"
#include "tool/content/open_file.h"
#include "tool/format/open_failure.h"
#include "tool/format/record_index.h"
#include "tool/output/text.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

/// No compression of the library makes values smaller by more than this; GZIP comes near it.
constexpr double kBestCompression = 1100;

/// How many times what is compressed may be larger.
double bestGain(const Compression& compression) {
  return compression.type == "NO_COMPRESSION" ? 1 : kBestCompression;
}

std::string quoted(const char* kind, const std::string& name) {
  return std::string(kind) + " \"" + printable(name) + '"';
}

/// Examines one file part by part: what is wrong with one part keeps no other from being read.
class Examination {
 public:
  Examination(Module& module, const std::string& path) : module_(module), path_(path) { open(); }

  void run() {
    attempt("", [&] { facts_ = file_->facts(); });
    std::size_t variables = 0;
    std::size_t attributes = 0;
    attempt("", [&] {
      variables = file_->variableCount();
      attributes = file_->attributeCount();
    });
    for (std::size_t number = 0; number < variables; ++number)
      readVariable(number);
    for (std::size_t number = 0; number < attributes; ++number)
      readAttribute(number);
    attempt("", [&] { file_->close(); });
  }

 private:
  void open();
  void recover();
  void attempt(const std::string& place, const std::function<void()>& read);
  void readVariable(std::size_t number);
  void readValues(const VariableDescription& facts);
  void readAttribute(std::size_t number);
  void requireRoomFor(const VariableDescription& facts) const;

  Module& module_;
  std::string path_;
  std::optional<File> file_;
  FileFacts facts_;
};

void Examination::attempt(const std::string& place, const std::function<void()>& read) try {
  read();
} catch (const Error& error) {
  reportError(place, error);
  recover();
} catch (const DamagedCounts& error) {
  reportProblem({place, error.identifier(), error.what()});
} catch (const ToolError& error) {
  reportUnread({place, error.identifier(), error.what()});
} catch (const FileError& error) {
  reportUnread({place, error.identifier(), error.reason()});
}

void Examination::open() {
  file_.emplace(openFile(module_, path_));
}

/// After some failures the library refuses everything until the file is opened anew.
void Examination::recover() try {
  if (file_ && file_->id()) file_->call("getFormat");
} catch (const Error&) {
  file_.reset();
  open();
}

void Examination::readVariable(std::size_t number) {
  std::string place = "variable " + std::to_string(number);
  attempt(place, [&] {
    place = quoted("variable", file_->text("getVarName", {static_cast<double>(number)}));
    const VariableDescription facts = file_->describeVariable(number);
    if (facts.definition.supported) return readValues(facts);
    reportUnsupported(place + " (" + datatypeName(facts.definition.datatype) + ")");
  });
}

void Examination::readValues(const VariableDescription& facts) {
  requireIndexed(*file_, facts.definition, static_cast<double>(facts.records));
  requireRoomFor(facts);
  const auto records = static_cast<std::size_t>(std::max<std::int64_t>(facts.records, 0));
  SlabPlan plan(facts.definition, 0, records);
  while (const auto slab = plan.next())
    file_->read(facts.definition, *slab);
}

/// A file whose counts are damaged may claim to hold more than there is in the world; reading all
/// of it would take just as long.
void Examination::requireRoomFor(const VariableDescription& facts) const {
  std::error_code error;
  const auto bytes = static_cast<double>(fs::file_size(fileOnDisk(path_), error));
  if (error || facts_.format != "SINGLE_FILE") return;
  double claimed =
      static_cast<double>(facts.written) * static_cast<double>(facts.definition.elements);
  for (std::size_t i = 0; i < facts.definition.sizes.size(); ++i)
    claimed *= facts.definition.varies.at(i) ? static_cast<double>(facts.definition.sizes[i]) : 1;
  // Compressed values may be compressed once more, with the file.
  if (claimed <= bytes * bestGain(facts.compression) * bestGain(facts_.compression)) return;
  throw DamagedCounts("the file is too small for the records that it lists");
}

void Examination::readAttribute(std::size_t number) {
  std::string place = "attribute " + std::to_string(number);
  attempt(place, [&] {
    place = quoted("attribute", file_->attribute(number).name);
    for (const auto& [entry, value] : file_->describeAttribute(number).entries) {
      if (entry.supported) continue;
      reportUnsupported("entry " + std::to_string(entry.number) + " of " + place + " (" +
                        datatypeName(entry.datatype) + ")");
    }
  });
}

}  // namespace

void examineFile(Module& module, const std::string& path) {
  module.call("setValidate", {Array::scalar(constantValue(module, "VALIDATEFILEON"))});
  Examination(module, path).run();
}

}  // namespace ambrix::tool
