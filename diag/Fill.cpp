#include "diag/Fill.h"

#include <fmt/args.h>
#include <fmt/format.h>

#include "diag/ShownText.h"

namespace diag {

std::string Fill(std::string_view text, const std::vector<std::string>& arguments) {
  fmt::dynamic_format_arg_store<fmt::format_context> shown;
  for (const std::string& argument : arguments) shown.push_back(ShownText(argument));
  return fmt::vformat(text, shown);
}

}  // namespace diag
