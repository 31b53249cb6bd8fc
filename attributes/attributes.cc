#include "attributes/attributes.h"

#include <string>

#include "attributes/attribute_arguments.h"
#include "constants/checked_values.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"

namespace TOLVEX::ambrix {

void createAttr(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const std::string name = getStringArg(arguments[1]);
  const long scope = libraryNumber(getLongScalarArg(arguments[2], "SCOPE"), kBadNumber);
  long attributeNumber = 0;
  callOnFile("CDFcreateAttr", file, CREATE_, ATTR_, name.c_str(), scope, &attributeNumber);
  outputs[0] = makeDoubleScalar(attributeNumber);
}

void deleteAttr(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attributeNumber = getAttributeArg(arguments[1], "ATTRNUM");
  callOnFile("CDFdeleteAttr", file, ATTR_, attributeNumber, DELETE_, ATTR_);
}

// The label is "ATTNUM", not "ATTRNUM": it is a value of the argument's error, and changed it would
// change the messages.
void renameAttr(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attributeNumber = getAttributeArg(arguments[1], "ATTNUM");
  const std::string name = getStringArg(arguments[2]);
  callOnFile("CDFrenameAttr", file, ATTR_, attributeNumber, PUT_, ATTR_NAME_, name.c_str());
}

void getAttrName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attributeNumber = getAttributeArg(arguments[1], "ATTRNUM");
  char name[CDF_ATTR_NAME_LEN256 + 1] = {};
  callOnFile("CDFgetAttrName", file, ATTR_, attributeNumber, GET_, ATTR_NAME_, name);
  outputs[0] = qvCreateString(name);
}

void getAttrNum(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const char* routine = "CDFgetAttrNum";
  const CdfId file = getCdfIdArg(arguments[0]);
  std::string name = getStringArg(arguments[1]);
  const long attributeNumber = CDFgetAttrNum(libraryHandle(file, routine), name.data());
  checkLibraryStatus(attributeNumber, routine);
  outputs[0] = makeDoubleScalar(attributeNumber);
}

void getAttrScope(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attributeNumber = getAttributeArg(arguments[1], "ATTRNUM");
  long scope = 0;
  callOnFile("CDFgetAttrScope", file, ATTR_, attributeNumber, GET_, ATTR_SCOPE_, &scope);
  outputs[0] = scopeName(scope);
}

// A failure is reported as one of "CDFinquireCDF", though the routine is CDFinquireAttr. The name
// is a value of `libraryFailure`: changed, it would change the messages.
void inquireAttr(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*) {
  const char* routine = "CDFinquireCDF";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attributeNumber = getAttributeArg(arguments[1], "ATTRNUM");
  char name[CDF_ATTR_NAME_LEN256 + 1] = {};
  long scope = 0, maxGEntry = 0, maxREntry = 0, maxZEntry = 0;
  checkLibraryStatus(CDFinquireAttr(libraryHandle(file, routine), attributeNumber, name, &scope,
                                    &maxGEntry, &maxREntry, &maxZEntry),
                     routine);
  qvArray* scopeText = scopeName(scope);
  setOutputs(outputs, {qvCreateString(name), scopeText, makeDoubleScalar(maxGEntry),
                       makeDoubleScalar(maxZEntry)});
}

}  // namespace TOLVEX::ambrix
