// "QZGP File Import Manager Suite" 3: the importers.
#include <string>
#include <vector>

#include "refhost/Call.h"
#include "refhost/ShownText.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

constexpr std::int32_t kCallbackCount = 2;

// Null after a refusal.
Importer* findImporter(Call& call, HostImporterId importer) {
  std::vector<Importer>& importers = call.host().importers;
  if (importer >= 1 && static_cast<std::size_t>(importer) <= importers.size()) {
    return &importers[static_cast<std::size_t>(importer) - 1];
  }
  call.refuse(HOST_ERR_BAD_HANDLE, "there is no importer of the number " + std::to_string(importer));
  return nullptr;
}

HostError RegisterImporterName(const char* name, HostImporterId* importer) {
  Call call(Operation::RegisterImporterName);
  if (call.goesOn(importer) && call.given(name, "the name") &&
      call.given(importer, "the place for the importer")) {
    if (*name == '\0') {
      call.refuse(HOST_ERR_REGISTRATION, "the importer's name is empty");
    } else {
      Importer added;
      added.name = shownText(name);
      call.host().importers.push_back(added);
      *importer = static_cast<HostImporterId>(call.host().importers.size());
    }
  }
  if (TraceLine* line = call.traced()) line->text("name", name).handedImporter("importer", importer);
  return call.finish();
}

void registerTypes(Call& call, HostImporterId importer, std::int32_t typeCount, const HostImporterType* types,
                   std::int32_t extensionCount, const HostImporterExtension* extensions) {
  Importer* found = findImporter(call, importer);
  if (found == nullptr || !call.given(types, "the array of types") ||
      !call.given(extensions, "the array of extensions")) {
    return;
  }
  if (typeCount < 1 || extensionCount < 1) {
    call.refuse(HOST_ERR_REGISTRATION, "an importer needs a type and an extension at least");
    return;
  }
  std::vector<std::string> texts;
  for (std::int32_t i = 0; i < extensionCount; ++i) {
    const std::string text = extensionText(extensions[i]);
    if (text.size() < 2 || text.front() != '.') {
      call.refuse(HOST_ERR_REGISTRATION,
                  "the extension \"" + shownText(text) + "\" is not a dot and letters");
      return;
    }
    texts.push_back(shownText(text));
  }
  found->extensions = texts;
}

HostError RegisterImporterTypes(HostImporterId importer, std::int32_t typeCount,
                                const HostImporterType* types, std::int32_t extensionCount,
                                const HostImporterExtension* extensions) {
  Call call(Operation::RegisterImporterTypes);
  if (call.goesOn()) registerTypes(call, importer, typeCount, types, extensionCount, extensions);
  if (TraceLine* line = call.traced()) {
    line->importer("importer", importer).types("types", types, typeCount);
    line->extensions("extensions", extensions, extensionCount);
  }
  return call.finish();
}

void registerCallbacks(Call& call, HostImporterId importer, std::int32_t count,
                       const HostImporterCallbacks* callbacks) {
  Importer* found = findImporter(call, importer);
  if (found == nullptr || !call.given(callbacks, "the set of callbacks")) return;
  if (count != kCallbackCount) {
    call.refuse(HOST_ERR_REGISTRATION, "the count of callbacks is " + std::to_string(count) + ", not 2");
  } else if (callbacks->none != nullptr) {
    call.refuse(HOST_ERR_REGISTRATION, "the first callback is not null");
  } else if (callbacks->import == nullptr || callbacks->verify == nullptr) {
    call.refuse(HOST_ERR_REGISTRATION, "the import or the verify callback is null");
  } else {
    found->callbacks = *callbacks;
  }
}

HostError RegisterImporterCallbacks(HostImporterId importer, std::int32_t count,
                                    const HostImporterCallbacks* callbacks) {
  Call call(Operation::RegisterImporterCallbacks);
  if (call.goesOn()) registerCallbacks(call, importer, count, callbacks);
  if (TraceLine* line = call.traced()) line->importer("importer", importer).integer("count", count);
  return call.finish();
}

constexpr QZGP_FileImportManagerSuite3 table() {
  QZGP_FileImportManagerSuite3 suite{};
  suite.RegisterImporterName = RegisterImporterName;
  suite.RegisterImporterTypes = RegisterImporterTypes;
  suite.RegisterImporterCallbacks = RegisterImporterCallbacks;
  return suite;
}

}  // namespace

constinit const QZGP_FileImportManagerSuite3 kFileImportManagerSuite3 = table();

}  // namespace refhost
