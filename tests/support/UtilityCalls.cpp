#include "tests/support/UtilityCalls.h"

#include <dlfcn.h>

#include <cstdint>
#include <utility>

#include "hostutil/UTF16String.h"

namespace {

testsupport::UtilityCalls noted;

// The service of the library, which the definition below it hides.
template <typename Service>
Service* Original(const char* name) {
  return reinterpret_cast<Service*>(dlsym(RTLD_NEXT, name));
}

}  // namespace

namespace testsupport {

UtilityCalls TakeUtilityCalls() { return std::exchange(noted, {}); }

}  // namespace testsupport

HostError RecordListCreate(std::int64_t recordSize, std::int64_t growth, std::int64_t initial,
                           RecordList** list) {
  noted.created.push_back({recordSize, growth, initial});
  static const auto original = Original<decltype(RecordListCreate)>("RecordListCreate");
  return original(recordSize, growth, initial, list);
}

HostError RecordListDispose(RecordList* list) {
  if (list != nullptr) noted.disposed.push_back(list);
  static const auto original = Original<decltype(RecordListDispose)>("RecordListDispose");
  return original(list);
}

HostError HostStripExtension(const UTF16String* text, std::int32_t flag, UTF16String** stripped) {
  noted.stripFlags.push_back(flag);
  static const auto original = Original<decltype(HostStripExtension)>("HostStripExtension");
  return original(text, flag, stripped);
}
