#include "tests/support/library_items.h"

#include <algorithm>
#include <iterator>

namespace ambrix_test {
namespace {

constexpr long kCreate = 1001, kOpen = 1002, kDelete = 1003, kClose = 1004, kSelect = 1005,
               kConfirm = 1006, kGet = 1007, kPut = 1008;

// clang-format off
constexpr Item kItems[] = {
    {kCreate,  57,  "zVAR_",                "snnnvnvN"},
    {kCreate,  85,  "ATTR_",                "snN"},
    {kOpen,    1,   "CDF_",                 "sH"},
    {kDelete,  1,   "CDF_",                 ""},
    {kDelete,  57,  "zVAR_",                ""},
    {kDelete,  85,  "ATTR_",                ""},
    {kDelete,  153, "zVAR_RECORDS_",        "nn"},
    {kClose,   1,   "CDF_",                 ""},
    {kClose,   57,  "zVAR_",                ""},
    {kSelect,  1,   "CDF_",                 "h"},
    {kSelect,  16,  "CDF_STATUS_",          "n"},
    {kSelect,  17,  "CDF_READONLY_MODE_",   "n"},
    {kSelect,  18,  "CDF_zMODE_",           "n"},
    {kSelect,  57,  "zVAR_",                "n"},
    {kSelect,  79,  "zVAR_RECNUMBER_",      "n"},
    {kSelect,  80,  "zVAR_RECCOUNT_",       "n"},
    {kSelect,  81,  "zVAR_RECINTERVAL_",    "n"},
    {kSelect,  82,  "zVAR_DIMINDICES_",     "v"},
    {kSelect,  83,  "zVAR_DIMCOUNTS_",      "v"},
    {kSelect,  84,  "zVAR_DIMINTERVALS_",   "v"},
    {kSelect,  85,  "ATTR_",                "n"},
    {kSelect,  117, "CDF_CACHESIZE_",       "n"},
    {kSelect,  119, "zVARs_CACHESIZE_",     "n"},
    {kSelect,  121, "zVAR_CACHESIZE_",      "n"},
    {kSelect,  151, "zVAR_RESERVEPERCENT_", "n"},
    {kSelect,  154, "STAGE_CACHESIZE_",     "n"},
    {kSelect,  155, "COMPRESS_CACHESIZE_",  "n"},
    {kConfirm, 2,   "CDF_NAME_",            "S"},
    {kConfirm, 17,  "CDF_READONLY_MODE_",   "N"},
    {kConfirm, 117, "CDF_CACHESIZE_",       "N"},
    {kConfirm, 121, "zVAR_CACHESIZE_",      "N"},
    {kConfirm, 151, "zVAR_RESERVEPERCENT_", "N"},
    {kConfirm, 154, "STAGE_CACHESIZE_",     "N"},
    {kConfirm, 155, "COMPRESS_CACHESIZE_",  "N"},
    {kGet,     3,   "CDF_ENCODING_",        "N"},
    {kGet,     5,   "CDF_MAJORITY_",        "N"},
    {kGet,     6,   "CDF_FORMAT_",          "N"},
    {kGet,     7,   "CDF_COPYRIGHT_",       "S"},
    {kGet,     8,   "CDF_NUMrVARS_",        "N"},
    {kGet,     9,   "CDF_NUMzVARS_",        "N"},
    {kGet,     10,  "CDF_NUMATTRS_",        "N"},
    {kGet,     11,  "CDF_NUMgATTRS_",       "N"},
    {kGet,     12,  "CDF_NUMvATTRS_",       "N"},
    {kGet,     13,  "CDF_VERSION_",         "N"},
    {kGet,     14,  "CDF_RELEASE_",         "N"},
    {kGet,     15,  "CDF_INCREMENT_",       "N"},
    {kGet,     20,  "LIB_COPYRIGHT_",       "S"},
    {kGet,     21,  "LIB_VERSION_",         "N"},
    {kGet,     22,  "LIB_RELEASE_",         "N"},
    {kGet,     23,  "LIB_INCREMENT_",       "N"},
    {kGet,     24,  "LIB_subINCREMENT_",    "C"},
    {kGet,     25,  "rVARs_NUMDIMS_",       "N"},
    {kGet,     26,  "rVARs_DIMSIZES_",      "V"},
    {kGet,     27,  "rVARs_MAXREC_",        "N"},
    {kGet,     55,  "zVARs_MAXREC_",        "N"},
    {kGet,     58,  "zVAR_NAME_",           "S"},
    {kGet,     59,  "zVAR_DATATYPE_",       "N"},
    {kGet,     60,  "zVAR_NUMELEMS_",       "N"},
    {kGet,     61,  "zVAR_NUMDIMS_",        "N"},
    {kGet,     62,  "zVAR_DIMSIZES_",       "V"},
    {kGet,     63,  "zVAR_RECVARY_",        "N"},
    {kGet,     64,  "zVAR_DIMVARYS_",       "V"},
    {kGet,     66,  "zVAR_DATA_",           "D"},
    {kGet,     67,  "zVAR_HYPERDATA_",      "D"},
    {kGet,     70,  "zVAR_MAXREC_",         "N"},
    {kGet,     71,  "zVAR_MAXallocREC_",    "N"},
    {kGet,     73,  "zVAR_PADVALUE_",       "D"},
    {kGet,     75,  "zVAR_BLOCKINGFACTOR_", "N"},
    {kGet,     86,  "ATTR_SCOPE_",          "N"},
    {kGet,     87,  "ATTR_NAME_",           "S"},
    {kGet,     116, "STATUS_TEXT_",         "T"},
    {kGet,     130, "CDF_COMPRESSION_",     "NPN"},
    {kGet,     131, "zVAR_COMPRESSION_",    "NPN"},
    {kGet,     132, "zVAR_SPARSERECORDS_",  "N"},
    {kGet,     135, "zVAR_NUMRECS_",        "N"},
    {kGet,     136, "zVAR_NUMallocRECS_",   "N"},
    {kGet,     156, "CDF_CHECKSUM_",        "N"},
    {kPut,     5,   "CDF_MAJORITY_",        "n"},
    {kPut,     6,   "CDF_FORMAT_",          "n"},
    {kPut,     58,  "zVAR_NAME_",           "s"},
    {kPut,     66,  "zVAR_DATA_",           "d"},
    {kPut,     67,  "zVAR_HYPERDATA_",      "d"},
    {kPut,     73,  "zVAR_PADVALUE_",       "d"},
    {kPut,     74,  "zVAR_INITIALRECS_",    "n"},
    {kPut,     75,  "zVAR_BLOCKINGFACTOR_", "n"},
    {kPut,     87,  "ATTR_NAME_",           "s"},
    {kPut,     130, "CDF_COMPRESSION_",     "np"},
    {kPut,     131, "zVAR_COMPRESSION_",    "np"},
    {kPut,     132, "zVAR_SPARSERECORDS_",  "n"},
    {kPut,     134, "zVAR_ALLOCATEBLOCK_",  "nn"},
    {kPut,     156, "CDF_CHECKSUM_",        "n"},
};
// clang-format on

}  // namespace

const Item* findItem(long operation, long code) {
  const auto* found =
      std::find_if(std::begin(kItems), std::end(kItems), [operation, code](const Item& item) {
        return item.operation == operation && item.code == code;
      });
  return found == std::end(kItems) ? nullptr : found;
}

const char* operationName(long operation) {
  static constexpr const char* kNames[] = {"CREATE_", "OPEN_",    "DELETE_", "CLOSE_",
                                           "SELECT_", "CONFIRM_", "GET_",    "PUT_"};
  const bool known = operation >= kCreate && operation <= kPut;
  return known ? kNames[operation - kCreate] : nullptr;
}

}  // namespace ambrix_test
