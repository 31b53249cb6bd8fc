// Tests of single functions of the module, outside any call.
#pragma once

#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <exception>
#include <string>

#include "tests/support/given.h"
#include "tests/support/message_text.h"

namespace ambrix_test {

/// Ends by asking whether anything is left alive.
class HostTest : public testing::Test {
 protected:
  ~HostTest() override { EXPECT_EQ(::ambrix::liveCounts(), before_); }

 private:
  ::ambrix::LiveCounts before_ = ::ambrix::liveCounts();
};

/// The message of what a function raises, or the text of another exception; "no error" if it
/// returns.
template <typename Function>
std::string failureOf(const Function& function) {
  try {
    function();
    return "no error";
  } catch (const ::ambrix::Error& error) {
    return messageText(error.id());
  } catch (const std::exception& error) {
    return error.what();
  }
}

/// The text that a function makes.
template <typename Function>
std::string textOf(const Function& function) {
  return Array::adopt(function()).utf8();
}

}  // namespace ambrix_test
