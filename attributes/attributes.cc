#include "attributes/attributes.h"

#include <string>

#include "attributes/attribute_calls.h"
#include "constants/checked_values.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"

namespace TOLVEX::ambrix {

void createAttr(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const std::string name = getStringArg(arguments[1]);
  const long scope = libraryNumber(getLongScalarArg(arguments[2], "SCOPE"), kBadNumber);
  long attribute = 0;
  callOnFile("CDFcreateAttr", file, CREATE_, ATTR_, name.c_str(), scope, &attribute);
  outputs[0] = makeDoubleScalar(attribute);
}

void deleteAttr(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attribute = getAttributeArg(arguments[1], "ATTRNUM");
  callOnFile("CDFdeleteAttr", file, ATTR_, attribute, DELETE_, ATTR_);
}

// Labels the attribute "ATTNUM", one letter short: users know it under that label.
void renameAttr(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attribute = getAttributeArg(arguments[1], "ATTNUM");
  const std::string name = getStringArg(arguments[2]);
  callOnFile("CDFrenameAttr", file, ATTR_, attribute, PUT_, ATTR_NAME_, name.c_str());
}

void getAttrName(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attribute = getAttributeArg(arguments[1], "ATTRNUM");
  char name[CDF_ATTR_NAME_LEN256 + 1] = {};
  callOnFile("CDFgetAttrName", file, ATTR_, attribute, GET_, ATTR_NAME_, name);
  outputs[0] = qvCreateString(name);
}

void getAttrNum(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                const CommandEntry*) {
  const char* routine = "CDFgetAttrNum";
  const CdfId file = getCdfIdArg(arguments[0]);
  std::string name = getStringArg(arguments[1]);
  const long attribute = CDFgetAttrNum(libraryHandle(file, routine), name.data());
  checkLibraryStatus(attribute, routine);
  outputs[0] = makeDoubleScalar(attribute);
}

void getAttrScope(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attribute = getAttributeArg(arguments[1], "ATTRNUM");
  long scope = 0;
  callOnFile("CDFgetAttrScope", file, ATTR_, attribute, GET_, ATTR_SCOPE_, &scope);
  outputs[0] = scopeName(scope);
}

// Reports a failure as "CDFinquireCDF": users know it under that name.
void inquireAttr(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                 const CommandEntry*) {
  const char* routine = "CDFinquireCDF";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long attribute = getAttributeArg(arguments[1], "ATTRNUM");
  char name[CDF_ATTR_NAME_LEN256 + 1] = {};
  long scope = 0, maxGEntry = 0, maxREntry = 0, maxZEntry = 0;
  checkLibraryStatus(CDFinquireAttr(libraryHandle(file, routine), attribute, name, &scope,
                                    &maxGEntry, &maxREntry, &maxZEntry),
                     routine);
  qvArray* scopeText = scopeName(scope);
  setOutputs(outputs, {qvCreateString(name), scopeText, makeDoubleScalar(maxGEntry),
                       makeDoubleScalar(maxZEntry)});
}

}  // namespace TOLVEX::ambrix
