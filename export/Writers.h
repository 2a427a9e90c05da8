// The writers of the table in Formats.cpp. Each is a Format::write.
#pragma once

#include <string_view>

#include "export/Format.h"

namespace interchange {

bool WriteGltf(const Composition& composition, const WriteOptions& options, Files& files,
               diag::Collector* diagnostics);
bool WriteGlb(const Composition& composition, const WriteOptions& options, Files& files,
              diag::Collector* diagnostics);
bool WriteUsda(const Composition& composition, const WriteOptions& options, Files& files,
               diag::Collector* diagnostics);
bool WriteChan(const Composition& composition, const WriteOptions& options, Files& files,
               diag::Collector* diagnostics);
bool WriteCsv(const Composition& composition, const WriteOptions& options, Files& files,
              diag::Collector* diagnostics);

}  // namespace interchange
