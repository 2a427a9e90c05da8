// The word with which a test begins the line that says what it leaves out, because this machine does not have
// it. scripts/test repeats these lines where it ends.
#pragma once

namespace testsupport {

inline constexpr char kLeftOut[] = "LEFT OUT: ";

}  // namespace testsupport
