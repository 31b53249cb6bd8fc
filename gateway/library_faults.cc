#include "gateway/library_faults.h"

#include <cdf.h>

namespace TOLVEX::ambrix {
namespace {

LibraryVersion runningVersion() {
  LibraryVersion library;
  CDFlib(GET_,                                //
         LIB_VERSION_, &library.version,      //
         LIB_RELEASE_, &library.release,      //
         LIB_INCREMENT_, &library.increment,  //
         NULL_);
  return library;
}

}  // namespace

LibraryFaults& libraryFaults() {
  static LibraryFaults faults = faultsOf(runningVersion());
  return faults;
}

}  // namespace TOLVEX::ambrix
