// "QZGP Utility Suite" 7: messages and silent errors.
#include "refhost/Call.h"
#include "refhost/ShownText.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

HostError ShowMessage(std::int32_t pluginId, const char* text) {
  Call call(Operation::ShowMessage);
  if (call.goesOn() && call.isPluginId(pluginId) && call.given(text, "the text")) {
    call.host().messages.show(shownText(text));
  }
  if (TraceLine* line = call.traced()) line->integer("pluginId", pluginId).text("text", text);
  return call.finish();
}

HostError BeginSilentErrors(HostSilentErrorState* state) {
  Call call(Operation::BeginSilentErrors);
  if (call.goesOn() && call.given(state, "the state record")) call.host().messages.beginSilence(state);
  call.traced();
  return call.finish();
}

HostError EndSilentErrors(std::int32_t report, HostSilentErrorState* state) {
  Call call(Operation::EndSilentErrors);
  if (!call.goesOn()) {
    call.host().silenceEndFailed = true;
  } else if (call.given(state, "the state record") && !call.host().messages.endSilence(state, report != 0)) {
    call.refuse(HOST_ERR_SILENT_ERRORS, "no silent errors had begun with this state record");
  }
  if (TraceLine* line = call.traced()) line->integer("report", report);
  return call.finish();
}

constexpr QZGP_UtilitySuite7 table() {
  QZGP_UtilitySuite7 suite{};
  suite.ShowMessage = ShowMessage;
  suite.BeginSilentErrors = BeginSilentErrors;
  suite.EndSilentErrors = EndSilentErrors;
  return suite;
}

}  // namespace

constinit const QZGP_UtilitySuite7 kUtilitySuite7 = table();

}  // namespace refhost
