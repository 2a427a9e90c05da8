// The beginning of a line with which a test reports what it leaves out, because this machine does not have
// it. scripts/test repeats these lines at its end.
#pragma once

namespace testsupport {

inline constexpr char kLeftOut[] = "LEFT OUT: ";

}  // namespace testsupport
