// Much data in one call, to be written.
#include <filesystem>
#include <numeric>

#include "bench/module/module_calls.h"

namespace ambrix_bench {
namespace {

constexpr double kVary = -1;

struct Target {
  const char* majority = "ROW_MAJOR";
  const char* checksum = nullptr;
  bool compressed = false;
};

struct NewVariable {
  const char* name;
  const char* datatype;
  double elements;
  std::vector<double> sizes;
};

Array createVariable(const Array& file, const NewVariable& variable) {
  const std::vector<double> vary(variable.sizes.size(), kVary);
  return call("createVar",
              {file, Array::fromNarrow(variable.name), constant(variable.datatype),
               number(variable.elements), row(variable.sizes), number(kVary), row(vary)});
}

Array createFile(const std::string& name) {
  std::filesystem::remove(name + ".cdf");
  return call("create", {Array::fromUtf8(name)});
}

void writeSlab(const Array& file, const Array& variable, const Slab& slab, const Array& data) {
  const std::vector<double> start(slab.counts.size(), 0);
  call("hyperPutVarData", {file, variable, number(0), number(static_cast<double>(slab.records)),
                           number(1), row(start), row(slab.counts), row(slab.intervals), data});
}

double writeNumbers(const Setup& setup, const Target& target) {
  std::vector<double> values(setup.records() * kRecordValues);
  std::iota(values.begin(), values.end(), 0.0);
  const Array data = row(values);
  const Slab slab = wholeSlab(setup.records(), kRecordSizes);
  const std::string name = setup.file("module_written");
  std::filesystem::remove(name + ".cdf");
  const Stopwatch watch;
  const Array file = createFile(name);
  call("setMajority", {file, constant(target.majority)});
  if (target.checksum != nullptr) call("setChecksum", {file, constant(target.checksum)});
  const bool rowMajor = target.majority == std::string_view("ROW_MAJOR");
  const std::vector<double> sizes =
      rowMajor ? slab.counts : std::vector<double>(slab.counts.rbegin(), slab.counts.rend());
  const Array variable = createVariable(file, {"values", "CDF_REAL8", 1, sizes});
  if (target.compressed) {
    call("setVarCompression", {file, variable, constant("GZIP_COMPRESSION"), number(6)});
  }
  writeSlab(file, variable, {slab.records, sizes, slab.intervals}, data);
  closeFile(file);
  return watch.seconds();
}

}  // namespace

double writeRow(const Setup& setup) {
  return writeNumbers(setup, {});
}
double writeColumn(const Setup& setup) {
  return writeNumbers(setup, {.majority = "COLUMN_MAJOR"});
}
double writeGzip(const Setup& setup) {
  return writeNumbers(setup, {.compressed = true});
}
double writeWithChecksum(const Setup& setup) {
  return writeNumbers(setup, {.checksum = "MD5_CHECKSUM"});
}

double writeText(const Setup& setup) {
  const Array data = Array::text(std::u16string(setup.texts() * kTextLength, u'a'));
  const Slab slab = wholeSlab(setup.texts(), {});
  const std::string name = setup.file("module_written");
  std::filesystem::remove(name + ".cdf");
  const Stopwatch watch;
  const Array file = createFile(name);
  const Array variable = createVariable(file, {"text", "CDF_CHAR", kTextLength, {}});
  writeSlab(file, variable, slab, data);
  closeFile(file);
  return watch.seconds();
}

double writeMetadata(const Setup& setup) {
  const Array text = Array::fromNarrow("a text of some length, such as units");
  const Array limit = number(1.5);
  const Array texts = constant("CDF_CHAR"), doubles = constant("CDF_REAL8");
  const std::string name = setup.file("module_written");
  std::filesystem::remove(name + ".cdf");
  const Stopwatch watch;
  const Array file = createFile(name);
  for (std::size_t attribute = 0; attribute < kAttributes; ++attribute) {
    call("createAttr", {file, Array::fromNarrow("attribute" + std::to_string(attribute)),
                        constant("VARIABLE_SCOPE")});
  }
  for (std::size_t i = 0; i < setup.variables(); ++i) {
    const std::string variableName = "variable" + std::to_string(i);
    const Array variable = createVariable(file, {variableName.c_str(), "CDF_REAL8", 1, {}});
    for (std::size_t attribute = 0; attribute < kAttributes; ++attribute) {
      const bool isText = attribute % 2 == 0;
      call("putAttrEntry", {file, number(static_cast<double>(attribute)), variable,
                            isText ? texts : doubles, isText ? text : limit});
    }
  }
  closeFile(file);
  return watch.seconds();
}

}  // namespace ambrix_bench
