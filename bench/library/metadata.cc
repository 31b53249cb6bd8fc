// Many variables with many attributes.
#include <array>
#include <cstddef>
#include <filesystem>
#include <string>
#include <vector>

#include "bench/library/plain_calls.h"

namespace ambrix_bench {
namespace {

constexpr int kZEntry = 3;
constexpr int kFileFacts = 7;

long countOf(CDFid file, long& attributes) {
  long rDimensions = 0, rSizes[CDF_MAX_DIMS] = {}, facts[kFileFacts] = {};
  check(CDFlib(SELECT_, CDF_, file, GET_,                              //
               rVARs_NUMDIMS_, &rDimensions, rVARs_DIMSIZES_, rSizes,  //
               CDF_ENCODING_, &facts[0],                               //
               CDF_MAJORITY_, &facts[1],                               //
               rVARs_MAXREC_, &facts[2],                               //
               CDF_NUMrVARS_, &facts[3],                               //
               zVARs_MAXREC_, &facts[4],                               //
               CDF_NUMzVARS_, &facts[5],                               //
               CDF_NUMATTRS_, &attributes, NULL_));
  return facts[5];
}

void readEntry(CDFid file, long attribute, long variable, std::vector<char>& value) {
  long datatype = 0, elements = 0;
  check(CDFinquireAttrEntry(file, kZEntry, attribute, variable, &datatype, &elements));
  value.assign(static_cast<std::size_t>(elements) * (datatype == CDF_REAL8 ? 8 : 1) + 1, 0);
  check(CDFgetAttrEntry(file, kZEntry, attribute, variable, value.data()));
}

}  // namespace

double walkMetadata(const Setup& setup) {
  const Stopwatch watch;
  CDFid file = openFile(setup.file("metadata.cdf"));
  long attributes = 0;
  const long variables = countOf(file, attributes);
  for (long attribute = 0; attribute < attributes; ++attribute) {
    char name[CDF_ATTR_NAME_LEN256 + 1];
    long scope = 0, maxGEntry = 0, maxREntry = 0, maxZEntry = 0;
    check(CDFinquireAttr(file, attribute, name, &scope, &maxGEntry, &maxREntry, &maxZEntry));
  }
  std::vector<char> value;
  for (long variable = 0; variable < variables; ++variable) {
    Description description;
    inquire(file, variable, description);
    majorityOf(file);
    for (long attribute = 0; attribute < attributes; ++attribute)
      readEntry(file, attribute, variable, value);
  }
  closeFile(file);
  return watch.seconds();
}

double writeMetadata(const Setup& setup) {
  const std::string name = setup.file("library_written");
  std::filesystem::remove(name + ".cdf");
  const Stopwatch watch;
  CDFid file = createFile(name);
  for (std::size_t attribute = 0; attribute < kAttributes; ++attribute) {
    long number = 0;
    check(CDFlib(SELECT_, CDF_, file, CREATE_, ATTR_,
                 ("attribute" + std::to_string(attribute)).c_str(), VARIABLE_SCOPE, &number,
                 NULL_));
  }
  char text[] = "a text of some length, such as units";
  double limit = 1.5;
  for (std::size_t variable = 0; variable < setup.variables(); ++variable) {
    const std::string variableName = "variable" + std::to_string(variable);
    majorityOf(file);
    const long number = createVariable(file, {variableName.c_str(), CDF_REAL8});
    for (long attribute = 0; attribute < static_cast<long>(kAttributes); ++attribute) {
      const bool isText = attribute % 2 == 0;
      long scope = 0;
      check(CDFlib(SELECT_, CDF_, file, ATTR_, attribute, GET_, ATTR_SCOPE_, &scope, NULL_));
      check(CDFputAttrEntry(file, kZEntry, attribute, number, isText ? CDF_CHAR : CDF_REAL8,
                            isText ? static_cast<long>(sizeof(text) - 1) : 1L,
                            isText ? static_cast<void*>(text) : &limit));
    }
  }
  closeFile(file);
  return watch.seconds();
}

}  // namespace ambrix_bench
