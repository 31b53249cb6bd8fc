// Compiles unless MISTAKE says which wrong type the call gets: 1 an int, 0 an unsigned long.
#include "gateway/library_calls.h"

namespace TOLVEX::ambrix {

void setFormat(CdfId file);
void setFormat(CdfId file) {
#if !defined(MISTAKE)
  const long format = 1;
#elif MISTAKE
  const int format = 1;
#else
  const unsigned long format = 1;
#endif
  callOnFile("CDFsetFormat", file, PUT_, CDF_FORMAT_, format);
}

}  // namespace TOLVEX::ambrix
