// The parts of the head.
#pragma once

#include <array>
#include <string>
#include <string_view>
#include <vector>

#include "check/Cameras.h"
#include "check/Head.h"
#include "diag/Collector.h"
#include "motion/Camera.h"
#include "motion/Measures.h"
#include "scene/Settings.h"

namespace check {

struct HeadSource {
  const scene::Scene& scene;
  const scene::Settings& settings;
  const motion::Measures& measures;
  const CameOver& cameOver;
  const std::vector<Camera>& cameras;
  diag::Lines& lines;
  bool all;  // however many there are of a kind
};

Head ReadHead(const HeadSource& source);

CameraHead DescribeCamera(const HeadSource& source, const Camera& camera);  // HeadCameras.cpp
void DescribeLensesOverFrames(const HeadSource& source,                     // HeadLenses.cpp
                              const std::vector<scene::NodeId>& shapes,     // of the cameras,
                              std::vector<CameraHead>* cameras);            // in their order
void DescribeLocators(const HeadSource& source, Head* head);                // HeadLocators.cpp
void DescribeLookAts(const HeadSource& source, Head* head);                 // HeadLookAts.cpp

// ---- what they have in common: HeadShapes.cpp ----

// Without a layer the shape did not come over.
void DescribeShape(const HeadSource& source, scene::NodeId shape, const CameOverLayer* layer,
                   ShapeHead* head);

// What drives the attribute; added to the list where anything does.
void AddDrive(const HeadSource& source, scene::NodeId node, std::string_view attribute,
              std::vector<Drive>* drives);

// The name, with "..." for what is beyond its first bytes.
std::string ShownName(std::string_view name);

Where WhereIs(const diag::Range& range, diag::Lines& lines);

// Degrees, across the picture.
double AngleOfView(const motion::Camera& camera, const motion::Picture& picture);

// Adds one to a list, or counts it where the list is full.
template <typename T, typename Make>
void AddOrCount(const HeadSource& source, std::vector<T>* list, std::size_t* notShown, Make make) {
  if (source.all || list->size() < Head::kMostOfAKind) {
    list->push_back(make());
  } else {
    ++*notShown;
  }
}

}  // namespace check
