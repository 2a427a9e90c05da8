// What the rules look at, and where they report. One topic a file.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <map>
#include <set>
#include <span>
#include <string_view>
#include <vector>

#include "check/CameOver.h"
#include "check/Cameras.h"
#include "check/CurveShapes.h"
#include "check/Curves.h"
#include "check/Head.h"
#include "check/Links.h"
#include "diag/Collector.h"
#include "motion/FrameEnds.h"
#include "motion/Measures.h"
#include "scene/Scene.h"
#include "scene/Settings.h"

namespace check {

struct Subject {
  const scene::Scene& scene;
  const scene::Settings& settings;
  const motion::Measures& measures;
  const CameOver& cameOver;
  const std::vector<Camera>& cameras;
  const std::vector<scene::NodeId>& locators;  // the marked ones, where any layer comes over
  const std::vector<Link>& links;
  Channels& channels;
  CurveShapes& shapes;
  diag::Collector& diagnostics;
  // The places of the connections whose drivers a rule has reported as not followed by the import. The
  // evaluation's diagnostics of these connections are left out. Null: none are left out.
  std::set<std::uint64_t>* driversSaid;
};

// The curves of the channels that the import takes of the link's node: of a target those of its translation.
std::span<const KeyedChannel> KeyedOf(const Subject& subject, const Link& link);  // Links.cpp

// ---- why the import stopped, and where ----

// The file is no scene: FileKind.cpp.
void ReportFileKind(std::string_view text, diag::Collector* diagnostics);

// A byte, a number, or the end of the text: Stops.cpp.
void ReportStopInText(std::string_view text, const CameOver& cameOver, diag::Collector* diagnostics);

// Keys of a node: KeyCounts.cpp.
void ReportKeyCounts(const Subject& subject);

// The code and its sentence, where there is nothing to show: Stops.cpp.
void ReportOtherStop(std::string_view text, const CameOver& cameOver, diag::Collector* diagnostics);

// ---- what does not come over ----

// What reading the scene found at single nodes, where something that comes over depends on the node:
// Dependencies.cpp.
void ReportNodeNotes(const Subject& subject, std::span<const scene::NodeNote> notes);

void ReportLostCameras(const Subject& subject);   // LostCameras.cpp
void ReportLostParents(const Subject& subject);   // LostParents.cpp
void ReportLostChannels(const Subject& subject);  // LostChannels.cpp
void ReportLostLookAts(const Subject& subject);   // LostLookAts.cpp
void ReportStoredValues(const Subject& subject);  // StoredValues.cpp
void ReportNames(const Subject& subject);         // Names.cpp

// ---- where the picture differs ----

void ReportLenses(const Subject& subject);         // Lenses.cpp
void ReportTransforms(const Subject& subject);     // Transforms.cpp
void ReportChannelValues(const Subject& subject);  // ChannelValues.cpp
void ReportTimes(const Subject& subject);          // Times.cpp
void ReportKeysAtOneTime(const Subject& subject);  // KeysAtOneTime.cpp
void ReportPicture(const Subject& subject);        // PictureSize.cpp

// The cameras whose shift is measured, with it: PictureShift.cpp.
std::map<scene::NodeId, LargestShift> ReportShifts(const Subject& subject);

// Reports what changes the finished picture of the camera and comes over nowhere, where a measurement has
// shown that it does. ReportLenses reports what always does: Lenses.cpp.
void ReportPictureChange(const Subject& subject, scene::NodeId camera);

// Curves that go on outside their keys, within the frames: Infinities.cpp.
void ReportInfinities(const Subject& subject, const motion::FrameEnds& frames);

}  // namespace check
