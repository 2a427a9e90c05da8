// Writes the bake, in the order of the file, and reports about each camera.
#include <cmath>
#include <string_view>

#include "bake/Baker.h"
#include "diag/Diagnostic.h"
#include "scene/SpecialNames.h"

namespace bake {
namespace {

constexpr std::string_view kMark = "null_";

// The bytes of a path that comments and reports show, at most.
constexpr std::size_t kLongestPath = 1'000;

}  // namespace

std::string Baker::PathText(scene::NodeId node) const { return scene_.PathOf(node, kLongestPath); }

void Baker::Write(const Origin& origin, std::ostream& out) {
  kept_.emplace(evaluator_);
  Writer writer(out, *report_.frames);
  writer.Begin(origin, head_);
  for (const Item& camera : cameras_) WriteCamera(camera, &writer);
  for (const Item& locator : locators_) WriteLocator(locator, &writer);
  writer.End(head_);
}

// Writes the links above this one that are not written yet, then this one. Returns its name.
std::string Baker::WriteChain(std::uint32_t link, Writer* writer) {
  std::vector<std::uint32_t> missing;
  for (std::uint32_t at = link; at != Link::kNone && chains_.link(at).name.empty();
       at = chains_.link(at).above) {
    missing.push_back(at);
  }
  for (auto at = missing.rbegin(); at != missing.rend(); ++at) {
    Link& one = chains_.link(*at);
    const std::string parent = one.above == Link::kNone ? "" : chains_.link(one.above).name;
    one.name = writer->TakeName(scene_.node(one.node).name);
    writer->Transform(one.name, parent, PathText(one.node), local_->track(one.track));
  }
  return chains_.link(link).name;
}

// Writes the transform of a camera or a locator. Returns its name, empty where there is none.
std::string Baker::WriteTransform(const Item& item, Writer* writer) {
  if (item.link == Link::kNone) return "";
  if (item.method == Method::kHierarchy) return WriteChain(item.link, writer);
  const scene::NodeId transform = chains_.link(item.link).node;
  const std::string name = writer->TakeName(scene_.node(transform).name);
  writer->Transform(name, "", PathText(transform), world_->track(item.world));
  return name;
}

bool Baker::IsWritable(const Item& item, const LensTrack& lens, const std::string& path) {
  const diag::Range place = scene_.node(item.shape).place;
  if (!lens.usable) {
    diagnostics_->Report(diag::Code::CameraWithoutLens, place, {path});
    return false;
  }
  if (item.method == Method::kWorld && !world_->track(item.world).finite) {
    diagnostics_->Report(diag::Code::CameraNotFinite, place, {path});
    return false;
  }
  return true;
}

void Baker::WriteCamera(const Item& item, Writer* writer) {
  CameraReport report;
  report.path = PathText(item.shape);
  report.method = item.method;
  const LensTrack& lens = local_->lens(item.lens);
  if (IsWritable(item, lens, report.path)) {
    const std::string parent = WriteTransform(item, writer);
    report.name = writer->TakeName(scene_.node(item.shape).name);
    writer->Camera(report.name, parent, report.path, lens);
    report.written = true;
    report.lensMoves = lens.focalLength.moves();
    if (item.method == Method::kWorld) {
      report.moves = world_->track(item.world).moves();
    } else {
      report.moves = item.link != Link::kNone && chains_.link(item.link).moves;
    }
    ReportDifferences(item, lens, &report);
  }
  report_.cameras.push_back(std::move(report));
}

void Baker::Differ(diag::Code code, const Item& item, const std::string& path, CameraReport* report) {
  diagnostics_->Report(code, scene_.node(item.shape).place, {path});
  report->differences.push_back(diag::SentenceOf({.code = code, .arguments = {path}}));
}

// Adds the channels that keep their stored values. Their diagnostics are already reported, once for all
// cameras.
void Baker::ReportKept(const Item& item, CameraReport* report) const {
  std::vector<motion::Kept> kept = local_->KeptOfLens(item.lens, *kept_);
  if (item.method == Method::kWorld) {
    motion::KeptBelow::Merge(world_->KeptOfTrack(item.world, *kept_), &kept);
  } else if (item.link != Link::kNone) {
    motion::KeptBelow::Merge(chains_.links()[item.link].kept, &kept);
  }
  for (const motion::Kept& one : kept) report->differences.push_back(motion::SentenceOf(evaluator_, one));
}

void Baker::ReportDifferences(const Item& item, const LensTrack& lens, CameraReport* report) {
  ReportKept(item, report);
  if (lens.offset) Differ(diag::Code::FilmOffsetLost, item, report->path, report);
  if (lens.squeezed) Differ(diag::Code::LensSqueezeInAperture, item, report->path, report);
  if (lens.otherEffects) Differ(diag::Code::PictureEffectLost, item, report->path, report);
  if (item.method != Method::kWorld) return;
  const Track& track = world_->track(item.world);
  if (!options_.world) Differ(diag::Code::CameraInWorldSpace, item, report->path, report);
  if (track.mirrors) Differ(diag::Code::CameraMirrored, item, report->path, report);
  if (track.IsSheared()) {
    Differ(diag::Code::CameraSheared, item, report->path, report);
  } else if (track.IsUneven()) {
    Differ(diag::Code::CameraUneven, item, report->path, report);
  }
}

void Baker::WriteLocator(const Item& item, Writer* writer) {
  const std::string path = PathText(item.shape);
  const diag::Range place = scene_.node(item.shape).place;
  if (item.method == Method::kWorld) {
    const Track& track = world_->track(item.world);
    if (!track.finite) {
      diagnostics_->Report(diag::Code::NullNotFinite, place, {path});
      return;
    }
    if (track.IsSheared()) diagnostics_->Report(diag::Code::NullSheared, place, {path});
  }
  const std::string parent = WriteTransform(item, writer);
  const std::string_view own = scene_.node(item.shape).name;
  // A long name is cut: a mark near its end would be lost.
  const bool marked = scene::IsMarked(own.substr(0, UniqueNames::kLongest / 2));
  const std::string name = writer->TakeName(marked ? std::string(own) : std::string(kMark).append(own));
  writer->Locator(name, parent, path);
}

}  // namespace bake
