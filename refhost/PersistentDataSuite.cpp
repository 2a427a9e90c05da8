// "QZGP Persistent Data Suite" 3: the preference store.
#include <string_view>

#include "refhost/Call.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

// Whether it is the entry that HostOptions::linearUnits replaces.
bool isLinearUnits(std::string_view section, std::string_view key) {
  return section == HOST_PREF_SECTION && key == HOST_PREF_LINEAR_UNITS;
}

HostError GetAppPrefsBlob(HostPrefsStore** store) {
  Call call(Operation::GetAppPrefsBlob);
  if (call.goesOn(store) && call.given(store, "the place for the store")) {
    *store = reinterpret_cast<HostPrefsStore*>(call.host().codec.lasting(HandleKind::Store, kStoreNumber));
  }
  if (TraceLine* line = call.traced()) line->handed("store", store);
  return call.finish();
}

void getPrefLong(Call& call, HostPrefsStore* store, const char* section, const char* key,
                 std::int32_t defaultValue, std::int32_t* value) {
  if ((store != nullptr && !call.isStore(store)) || !call.given(section, "the section") ||
      !call.given(key, "the key") || !call.given(value, "the place for the value")) {
    return;
  }
  if (store == nullptr) {
    *value = defaultValue;
    return;
  }
  Preferences& preferences = call.host().preferences;
  if (!preferences.find(section, key)) preferences.set(section, key, defaultValue);
  const auto& linearUnits = call.host().options.linearUnits;
  if (linearUnits && isLinearUnits(section, key)) {
    *value = *linearUnits;
  } else {
    *value = *preferences.find(section, key);
  }
}

HostError GetPrefLong(HostPrefsStore* store, const char* section, const char* key, std::int32_t defaultValue,
                      std::int32_t* value) {
  Call call(Operation::GetPrefLong);
  if (call.goesOn(value)) getPrefLong(call, store, section, key, defaultValue, value);
  const bool handedOut = !call.failed() && value != nullptr && section != nullptr && key != nullptr;
  if (handedOut && isLinearUnits(section, key)) call.host().linearUnits = *value;
  if (TraceLine* line = call.traced()) {
    line->handle("store", store).text("section", section).text("key", key);
    line->integer("default", defaultValue).handedInteger("value", value);
  }
  return call.finish();
}

constexpr QZGP_PersistentDataSuite3 table() {
  QZGP_PersistentDataSuite3 suite{};
  suite.GetAppPrefsBlob = GetAppPrefsBlob;
  suite.GetPrefLong = GetPrefLong;
  return suite;
}

}  // namespace

constinit const QZGP_PersistentDataSuite3 kPersistentDataSuite3 = table();

}  // namespace refhost
