// Names, texts and lenses as USD has them.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "export/Composition.h"

namespace interchange {

// The names of prims: letters, digits and underscores, no digit in front, each name once in the file. A name
// that is valid and free stays as it is.
class PrimNames {
 public:
  explicit PrimNames(const Composition& composition);

  const std::string& root() const { return root_; }
  const std::string& layer(std::size_t index) const { return layers_[index]; }
  // The prim of the lens, below that of the camera's layer.
  const std::string& lens(std::size_t index) const { return lenses_[index]; }

 private:
  std::vector<std::string> layers_;
  std::vector<std::string> lenses_;  // empty for nulls
  std::string root_;
};

// Any bytes as a string of USD with its quotes, on one line.
std::string UsdaText(std::string_view bytes);

// In tenths of a unit of the description.
double HorizontalAperture(const Composition& composition, const Lens& lens);
double VerticalAperture(const Composition& composition, const Lens& lens);
double FocalLength(const Composition& composition, const Lens& lens, std::size_t frame);

// Whether the numbers of the lens are above 0 and finite as floats: USD keeps a lens in numbers of 32 bits.
bool IsLensOfFloats(const Composition& composition, const Lens& lens);

}  // namespace interchange
