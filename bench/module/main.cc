// The workloads through the module.
#include "bench/module/module_calls.h"

int main(int argumentCount, char** arguments) {
  using namespace ambrix_bench;
  constexpr Workload kWorkloads[] = {
      {"read", readRow},
      {"read_column_major", readColumn},
      {"read_gzip", readGzip},
      {"read_gzip_file", readGzipFile},
      {"read_small_files", readSmallFiles},
      {"read_small_files_keeping_memory", readSmallFilesKeepingMemory},
      {"read_checksum", readWithChecksum},
      {"write", writeRow},
      {"write_column_major", writeColumn},
      {"write_gzip", writeGzip},
      {"write_checksum", writeWithChecksum},
      {"walk_metadata", walkMetadata},
      {"walk_metadata_read_only", walkReadOnly},
      {"walk_metadata_cache_2", walkSmallCache},
      {"open_close", openValidated},
      {"open_close_unvalidated", openUnvalidated},
      {"write_metadata", writeMetadata},
      {"read_values", readSingles},
      {"read_values_hyper", readHyperSingles},
      {"read_values_gzip", readRandomGzip},
      {"read_values_gzip_100", readRandomGzipBlocks},
      {"read_text", readText},
      {"write_text", writeText},
      {"widen", widen},
      {"narrow", narrow},
      {"read_strided", readStrided},
      {"read_strided_cache_2", readStridedSmallCache},
      {"epoch_breakdown", breakEpochsDown},
      {"epoch_compute", computeEpochs},
      {"epoch16_breakdown", breakEpochs16Down},
      {"epoch16_compute", computeEpochs16},
      {"get_constant", getConstant},
      {"unknown_command", callUnknown},
      {"refused_argument", refuseArgument},
      {"library_failure", failInLibrary},
  };
  return serve(argumentCount, arguments, kWorkloads);
}
