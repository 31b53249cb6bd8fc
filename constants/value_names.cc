#include "constants/value_names.h"

#include <boost/assign/list_of.hpp>

#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {

using boost::assign::map_list_of;

const ValueNameTable FormatNames =
    map_list_of<std::int64_t, std::string>(1, "SINGLE_FILE")(2, "MULTI_FILE");

const ValueNameTable ChecksumNames = map_list_of<std::int64_t, std::string>  //
    (0, "NO_CHECKSUM")(1, "MD5_CHECKSUM")(2, "OTHER_CHECKSUM");

const ValueNameTable ReadOnlyModeNames =
    map_list_of<std::int64_t, std::string>(-1, "READONLYon")(0, "READONLYoff");

const ValueNameTable MajorityNames =
    map_list_of<std::int64_t, std::string>(1, "ROW_MAJOR")(2, "COLUMN_MAJOR");

// The mode is set with VALIDATEFILEon, -1, but CDFgetValidate answers 1.
const ValueNameTable ValidateModeNames =
    map_list_of<std::int64_t, std::string>(0, "VALIDATEFILEoff")(1, "VALIDATEFILEon");

const ValueNameTable BackwardFileModeNames =
    map_list_of<std::int64_t, std::string>(0, "BACKWARDFILEoff")(1, "BACKWARDFILEon");

const ValueNameTable SparseRecordsNames = map_list_of<std::int64_t, std::string>  //
    (0, "NO_SPARSERECORDS")(1, "PAD_SPARSERECORDS")(2, "PREV_SPARSERECORDS");

const ValueNameTable ScopeNames =
    map_list_of<std::int64_t, std::string>(1, "GLOBAL_SCOPE")(2, "VARIABLE_SCOPE");

// There is no type 4.
const ValueNameTable CompressionNames = map_list_of<std::int64_t, std::string>  //
    (0, "NO_COMPRESSION")(1, "RLE_COMPRESSION")(2, "HUFF_COMPRESSION")          //
    (3, "AHUFF_COMPRESSION")(5, "GZIP_COMPRESSION");

const std::string& lookupValueName(const ValueNameTable& table, std::int64_t value,
                                   const char* kindName) {
  const auto found = table.find(value);
  if (found == table.end()) raiseError(cdflib::unrecognizedValue(value, kindName));
  return found->second;
}

}  // namespace TOLVEX::ambrix
