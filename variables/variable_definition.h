// The commands that define variables and ask about their definition. Sizes and variances of
// dimensions are in the host's order: reversed for a row-major file.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "createVar" (identifier, name, datatype, elements, sizes, record variance, dimension variances):
/// the new variable's number. Raises `badVarianceDatatype`, `unrecognizedValue` ("VARIANCE"),
/// `mismatchedVarianceSize`, `libraryFailure` ("CDFgetMajority", "CDFcreatezVar").
void createVar(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
               const CommandEntry*);

/// "inquireVar" (identifier, variable), 6 outputs: name, lower-case datatype name, elements, sizes
/// (1-by-n double), record variance (logical), dimension variances (1-by-n logical); 0-by-0 arrays
/// for a scalar variable. Raises `unrecognizedValue` ("DATATYPE", "VARIANCE"), `libraryFailure`
/// ("CDFinquirezVar", "CDFgetMajority").
void inquireVar(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*);

/// "closeVar" (identifier, variable): closes the variable's file of a multi-file CDF. Raises
/// `libraryFailure` ("CDFclosezVar").
void closeVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "deleteVar" (identifier, variable). Raises `libraryFailure` ("CDFdeletezVar").
void deleteVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "renameVar" (identifier, variable, name). Raises `libraryFailure` ("CDFrenamezVar").
void renameVar(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "getVarName" (identifier, variable): its name. Raises `libraryFailure` ("CDFgetzVarName").
void getVarName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*);

/// "getVarNum" (identifier, name): its number. Raises `libraryFailure` ("CDFclosezVar").
void getVarNum(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
               const CommandEntry*);

}  // namespace TOLVEX::ambrix
