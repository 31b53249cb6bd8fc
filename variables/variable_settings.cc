#include "variables/variable_settings.h"

#include "constants/value_names.h"
#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

/// Only the files of variables in a multi-file CDF have caches of their own.
void requireMultiFile(CdfId file) {
  long format = 0;
  callOnFile("CDFgetFormat", file, GET_, CDF_FORMAT_, &format);
  if (format == SINGLE_FILE) raiseError(cdflib::varCacheSizeOpInappropriate());
}

}  // namespace

void getVarSparseRecords(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                         const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  long mode = 0;
  VariableOperation(file, variableNumber, "CDFgetzVarSparseRecords")
      .call(GET_, zVAR_SPARSERECORDS_, &mode);
  outputs[0] =
      qvCreateString(lookupValueName(SparseRecordsNames, mode, "SPARSE RECORDS TYPE").c_str());
}

void getVarCacheSize(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  requireMultiFile(file);
  long buffers = 0;
  VariableOperation(file, variableNumber, "CDFgetzVarCacheSize")
      .call(CONFIRM_, zVAR_CACHESIZE_, &buffers);
  outputs[0] = makeDoubleScalar(buffers);
}

void setVarCacheSize(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long buffers = libraryNumber(getLongScalarArg(arguments[2], "NUMBUFFERS"), kBadNumber);
  requireMultiFile(file);
  VariableOperation(file, variableNumber, "CDFsetzVarCacheSize").call(zVAR_CACHESIZE_, buffers);
}

void setVarAllocBlockRecords(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                             const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long first = libraryNumber(getLongScalarArg(arguments[2], "RECSTART"), kBadNumber);
  const long last = libraryNumber(getLongScalarArg(arguments[3], "RECSTOP"), kBadNumber);
  const VariableOperation variable(file, variableNumber, "CDFsetzVarAllocBlockRecords");
  requireDivisibleRecord(variable);
  variable.call(PUT_, zVAR_ALLOCATEBLOCK_, first, last);
}

}  // namespace TOLVEX::ambrix
