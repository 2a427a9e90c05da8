// The importer's localised texts.
#pragma once

#include <cstdint>

#include "hostapi/HostTypes.h"
#include "hostutil/HostStrings.h"
#include "plugin/Globals.h"

namespace mayaimport {

// The entries of the table, by number.
enum MessageId : std::int32_t {
  kImporterName = 0,             // "Maya Scene"
  kOnlyMayaAscii = 1,            // "Only Baked Maya Ascii files are supported."
  kMessageWithContext = 2,       // "^^1: ^^2"
  kReadingMessage = 3,           // "Error reading Maya file."
  kUnexpectedEndMessage = 4,     // "Unexpected end of maya file."
  kInconsistentKeysMessage = 5,  // "Inconsistant number of keyframes for Maya camera."
  kSquareWord = 6,               // "Square"
  kSquareNamePattern = 7,        // "^^1 ^^2"
};

// The buffer, its NUL included, of messages that are formatted or copied first; longer ones are not shown.
// The reader and the key count pass theirs to the host straight from the table, whatever their length.
inline constexpr std::int64_t kMessageCapacity = 1024;

// Registers the table "Maya_Import" with the host and remembers it in Maya_Import_G_zref.
HostError RegisterMessages();

// Gives the table back.
void UnregisterMessages();

// The text of an entry in the user's language. Never null; "" when the table is not registered.
inline const char* LocalizedText(MessageId id) { return HostLocalizedString(Maya_Import_G_zref, id); }

}  // namespace mayaimport
