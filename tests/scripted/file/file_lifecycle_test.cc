// Creating, opening, closing and deleting files.
#include "host/qvh.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;
using FileLifecycleTest = ScriptedTest;
using TOLVEX::ambrix::CdfId;

constexpr long kBadCdfId = -2002;
constexpr long kCloseError = -2055;

TEST_F(FileLifecycleTest, CreateReturnsAndRegistersTheIdentifier) {
  fake.answer("handle", {8});
  EXPECT_EQ(shown(result("create", {"new.cdf"})), "uint64 1x1 [8]");
  EXPECT_THAT(calls(), ElementsAre("CDFcreateCDF 'new.cdf'"));
  EXPECT_THAT(openFiles(), ElementsAre(CdfId{7}, CdfId{8}));
}

TEST_F(FileLifecycleTest, OpenSwitchesToZVariableMode) {
  fake.answer("handle", {8});
  EXPECT_EQ(shown(result("open", {"old.cdf"})), "uint64 1x1 [8]");
  EXPECT_THAT(calls(), ElementsAre("OPEN_ CDF_ 'old.cdf'", "SELECT_ CDF_ 8 | CDF_zMODE_ 2"));
  EXPECT_THAT(openFiles(), ElementsAre(CdfId{7}, CdfId{8}));
}

TEST_F(FileLifecycleTest, NamesGoToTheLibraryInUtf8AndEmptyOnesAsTheyAre) {
  call("open", {Array::text(u"\u00E9")});
  call("open", {""});
  call("create", {""});
  EXPECT_THAT(calls(), testing::Contains("OPEN_ CDF_ '\xC3\xA9'"));
  fake.forgetCalls();
  call("create", {""});
  EXPECT_THAT(calls(), ElementsAre("CDFcreateCDF ''"));
}

TEST_F(FileLifecycleTest, NamesThatDoNotConvertAreRefusedBeforeTheLibrary) {
  const Given name = Array::text(std::u16string{u'\xD800'});
  EXPECT_EQ(errorOf("open", {name}), cdflib("invalidCharError"));
  EXPECT_EQ(errorOf("create", {name}), cdflib("invalidCharError"));
  EXPECT_THAT(calls(), IsEmpty());
}

