#include "refhost/ShownText.h"

#include <cstdint>

#include "hostutil/HostSetup.h"
#include "text/Utf8.h"

namespace refhost {
std::string shownText(std::string_view bytes) { return text::ValidUtf8(bytes); }

std::string shownUnits(const HostUTF16Unit* units) {
  const std::int64_t length = HostUnitsToShownText(units, nullptr, 0);
  std::string text(static_cast<std::size_t>(length) + 1, '\0');
  HostUnitsToShownText(units, text.data(), length + 1);
  text.pop_back();
  return text;
}

}  // namespace refhost
