// An exception that is neither an integer nor a standard exception.
#pragma once

#include <exception>

namespace testsupport {

// Whether the work ends in an exception that is neither an integer nor a standard exception.
template <typename Work>
bool ThrowsOther(Work&& work) {
  try {
    work();
  } catch (int) {
    return false;
  } catch (const std::exception&) {
    return false;
  } catch (...) {
    return true;
  }
  return false;
}

}  // namespace testsupport
