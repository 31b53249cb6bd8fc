// The most memory that a read takes: what it returns, the bytes that characters come from, and no
// second copy of anything.
#include <cstddef>
#include <fstream>
#include <string>

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

constexpr std::size_t kValues = std::size_t{6} << 20U;       // 48 MiB of doubles
constexpr std::size_t kCharacters = std::size_t{16} << 20U;  // 16 MiB of bytes
constexpr std::size_t kTextLength = 1024;
constexpr std::size_t kConstant = std::size_t{3} << 20U;  // buffers of the library, and the rest

/// Bytes of a quantity in the system's account of this process, such as "VmHWM".
std::size_t account(const std::string& quantity) {
  std::ifstream status("/proc/self/status");
  for (std::string line; std::getline(status, line);) {
    if (line.starts_with(quantity + ':'))
      return std::stoul(line.substr(quantity.size() + 1)) << 10U;
  }
  return 0;
}

/// Whether the system lets the peak begin anew.
bool forgetPeak() {
  std::ofstream references("/proc/self/clear_refs");
  references << "5" << std::flush;
  return references.good() && account("VmHWM") > 0;
}

class PeakMemoryTest : public ModuleTest {
 protected:
  /// The bytes by which the peak of reading this many records exceeds what was in use before.
  std::size_t peakOfReading(const Given& file, double records) {
    const std::size_t before = account("VmRSS");
    const Array values = result("hyperGetVarData", {file, 0, 0, records, 1, {}, {}, {}});
    EXPECT_FALSE(values.bytes().empty());
    const std::size_t peak = account("VmHWM");
    return peak > before ? peak - before : 0;
  }
};

#define AMBRIX_NEED_PEAK() \
  if (!forgetPeak()) GTEST_SKIP() << "this system does not tell the peak of memory use"

TEST_F(PeakMemoryTest, ANumericReadTakesTheArrayAndAConstant) {
  const Given created = create();
  createVar(created, {.datatype = 45});
  results("hyperPutVarData", {created,
                              0,
                              0,
                              double{kValues},
                              1,
                              {},
                              {},
                              {},
                              Array::zeros(ClassId::kDouble, {kValues, 1})});
  const Given file = reopen(created);
  AMBRIX_NEED_PEAK();
  const std::size_t peak = peakOfReading(file, double{kValues});
  EXPECT_GE(peak, kValues * sizeof(double) - kConstant);
  EXPECT_LE(peak, kValues * sizeof(double) + kConstant);
}

TEST_F(PeakMemoryTest, ATextReadTakesTheArrayTheBytesAndAConstant) {
  const Given created = create();
  createVar(created, {.datatype = 51, .elements = kTextLength});
  const double records = double{kCharacters} / kTextLength;
  results("hyperPutVarData",
          {created, 0, 0, records, 1, {}, {}, {}, Array::text(std::u16string(kCharacters, u'a'))});
  const Given file = reopen(created);
  AMBRIX_NEED_PEAK();
  const std::size_t peak = peakOfReading(file, records);
  EXPECT_GE(peak, kCharacters * 3 - kConstant);
  EXPECT_LE(peak, kCharacters * 3 + kConstant);
}

}  // namespace
}  // namespace ambrix_test
