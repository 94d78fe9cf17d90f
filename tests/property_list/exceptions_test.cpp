// SPDX-License-Identifier: MIT
// The toolkit's exceptions, as a C++ program catches them.
#include <gtest/gtest.h>

#include "qz/toolkit/exception.hpp"

namespace qz::toolkit {
namespace {

/// Returns the text of the exception that `raise` throws, as any standard exception tells it.
template <class Raise>
std::string textOf(Raise raise) {
  try {
    raise();
  } catch (const std::exception& exception) {
    return exception.what();
  }
  return "";
}

TEST(Exceptions, TellTheirReasonAsStandardExceptions) {
  EXPECT_EQ(textOf([] { throw Exception("MyException", "too wide"); }), "too wide");
  EXPECT_EQ(textOf([] { throw RangeException("too far"); }), "too far");
  EXPECT_EQ(textOf([] { raiseUnrecognizedSelector("NSDate", "intValue"); }),
            "-[NSDate intValue]: unrecognized selector sent to instance");
}

}  // namespace
}  // namespace qz::toolkit
