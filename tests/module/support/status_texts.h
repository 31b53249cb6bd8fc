// The texts that the CDF library has for its statuses: the same in all versions.
#pragma once

namespace ambrix_test {

// clang-format off
inline constexpr const char* kAttrExists          = "ATTR_EXISTS: Named attribute already exists.";
inline constexpr const char* kAttrNameTrunc       = "ATTR_NAME_TRUNC: Attribute name truncated.";
inline constexpr const char* kBadAllocateRecs     = "BAD_ALLOCATE_RECS: Illegal number of records to allocate specified.";
inline constexpr const char* kBadAttrName         = "BAD_ATTR_NAME: Illegal attribute name specified.";
inline constexpr const char* kBadAttrNum          = "BAD_ATTR_NUM: Illegal attribute number specified.";
inline constexpr const char* kBadBlockingFactor   = "BAD_BLOCKING_FACTOR: Illegal blocking factor specified (less than zero).";
inline constexpr const char* kBadCacheSize        = "BAD_CACHE_SIZE: Illegal number of cache buffers specified.";
inline constexpr const char* kBadCdfId            = "BAD_CDF_ID: CDF identifier is unknown or invalid.";
inline constexpr const char* kBadChecksum         = "BAD_CHECKSUM: The specified checksum method is not currently supported.";
inline constexpr const char* kBadCompressionParm  = "BAD_COMPRESSION_PARM: An illegal compression parameter was specified.";
inline constexpr const char* kBadDataType         = "BAD_DATA_TYPE: Unknown data type specified or encountered.";
inline constexpr const char* kBadDimCount         = "BAD_DIM_COUNT: Illegal dimension count specified.";
inline constexpr const char* kBadDimIndex         = "BAD_DIM_INDEX: Dimension index out of range.";
inline constexpr const char* kBadDimInterval      = "BAD_DIM_INTERVAL: Illegal dimension interval specified.";
inline constexpr const char* kBadDimSize          = "BAD_DIM_SIZE: Dimension size specified as zero or less.";
inline constexpr const char* kBadEntryNum         = "BAD_ENTRY_NUM: Illegal attribute entry number specified.";
inline constexpr const char* kBadFormat           = "BAD_FORMAT: Unknown CDF format specified.";
inline constexpr const char* kBadInitialRecs      = "BAD_INITIAL_RECS: Illegal number of initial records.";
inline constexpr const char* kBadMajority         = "BAD_MAJORITY: Unknown variable majority specified.";
inline constexpr const char* kBadNumDims          = "BAD_NUM_DIMS: Illegal number of dimensions.";
inline constexpr const char* kBadNumElems         = "BAD_NUM_ELEMS: Illegal number of elements (for data type).";
inline constexpr const char* kBadReadonlyMode     = "BAD_READONLY_MODE: Illegal read-only mode specified.";
inline constexpr const char* kBadRecCount         = "BAD_REC_COUNT: Illegal record count specified.";
inline constexpr const char* kBadRecInterval      = "BAD_REC_INTERVAL: Illegal record interval specified.";
inline constexpr const char* kBadRecNum           = "BAD_REC_NUM: Record number is out of range.";
inline constexpr const char* kBadScope            = "BAD_SCOPE: Unrecognized attribute scope.";
inline constexpr const char* kBadVarName          = "BAD_VAR_NAME: Illegal variable name specified.";
inline constexpr const char* kBadVarNum           = "BAD_VAR_NUM: Illegal variable number specified.";
inline constexpr const char* kCannotChange        = "CANNOT_CHANGE: The parameter/value can't be set/changed.";
inline constexpr const char* kCannotCompress      = "CANNOT_COMPRESS: The compression for the CDF/variable can't be set/modified.";
inline constexpr const char* kCannotSparserecords = "CANNOT_SPARSERECORDS: Sparse records can't be set/modified for the variable.";
inline constexpr const char* kCdfCloseError       = "CDF_CLOSE_ERROR: Close failed - error from file system.";
inline constexpr const char* kCdfDeleteError      = "CDF_DELETE_ERROR: Deletion failed - error from file system.";
inline constexpr const char* kCdfOpenError        = "CDF_OPEN_ERROR: Open failed - error from file system.";
inline constexpr const char* kCdfReadError        = "CDF_READ_ERROR: Read failed - error from file system.";
inline constexpr const char* kIllegalForScope     = "ILLEGAL_FOR_SCOPE: The operation is illegal for the attribute's scope.";
inline constexpr const char* kIllegalInZmode      = "ILLEGAL_IN_zMODE: Operation is illegal while in zMode.";
inline constexpr const char* kNaForVariable       = "NA_FOR_VARIABLE: Operation n/a for the type of variable.";
inline constexpr const char* kNoMoreAccess        = "NO_MORE_ACCESS: No more access to the CDF due to a severe error.";
inline constexpr const char* kNoSuchAttr          = "NO_SUCH_ATTR: Named attribute not found in this CDF.";
inline constexpr const char* kNoSuchEntry         = "NO_SUCH_ENTRY: No such entry for specified attribute.";
inline constexpr const char* kNoSuchRecord        = "NO_SUCH_RECORD: The specified record does not exist.";
inline constexpr const char* kNoSuchVar           = "NO_SUCH_VAR: Named variable not found in this CDF.";
inline constexpr const char* kReadOnlyMode        = "READ_ONLY_MODE: CDF is in read-only mode.";
inline constexpr const char* kUnknownSparseness   = "UNKNOWN_SPARSENESS: An unknown sparseness was encountered.";
inline constexpr const char* kVarExists           = "VAR_EXISTS: Named variable already exists.";
inline constexpr const char* kVarNameTrunc        = "VAR_NAME_TRUNC: Variable name truncated.";
// clang-format on

}  // namespace ambrix_test
