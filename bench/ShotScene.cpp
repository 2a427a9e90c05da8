// A production shot: a tracked camera in a set of referenced files, with their edits and the curves that
// drive them, rigs and meshes of its own. An import takes the camera, its chain, and the points that it was
// solved from; it reads or skips all the rest.
#include <array>

#include "bench/SceneParts.h"
#include "bench/Scenes.h"
#include "bench/ShotParts.h"

namespace bench {
namespace {

constexpr int kFrames = 240;
constexpr int kKeysOfChain = 12;

void head(SceneText& scene, const ShotSize& size) {
  scene.text("//Maya ASCII 2024 scene\n//Name: measured.ma\n//Codeset: UTF-8\n");
  referenceFiles(scene, size);
  scene.text("requires maya \"2024\";\nrequires \"stereoCamera\" \"10.0\";\n");
  scene.text("currentUnit -l centimeter -a degree -t film;\n");
  for (const std::string_view info : {"application\" \"bench", "product\" \"Maya 2024", "version\" \"2024"}) {
    scene.text("fileInfo \"").text(info).text("\";\n");
  }
}

// The four that every scene has, which an import leaves out.
void standardCameras(SceneText& scene) {
  for (const std::string_view name : {"persp", "top", "front", "side"}) {
    const std::string shape = std::string(name) + "Shape";
    scene.node("transform", name).text("\tsetAttr \".v\" no;\n").triple(".t", 0, 1000.1, 0, 1);
    scene.node("camera", shape, name).text("\tsetAttr -k off \".v\" no;\n");
    if (name != "persp") scene.text("\tsetAttr \".rnd\" no;\n\tsetAttr \".o\" yes;\n\tsetAttr \".ow\" 30;\n");
    scene.text("\tsetAttr \".coi\" 1000.1;\n\tsetAttr \".imn\" -type \"string\" \"").text(name).text("\";\n");
    scene.text("\tsetAttr \".hc\" -type \"string\" \"viewSet -")
        .text(name.substr(0, 1))
        .text(" %camera\";\n");
  }
}

// The camera below two groups. Its curves, and those of the upper group, come later.
void trackedCamera(SceneText& scene) {
  transform(scene, "shot_world_grp");
  transform(scene, "shot_offset_grp", "shot_world_grp");
  scene.triple(".s", 10, 10, 10, 1);
  transform(scene, "shot_cam", "shot_offset_grp");
  scene.node("camera", "shot_camShape", "shot_cam")
      .text("\tsetAttr -k off \".v\";\n\tsetAttr \".rnd\" no;\n");
  scene.text(
      "\tsetAttr \".cap\" -type \"double2\" 1.41732 0.94488 ;\n\tsetAttr \".ff\" 1;\n\tsetAttr \".fl\" "
      "35;\n");
  scene.text("\tsetAttr \".ncp\" 1;\n\tsetAttr \".coi\" 44.8;\n\tsetAttr \".dr\" yes;\n");
}

Built trackers(SceneText& scene, const ShotSize& size) {
  transform(scene, "trackers_grp");
  for (std::int64_t i = 0; i < size.trackers; ++i) {
    const std::string name = numbered("track_", i);
    transform(scene, name, "trackers_grp");
    locator(scene, name + "_nullShape", name);
  }
  // Each has a null of its own for the group.
  return {.layers = 2 * size.trackers};
}

Built cameraCurves(SceneText& scene) {
  constexpr std::size_t kPlaceAndRotation = 6;
  animate(scene, "shot_cam", kFrames, 14, 0, kPlaceAndRotation);
  scene.curve("animCurveTU", "shot_camShape_focalLength", kFrames, 14, 5.0, 35.0);
  scene.connect("shot_camShape_focalLength.o", "shot_camShape.fl");
  for (std::size_t c = 0; c < kPlaceAndRotation; ++c) {
    const std::string curve = "shot_world_grp_" + std::string(kChannels[c].suffix);
    sparseCurve(scene, kChannels[c].curveType, curve, kKeysOfChain, c % 2 == 0);
    scene.connect(curve + ".o", "shot_world_grp." + std::string(kChannels[c].attribute));
  }
  return {.layers = 3, .keys = kFrames * (kStreams + 1) + kKeysOfChain * kStreams};
}

void shading(SceneText& scene, const ShotSize& size) {
  scene.node("lightLinker", "lightLinker1").text("\tsetAttr -s 2 \".lnk\";\n\tsetAttr -s 2 \".slnk\";\n");
  scene.node("displayLayer", "defaultLayer");
  scene.node("renderLayer", "defaultRenderLayer").text("\tsetAttr \".g\" yes;\n");
  scene.node("script", "sceneConfigurationScriptNode").text("\tsetAttr \".b\" -type \"string\" ");
  scene.text("\"playbackOptions -min 1 -max 240 -ast 1 -aet 240 \";\n\tsetAttr \".st\" 6;\n");
  for (std::int64_t i = 0; i < size.meshes; ++i) {
    scene.node("lambert", numbered("lambert", i))
        .text("\tsetAttr \".c\" -type \"float3\" 0.5 0.25 0.125 ;\n");
    scene.node("shadingEngine", numbered("lambertSG", i))
        .text("\tsetAttr \".ihi\" 0;\n\tsetAttr \".ro\" yes;\n");
    scene.node("groupId", numbered("groupId", i)).text("\tsetAttr \".ihi\" 0;\n");
    scene.node("groupParts", numbered("groupParts", i))
        .text("\tsetAttr \".ihi\" 0;\n\tsetAttr \".ic\" -type ");
    scene.text("\"componentList\" 2 \"f[0:99]\" \"f[120]\";\n");
  }
}

void shadingConnections(SceneText& scene, const ShotSize& size) {
  scene.text(
      "relationship \"link\" \":lightLinker1\" \":initialShadingGroup.message\" "
      "\":defaultLightSet.message\";\n");
  for (std::int64_t i = 0; i < size.meshes; ++i) {
    scene.connect(numbered("groupId", i) + ".id", numbered("mesh", i) + "Shape.iog.og[0].gid");
    scene.connect(numbered("lambert", i) + ".oc", numbered("lambertSG", i) + ".ss");
    scene.text("connectAttr \"").text(numbered("mesh", i)).text("Shape.iog\" \"");
    scene.text(numbered("lambertSG", i)).text(".dsm\" -na;\n");
  }
}

Built writeShotWith(EditPaths paths, std::ostream& out, double scale, std::uint64_t seed) {
  SceneText scene(out, seed);
  ShotSize size;
  for (std::int64_t* const count :
       {&size.controls, &size.joints, &size.skinPoints, &size.vertices, &size.trackers}) {
    *count = scaled(scale, static_cast<double>(*count));
  }
  head(scene, size);
  standardCameras(scene);
  trackedCamera(scene);
  const Built points = trackers(scene, size);
  for (std::int64_t i = 0; i < size.meshes; ++i) mesh(scene, numbered("mesh", i), size.vertices);
  rigNodes(scene, size);
  shading(scene, size);
  referenceNodes(scene, size, paths);
  rigSkins(scene, size);
  referenceCurves(scene, size);
  const Built tracked = cameraCurves(scene);
  scene.text("select -ne :time1;\n\tsetAttr \".o\" 1;\n\tsetAttr \".unw\" 1;\n");
  scene.renderSettings();
  referenceConnections(scene, size);
  rigConnections(scene, size);
  shadingConnections(scene, size);
  scene.text("// End of measured.ma\n");
  return {points.layers + tracked.layers, points.keys + tracked.keys};
}

}  // namespace

Built writeShot(std::ostream& out, double scale, std::uint64_t seed) {
  return writeShotWith(EditPaths::Quoted, out, scale, seed);
}

Built writeShotUnquoted(std::ostream& out, double scale, std::uint64_t seed) {
  return writeShotWith(EditPaths::Unquoted, out, scale, seed);
}

}  // namespace bench
