// The picture that the layers of an import show, in the scene's own space.
#pragma once

#include <vector>

#include "check/CameOver.h"
#include "motion/Camera.h"
#include "motion/Matrix.h"

namespace check {

// One camera layer. What came over must outlive it.
class ImportedPicture {
 public:
  // `unit` is one unit of the scene's lengths in those of the layers.
  ImportedPicture(const CameOver& cameOver, const CameOverLayer& camera, double unit);

  // Goes to a time of the composition, in seconds.
  void MoveTo(double seconds);

  // Where a point of the scene's world lands. False where it is not in front of the camera.
  bool Project(const motion::Vector& point, motion::PicturePoint* landed) const;

  // Whether a property of a layer has keys.
  bool Moves() const;

  // How many layers its place depends on.
  std::size_t layers() const { return chain_.size(); }

 private:
  const CameOver& cameOver_;
  std::vector<const CameOverLayer*> chain_;  // from the camera upwards
  double unit_;
  motion::Matrix toCamera_;
  double zoom_ = 0.0;
};

// The value of a property at a time: straight between keys, level outside.
double ValueAt(const CameOverStream& stream, double seconds, std::size_t component, std::size_t components);

}  // namespace check
