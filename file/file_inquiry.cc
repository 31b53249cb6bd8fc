#include "file/file_inquiry.h"

#include <cdf.h>

#include <algorithm>
#include <boost/assign/list_of.hpp>
#include <string>

#include "constants/value_names.h"
#include "gateway/library_calls.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"

namespace TOLVEX::ambrix {
namespace {

// The library may be newer than its header here.
constexpr int kNameLength = std::max(CDF_PATHNAME_LEN, 512);
constexpr int kCopyrightLength = std::max(CDF_COPYRIGHT_LEN, 256);

// The spellings are the module's own; 10 and the numbers above 16 have no name here.
const ValueNameTable& encodingNames() {
  static const ValueNameTable EncodingNames =
      boost::assign::map_list_of<std::int64_t, std::string>  //
      (1, "NETWORK_ENCODING")                                //
      (2, "SUN_ENCODING")                                    //
      (3, "VAX_ENCODING")                                    //
      (4, "DECSTATION_ENCODING")                             //
      (5, "SGI_ENCODING")                                    //
      (6, "IBMPC_ENCODING")                                  //
      (7, "IBMRS_ENCODING")                                  //
      (8, "HOST_ENCODING")                                   //
      (9, "MAC_ENCODING")                                    //
      (11, "HP_ENCODING")                                    //
      (12, "NEXT_ENCODING")                                  //
      (13, "ALPHAOSF1_ENCODING")                             //
      (14, "ALPHAMVSD_ENCODING")                             //
      (15, "ALPHAMVSG_ENCODING")                             //
      (16, "ALPHAMVSI_ENCODING");
  return EncodingNames;
}

}  // namespace

void inquireFile(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  long rDimensions = 0, rSizes[CDF_MAX_DIMS] = {}, rMaxRecord = 0, rVariables = 0;  // not returned
  long encoding = 0, majority = 0, maxRecord = 0, variables = 0, attributes = 0;
  callOnFile("CDFinquireCDF", file, GET_,                            //
             rVARs_NUMDIMS_, &rDimensions, rVARs_DIMSIZES_, rSizes,  //
             CDF_ENCODING_, &encoding,                               //
             CDF_MAJORITY_, &majority,                               //
             rVARs_MAXREC_, &rMaxRecord,                             //
             CDF_NUMrVARS_, &rVariables,                             //
             zVARs_MAXREC_, &maxRecord,                              //
             CDF_NUMzVARS_, &variables,                              //
             CDF_NUMATTRS_, &attributes);
  const std::string& encodingText = lookupValueName(encodingNames(), encoding, "ENCODING");
  const std::string& majorityText = lookupValueName(MajorityNames, majority, "MAJORITY");
  setOutputs(outputs, {qvCreateString(encodingText.c_str()), qvCreateString(majorityText.c_str()),
                       makeDoubleScalar(maxRecord), makeDoubleScalar(variables),
                       makeDoubleScalar(attributes)});
}

void getVersion(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  long version = 0, release = 0, increment = 0;
  callOnFile("CDFgetVersion", file, GET_,  //
             CDF_VERSION_, &version,       //
             CDF_RELEASE_, &release,       //
             CDF_INCREMENT_, &increment);
  setOutputs(outputs,
             {makeDoubleScalar(version), makeDoubleScalar(release), makeDoubleScalar(increment)});
}

void getLibraryVersion(int, qvArray* outputs[], std::int32_t, const qvArray*[],
                       const CommandEntry*) {
  long version = 0, release = 0, increment = 0;
  char subIncrement[2] = {};                 // one character, not returned
  callLibrary("CDFgetLibraryVersion", GET_,  //
              LIB_VERSION_, &version,        //
              LIB_RELEASE_, &release,        //
              LIB_INCREMENT_, &increment,    //
              LIB_subINCREMENT_, subIncrement);
  setOutputs(outputs,
             {makeDoubleScalar(version), makeDoubleScalar(release), makeDoubleScalar(increment)});
}

void getName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
             const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  char name[kNameLength + 1] = {};
  callOnFile("CDFgetName", file, CONFIRM_, CDF_NAME_, name);
  outputs[0] = qvCreateString(name);
}

void getCopyright(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  char text[kCopyrightLength + 1] = {};
  callOnFile("CDFgetCopyright", file, GET_, CDF_COPYRIGHT_, text);
  outputs[0] = qvCreateString(text);
}

void getLibraryCopyright(int, qvArray* outputs[], std::int32_t, const qvArray*[],
                         const CommandEntry*) {
  char text[kCopyrightLength + 1] = {};
  callLibrary("CDFgetLibraryCopyright", GET_, LIB_COPYRIGHT_, text);
  outputs[0] = qvCreateString(text);
}

}  // namespace TOLVEX::ambrix
