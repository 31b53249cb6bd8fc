// The constants that users see, restated by hand.
#pragma once

#include <iterator>
#include <utility>

namespace ambrix_test {

// In the order in which "getConstantNames" lists them.
inline constexpr std::pair<const char*, int> kConstants[] = {
    {"AHUFF_COMPRESSION", 3},
    {"ALPHAMVSD_ENCODING", 14},
    {"ALPHAMVSG_ENCODING", 15},
    {"ALPHAMVSI_ENCODING", 16},
    {"ALPHAOSF1_ENCODING", 13},
    {"BACKWARDFILEOFF", 0},
    {"BACKWARDFILEON", 1},
    {"CDF_BYTE", 41},
    {"CDF_CHAR", 51},
    {"CDF_DOUBLE", 45},
    {"CDF_EPOCH", 31},
    {"CDF_EPOCH16", 32},
    {"CDF_FLOAT", 44},
    {"CDF_INT1", 1},
    {"CDF_INT2", 2},
    {"CDF_INT4", 4},
    {"CDF_REAL4", 21},
    {"CDF_REAL8", 22},
    {"CDF_UCHAR", 52},
    {"CDF_UINT1", 11},
    {"CDF_UINT2", 12},
    {"CDF_UINT4", 14},
    {"COLUMN_MAJOR", 2},
    {"DECSTATION_ENCODING", 4},
    {"GLOBAL_SCOPE", 1},
    {"GZIP_COMPRESSION", 5},
    {"HOST_ENCODING", 8},
    {"HP_ENCODING", 11},
    {"HUFF_COMPRESSION", 2},
    {"IBMPC_ENCODING", 6},
    {"IBMRS_ENCODING", 7},
    {"MAC_ENCODING", 9},
    {"MD5_CHECKSUM", 1},
    {"MULTI_FILE", 2},
    {"NETWORK_ENCODING", 1},
    {"NEXT_ENCODING", 12},
    {"NOVARY", 0},
    {"NO_CHECKSUM", 0},
    {"NO_COMPRESSION", 0},
    {"NO_SPARSERECORDS", 0},
    {"OPTIMAL_ENCODING_TREES", 0},
    {"OTHER_CHECKSUM", 2},
    {"PAD_SPARSERECORDS", 1},
    {"PREV_SPARSERECORDS", 2},
    {"READONLYOFF", 0},
    {"READONLYON", -1},
    {"RLE_COMPRESSION", 1},
    {"RLE_OF_ZEROS", 0},
    {"ROW_MAJOR", 1},
    {"SGI_ENCODING", 5},
    {"SINGLE_FILE", 1},
    {"SUN_ENCODING", 2},
    {"VALIDATEFILEOFF", 0},
    {"VALIDATEFILEON", -1},
    {"VARIABLE_SCOPE", 2},
    {"VARY", -1},
    {"VAX_ENCODING", 3},
};
static_assert(std::size(kConstants) == 57);

}  // namespace ambrix_test
