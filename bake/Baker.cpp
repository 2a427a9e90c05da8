// Chooses what is baked, and the method for each part of it.
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
  AskForHierarchy();
  if (options_.world) AskForWorld();
  if (!FindRange()) return report_;
  SampleHierarchy();
  if (!options_.world) AskForWorld();
  world_->Run(*report_.frames);
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

// Asks for all values before FindRange, because their curves determine the range.
void Baker::AskForHierarchy() {
  local_.emplace(&evaluator_, head_.picture, head_.unitsPerFrame);
  if (!options_.world) chains_.AskFor(&*local_);
  for (Item& camera : cameras_) camera.lens = local_->AddLens(camera.shape);
}

bool Baker::FindRange() {
  report_.frames =
      FindFrames(scene_, evaluator_.computingNodes(), options_, head_, evaluator_.measures(), diagnostics_);
  return report_.frames.has_value();
}

void Baker::SampleHierarchy() {
  local_->Run(*report_.frames);
  if (!options_.world) chains_.Judge(&*local_, motion::KeptBelow(evaluator_));
}

// Scale in the chain changes a camera's picture; of a null only the place matters.
bool Baker::ComesInHierarchy(const Item& item, bool camera) const {
  if (item.link == Link::kNone) return true;
  if (options_.world) return false;
  const Link& link = chains_.links()[item.link];
  return link.finite && link.square && !link.cutOff && (link.unscaled || !camera);
}

// Asks for the world matrix of each item that cannot be written under its hierarchy.
void Baker::AskForWorld() {
  world_.emplace(&evaluator_, head_.picture, head_.unitsPerFrame);
  const auto decide = [this](Item* item, bool camera) {
    if (ComesInHierarchy(*item, camera)) return;
    item->method = Method::kWorld;
    item->world = world_->AddWorld(scene_.node(item->shape).parent, !camera);
  };
  for (Item& item : cameras_) decide(&item, true);
  for (Item& item : locators_) decide(&item, false);
}

Report Bake(const scene::Scene& scene, const Options& options, const Origin& origin,
            diag::Collector* diagnostics, std::ostream& out) {
  return Baker(scene, options, diagnostics).Run(origin, out);
}

}  // namespace bake
