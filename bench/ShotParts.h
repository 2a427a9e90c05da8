// The parts of the workload "shot", in the order in which Maya writes them.
#pragma once

#include <cstdint>
#include <string>

#include "bench/SceneText.h"

namespace bench {

// The sizes of the parts.
struct ShotSize {
  std::int64_t references = 10;   // referenced files
  std::int64_t controls = 650;    // animated controls of each
  std::int64_t rigs = 12;         // of the scene's own
  std::int64_t joints = 40;       // of each
  std::int64_t skinPoints = 900;  // of each rig, weighed by two joints
  std::int64_t meshes = 20;
  std::int64_t vertices = 1500;  // of each
  std::int64_t trackers = 400;   // points that the camera was solved from
};

enum class EditPaths { Quoted, Unquoted };

// ---- ShotReferences.cpp ----

// The "file" commands at the head of the scene.
void referenceFiles(SceneText& scene, const ShotSize& size);

// The "reference" nodes with their edits, and the curves that drive referenced nodes.
void referenceNodes(SceneText& scene, const ShotSize& size, EditPaths paths);
void referenceCurves(SceneText& scene, const ShotSize& size);
void referenceConnections(SceneText& scene, const ShotSize& size);

// ---- ShotRigs.cpp ----

// Joints with their controls and constraints, then skins and driven curves, which lie below no transform.
void rigNodes(SceneText& scene, const ShotSize& size);
void rigSkins(SceneText& scene, const ShotSize& size);
void rigConnections(SceneText& scene, const ShotSize& size);

// ---- SparseCurve.cpp ----

// A curve as an animator sets it: few keys, at whole frames; with `fixed`, its tangents are written.
void sparseCurve(SceneText& scene, std::string_view type, const std::string& name, int keys, bool fixed);

}  // namespace bench
