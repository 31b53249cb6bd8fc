/* Prints the version of the CDF library that it is linked with; fails when that is not 3. */
#include <cdf.h>
#include <stdio.h>

int main(void) {
  long version = 0, release = 0, increment = 0;
  CDFstatus status = CDFlib(GET_, LIB_VERSION_, &version, LIB_RELEASE_, &release, LIB_INCREMENT_,
                            &increment, NULL_);
  printf("%ld.%ld.%ld", version, release, increment);
  return status == CDF_OK && version == 3 ? 0 : 1;
}
