// A host whose error call comes back: the error then leaves as an exception of the module.
#include <gtest/gtest.h>

#include <exception>
#include <string>
#include <utility>
#include <variant>

#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace {

int reports = 0;
const char* lastText = nullptr;  // where the last value of the last error has its characters
bool catalogueFails = false;

const char* textOf(const TOLVEX::ambrix::MessageArg& value) {
  const auto* text = std::get_if<std::string>(&value);
  return text == nullptr ? nullptr : text->data();
}

}  // namespace

extern "C" void qvErrMsgId(const TOLVEX::ambrix::MessageId& id) {
  ++reports;
  lastText = id.values.empty() ? nullptr : textOf(id.values.back());
}

extern "C" void qvGetMessageText(const TOLVEX::ambrix::MessageId& id, std::string& text) {
  if (catalogueFails) throw std::bad_alloc();
  text = "text of " + id.identifier;
}

namespace TOLVEX::ambrix {
namespace {

RaisedError raised() {
  try {
    raiseError(cdflib::mismatchedVarianceSize(3, 2));
  } catch (const RaisedError& error) {
    return error;
  }
}

TEST(ReturningHostTest, TheErrorIsReportedOnceAndThenThrown) {
  reports = 0;
  EXPECT_THROW(raiseError(validate::wrongNumberOfInputs()), RaisedError);
  EXPECT_EQ(reports, 1);
}

TEST(ReturningHostTest, TextsReachTheHostWithoutACopy) {
  std::string text(100, 'x');
  const char* const characters = text.data();
  EXPECT_THROW(raiseError(cdflib::libraryFailure("routine", std::move(text))), RaisedError);
  EXPECT_EQ(lastText, characters);
}

TEST(ReturningHostTest, TheExceptionTellsIdentifierTextAndValues) {
  const RaisedError error = raised();
  EXPECT_EQ(error.identifier(), "TOLVEX:ambrix:cdflib:mismatchedVarianceSize");
  EXPECT_STREQ(error.what(), "text of mismatchedVarianceSize");
  EXPECT_EQ(error.messageId().values, (std::vector<MessageArg>{3, 2}));
}

TEST(ReturningHostTest, TheExceptionIsAStandardOne) {
  try {
    raiseError(cdflib::fileOpenError());
  } catch (const std::exception& error) {
    EXPECT_STREQ(error.what(), "text of fileOpenError");
  }
}

TEST(ReturningHostTest, TheCatalogueIsAskedOnce) {
  const RaisedError error = raised();
  const char* const text = error.what();
  catalogueFails = true;
  EXPECT_EQ(error.what(), text);
  catalogueFails = false;
}

TEST(ReturningHostTest, ACatalogueThatFailsLeavesTheIdentifierAsText) {
  catalogueFails = true;
  EXPECT_STREQ(raised().what(), "mismatchedVarianceSize");
  catalogueFails = false;
}

TEST(ReturningHostTest, ACloneIsTheSameErrorOnItsOwn) {
  std::unique_ptr<RaisedError> clone;
  {
    const RaisedError error = raised();
    clone = error.clone();
    EXPECT_NE(clone.get(), &error);
  }
  EXPECT_EQ(clone->identifier(), "TOLVEX:ambrix:cdflib:mismatchedVarianceSize");
  EXPECT_EQ(clone->messageId().values, (std::vector<MessageArg>{3, 2}));
}

TEST(ReturningHostTest, RethrownItKeepsItsType) {
  const RaisedError error = raised();
  const std::exception& base = error;
  EXPECT_THROW(dynamic_cast<const RaisedError&>(base).rethrow(), RaisedError);
}

TEST(ReturningHostTest, ItTravelsThroughAnExceptionPointer) {
  std::exception_ptr carried;
  try {
    raiseError(cdflib::invalidOperation("fly"));
  } catch (...) {
    carried = std::current_exception();
  }
  try {
    std::rethrow_exception(carried);
  } catch (const RaisedError& error) {
    EXPECT_EQ(error.messageId().values, std::vector<MessageArg>{"fly"});
  }
}

}  // namespace
}  // namespace TOLVEX::ambrix
