#include "variables/variable_definition.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <vector>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library_calls.h"
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
  wanted.recordVariance = recordVariance.front();  // the library takes one; others are ignored
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
  long variableNumber = 0;
  callOnFile("CDFcreatezVar", file, CREATE_, zVAR_, wanted.name.c_str(),
             libraryNumber(wanted.datatype, kBadNumber), libraryNumber(wanted.elements, kBadNumber),
             static_cast<long>(wanted.sizes.size()), sizes.data(), wanted.recordVariance,
             variances.data(), &variableNumber);
  outputs[0] = makeDoubleScalar(variableNumber);
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

// The label of the variable's number is "CDFID": it is a value of the argument's error, and changed
// it would change the messages.
void closeVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "CDFID");
  VariableOperation(file, variableNumber, "CDFclosezVar").call(CLOSE_, zVAR_);
}

void deleteVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  VariableOperation(file, variableNumber, "CDFdeletezVar").call(DELETE_, zVAR_);
}

void renameVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const std::string name = getStringArg(arguments[2]);
  VariableOperation(file, variableNumber, "CDFrenamezVar").call(PUT_, zVAR_NAME_, name.c_str());
}

void getVarName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  char name[CDF_VAR_NAME_LEN256 + 1] = {};
  VariableOperation(file, variableNumber, "CDFgetzVarName").call(GET_, zVAR_NAME_, name);
  outputs[0] = qvCreateString(name);
}

// A failure is reported as one of "CDFclosezVar", though the routine is CDFgetVarNum. The name is a
// value of `libraryFailure`: changed, it would change the messages.
void getVarNum(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
               const CommandEntry*) {
  const char* routine = "CDFclosezVar";
  const CdfId file = getCdfIdArg(arguments[0]);
  std::string name = getStringArg(arguments[1]);
  const long variableNumber = CDFgetVarNum(libraryHandle(file, routine), name.data());
  checkLibraryStatus(variableNumber, routine);
  outputs[0] = makeDoubleScalar(variableNumber);
}

}  // namespace TOLVEX::ambrix
