// Messages to the user.
#pragma once

#include "plugin/Messages.h"
#include "plugin/QZGP_SuiteHandler.h"

namespace mayaimport {

// Shows a localised text through the host, after "context: " when the context is not null. A message that
// does not fit kMessageCapacity is not shown. A failure to show it changes nothing; a missing suite
// throws 13.
void ReportError(QZGP_SuiteHandler& suites, const char* context, MessageId id);

}  // namespace mayaimport
