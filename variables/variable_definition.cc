#include "variables/variable_definition.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <vector>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"
#include "gateway/raise_error.h"
#include "variables/datatypes.h"
#include "variables/host_dimensions.h"
#include "variables/variable_description.h"
#include "variables/variance.h"

namespace TOLVEX::ambrix {
namespace {

qvArray* makeSizes(const std::vector<long>& sizes) {
  if (sizes.empty()) return qvCreateNumericMatrix(0, 0, qvDOUBLE_CLASS, qvREAL);
  qvArray* array = qvCreateNumericMatrix(1, sizes.size(), qvDOUBLE_CLASS, qvREAL);
  std::ranges::copy(sizes, static_cast<double*>(qvGetData(array)));
  return array;
}

qvArray* makeLogicals(const std::vector<bool>& logicals) {
  const std::size_t sizes[] = {logicals.empty() ? 0UL : 1UL, logicals.size()};
  qvArray* array = qvCreateLogicalArray(2, sizes);
  std::ranges::copy(logicals, static_cast<bool*>(qvGetData(array)));
  return array;
}

struct NewVariable {
  std::string name;
  long datatype = 0;
  long elements = 0;
  std::vector<long> sizes;
  long recordVariance = 0;
  std::vector<long> variances;
};

NewVariable getNewVariableArgs(const qvArray* arguments[]) {
  NewVariable wanted;
  wanted.name = getStringArg(arguments[0]);
  wanted.datatype = getLongScalarArg(arguments[1], "DATATYPE");
  wanted.elements = getLongScalarArg(arguments[2], "NUMELEMENTS");
  wanted.sizes = getLongVectorArg(arguments[3], "DIMS");
  const std::vector<long> recordVariance = getVarianceArg(arguments[4]);
  wanted.variances = getVarianceArg(arguments[5]);
  if (wanted.variances.size() != wanted.sizes.size()) {
    raiseError(
        cdflib::mismatchedVarianceSize(std::ssize(wanted.variances), std::ssize(wanted.sizes)));
  }
  if (recordVariance.empty()) raiseError(cdflib::mismatchedVarianceSize(0, 1));
  wanted.recordVariance = recordVariance.front();  // further ones do not count
  return wanted;
}

}  // namespace

void createVar(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
               const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  NewVariable wanted = getNewVariableArgs(arguments + 1);
  if (isRowMajor(file)) {
    std::ranges::reverse(wanted.sizes);
    std::ranges::reverse(wanted.variances);
  }
  DimensionVector sizes = libraryVector(wanted.sizes, kBadNumber);
  DimensionVector variances = libraryVector(wanted.variances, kBadNumber);
  long number = 0;
  callOnFile("CDFcreatezVar", file, CREATE_, zVAR_, wanted.name.c_str(),
             libraryNumber(wanted.datatype, kBadNumber), libraryNumber(wanted.elements, kBadNumber),
             static_cast<long>(wanted.sizes.size()), sizes.data(), wanted.recordVariance,
             variances.data(), &number);
  outputs[0] = makeDoubleScalar(number);
}

void inquireVar(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const VariableDescription description =
      inquireVariable(file, getLongScalarArg(arguments[1], "VARNUM"));
  std::vector<long> sizes(description.sizes().begin(), description.sizes().end());
  std::vector<long> variances(description.variances().begin(), description.variances().end());
  if (isRowMajor(file)) {
    std::ranges::reverse(sizes);
    std::ranges::reverse(variances);
  }
  qvArray* datatype = datatypeNameArray(description.datatype);
  const bool recordVaries = varies(description.recordVariance);
  std::vector<bool> dimensionVaries(variances.size());
  std::transform(variances.begin(), variances.end(), dimensionVaries.begin(), varies);
  setOutputs(outputs,
             {qvCreateString(description.name), datatype, makeDoubleScalar(description.elements),
              makeSizes(sizes), makeLogicals({recordVaries}), makeLogicals(dimensionVaries)});
}

// Labels the variable's number "CDFID": users know it under that label.
void closeVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "CDFID");
  VariableOperation(file, number, "CDFclosezVar").call(CLOSE_, zVAR_);
}

void deleteVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  VariableOperation(file, number, "CDFdeletezVar").call(DELETE_, zVAR_);
}

void renameVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const std::string name = getStringArg(arguments[2]);
  VariableOperation(file, number, "CDFrenamezVar").call(PUT_, zVAR_NAME_, name.c_str());
}

void getVarName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  char name[CDF_VAR_NAME_LEN256 + 1] = {};
  VariableOperation(file, number, "CDFgetzVarName").call(GET_, zVAR_NAME_, name);
  outputs[0] = qvCreateString(name);
}

// Reports a failure as "CDFclosezVar": users know it under that name.
void getVarNum(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
               const CommandEntry*) {
  const char* routine = "CDFclosezVar";
  const CdfId file = getCdfIdArg(arguments[0]);
  std::string name = getStringArg(arguments[1]);
  const long number = CDFgetVarNum(libraryHandle(file, routine), name.data());
  checkLibraryStatus(number, routine);
  outputs[0] = makeDoubleScalar(number);
}

}  // namespace TOLVEX::ambrix
