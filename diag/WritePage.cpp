// diagnostics-page: prints docs/diagnostics.md to standard output.
#include <cstdio>
#include <string>

#include "diag/Page.h"

int main() {
  const std::string page = diag::Page();
  return std::fwrite(page.data(), 1, page.size(), stdout) == page.size() && std::fflush(stdout) == 0 ? 0 : 5;
}
