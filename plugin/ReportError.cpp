#include "plugin/ReportError.h"

#include "plugin/ErrorCodes.h"

namespace mayaimport {

void ReportError(QZGP_SuiteHandler& suites, const char* context, MessageId id) {
  char message[kMessageCapacity] = "";
  const HostError code = context != nullptr
                             ? HostStringFormat(message, kMessageCapacity, LocalizedText(kMessageWithContext),
                                                context, LocalizedText(id))
                             : HostStringCopy(message, kMessageCapacity, LocalizedText(id));
  if (code == kNoError) suites.UtilitySuite7().ShowMessage(G_plugin_idL, message);
}

}  // namespace mayaimport
