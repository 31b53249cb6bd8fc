// Writing attribute entries: one handler for both commands, the attribute's scope decides.
#include <sys/mman.h>

#include <span>

#include "tests/support/datatypes.h"
#include "tests/support/host_texts.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const char* const kScope = "SELECT_ CDF_ 7 | ATTR_ 2 | GET_ ATTR_SCOPE_";

class PutEntryTest : public ScriptedTest {
 protected:
  PutEntryTest() { fake.answer("ATTR_SCOPE_", {1}); }
};

TEST_F(PutEntryTest, TheScopeDecidesTheKindWhicheverCommandIsUsed) {
  for (const char* command : {"putAttrgEntry", "putAttrEntry"}) {
    fake.answer("ATTR_SCOPE_", {1});
    EXPECT_THAT(call(command, {file(), 2, 5, 45, {1, 2, 3}}), IsEmpty());
    EXPECT_THAT(calls(), ElementsAre(kScope, "CDFputAttrEntry 7 1 2 5 45 3"));
    fake.answer("ATTR_SCOPE_", {2});
    EXPECT_THAT(call(command, {file(), 2, 5, 45, {1, 2, 3}}), IsEmpty());
    EXPECT_THAT(calls(), ElementsAre(kScope, "CDFputAttrEntry 7 3 2 5 45 3"));
  }
}

TEST_F(PutEntryTest, AnUnknownScopeIsUnrecognized) {
  for (const long scope : {3L, 0L, 4L}) {
    fake.answer("ATTR_SCOPE_", {scope});
    EXPECT_EQ(errorOf("putAttrEntry", {file(), 2, 5, 45, 1}), unrecognized(scope, "SCOPE"));
    EXPECT_THAT(calls(), ElementsAre(kScope));
  }
}

TEST_F(PutEntryTest, NumbersGoByteForByte) {
  fake.readBytes(4);
  call("putAttrEntry", {file(), 2, 5, 2, row<std::int16_t>({0x0102, 0x0304})});
  EXPECT_THAT(fake.bytesRead(), ElementsAre(2, 1, 4, 3));
}

TEST_F(PutEntryTest, CharactersGoAsTheirLowBitsWithAZeroBehindThem) {
  for (const int datatype : {51, 52}) {
    fake.readBytes(4);
    call("putAttrgEntry", {file(), 2, 5, datatype, Array::text(u"a\u00E9\u20AC")});
    EXPECT_THAT(fake.bytesRead(), ElementsAre('a', 0xE9, 0xAC, 0));
    EXPECT_EQ(calls()[1], "CDFputAttrEntry 7 1 2 5 " + std::to_string(datatype) + " 3");
  }
}

TEST_F(PutEntryTest, TheHostNarrowsSignedTextsOnly) {
  narrowCopiesMade();  // those of the commands' names count, too
  call("putAttrEntry", {file(), 2, 5, 52, "abc"});
  const std::size_t unsignedText = narrowCopiesMade();
  call("putAttrEntry", {file(), 2, 5, 51, "abc"});
  EXPECT_EQ(narrowCopiesMade(), unsignedText + 1);
}

TEST_F(PutEntryTest, AnEmptyTextHandsOverAZeroByteAndNeverNull) {
  fake.readBytes(1);
  call("putAttrEntry", {file(), 2, 5, 51, ""});
  EXPECT_THAT(fake.bytesRead(), ElementsAre(0));
  EXPECT_THAT(calls()[1], "CDFputAttrEntry 7 1 2 5 51 0");
  call("putAttrEntry", {file(), 2, 5, 45, {}});
  EXPECT_FALSE(fake.sawNullData());
}

TEST_F(PutEntryTest, AnEpoch16CountsPairs) {
  call("putAttrEntry", {file(), 2, 5, 32, {1, 2, 3, 4}});
  EXPECT_EQ(calls()[1], "CDFputAttrEntry 7 1 2 5 32 2");
  call("putAttrEntry", {file(), 2, 5, 32, {1, 2, 3}});
  EXPECT_EQ(calls()[1], "CDFputAttrEntry 7 1 2 5 32 1");
}

TEST_F(PutEntryTest, EachDatatypeTakesItsClassOnly) {
  for (const CdfDatatype& datatype : kCdfDatatypes) {
    const auto code = static_cast<double>(datatype.code);
    for (const ClassId classId : ::ambrix::kClassIds) {
      const Given value = Array::zeros(classId, {1, 2});
      const std::string error = errorOf("putAttrEntry", {file(), 2, 5, code, value});
      EXPECT_EQ(error == "no error", classId == datatype.classId) << datatype.name << ' ' << error;
    }
  }
}

TEST_F(PutEntryTest, AnotherClassIsRefusedBeforeTheFileIsTouched) {
  EXPECT_EQ(errorOf("putAttrgEntry", {file(), 2, 5, 4, 1}),
            cdflib("badPutAttrEntryDatatype", "double", "CDF_INT4"));
  EXPECT_EQ(errorOf("putAttrgEntry", {file(), 2, 5, 45, "x"}),
            cdflib("badPutAttrEntryDatatype", "char", "CDF_DOUBLE"));
  EXPECT_EQ(errorOf("putAttrgEntry", {file(), 2, 5, 51, row<float>({1})}),
            cdflib("badPutAttrEntryDatatype", "single", "CDF_CHAR"));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(PutEntryTest, TheDatatypeIsLookedAtBeforeTheClass) {
  for (const long datatype : {3L, 8L, 33L, 0L, -1L}) {
    EXPECT_EQ(errorOf("putAttrgEntry", {file(), 2, 5, static_cast<double>(datatype), "x"}),
              unrecognized(datatype, "DATATYPE"));
  }
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(PutEntryTest, MoreValuesThan32BitsCountReachTheLibraryAsANumberThatItRefuses) {
  constexpr std::size_t kBeyond = std::size_t{1} << 31;
  void* memory =
      mmap(nullptr, kBeyond, PROT_READ, MAP_PRIVATE | MAP_ANONYMOUS | MAP_NORESERVE, -1, 0);
  ASSERT_NE(memory, MAP_FAILED);
  const std::span<const std::int8_t> values(static_cast<const std::int8_t*>(memory), kBeyond);
  call("putAttrEntry", {file(), 2, 5, 1, Array::borrowed(values, {1, kBeyond})});
  EXPECT_EQ(calls()[1], "CDFputAttrEntry 7 1 2 5 1 -1");
  munmap(memory, kBeyond);
}

TEST_F(PutEntryTest, FailuresNameTheRoutineOfTheKind) {
  fake.failCall(1, -2017);
  EXPECT_EQ(errorOf("putAttrEntry", {file(), 2, 5, 45, 1}),
            libraryFailure("CDFgetAttrScope", -2017));
  fake.failCall(2, -2017);
  EXPECT_EQ(errorOf("putAttrEntry", {file(), 2, 5, 45, 1}),
            libraryFailure("CDFputAttrgEntry", -2017));
  fake.answer("ATTR_SCOPE_", {2});
  fake.failCall(2, -2017);
  EXPECT_EQ(errorOf("putAttrgEntry", {file(), 2, 5, 51, "text"}),
            libraryFailure("CDFputAttrzEntry", -2017));
}

}  // namespace
}  // namespace ambrix_test