// The library would create or open the file of the shorter path and report a failure.
TEST_F(FileLifecycleTest, PathsThatTheLibraryWouldCutAreRefusedBeforeIt) {
  const std::string longest(512, 'p');
  EXPECT_THAT(call("create", {longest.c_str()}), SizeIs(1));
  EXPECT_THAT(call("open", {longest.c_str()}), SizeIs(1));
  fake.forgetCalls();
  const std::string tooLong = longest + ' ';  // blanks at the end count, too
  EXPECT_EQ(errorOf("create", {tooLong.c_str()}), cdflib("fileCreateError"));
  EXPECT_EQ(errorOf("open", {tooLong.c_str()}), cdflib("fileOpenError"));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(FileLifecycleTest, ARefusedFileHasNoLibraryText) {
  fake.failCall(1, -2013);
  EXPECT_EQ(errorOf("create", {"exists.cdf"}), cdflib("fileCreateError"));
  fake.failCall(1, -2013);
  EXPECT_EQ(errorOf("open", {"missing.cdf"}), cdflib("fileOpenError"));
  fake.failCall(1, -1);
  EXPECT_EQ(errorOf("open", {"missing.cdf"}), cdflib("fileOpenError"));
  EXPECT_THAT(fake.statusCalls(), IsEmpty());
}

TEST_F(FileLifecycleTest, PositiveStatusesSucceed) {
  fake.answer("handle", {8});
  fake.endWith("8", 1003);
  fake.endWith("new.cdf", 1001);
  EXPECT_THAT(call("create", {"new.cdf"}), SizeIs(1));
  EXPECT_THAT(call("open", {"new.cdf"}), SizeIs(1));
  EXPECT_THAT(call("close", {file(8)}), IsEmpty());
}

TEST_F(FileLifecycleTest, AFileWhoseModeCannotBeSetIsNotRegisteredAndStaysOpenInTheLibrary) {
  fake.answer("handle", {8});
  fake.failCall(2, -2045);
  EXPECT_EQ(errorOf("open", {"old.cdf"}), libraryFailure("CDFsetzMode", -2045));
  EXPECT_THAT(calls(), SizeIs(2));
  EXPECT_EQ(errorOf("close", {file(8)}), cdflib("invalidFileId"));
}

TEST_F(FileLifecycleTest, CloseUnregistersAfterSuccess) {
  EXPECT_THAT(call("close", {file()}), IsEmpty());
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CLOSE_ CDF_"));
  EXPECT_EQ(errorOf("close", {file()}), cdflib("invalidFileId"));
  EXPECT_EQ(errorOf("delete", {file()}), cdflib("invalidFileId"));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(FileLifecycleTest, DeleteUnregistersAfterSuccess) {
  EXPECT_THAT(call("delete", {file()}), IsEmpty());
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | DELETE_ CDF_"));
  EXPECT_EQ(errorOf("delete", {file()}), cdflib("invalidFileId"));
}

TEST_F(FileLifecycleTest, AnIdentifierAsADoubleIsRefused) {
  EXPECT_EQ(errorOf("close", {7}), validate("argumentNotUint64Scalar", "CDFID"));
  EXPECT_EQ(errorOf("delete", {7}), validate("argumentNotUint64Scalar", "CDFID"));
}

TEST_F(FileLifecycleTest, AFailedCloseLeavesTheIdentifierRegisteredButNotUsable) {
  fake.failCall(1, kCloseError);
  EXPECT_EQ(errorOf("close", {file()}), libraryFailure("CDFcloseCDF", kCloseError));
  EXPECT_THAT(openFiles(), ElementsAre(CdfId{7}));
  fake.forgetCalls();
  EXPECT_EQ(errorOf("close", {file()}), libraryFailure("CDFcloseCDF", kBadCdfId));
  EXPECT_EQ(errorOf("delete", {file()}), libraryFailure("CDFdelete", kBadCdfId));
  EXPECT_EQ(errorOf("inquire", {file()}), libraryFailure("CDFinquireCDF", kBadCdfId));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(FileLifecycleTest, AnAbandonedFileIsClosedAndUnregistered) {
  qvhAbandonFile(7);
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CLOSE_ CDF_"));
  EXPECT_THAT(openFiles(), IsEmpty());
  qvhAbandonFile(7);
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(FileLifecycleTest, AFileThatDoesNotCloseCanBeAbandoned) {
  fake.failCall(1, kCloseError);
  errorOf("close", {file()});
  fake.forgetCalls();
  qvhAbandonFile(7);
  EXPECT_THAT(calls(), IsEmpty());
  EXPECT_THAT(openFiles(), IsEmpty());
}

TEST_F(FileLifecycleTest, AnIdentifierHandedOutAnewIsUsableAgain) {
  fake.failCall(1, kCloseError);
  errorOf("close", {file()});
  call("open", {"other.cdf"});
  fake.forgetCalls();
  EXPECT_THAT(call("close", {file()}), IsEmpty());
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CLOSE_ CDF_"));
}

TEST_F(FileLifecycleTest, AFailedDeleteFreesTheFileOnlyWhenTheLibraryHasBegun) {
  fake.failCall(1, -2070);  // read-only: refused at once
  EXPECT_EQ(errorOf("delete", {file()}), libraryFailure("CDFdelete", -2070));
  EXPECT_EQ(errorOf("getFormat", {file()}), unrecognized(0, "FORMAT"));
  for (const long status : {-2088L, -2089L, -2106L}) {
    call("open", {"any.cdf"});
    fake.failCall(1, status);
    EXPECT_EQ(errorOf("delete", {file()}), libraryFailure("CDFdelete", status));
    EXPECT_EQ(errorOf("getFormat", {file()}), libraryFailure("CDFgetFormat", kBadCdfId));
  }
}

TEST_F(FileLifecycleTest, ADeleteThatEndsWithAWarningHasFreedTheFile) {
  for (const long status : {-1L, -1001L, -1999L}) {
    call("open", {"any.cdf"});
    fake.failCall(1, status);
    EXPECT_EQ(errorOf("delete", {file()}), libraryFailure("CDFdelete", status));
    EXPECT_EQ(errorOf("getFormat", {file()}), libraryFailure("CDFgetFormat", kBadCdfId));
  }
}

}  // namespace
}  // namespace ambrix_test
