// The two callbacks that the host calls for a file of the importer's type.
#pragma once

#include <cstdint>

#include "hostapi/FileImportManagerSuite.h"
#include "hostutil/HostFile.h"
#include "plugin/QZGP_SuiteHandler.h"

namespace mayaimport {

// Reads the file and builds its composition in the folder. The path is NUL-terminated UTF-16; null counts as
// empty. Returns the code of the first failure in parsing or building, else of the first one in reading, else
// 0; what was built before a failure stays. For a file that is no Maya ASCII scene the user sees a message;
// it is no failure.
HostError ImportFileCallback(const HostUTF16Unit* path, void* ignored1, void* ignored2, VOR_Item* folder);

// Sets *canImport to 1 when the file begins as a Maya ASCII scene does, without showing anything. Returns 3
// when canImport is null, and the first failure else; *canImport is then 0, but for a failure to end the
// silence or to dispose of the file.
HostError VerifyFileCallback(const HostUTF16Unit* path, void* ignored, std::uint8_t* canImport);

// Sets *isMaya to whether the file begins with "//Maya" in any case. Unless `quiet`, the user sees a
// message for a file that does not. Returns 3 when the file or the flag is null, else the first failure of
// opening, reading 10 bytes or closing.
HostError CheckMayaHeader(HostFile* file, QZGP_SuiteHandler& suites, bool quiet, std::uint8_t* isMaya);

}  // namespace mayaimport
