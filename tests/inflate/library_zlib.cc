// The CDF library's zlib for streams in a program that is linked with it in the usual order.
#include "inflate/library_zlib.h"

#include "tests/inflate/zlib_of_cdf.h"

namespace ambrix::inflate {

const LibraryZlib& libraryZlib() {
  static const LibraryZlib zlib{z_inflateInit2_, z_inflate, z_inflateEnd};
  return zlib;
}

}  // namespace ambrix::inflate
