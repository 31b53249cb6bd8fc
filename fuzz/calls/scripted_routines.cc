// The routines of the scripted library beside CDFlib.
#include <cdf.h>

#include <algorithm>
#include <cstdarg>
#include <cstring>
#include <initializer_list>
#include <string>

#include "fuzz/calls/script.h"

namespace {

using ambrix_fuzz::Description;
using ambrix_fuzz::requireFitting;
using ambrix_fuzz::script;

long number(const char* routine) {
  return script().number(routine);
}

/// A number or a negative status, as the routines that look up names give it.
long numberOrStatus(const char* routine, const char* name) {
  ambrix_fuzz::readAll(name, std::strlen(name) + 1);
  const long status = script().nextStatus();
  return status < 0 ? status : number(routine);
}

long finish(std::initializer_list<long> numbers) {
  std::ranges::for_each(numbers, requireFitting);
  return script().nextStatus();
}

std::size_t bytesOfRecord() {
  const Description& variable = script().variable();
  return ambrix_fuzz::bytesOf(variable, ambrix_test::valuesOfRecord(variable));
}

std::size_t bytesOfEntry(long datatype, long elements) {
  Description entry;
  entry.datatype = datatype;
  entry.elements = elements;
  return ambrix_fuzz::bytesOf(entry, 1);
}

}  // namespace

extern "C" {

CDFstatus CDFcreateCDF(char* name, CDFid* id) {
  ambrix_fuzz::readAll(name, std::strlen(name) + 1);
  *id = reinterpret_cast<CDFid>(script().handle());
  return script().nextStatus();
}

long CDFgetVarNum(CDFid, char* name) {
  return numberOrStatus("CDFgetVarNum", name);
}

long CDFgetAttrNum(CDFid, char* name) {
  return numberOrStatus("CDFgetAttrNum", name);
}

CDFstatus CDFinquireAttr(CDFid, long attribute, char* name, long* scope, long* maxGEntry,
                         long* maxREntry, long* maxZEntry) {
  const std::string text = script().text(256);
  std::memcpy(name, text.c_str(), text.size() + 1);
  for (long* place : {scope, maxGEntry, maxREntry, maxZEntry})
    *place = number("CDFinquireAttr");
  return finish({attribute});
}

CDFstatus CDFgetAttrMaxEntry(CDFid, int, long attribute, long* value) {
  *value = number("CDFgetAttrMaxEntry");
  return finish({attribute});
}

CDFstatus CDFgetNumAttrEntries(CDFid, int, long attribute, long* value) {
  *value = number("CDFgetNumAttrEntries");
  return finish({attribute});
}

CDFstatus CDFinquireAttrEntry(CDFid, int, long attribute, long entry, long* datatype,
                              long* elements) {
  const bool sane = !script().choices().oneIn(6);
  script().entryDatatype = sane ? script().variable().datatype : number("an entry's datatype");
  script().entryElements =
      sane ? 1 + static_cast<long>(script().choices().below(9)) : number("an entry's elements");
  *datatype = script().entryDatatype;
  *elements = script().entryElements;
  return finish({attribute, entry});
}

CDFstatus CDFgetAttrEntry(CDFid, int, long attribute, long entry, void* value) {
  if (!script().stopsEarly()) {
    ambrix_fuzz::writeAll(value, bytesOfEntry(script().entryDatatype, script().entryElements));
  }
  return finish({attribute, entry});
}

CDFstatus CDFputAttrEntry(CDFid, int, long attribute, long entry, long datatype, long elements,
                          void* value) {
  ambrix_fuzz::readAll(value, bytesOfEntry(datatype, elements));
  return finish({attribute, entry, datatype, elements});
}

CDFstatus CDFdeleteAttrEntry(CDFid, int, long attribute, long entry) {
  return finish({attribute, entry});
}

CDFstatus CDFgetVarRecordData(CDFid, int, long variable, long record, void* buffer) {
  if (!script().stopsEarly()) ambrix_fuzz::writeAll(buffer, bytesOfRecord());
  return finish({variable, record});
}

CDFstatus CDFputVarRecordData(CDFid, int, long variable, long record, void* buffer) {
  if (!script().stopsEarly()) ambrix_fuzz::readAll(buffer, bytesOfRecord());
  return finish({variable, record});
}

int CDFgetValidate() {
  return static_cast<int>(number("CDFgetValidate"));
}

void CDFsetValidate(long mode) {
  requireFitting(mode);
}

int CDFgetFileBackward() {
  return static_cast<int>(number("CDFgetFileBackward"));
}

void CDFsetFileBackward(int) {}

double computeEPOCH(long, long, long, long, long, long, long) {
  return script().epoch();
}

double computeEPOCH16(long, long, long, long, long, long, long, long, long, long, double* epoch) {
  ambrix_fuzz::writeAll(epoch, 2 * sizeof(double));
  return script().epoch();
}

void EPOCHbreakdown(double, long* year, long* month, long* day, long* hour, long* minute,
                    long* second, long* millisecond) {
  for (long* part : {year, month, day, hour, minute, second, millisecond})
    *part = number("EPOCHbreakdown");
}

void EPOCH16breakdown(double* epoch, long* year, long* month, long* day, long* hour, long* minute,
                      long* second, long* millisecond, long* microsecond, long* nanosecond,
                      long* picosecond) {
  ambrix_fuzz::readAll(epoch, 2 * sizeof(double));
  for (long* part :
       {year, month, day, hour, minute, second, millisecond, microsecond, nanosecond, picosecond})
    *part = number("EPOCH16breakdown");
}

long long computeTT2000(double, double, double, ...) {
  return number("computeTT2000");
}

void breakdownTT2000(long long, double* year, double* month, double* day, ...) {
  for (double* part : {year, month, day})
    *part = static_cast<double>(number("breakdownTT2000"));
  va_list rest;
  va_start(rest, day);
  for (int i = 0; i < 6; ++i)
    *va_arg(rest, double*) = static_cast<double>(number("breakdownTT2000"));
  va_end(rest);
}

}  // extern "C"
