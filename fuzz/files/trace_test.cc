// Who is blamed for a crash, from stacks as the sanitizers print them.
#include "fuzz/files/trace.h"

#include <gtest/gtest.h>

namespace ambrix::fuzz {
namespace {

const std::string kRoot = AMBRIX_ROOT;
const std::string kSystem = "    #0 0x7f01 in memcpy (/lib/x86_64-linux-gnu/libc.so.6+0x1)\n";
const std::string kLibrary = "    #1 0x7f02 in DecompressRLE64 " + kRoot +
                             "build/cdf/cdf-3.6.3-source/src/lib/cdfrle64.c:120\n";
const std::string kModule =
    "    #2 0x7f03 in TOLVEX::ambrix::getVarData(int) " + kRoot + "variables/read_data.cc:50\n";
const std::string kHost = "    #1 0x7f04 in ambrix::allocate(unsigned long) " + kRoot +
                          "adapters/embedded/allocation.cc:20\n";

TEST(BlameTest, TheInnermostFrameThatIsNotTheSystemsCounts) {
  const Blame library = blameOf("==1==ERROR: SEGV\n" + kSystem + kLibrary + kModule);
  EXPECT_TRUE(library.known);
  EXPECT_FALSE(library.ours);
  EXPECT_EQ(library.place.substr(0, 16), "DecompressRLE64 ");
  const Blame module = blameOf("==1==ERROR: SEGV\n" + kSystem + kModule + kLibrary);
  EXPECT_TRUE(module.ours);
  EXPECT_EQ(module.place.substr(0, 28), "TOLVEX::ambrix::getVarData(i");
}

TEST(BlameTest, MemoryOfOursThatTheLibraryOverrunsIsOurFault) {
  const std::string overrun = "==1==ERROR: heap-buffer-overflow\n" + kSystem + kLibrary + kModule;
  const std::string allocated = "\nallocated by thread T0 here:\n    #0 0x7f05 in malloc (x)\n";
  EXPECT_TRUE(blameOf(overrun + allocated + kHost).ours);
  EXPECT_FALSE(blameOf(overrun + allocated + kLibrary + kModule).ours);
}

TEST(BlameTest, SourcesMayBeRelativeToTheBuild) {
  const std::string library =
      "    #0 0x7f02 in CDFlib ../cdf/cdf-3.6.3-source/src/lib/cdflib.c:1\n";
  const std::string module =
      "    #1 0x7f03 in TOLVEX::ambrix::f() ../../variables/read_data.cc:50\n";
  const std::string header = "    #1 0x7f03 in g() layers/gateway/gateway/library_calls.h:54\n";
  EXPECT_FALSE(blameOf("ERROR\n" + library + module).ours);
  EXPECT_TRUE(blameOf("ERROR\n" + kSystem + module + library).ours);
  EXPECT_TRUE(blameOf("ERROR\n" + kSystem + header + library).ours);
}

TEST(BlameTest, ALogWithoutAStackTellsNothing) {
  const Blame blame = blameOf("free(): double free detected\n");
  EXPECT_FALSE(blame.known);
  EXPECT_FALSE(blame.ours);
}

}  // namespace
}  // namespace ambrix::fuzz
