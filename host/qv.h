// The host's array, allocator, text and message interface. The module calls these; its host
// supplies them when it loads the module.
#pragma once

#include <cstddef>
#include <string>

#include "host/message_id.h"

/// A host array: a class, at least two dimensions, and data stored first dimension fastest.
struct qvArray;

/// The host's class identifiers. The numbers are the host's own and never change.
enum qvClassID : int {
  qvUNKNOWN_CLASS = 0,
  qvCELL_CLASS = 1,
  qvSTRUCT_CLASS = 2,
  qvLOGICAL_CLASS = 3,
  qvCHAR_CLASS = 4,
  qvDOUBLE_CLASS = 6,
  qvSINGLE_CLASS = 7,
  qvINT8_CLASS = 8,
  qvUINT8_CLASS = 9,
  qvINT16_CLASS = 10,
  qvUINT16_CLASS = 11,
  qvINT32_CLASS = 12,
  qvUINT32_CLASS = 13,
  qvINT64_CLASS = 14,
  qvUINT64_CLASS = 15,
};

enum qvComplexity : int { qvREAL = 0, qvCOMPLEX = 1 };

extern "C" {

// --- What an array is -----------------------------------------------------------------------

qvClassID qvGetClassID(const qvArray* array);

/// The class as people know it: "double", "single", "int8", ..., "char", "logical", "cell".
const char* qvGetClassName(const qvArray* array);

std::size_t qvGetNumberOfElements(const qvArray* array);
std::size_t qvGetNumberOfDimensions(const qvArray* array);
const std::size_t* qvGetDimensions(const qvArray* array);

// --- What an array holds --------------------------------------------------------------------
// Pointers stay valid as long as the array. An empty array may give a null pointer.

/// The elements of a numeric array, of a logical array (one byte each) or of a character array.
const void* qvGetReadOnlyData(const qvArray* array);
/// The same for an array that the caller has created and not yet handed over.
void* qvGetData(qvArray* array);

/// The elements of a logical array.
const bool* qvGetLogicals(const qvArray* array);

/// The UTF-16 characters of a character array.
const char16_t* qvGetReadOnlyChars(const qvArray* array);
char16_t* qvGetChars(qvArray* array);

/// The i-th element of a cell array, which keeps it; null when it is unset.
const qvArray* qvGetCell(const qvArray* array, std::size_t index);

// --- Making arrays --------------------------------------------------------------------------
// A new array belongs to the host, which reclaims what a failed call leaves behind. A list of one
// dimension n makes an n-by-1 array; trailing dimensions of 1 beyond the second are dropped. A size
// that is negative when taken as signed is refused before anything is allocated; so is one that
// overflows or cannot be had: both are errors of the host, raised and never returned.

/// All elements are zero.
qvArray* qvCreateNumericArray(std::size_t dimensions, const std::size_t* sizes, qvClassID classId,
                              qvComplexity complexity);
/// The elements are unset: for callers that overwrite every one.
qvArray* qvCreateUninitNumericArray(std::size_t dimensions, const std::size_t* sizes,
                                    qvClassID classId, qvComplexity complexity);
qvArray* qvCreateNumericMatrix(std::size_t rows, std::size_t columns, qvClassID classId,
                               qvComplexity complexity);
qvArray* qvCreateDoubleScalar(double value);
qvArray* qvCreateLogicalArray(std::size_t dimensions, const std::size_t* sizes);

/// Characters are unset: callers overwrite every one.
qvArray* qvCreateCharArray(std::size_t dimensions, const std::size_t* sizes);
/// A 1-by-N text, byte b as the unit b; an empty text is 0-by-0.
qvArray* qvCreateString(const char* text);

qvArray* qvCreateCellMatrix(std::size_t rows, std::size_t columns);
/// The cell array takes over the value.
void qvSetCell(qvArray* cell, std::size_t index, qvArray* value);

// --- Allocator and text ---------------------------------------------------------------------

/// Memory that the host reclaims when the call ends. Failure is an error of the host, never null.
void* qvMalloc(std::size_t bytes);
void qvFree(void* memory);

/// A zero-terminated narrow copy (the low 8 bits of each unit) for `qvFree`; null when the array is
/// not a character array.
char* qvArrayToString(const qvArray* array);

/// A zero-terminated copy of the text in the platform's narrow encoding of file names, for
/// `qvFree`; null when a character has no narrow form.
char* qvUtf16ToNarrow(const char16_t* text, std::size_t length);

// --- Extended datatypes ---------------------------------------------------------------------

/// Whether the call under way may use the datatypes and commands of docs/extended.md. A host need
/// not have this function; without it they do not exist.
[[gnu::weak]] bool qvOffersExtendedDatatypes();

// --- Messages -------------------------------------------------------------------------------

/// Raises the error; does not return.
void qvErrMsgId(const TOLVEX::ambrix::MessageId& id);
/// Issues the warning and returns.
void qvWarningMsgId(const TOLVEX::ambrix::MessageId& id);
/// The text of the host's message catalogue with the values filled in.
void qvGetMessageText(const TOLVEX::ambrix::MessageId& id, std::string& text);

}  // extern "C"
