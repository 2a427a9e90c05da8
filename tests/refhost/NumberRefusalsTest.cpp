// Numbers that the host cannot hold, and the permissive host that records them.
#include <cmath>

#include "tests/refhost/RefusalScene.h"

namespace refhost {
namespace {

using ::testing::IsEmpty;

template <typename Change>
std::function<HostError(Scene&)> compWith(Change change) {
  return [change](Scene& s) {
    change(s);
    return s.createComp(s.plugin.folder());
  };
}

const std::vector<Refusal> kNumberRefusals = {
    {3011, "CreateComp: a size of 0 x 48 is below 1 x 1", compWith([](Scene& s) { s.width = 0; })},
    {3011, "CreateComp: a size of 64 x -2 is below 1 x 1", compWith([](Scene& s) { s.height = -2; })},
    {3012, "CreateComp: a pixel aspect of 0/1 is not positive",
     compWith([](Scene& s) { s.aspect.numerator = 0; })},
    {3012, "CreateComp: a pixel aspect of 1/0 is not positive",
     compWith([](Scene& s) { s.aspect.denominator = 0; })},
    {3012, "CreateComp: a frame rate of -25/1 is not positive",
     compWith([](Scene& s) { s.rate.numerator = -25; })},
    {3012, "CreateComp: a frame rate of 25/0 is not positive",
     compWith([](Scene& s) { s.rate.denominator = 0; })},
    {3013, "CreateComp: a duration of 10/0 has scale 0", compWith([](Scene& s) { s.duration.scale = 0; })},
    {3013, "CreateComp: a duration of -1/1 is negative", compWith([](Scene& s) { s.duration.value = -1; })},
    {3013, "NewNullLayer: a time of 1/0 is no length",
     [](Scene& s) {
       return s.newNull({1, 0});
     }},
    {3013, "NewNullLayer: a time of -1/5 is no length",
     [](Scene& s) {
       return s.newNull({-1, 5});
     }},
    {3013, "AddBatchKeyframe: a key time of 4/0 has scale 0",
     [](Scene& s) {
       return s.addKey(s.batch, 0, {4, 0});
     }},
    {3014, "NewCameraLayer: the centre is not finite", [](Scene& s) { return s.newCamera(HUGE_VAL, 0.0); }},
    {3014, "NewCameraLayer: the centre is not finite",
     [](Scene& s) { return s.newCamera(0.0, std::nan("")); }},
    {3014, "SetCameraFilmSize: the film size is not finite",
     [](Scene& s) { return s.filmSize(s.camera, 1, HUGE_VAL); }},
    {3015, "SetCameraFilmSize: the film size is not positive",
     [](Scene& s) { return s.filmSize(s.camera, 2, 0.0); }},
    {3015, "SetCameraFilmSize: the film size is not positive",
     [](Scene& s) { return s.filmSize(s.camera, 1, -1.5); }},
    {3014, "SetStreamValue: the value is not finite",
     [](Scene& s) { return s.setValue(s.rotation, s.rotation, -HUGE_VAL); }},
    {3014, "SetStreamValue: the value is not finite",
     [](Scene& s) { return s.setValue(s.position, s.position, 0.0, std::nan("")); }},
    {3014, "SetBatchKeyframeValue: the value is not finite",
     [](Scene& s) { return s.setKey(s.batch, 0, s.rotation, HUGE_VAL); }},
};

TEST(Refusals, NumbersThatTheHostCannotHold) { expectRefusals(kNumberRefusals); }

TEST(Refusals, PermissiveHostRecordsAnyNumber) {
  HostOptions options;
  options.permissive = true;
  for (const Refusal& refusal : kNumberRefusals) {
    Scene scene(options);
    EXPECT_EQ(refusal.call(scene), 0) << refusal.sentence;
    EXPECT_THAT(scene.plugin.leave().refusals, IsEmpty());
  }
}

TEST(Refusals, RefusedCallChangesNothing) {
  for (const Refusal& refusal : kNumberRefusals) {
    Scene scene;
    const Project& project = scene.plugin.host().project();
    const std::size_t compositions = project.compositions().size();
    const std::size_t layers = project.layers().size();
    refusal.call(scene);
    EXPECT_EQ(project.compositions().size(), compositions) << refusal.sentence;
    EXPECT_EQ(project.layers().size(), layers) << refusal.sentence;
    EXPECT_EQ(project.layers()[2].filmDirection, 0) << refusal.sentence;
    EXPECT_DOUBLE_EQ(project.layers()[0].findStream(HOST_STREAM_ROTATION_Z)->value[0], 0.0)
        << refusal.sentence;
  }
}

TEST(Refusals, WhatTheHostAccepts) {
  Scene scene;
  EXPECT_EQ(scene.newNull({0, 0}), 0);
  EXPECT_EQ(scene.newNull({0, 5}), 0);
  scene.duration.value = 0;
  EXPECT_EQ(scene.createComp(scene.plugin.folder()), 0);
  EXPECT_EQ(scene.addKey(scene.batch, 0, {-3, 24}), 0);
  EXPECT_EQ(scene.addKey(scene.batch, 0, {1000, 1}), 0);
  // Components beyond the stream's dimension are not looked at.
  EXPECT_EQ(scene.setValue(scene.rotation, scene.rotation, 1.0, HUGE_VAL), 0);
  HostMemHandle* empty = nullptr;
  EXPECT_EQ(kMemorySuite1.NewMemHandle(kPluginId, "", 0, 0, &empty), 0);
  EXPECT_NE(empty, nullptr);
  EXPECT_THAT(scene.plugin.leave().refusals, IsEmpty());
}

}  // namespace
}  // namespace refhost
