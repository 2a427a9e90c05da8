#include "tests/plugin/PluginRun.h"

#include "plugin/Entry.h"
#include "plugin/Globals.h"

using namespace mayaimport;

namespace testsupport {
namespace {

// The text value of a key in a line of the trace.
std::string ValueOf(const std::string& line, const std::string& key) {
  const std::string lead = "\"" + key + "\":";
  const std::size_t at = line.find(lead);
  if (at == std::string::npos) return {};
  std::size_t from = at + lead.size();
  const bool text = line[from] == '"';
  if (text) ++from;
  return line.substr(from, line.find_first_of(text ? "\"" : ",}", from) - from);
}

}  // namespace

PluginTest::PluginTest() { G_use_linear_unitsL = 0; }

PluginTest::~PluginTest() { EndHost(); }

refhost::CallbackResult PluginTest::Load(refhost::HostOptions options) {
  EndHost();
  trace_.str("");
  options.pluginId = kRunPluginId;
  options.trace = &trace_;
  host_ = std::make_unique<refhost::Host>(std::move(options));
  refhost::CallbackResult result;
  EXPECT_TRUE(host_->load(&MayaImportEntry, &result));
  return result;
}

refhost::CallbackResult PluginTest::Import(const std::filesystem::path& path,
                                           std::vector<refhost::Failure> failures) {
  refhost::HostOptions options;
  options.failures = std::move(failures);
  options.during = refhost::Callback::Import;
  EXPECT_EQ(Load(std::move(options)).code, 0);
  return host_->importScene(path);
}

refhost::CallbackResult PluginTest::Verify(const std::filesystem::path& path,
                                           std::vector<refhost::Failure> failures) {
  refhost::HostOptions options;
  options.failures = std::move(failures);
  options.during = refhost::Callback::Verify;
  EXPECT_EQ(Load(std::move(options)).code, 0);
  return host_->verifyScene(path);
}

void PluginTest::EndHost() {
  host_.reset();
  DeathHook(0);
}

std::filesystem::path PluginTest::Write(const std::string& name, std::string_view bytes) const {
  return folder_.write(name, bytes);
}

std::vector<std::string> PluginTest::Lines() const {
  std::vector<std::string> lines;
  std::istringstream trace(trace_.str());
  for (std::string line; std::getline(trace, line);) {
    if (line.find("\"call\":\"enter\"") != std::string::npos) lines.clear();
    lines.push_back(line);
  }
  return lines;
}

std::vector<std::string> PluginTest::Calls() const {
  std::vector<std::string> calls;
  for (const std::string& line : Lines()) {
    const std::string call = ValueOf(line, "call");
    if (call == "enter" || call == "leave") continue;
    const bool basic = call == "AcquireSuite" || call == "ReleaseSuiteByName";
    calls.push_back(basic ? call + " " + ValueOf(line, "suite") + " " + ValueOf(line, "version") : call);
  }
  return calls;
}

std::size_t PluginTest::CallsNamed(std::string_view name) const {
  std::size_t count = 0;
  for (const std::string& call : Calls()) count += call == name ? 1 : 0;
  return count;
}

std::string PluginTest::LineOf(std::string_view name) const {
  for (const std::string& line : Lines())
    if (ValueOf(line, "call") == name) return line;
  return {};
}

std::vector<std::string> PluginTest::CompositionNames(const refhost::CallbackResult& result) const {
  std::vector<std::string> names;
  if (result.folder == nullptr) return names;
  for (const refhost::Composition* composition : result.folder->compositions)
    names.push_back(composition->name);
  return names;
}

void PluginTest::ExpectSound(const refhost::CallbackResult& result) const {
  EXPECT_THAT(result.refusals, ::testing::Not(::testing::Contains("an exception left the plug-in")));
  for (const refhost::Leftover& leftover : result.leftovers)
    EXPECT_TRUE(leftover.keptByDesign) << leftover.description;
}

}  // namespace testsupport
