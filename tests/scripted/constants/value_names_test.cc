// Values that have names, and values that are checked.
#include "constants/value_names.h"

#include "constants/checked_values.h"
#include "gateway/errors.h"
#include "tests/support/failure_of.h"

namespace ambrix_test {
namespace {

using namespace TOLVEX::ambrix;
using ValueNamesTest = HostTest;

TEST_F(ValueNamesTest, EachTableHasItsRowsAndNoOther) {
  EXPECT_EQ(FormatNames, (ValueNameTable{{1, "SINGLE_FILE"}, {2, "MULTI_FILE"}}));
  EXPECT_EQ(ChecksumNames,
            (ValueNameTable{{0, "NO_CHECKSUM"}, {1, "MD5_CHECKSUM"}, {2, "OTHER_CHECKSUM"}}));
  EXPECT_EQ(ReadOnlyModeNames, (ValueNameTable{{-1, "READONLYon"}, {0, "READONLYoff"}}));
  EXPECT_EQ(MajorityNames, (ValueNameTable{{1, "ROW_MAJOR"}, {2, "COLUMN_MAJOR"}}));
  EXPECT_EQ(ValidateModeNames, (ValueNameTable{{0, "VALIDATEFILEoff"}, {1, "VALIDATEFILEon"}}));
  EXPECT_EQ(BackwardFileModeNames, (ValueNameTable{{0, "BACKWARDFILEoff"}, {1, "BACKWARDFILEon"}}));
  EXPECT_EQ(SparseRecordsNames,
            (ValueNameTable{
                {0, "NO_SPARSERECORDS"}, {1, "PAD_SPARSERECORDS"}, {2, "PREV_SPARSERECORDS"}}));
  EXPECT_EQ(ScopeNames, (ValueNameTable{{1, "GLOBAL_SCOPE"}, {2, "VARIABLE_SCOPE"}}));
  EXPECT_EQ(CompressionNames, (ValueNameTable{{0, "NO_COMPRESSION"},
                                              {1, "RLE_COMPRESSION"},
                                              {2, "HUFF_COMPRESSION"},
                                              {3, "AHUFF_COMPRESSION"},
                                              {5, "GZIP_COMPRESSION"}}));
}

TEST_F(ValueNamesTest, ALookUpGivesTheNameOrTellsValueAndKind) {
  EXPECT_EQ(lookupValueName(ValidateModeNames, 1, "K"), "VALIDATEFILEon");
  EXPECT_EQ(failureOf([] { lookupValueName(ValidateModeNames, -1, "K"); }), unrecognized(-1, "K"));
  EXPECT_EQ(failureOf([] { lookupValueName(ReadOnlyModeNames, 1, "L"); }), unrecognized(1, "L"));
}

TEST_F(ValueNamesTest, ScopesHaveTwoNames) {
  EXPECT_EQ(textOf([] { return scopeName(1); }), "GLOBAL_SCOPE");
  EXPECT_EQ(textOf([] { return scopeName(2); }), "VARIABLE_SCOPE");
  for (const long scope : {0L, 3L, 4L, -1L, 4294967297L})
    EXPECT_EQ(failureOf([scope] { scopeName(scope); }), unrecognized(scope, "SCOPE"));
}

TEST_F(ValueNamesTest, FiveCompressionTypesPass) {
  for (const long type : {0L, 1L, 2L, 3L, 5L})
    EXPECT_EQ(failureOf([type] { checkCompressionType(type); }), "no error");
  for (const long type : {4L, 6L, 16L, -1L, 4294967297L})
    EXPECT_EQ(failureOf([type] { checkCompressionType(type); }), unrecognized(type, "COMPRESSION"));
}

}  // namespace
}  // namespace ambrix_test
