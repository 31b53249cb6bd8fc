#include "fuzz/files/seed_files.h"

#include <algorithm>
#include <fstream>
#include <functional>
#include <sstream>

#include "fuzz/files/file_maker.h"

namespace ambrix::fuzz {
namespace {

namespace fs = std::filesystem;

constexpr const char* kCompressions[] = {"RLE_COMPRESSION", "HUFF_COMPRESSION", "AHUFF_COMPRESSION",
                                         "GZIP_COMPRESSION"};

struct Make {
  std::string name;
  std::function<void(FileMaker&)> fill;
};

/// What the compression takes beside its type.
double parameterOf(const char* type) {
  return std::string_view(type) == "GZIP_COMPRESSION" ? 6 : 0;
}

void addUsualContent(FileMaker& file) {
  file.addVariable({"Epoch", "CDF_EPOCH"}, 20);
  file.addVariable({"counts", "CDF_INT2", 1, {3, 4}}, 12);
  file.addVariable({"flux", "CDF_REAL4", 1, {5}}, 15);
  file.addVariable({"labels", "CDF_CHAR", 9, {3}}, 2);
  file.addAttribute("Project", "GLOBAL_SCOPE", 3);
  file.addAttribute("UNITS", "VARIABLE_SCOPE", 4);
}

void addEveryDatatype(FileMaker& file) {
  for (const char* datatype : {"CDF_INT1", "CDF_UINT1", "CDF_INT2", "CDF_UINT2", "CDF_INT4",
                               "CDF_UINT4", "CDF_REAL4", "CDF_REAL8", "CDF_EPOCH", "CDF_EPOCH16"})
    file.addVariable({datatype, datatype, 1, {2}}, 3);
  file.addVariable({"CDF_CHAR", "CDF_CHAR", 5, {2}}, 3);
  file.addVariable({"CDF_UCHAR", "CDF_UCHAR", 1, {4}}, 3);
}

void addManyAttributes(FileMaker& file) {
  file.addVariable({"v", "CDF_INT4"}, 2);
  for (int i = 0; i < 12; ++i) {
    const bool global = i % 2 == 0;
    file.addAttribute("attribute " + std::to_string(i), global ? "GLOBAL_SCOPE" : "VARIABLE_SCOPE",
                      5);
  }
}

void addSparseRecords(FileMaker& file) {
  for (const char* mode : {"PAD_SPARSERECORDS", "PREV_SPARSERECORDS"}) {
    const NewVariable variable{mode, "CDF_INT4", 1, {3}};
    const double number = file.createVariable(variable);
    file.set("setVarSparseRecords", {number, file.constant(mode)});
    for (const double first : {2.0, 9.0, 30.0})
      file.fill(number, variable, first, 3);
  }
}

void compressVariables(FileMaker& file, const char* type) {
  for (const NewVariable& variable :
       {NewVariable{"numbers", "CDF_INT4", 1, {6, 5}}, NewVariable{"texts", "CDF_CHAR", 20}}) {
    const double number = file.createVariable(variable);
    file.set("setVarCompression", {number, file.constant(type), parameterOf(type)});
    file.fill(number, variable, 0, 25);
  }
  file.addAttribute("UNITS", "VARIABLE_SCOPE", 2);
}

void compressFile(FileMaker& file, const char* type) {
  file.set("setCompression", {file.constant(type), parameterOf(type)});
  addUsualContent(file);
}

std::vector<Make> allMakes() {
  const auto setting = [](const char* command, const char* name) {
    return [=](FileMaker& file) {
      file.set(command, {file.constant(name)});
      addUsualContent(file);
    };
  };
  std::vector<Make> makes = {{"row-major", setting("setMajority", "ROW_MAJOR")},
                             {"column-major", setting("setMajority", "COLUMN_MAJOR")},
                             {"checksum", setting("setChecksum", "MD5_CHECKSUM")},
                             {"multi-file", setting("setFormat", "MULTI_FILE")},
                             {"datatypes", addEveryDatatype},
                             {"attributes", addManyAttributes},
                             {"sparse", addSparseRecords}};
  for (const char* type : kCompressions) {
    const std::string name(type, std::string_view(type).find('_'));
    makes.push_back({name + "-file", [=](FileMaker& file) { compressFile(file, type); }});
    makes.push_back({name + "-variables", [=](FileMaker& file) { compressVariables(file, type); }});
  }
  return makes;
}

std::string contentOf(const fs::path& path) {
  std::ifstream file(path, std::ios::binary);
  std::ostringstream content;
  content << file.rdbuf();
  return content.str();
}

/// The files in the folder, which are taken away from there.
SeedFile takeFiles(const std::string& make, const fs::path& folder) {
  SeedFile seed{make, {}};
  for (const auto& entry : fs::directory_iterator(folder)) {
    seed.parts.push_back({entry.path().extension().string(), contentOf(entry.path())});
    fs::remove(entry.path());
  }
  std::ranges::sort(seed.parts, {}, &SeedFile::Part::extension);
  return seed;
}

SeedFile makeSeedFile(Module& module, const Make& make, const fs::path& folder) {
  FileMaker file(module, (folder / "seed").string());
  make.fill(file);
  file.close();
  return takeFiles(make.name, folder);
}

void setBackward(Module& module, const char* name) {
  const auto mode = module.call("getConstantValue", {Array::fromNarrow(name)});
  module.call("setFileBackward", mode);
}

}  // namespace

std::vector<SeedFile> makeSeedFiles(Module& module, const fs::path& folder) {
  std::vector<SeedFile> seeds;
  for (const Make& make : allMakes())
    seeds.push_back(makeSeedFile(module, make, folder));
  setBackward(module, "BACKWARDFILEON");
  seeds.push_back(makeSeedFile(module, {"format-2.7", addUsualContent}, folder));
  setBackward(module, "BACKWARDFILEOFF");
  return seeds;
}

}  // namespace ambrix::fuzz
