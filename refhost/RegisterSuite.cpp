// "QZGP Register Suite" 6: the death hook.
#include "refhost/Call.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

HostError RegisterDeathHook(std::int32_t pluginId, HostDeathHook hook, std::intptr_t refcon) {
  Call call(Operation::RegisterDeathHook);
  if (call.goesOn() && call.isPluginId(pluginId) &&
      call.given(reinterpret_cast<const void*>(hook), "the death hook")) {
    call.host().deathHook = hook;
    call.host().deathHookRefcon = refcon;
  }
  if (TraceLine* line = call.traced()) line->integer("pluginId", pluginId).integer("refcon", refcon);
  return call.finish();
}

constexpr QZGP_RegisterSuite6 table() {
  QZGP_RegisterSuite6 suite{};
  suite.RegisterDeathHook = RegisterDeathHook;
  return suite;
}

}  // namespace

constinit const QZGP_RegisterSuite6 kRegisterSuite6 = table();

}  // namespace refhost
