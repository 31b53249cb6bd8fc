// The bare calls of the CDF library that each command stands for.
#include "bench/library/plain_calls.h"

int main(int argumentCount, char** arguments) {
  using namespace ambrix_bench;
  constexpr Workload kWorkloads[] = {
      {"prepare", prepareFiles},
      {"read", readRow},
      {"read_column_major", readColumn},
      {"read_gzip", readGzip},
      {"read_gzip_file", readGzipFile},
      {"read_small_files", readSmallFiles},
      {"write", writeRow},
      {"write_column_major", writeColumn},
      {"write_gzip", writeGzip},
      {"walk_metadata", walkMetadata},
      {"write_metadata", writeMetadata},
      {"read_values", readSingles},
      {"read_values_hyper", readHyperSingles},
      {"read_text", readText},
      {"write_text", writeText},
      {"widen", copyForWidening},
      {"narrow", copyForNarrowing},
      {"read_strided", readStrided},
      {"epoch_breakdown", breakEpochsDown},
      {"epoch_compute", computeEpochs},
      {"epoch16_breakdown", breakEpochs16Down},
      {"epoch16_compute", computeEpochs16},
      {"library_failure", failInLibrary},
  };
  return serve(argumentCount, arguments, kWorkloads);
}
