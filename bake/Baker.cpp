// What is baked, and how each part of it comes over.
#include "bake/Baker.h"

namespace bake {

Baker::Baker(const scene::Scene& scene, const Options& options, diag::Collector* diagnostics)
    : scene_(scene),
      options_(options),
      diagnostics_(diagnostics),
      head_(ReadHead(scene, diagnostics)),
      chains_(scene),
      evaluator_(scene, diagnostics) {}

Report Baker::Run(const Origin& origin, std::ostream& out) {
  Choose();
  if (!FindRange()) return report_;
  SampleHierarchy();
  DecideMethods();
  SampleWorld();
  Write(origin, out);
  return report_;
}

void Baker::Choose() {
  const Selection selection = Select(scene_, options_, diagnostics_);
  const auto makeItems = [&](const std::vector<scene::NodeId>& shapes, std::vector<Item>* items) {
    for (const scene::NodeId shape : shapes) {
      Item item;
      item.shape = shape;
      item.link = chains_.Add(scene_.node(shape).parent);
      items->push_back(item);
    }
  };
  makeItems(selection.cameras, &cameras_);
  makeItems(selection.locators, &locators_);
  report_.locators = locators_.size();
  report_.locatorsLeftOut = selection.locatorsLeftOut;
  if (selection.locatorsLeftOut != 0) {
    diagnostics_->Report(diag::Code::LocatorsLeftOut, {}, {std::to_string(selection.locatorsLeftOut)});
  }
  if (cameras_.empty() && options_.cameras.empty()) diagnostics_->Report(diag::Code::NoCamera, {});
}

bool Baker::FindRange() {
  std::vector<scene::NodeId> nodes;
  for (const Item& camera : cameras_) nodes.push_back(camera.shape);
  for (const Link& link : chains_.links()) nodes.push_back(link.node);
  report_.frames =
      FindFrames(scene_, nodes, options_, head_.unitsPerFrame, evaluator_.measures(), diagnostics_);
  return report_.frames.has_value();
}

void Baker::SampleHierarchy() {
  local_.emplace(&evaluator_, head_.picture, *report_.frames, head_.unitsPerFrame);
  if (!options_.world) chains_.AskFor(&*local_);
  for (Item& camera : cameras_) camera.lens = local_->AddLens(camera.shape);
  local_->Run();
  if (!options_.world) chains_.Judge(&*local_);
}

// A camera's picture depends on what its chain does to it; a null only has to say its place.
bool Baker::ComesInHierarchy(const Item& item, bool camera) const {
  if (item.link == Link::kNone) return true;
  if (options_.world) return false;
  const Link& link = chains_.links()[item.link];
  return link.finite && link.square && !link.cutOff && (link.unscaled || !camera);
}

void Baker::DecideMethods() {
  for (Item& item : cameras_)
    item.method = ComesInHierarchy(item, true) ? Method::kHierarchy : Method::kWorld;
  for (Item& item : locators_)
    item.method = ComesInHierarchy(item, false) ? Method::kHierarchy : Method::kWorld;
}

void Baker::SampleWorld() {
  world_.emplace(&evaluator_, head_.picture, *report_.frames, head_.unitsPerFrame);
  for (Item& item : cameras_) {
    if (item.method == Method::kWorld) item.world = world_->AddWorld(scene_.node(item.shape).parent, false);
  }
  for (Item& item : locators_) {
    if (item.method == Method::kWorld) item.world = world_->AddWorld(scene_.node(item.shape).parent, true);
  }
  world_->Run();
}

Report Bake(const scene::Scene& scene, const Options& options, const Origin& origin,
            diag::Collector* diagnostics, std::ostream& out) {
  return Baker(scene, options, diagnostics).Run(origin, out);
}

}  // namespace bake
