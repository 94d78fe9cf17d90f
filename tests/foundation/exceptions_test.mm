// SPDX-License-Identifier: MIT
// Exceptions that cross between C++ and Objective-C.

#import "toolkit/foundation/exceptions.hpp"

#include <gtest/gtest.h>

#include <new>
#include <stdexcept>

#import "tests/foundation/pool.hpp"

namespace qz::toolkit::foundation {
namespace {

using Exceptions = WithPool;

void raiseRange() { [NSException raise:NSRangeException format:@"beyond the end"]; }

TEST_F(Exceptions, OfFoundationLeaveSendAsToolkitExceptions) {
  bool unwound = false;
  struct Guard {
    bool& flag;
    ~Guard() { flag = true; }
  };
  try {
    send([&] {
      const Guard guard{unwound};
      raiseRange();
    });
    FAIL() << "nothing was raised";
  } catch (const Exception& exception) {
    EXPECT_EQ(exception.name(), "NSRangeException");
    EXPECT_EQ(exception.reason(), "beyond the end");
  }
  EXPECT_TRUE(unwound);
}

TEST_F(Exceptions, OfCppPassThroughSend) {
  EXPECT_THROW(send([] { throw std::out_of_range("far"); }), std::out_of_range);
  EXPECT_THROW(send([] { throw RangeException("far"); }), RangeException);
}

TEST_F(Exceptions, OfTheToolkitLeaveAnswerAsFoundations) {
  EXPECT_EQ(raisedBy([] { answer([] { throw RangeException("far"); }); }), "NSRangeException: far");
  EXPECT_EQ(raisedBy([] { answer([] { throw std::runtime_error("broken"); }); }),
            "NSGenericException: broken");
  EXPECT_EQ(raisedBy([] { answer([] { throw std::bad_alloc(); }); }).substr(0, 17),
            "NSMallocException");
}

TEST_F(Exceptions, OfFoundationPassThroughAnswer) {
  EXPECT_EQ(raisedBy([] { answer(raiseRange); }), "NSRangeException: beyond the end");
}

TEST_F(Exceptions, CrossSeveralTimes) {
  EXPECT_EQ(raisedBy([] { answer([] { send([] { answer([] { send(raiseRange); }); }); }); }),
            "NSRangeException: beyond the end");
}

TEST_F(Exceptions, LeaveResultsAlone) {
  EXPECT_EQ(sending([] { return 7; }), 7);
  EXPECT_EQ(answering([] { return 8; }), 8);
  bool called = false;
  sending([&] { called = true; });
  EXPECT_TRUE(called);
}

}  // namespace
}  // namespace qz::toolkit::foundation
