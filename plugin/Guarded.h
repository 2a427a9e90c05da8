// The one place where an exception becomes a code.
#pragma once

#include <exception>
#include <type_traits>

#include "hostutil/HostReport.h"
#include "plugin/ErrorCodes.h"

namespace mayaimport {

// Runs the work, which returns a code or nothing, and returns the code that it ended with: its own or 0, an
// integer exception's value, or what the host's translate-and-report makes of a standard exception. Any other
// exception passes through.
template <typename Work>
HostError Guarded(Work&& work) {
  try {
    if constexpr (std::is_void_v<std::invoke_result_t<Work&>>) {
      work();
      return kNoError;
    } else {
      return work();
    }
  } catch (int code) {
    return code;
  } catch (const std::exception& exception) {
    return TranslateAndReport(exception);
  }
}

// The same where no exception may leave: at the C border, and while another exception is in flight. An
// exception that is neither an integer nor a standard one becomes HOST_ERR_EXCEPTION_OTHER, without a
// message.
template <typename Work>
HostError GuardedAtBorder(Work&& work) {
  try {
    return Guarded(work);
  } catch (...) {
    return HOST_ERR_EXCEPTION_OTHER;
  }
}

// Runs work whose failure is not reported: a standard exception ends it and is dropped. Any other exception
// passes through.
template <typename Work>
void Unreported(Work&& work) {
  try {
    work();
  } catch (const std::exception&) {
    return;
  }
}

// Keeps the first code that is not 0.
inline void KeepFirst(HostError* kept, HostError code) {
  if (*kept == kNoError) *kept = code;
}

}  // namespace mayaimport
