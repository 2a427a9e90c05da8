#include "bake/Chains.h"

#include "bake/PlainForm.h"

namespace bake {

std::uint32_t Chains::Add(scene::NodeId transform) {
  std::vector<scene::NodeId> chain;
  std::uint32_t above = Link::kNone;
  bool cutOff = false;
  for (scene::NodeId node = transform; node != scene::kNoNode; node = scene_.node(node).parent) {
    if (const auto known = linkOfNode_.find(node); known != linkOfNode_.end()) {
      above = known->second;
      cutOff = links_[above].cutOff;
      break;
    }
    if (scene_.node(node).origin != scene::Origin::Created) {
      cutOff = true;
      break;
    }
    chain.push_back(node);
    if (!Inherits(scene_, node)) break;
  }
  for (auto node = chain.rbegin(); node != chain.rend(); ++node) {
    cutOff = cutOff || IsInheritanceDriven(scene_, *node);
    Link link;
    link.node = *node;
    link.above = above;
    link.cutOff = cutOff;
    above = static_cast<std::uint32_t>(links_.size());
    links_.push_back(std::move(link));
    linkOfNode_.emplace(*node, above);
  }
  return above;
}

void Chains::AskFor(Sampler* sampler) {
  for (Link& link : links_) link.track = sampler->AddLocal(link.node);
}

void Chains::Judge(Sampler* sampler, const motion::KeptBelow& below) {
  for (Link& link : links_) {
    const Track& track = sampler->track(link.track);
    link.finite = track.finite;
    link.square = !track.IsSheared();
    link.unscaled = !track.mirrors && !track.IsScaled();
    link.moves = track.moves();
    link.kept = sampler->KeptOfTrack(link.track, below);
    if (link.above == Link::kNone) continue;
    const Link& above = links_[link.above];
    link.finite = link.finite && above.finite;
    link.square = link.square && above.square;
    link.unscaled = link.unscaled && above.unscaled;
    link.moves = link.moves || above.moves;
    motion::KeptBelow::Merge(above.kept, &link.kept);
  }
}

}  // namespace bake
