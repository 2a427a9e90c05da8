#include "refhost/LedgerReport.h"

#include <string>

#include "hostutil/HostSetup.h"
#include "refhost/HostState.h"
#include "refhost/ShownText.h"
#include "refhost/StreamTable.h"

namespace refhost {
namespace {

std::string property(const Layer& layer, const Stream& stream) {
  return std::string(streamName(stream.id, layer.kind)) + " of layer:" + std::to_string(layer.number);
}

// Deliberate: a camera's position and zoom handles are not leaks when their value could not be set, nor is
// its zoom handle when the stream already held keys. Counted as leaks, they would make every rehearsal of
// these failures end with status 1, although the importer keeps the handles on purpose.
bool isKeptByDesign(const HostState& host, std::uint32_t number, const HeldStream& held) {
  if (held.releaseFailed) return true;
  if (held.layer->kind != LayerKind::Camera) return false;
  const std::int32_t id = held.stream->id;
  if (id != HOST_STREAM_POSITION && id != HOST_STREAM_ZOOM) return false;
  const bool hadNoSuite = !held.valueSet && number <= host.streamsWithoutValueSuite;
  return held.valueFailed || hadNoSuite || (id == HOST_STREAM_ZOOM && held.heldKeys);
}

void listSuites(const HostState& host, std::vector<Leftover>& leftovers) {
  for (const OfferedSuite& suite : host.suites.all()) {
    if (suite.held == 0) continue;
    leftovers.push_back(
        {"suite " + std::string(suite.name) + " " + std::to_string(suite.version) +
             (suite.held == 1 ? " (held once)" : " (held " + std::to_string(suite.held) + " times)"),
         suite.failedReleases >= suite.held});
  }
}

void listHandles(HostState& host, std::vector<Leftover>& leftovers) {
  for (const auto& [number, held] : host.streams.held()) {
    leftovers.push_back(
        {"stream:" + std::to_string(number) + " (" + property(*held->layer, *held->stream) + ")",
         isKeptByDesign(host, number, *held)});
  }
  for (const auto& [number, batch] : host.batches.held()) {
    leftovers.push_back({"batch:" + std::to_string(number) + " (" + property(*batch->layer, *batch->stream) +
                             ", " + std::to_string(batch->times.size()) + " keys)",
                         batch->endFailed});
  }
  for (const auto& [number, block] : host.memory.held()) {
    leftovers.push_back({"mem:" + std::to_string(number) + " (" + shownText(block->name) + ", " +
                             std::to_string(block->size) + " bytes)",
                         block->freeFailed});
  }
}

struct UtilityVisit {
  std::vector<Leftover>* leftovers;
  bool mayKeepFile;  // one file object is kept by design in an import
};

void visitUtilityObject(void* context, std::int32_t kind, const char* description,
                        std::int32_t releaseFailed) {
  UtilityVisit& visit = *static_cast<UtilityVisit*>(context);
  const bool releaseWasMadeToFail = releaseFailed != 0;
  const bool importFile = !releaseWasMadeToFail && kind == HOST_LEDGER_FILE && visit.mayKeepFile;
  if (importFile) visit.mayKeepFile = false;
  visit.leftovers->push_back({shownText(description), releaseWasMadeToFail || importFile, importFile});
}

}  // namespace

std::vector<Leftover> drawLedger(HostState& host) {
  std::vector<Leftover> leftovers;
  listSuites(host, leftovers);
  listHandles(host, leftovers);
  UtilityVisit visit{&leftovers, host.callback == Callback::Import};
  HostVisitLedger(visitUtilityObject, &visit);
  return leftovers;
}

void releaseLeftovers(HostState& host) {
  host.suites.giveAllBack();
  for (const auto& held : host.batches.held()) {
    host.allowance.keys += static_cast<std::int64_t>(held.second->times.size());
  }
  for (const auto& held : host.memory.held()) host.allowance.memory += held.second->size;
  host.batches.removeAll();
  host.streams.removeAll();
  host.memory.removeAll();
  HostReleaseLeftovers();
}

}  // namespace refhost
