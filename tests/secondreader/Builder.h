// Turns the records of a scene into calls of the host.
#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include "tests/secondreader/Conversions.h"
#include "tests/secondreader/Matrices.h"
#include "tests/secondreader/Records.h"
#include "tests/secondreader/SuiteUser.h"

namespace secondreader {

inline constexpr int kKeyCountsMessage = 5;

class Builder {
 public:
  // Everything given outlives the builder. `show` puts a message before the user, by its number.
  Builder(SuiteUser& suites, const Scene& scene, std::function<void(int)> show);

  // Makes the compositions in the folder. Throws the code of the first failure.
  void build(Handle folder, const std::string& name);

 private:
  struct Batch {
    std::int32_t stream;
    Handle number = 0;
  };

  // Builder.cpp
  Handle makeComps(Handle folder, const std::string& name);
  void makeCamera(Handle comp, const Camera& camera);
  void makeLocator(Handle comp, const Locator& locator);
  void makeParents(Handle comp, Handle child, int transform);
  void setTransformAndKeys(Handle layer, const Transform& transform);
  void setCamera(Handle layer, const Camera& camera);
  bool aim(Handle layer, const Camera& camera, const Transform& constraint);

  // BuilderStreams.cpp
  template <typename Work>
  void withStream(Handle layer, std::int32_t id, Work work);
  void setStream(Handle layer, std::int32_t id, const SuiteUser::Value& value);
  void setStreamUnguarded(Handle layer, std::int32_t id, const SuiteUser::Value& value);
  void openBatch(Handle layer, Batch& batch);
  void insertKey(Handle layer, const Batch& batch, T_Time time, const SuiteUser::Value& value);
  void closeBatches(const std::vector<Batch>& batches);
  template <typename Work>
  void withBatches(Handle layer, std::vector<Batch> batches, Work work);

  // BuilderMatrices.cpp
  Parts decomposed(const Transform& transform, const Triple& translate, const Triple& rotate,
                   const Triple& scale) const;
  Triple hostPoint(const Triple& point) const;
  void setTransform(Handle layer, const Transform& transform);
  void setAnchor(Handle layer, const Transform& transform);

  // BuilderKeys.cpp
  int keyCount(const Transform& node);
  T_Time keyTime(const Transform& node, std::size_t key);
  void sample(const Transform& node, std::size_t group, std::size_t key, Triple& values) const;
  void animate(Handle layer, const Transform& node);
  void animateAnchor(Handle layer, const Transform& node);
  void animateCamera(Handle layer, const Camera& camera);
  void zoomKeys(Handle stream, Batch& batch, const Camera& camera, const std::vector<Key>& keys);

  SuiteUser& suites_;
  const Scene& scene_;
  std::function<void(int)> show_;
  Conversions convert_;
};

}  // namespace secondreader
