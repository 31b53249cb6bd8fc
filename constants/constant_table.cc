#include "constants/constant_table.h"

#include <algorithm>
#include <boost/assign/list_of.hpp>
#include <cctype>
#include <cstddef>
#include <string_view>
#include <vector>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/extension.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {

// The numbers are the library's. Every "on" is -1 but that of the backward-file mode, encoding 10
// does not exist, and the two compression parameters share the value 0.
const std::map<std::string, double> ConstantNameTable =
    boost::assign::map_list_of<std::string, std::int64_t>  //
    ("GLOBAL_SCOPE", 1)                                    //
    ("VARIABLE_SCOPE", 2)                                  //
    ("CDF_INT1", 1)                                        //
    ("CDF_INT2", 2)                                        //
    ("CDF_INT4", 4)                                        //
    ("CDF_UINT1", 11)                                      //
    ("CDF_UINT2", 12)                                      //
    ("CDF_UINT4", 14)                                      //
    ("CDF_REAL4", 21)                                      //
    ("CDF_REAL8", 22)                                      //
    ("CDF_EPOCH", 31)                                      //
    ("CDF_EPOCH16", 32)                                    //
    ("CDF_BYTE", 41)                                       //
    ("CDF_FLOAT", 44)                                      //
    ("CDF_DOUBLE", 45)                                     //
    ("CDF_CHAR", 51)                                       //
    ("CDF_UCHAR", 52)                                      //
    ("NO_CHECKSUM", 0)                                     //
    ("MD5_CHECKSUM", 1)                                    //
    ("OTHER_CHECKSUM", 2)                                  //
    ("NO_COMPRESSION", 0)                                  //
    ("RLE_COMPRESSION", 1)                                 //
    ("HUFF_COMPRESSION", 2)                                //
    ("AHUFF_COMPRESSION", 3)                               //
    ("GZIP_COMPRESSION", 5)                                //
    ("RLE_OF_ZEROS", 0)                                    //
    ("OPTIMAL_ENCODING_TREES", 0)                          //
    ("NETWORK_ENCODING", 1)                                //
    ("SUN_ENCODING", 2)                                    //
    ("VAX_ENCODING", 3)                                    //
    ("DECSTATION_ENCODING", 4)                             //
    ("SGI_ENCODING", 5)                                    //
    ("IBMPC_ENCODING", 6)                                  //
    ("IBMRS_ENCODING", 7)                                  //
    ("HOST_ENCODING", 8)                                   //
    ("MAC_ENCODING", 9)                                    //
    ("HP_ENCODING", 11)                                    //
    ("NEXT_ENCODING", 12)                                  //
    ("ALPHAOSF1_ENCODING", 13)                             //
    ("ALPHAMVSD_ENCODING", 14)                             //
    ("ALPHAMVSG_ENCODING", 15)                             //
    ("ALPHAMVSI_ENCODING", 16)                             //
    ("SINGLE_FILE", 1)                                     //
    ("MULTI_FILE", 2)                                      //
    ("ROW_MAJOR", 1)                                       //
    ("COLUMN_MAJOR", 2)                                    //
    ("READONLYOFF", 0)                                     //
    ("READONLYON", -1)                                     //
    ("NO_SPARSERECORDS", 0)                                //
    ("PAD_SPARSERECORDS", 1)                               //
    ("PREV_SPARSERECORDS", 2)                              //
    ("NOVARY", 0)                                          //
    ("VARY", -1)                                           //
    ("VALIDATEFILEOFF", 0)                                 //
    ("VALIDATEFILEON", -1)                                 //
    ("BACKWARDFILEOFF", 0)                                 //
    ("BACKWARDFILEON", 1);

namespace {

/// Those of the table and of the host's extension, in byte-wise order; each ends with a zero.
std::vector<std::string_view> namesOfConstants() {
  std::vector<std::string_view> names;
  names.reserve(ConstantNameTable.size() + extension().constants.size());
  for (const auto& [name, value] : ConstantNameTable)
    names.emplace_back(name);
  for (const NamedConstant& added : extension().constants)
    names.emplace(std::ranges::lower_bound(names, added.name), added.name);
  return names;
}

double extendedConstant(const std::string& name) {
  for (const NamedConstant& added : extension().constants) {
    if (added.name == name) return added.value;
  }
  raiseError(cdflib::unrecognizedConstantName(name));
}

}  // namespace

void getConstantNames(int, qvArray* outputs[], std::int32_t, const qvArray*[],
                      const CommandEntry*) {
  const std::vector<std::string_view> sorted = namesOfConstants();
  qvArray* names = qvCreateCellMatrix(sorted.size(), 1);
  std::size_t row = 0;
  for (const std::string_view name : sorted)
    qvSetCell(names, row++, qvCreateString(name.data()));
  outputs[0] = names;
}

void getConstantValue(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  std::string name = getStringArg(arguments[0]);
  for (char& c : name)
    c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
  const auto found = ConstantNameTable.find(name);
  const double value = found != ConstantNameTable.end() ? found->second : extendedConstant(name);
  outputs[0] = qvCreateDoubleScalar(value);
}

}  // namespace TOLVEX::ambrix
