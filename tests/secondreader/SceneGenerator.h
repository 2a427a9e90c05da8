// Scenes by seed: well-formed ones, odd ones and broken ones.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "refhost/Host.h"
#include "tests/secondreader/Dice.h"

namespace secondreader {

struct GeneratedScene {
  std::string fileName;
  std::string bytes;
  refhost::HostOptions options;  // without failures
  int imports = 1;               // how often it is imported, one after the other
};

class SceneGenerator {
 public:
  explicit SceneGenerator(std::uint64_t seed);

  GeneratedScene make();

 private:
  // SceneGenerator.cpp: the scene as a whole, and the settings of the host.
  refhost::HostOptions settings();
  std::string fileName();
  void header();
  void damage();

  // GeneratedNodes.cpp: nodes with their attributes and keys.
  void rig();
  void createNode(std::string_view type, const std::string& name, const std::string& parent);
  void transformAttributes();
  void cameraAttributes();
  void curve(const std::string& name, int keys, bool angles);
  void animateTransform(const std::string& name);
  void animateFocalLength(const std::string& camera);
  void constraint(const std::string& turned, const std::string& target);

  // GeneratedCommands.cpp: everything else that stands between nodes.
  void units();
  void resolution();
  void otherCommand();
  void strayConnection();
  void repeatedNode();
  void attributesAgain();
  void connect(const std::string& source, const std::string& destination);

  // GeneratedBulk.cpp: what only large scenes hold.
  void bulk();
  void longSpin();
  void manyNodes();
  void manyConnections();
  void longCommand();

  // GeneratedWords.cpp: names, numbers and what stands between words.
  bool odd() { return dice_.chance(oddity_); }
  void word(std::string_view text);
  void words(std::string_view line);  // parts at single blanks
  void quoted(const std::string& text) { word("\"" + text + "\""); }
  void end();
  std::string newName(std::string_view stem);
  std::string knownName(const std::vector<std::string>& names);
  std::string anyCase(std::string_view text);
  std::string number();
  std::string angle();
  std::string factor();
  std::string oddNumber();
  void triple(std::string (SceneGenerator::*part)());

  Dice dice_;
  int oddity_ = 0;  // in percent: how often something odd stands where something plain could
  std::string text_;
  std::vector<std::string> transforms_;
  std::vector<std::string> cameras_;
  std::vector<std::string> curves_;
};

// Failures for a run that made so many suite calls and number scans in its import.
struct RunCounts {
  int suiteCalls = 0;
  int numberScans = 0;
};
void planFailures(std::uint64_t seed, const RunCounts& counts, refhost::HostOptions* options);

}  // namespace secondreader
