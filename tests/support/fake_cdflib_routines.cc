// The routines of the stand-in beside CDFlib.
#include <cdf.h>

#include <cstdarg>
#include <cstdint>
#include <initializer_list>
#include <sstream>
#include <string>

#include "tests/support/fake_cdflib.h"
#include "tests/support/fake_cdflib_sizes.h"

namespace {

using ambrix_test::bytesOfEntry;
using ambrix_test::fakeCdflib;

std::size_t bytesOfRecord() {
  return ambrix_test::bytesOfValues(ambrix_test::valuesOfRecord(ambrix_test::describedVariable()));
}

std::string textOf(const char* routine, CDFid id, std::initializer_list<long> numbers) {
  std::string text =
      routine + std::string(" ") + std::to_string(reinterpret_cast<std::uintptr_t>(id));
  for (const long number : numbers)
    text += ' ' + std::to_string(number);
  return text;
}

std::string quoted(const char* text) {
  return " '" + std::string(text) + '\'';
}

std::string timeText(const char* routine, std::initializer_list<long> components) {
  std::string text = routine;
  for (const long component : components)
    text += ' ' + std::to_string(component);
  return text;
}

std::string epochText(const char* routine, std::initializer_list<double> values) {
  std::ostringstream text;
  text << routine;
  for (const double value : values)
    text << ' ' << value;
  return text.str();
}

void breakDown(const char* routine, std::initializer_list<long*> components) {
  std::size_t next = 0;
  for (long* component : components)
    *component = fakeCdflib().number(routine, next++);
}

}  // namespace

