// One bake, from the selection to the text.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "bake/Bake.h"
#include "bake/Chains.h"
#include "bake/Head.h"
#include "bake/Sampler.h"
#include "bake/Selection.h"
#include "bake/Writer.h"
#include "motion/Evaluator.h"

namespace bake {

// A camera or a locator that is baked.
struct Item {
  scene::NodeId shape = scene::kNoNode;
  std::uint32_t link = Link::kNone;  // of its transform
  std::size_t world = 0;             // the track in world space, with kWorld
  std::size_t lens = 0;              // of a camera
  Method method = Method::kHierarchy;
};

class Baker {
 public:
  // All must outlive the baker.
  Baker(const scene::Scene& scene, const Options& options, diag::Collector* diagnostics);

  Report Run(const Origin& origin, std::ostream& out);

 private:
  void Choose();
  void AskForHierarchy();
  bool FindRange();
  void SampleHierarchy();
  void AskForWorld();
  bool ComesInHierarchy(const Item& item, bool camera) const;

  void Write(const Origin& origin, std::ostream& out);
  void WriteCamera(const Item& item, Writer* writer);
  void WriteLocator(const Item& item, Writer* writer);
  std::string WriteTransform(const Item& item, Writer* writer);
  std::string WriteChain(std::uint32_t link, Writer* writer);

  std::string PathText(scene::NodeId node) const;
  bool IsWritable(const Item& item, const LensTrack& lens, const std::string& path);
  void ReportDifferences(const Item& item, const LensTrack& lens, CameraReport* report);
  void ReportKept(const Item& item, CameraReport* report) const;
  void Differ(diag::Code code, const Item& item, const std::string& path, CameraReport* report);

  const scene::Scene& scene_;
  const Options& options_;
  diag::Collector* diagnostics_;
  Head head_;
  std::vector<Item> cameras_;
  std::vector<Item> locators_;
  Chains chains_;
  motion::Evaluator evaluator_;
  std::optional<Sampler> local_;
  std::optional<Sampler> world_;
  std::optional<motion::KeptBelow> kept_;  // after all frames
  Report report_;
};

}  // namespace bake
