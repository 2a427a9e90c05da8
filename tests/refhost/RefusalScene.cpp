#include "tests/refhost/RefusalScene.h"

namespace refhost {

void expectRefusals(const std::vector<Refusal>& refusals, const HostOptions& options) {
  for (const Refusal& refusal : refusals) {
    Scene scene(options);
    EXPECT_EQ(refusal.call(scene), refusal.code) << refusal.sentence;
    EXPECT_THAT(scene.plugin.leave().refusals, ::testing::ElementsAre(refusal.sentence));
  }
}

}  // namespace refhost