extern "C" {

CDFstatus CDFcreateCDF(char* name, CDFid* id) {
  *id = reinterpret_cast<CDFid>(fakeCdflib().number("handle"));
  return fakeCdflib().finish("CDFcreateCDF" + quoted(name));
}

long CDFgetVarNum(CDFid id, char* name) {
  return fakeCdflib().finish(textOf("CDFgetVarNum", id, {}) + quoted(name),
                             fakeCdflib().number("CDFgetVarNum"));
}

long CDFgetAttrNum(CDFid id, char* name) {
  return fakeCdflib().finish(textOf("CDFgetAttrNum", id, {}) + quoted(name),
                             fakeCdflib().number("CDFgetAttrNum"));
}

CDFstatus CDFinquireAttr(CDFid id, long attribute, char* name, long* scope, long* maxGEntry,
                         long* maxREntry, long* maxZEntry) {
  const std::string& text = fakeCdflib().text("CDFinquireAttr");
  name[text.copy(name, text.size())] = '\0';
  breakDown("CDFinquireAttr", {scope, maxGEntry, maxREntry, maxZEntry});
  return fakeCdflib().finish(textOf("CDFinquireAttr", id, {attribute}));
}

CDFstatus CDFgetAttrMaxEntry(CDFid id, int kind, long attribute, long* value) {
  *value = fakeCdflib().number("CDFgetAttrMaxEntry");
  return fakeCdflib().finish(textOf("CDFgetAttrMaxEntry", id, {kind, attribute}));
}

CDFstatus CDFgetNumAttrEntries(CDFid id, int kind, long attribute, long* value) {
  *value = fakeCdflib().number("CDFgetNumAttrEntries");
  return fakeCdflib().finish(textOf("CDFgetNumAttrEntries", id, {kind, attribute}));
}

CDFstatus CDFinquireAttrEntry(CDFid id, int kind, long attribute, long entry, long* datatype,
                              long* elements) {
  breakDown("CDFinquireAttrEntry", {datatype, elements});
  return fakeCdflib().finish(textOf("CDFinquireAttrEntry", id, {kind, attribute, entry}));
}

CDFstatus CDFgetAttrEntry(CDFid id, int kind, long attribute, long entry, void* value) {
  fakeCdflib().give(value, bytesOfEntry(fakeCdflib().number("CDFinquireAttrEntry", 0),
                                        fakeCdflib().number("CDFinquireAttrEntry", 1)));
  return fakeCdflib().finish(textOf("CDFgetAttrEntry", id, {kind, attribute, entry}));
}

CDFstatus CDFputAttrEntry(CDFid id, int kind, long attribute, long entry, long datatype,
                          long elements, void* value) {
  fakeCdflib().take(value, bytesOfEntry(datatype, elements));
  return fakeCdflib().finish(
      textOf("CDFputAttrEntry", id, {kind, attribute, entry, datatype, elements}));
}

CDFstatus CDFdeleteAttrEntry(CDFid id, int kind, long attribute, long entry) {
  return fakeCdflib().finish(textOf("CDFdeleteAttrEntry", id, {kind, attribute, entry}));
}

CDFstatus CDFgetVarRecordData(CDFid id, int zVar, long variable, long record, void* buffer) {
  fakeCdflib().give(buffer, bytesOfRecord());
  return fakeCdflib().finish(textOf("CDFgetVarRecordData", id, {zVar, variable, record}));
}

CDFstatus CDFputVarRecordData(CDFid id, int zVar, long variable, long record, void* buffer) {
  fakeCdflib().take(buffer, bytesOfRecord());
  return fakeCdflib().finish(textOf("CDFputVarRecordData", id, {zVar, variable, record}));
}

// The modes of the library are no statuses: these end with what they answer.
int CDFgetValidate() {
  return static_cast<int>(
      fakeCdflib().finish("CDFgetValidate", fakeCdflib().number("CDFgetValidate")));
}

void CDFsetValidate(long mode) {
  fakeCdflib().finish("CDFsetValidate " + std::to_string(mode));
}

int CDFgetFileBackward() {
  return static_cast<int>(
      fakeCdflib().finish("CDFgetFileBackward", fakeCdflib().number("CDFgetFileBackward")));
}

void CDFsetFileBackward(int mode) {
  fakeCdflib().finish("CDFsetFileBackward " + std::to_string(mode));
}

double computeEPOCH(long year, long month, long day, long hour, long minute, long second,
                    long millisecond) {
  fakeCdflib().finish(
      timeText("computeEPOCH", {year, month, day, hour, minute, second, millisecond}));
  return fakeCdflib().nextEpoch();
}

double computeEPOCH16(long year, long month, long day, long hour, long minute, long second,
                      long millisecond, long microsecond, long nanosecond, long picosecond,
                      double* epoch) {
  fakeCdflib().finish(timeText(
      "computeEPOCH16",
      {year, month, day, hour, minute, second, millisecond, microsecond, nanosecond, picosecond}));
  epoch[0] = static_cast<double>(year);
  epoch[1] = static_cast<double>(picosecond);
  return fakeCdflib().nextEpoch();
}

void EPOCHbreakdown(double epoch, long* year, long* month, long* day, long* hour, long* minute,
                    long* second, long* millisecond) {
  breakDown("EPOCHbreakdown", {year, month, day, hour, minute, second, millisecond});
  fakeCdflib().finish(epochText("EPOCHbreakdown", {epoch}));
}

void EPOCH16breakdown(double* epoch, long* year, long* month, long* day, long* hour, long* minute,
                      long* second, long* millisecond, long* microsecond, long* nanosecond,
                      long* picosecond) {
  breakDown("EPOCH16breakdown", {year, month, day, hour, minute, second, millisecond, microsecond,
                                 nanosecond, picosecond});
  fakeCdflib().finish(epochText("EPOCH16breakdown", {epoch[0], epoch[1]}));
}

// The rest of the components is read as the library reads them: six of the same kind.
long long computeTT2000(double year, double month, double day, ...) {
  std::ostringstream text;
  text << "computeTT2000 " << year << ' ' << month << ' ' << day;
  va_list rest;
  va_start(rest, day);
  for (int i = 0; i < 6; ++i)
    text << ' ' << va_arg(rest, double);
  va_end(rest);
  fakeCdflib().finish(text.str());
  return fakeCdflib().number("computeTT2000");
}

void breakdownTT2000(long long time, double* year, double* month, double* day, ...) {
  std::size_t next = 0;
  for (double* component : {year, month, day})
    *component = static_cast<double>(fakeCdflib().number("breakdownTT2000", next++));
  va_list rest;
  va_start(rest, day);
  for (int i = 0; i < 6; ++i)
    *va_arg(rest, double*) = static_cast<double>(fakeCdflib().number("breakdownTT2000", next++));
  va_end(rest);
  fakeCdflib().finish("breakdownTT2000 " + std::to_string(time));
}

}  // extern "C"
