// Pictures that are kept beside the tests and compared pixel for pixel.
#pragma once
#include <gtest/gtest.h>
#include <string>

class Surface;

namespace GoldenPicture {

// Compares with golden/NAME.png. A difference fails and writes expected, actual and difference side by side
// into the test output.
testing::AssertionResult Compared(Surface const &actual, std::string const &name);
// The same; but with GLOG_UPDATE_GOLDEN=1 in the environment the picture is written anew, and that fails as
// well: a run that makes its own expectations has shown nothing.
testing::AssertionResult Matches(Surface const &actual, std::string const &name);
// The same with a picture of any other folder, whose path is from the top of the tree.
testing::AssertionResult MatchesFile(Surface const &actual, std::string const &path);

} // namespace GoldenPicture
