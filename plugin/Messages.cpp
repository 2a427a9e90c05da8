#include "plugin/Messages.h"

#include <iterator>

namespace mayaimport {

namespace {

constexpr const char* kEntries[] = {
    "$$$/QZ/Maya_Import/LStr/0000=Maya Scene",
    "$$$/QZ/Maya_Import/LStr/0001=Only Baked Maya Ascii files are supported.",
    "$$$/QZ/Maya_Import/LStr/0002=^^1: ^^2",
    "$$$/QZ/Maya_Import/LStr/0003=Error reading Maya file.",
    "$$$/QZ/Maya_Import/LStr/0004=Unexpected end of maya file.",
    // Deliberate: the spelling "Inconsistant". A search for the text as users see it finds it only so.
    "$$$/QZ/Maya_Import/LStr/0005=Inconsistant number of keyframes for Maya camera.",
    "$$$/QZ/Maya_Import/LStr/0006=Square",
    "$$$/QZ/Maya_Import/LStr/0007=^^1 ^^2",
};

}  // namespace

HostError RegisterMessages() {
  return HostRegisterStringTable("Maya_Import", kEntries, static_cast<std::int32_t>(std::size(kEntries)),
                                 &Maya_Import_G_zref);
}

void UnregisterMessages() {
  HostUnregisterStringTable(Maya_Import_G_zref);
  Maya_Import_G_zref = nullptr;
}

}  // namespace mayaimport
