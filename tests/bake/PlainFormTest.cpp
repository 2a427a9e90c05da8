#include "bake/PlainForm.h"

#include <gtest/gtest.h>

#include <string>

#include "diag/Collector.h"

namespace {

// A transform of the type, with further lines about it.
struct Read {
  Read(const std::string& type, const std::string& lines)
      : text("createNode " + type + " -n \"a\";\n" + lines),
        ignored(text),
        scene(scene::Read(text, ignored)) {}

  bool IsPlain() const { return bake::IsPlain(scene, scene.Find("a")); }

  std::string text;
  diag::Collector ignored;
  scene::Scene scene;
};

TEST(PlainForm, TranslateRotateAndScaleArePlain) {
  EXPECT_TRUE(Read("transform",
                   "setAttr \".t\" -type \"double3\" 1 2 3 ;\nsetAttr \".r\" -type \"double3\" 4 5 6 ;\n"
                   "setAttr \".s\" -type \"double3\" 7 8 9 ;\nsetAttr \".mxtx\" 5;\n")
                  .IsPlain());
}

TEST(PlainForm, AnythingElseThatCountsIsNot) {
  for (const char* name : {"ro",   "rax",  "ray",  "raz",  "rpx",  "rpy",  "rpz",  "rptx", "rpty", "rptz",
                           "spx",  "spy",  "spz",  "sptx", "spty", "sptz", "shxy", "shxz", "shyz", "mtxe",
                           "mtye", "mtze", "xtxe", "xtye", "xtze", "mrxe", "mrye", "mrze", "xrxe", "xrye",
                           "xrze", "msxe", "msye", "msze", "xsxe", "xsye", "xsze", "opm"}) {
    const std::string plug = "." + std::string(name);
    EXPECT_FALSE(Read("transform", "setAttr \"" + plug + "\" 1;\n").IsPlain()) << name;
    EXPECT_FALSE(Read("transform", "connectAttr \"b.x\" \"a" + plug + "\";\n").IsPlain()) << name;
  }
}

TEST(PlainForm, AJointIsPlainWithoutItsOrientAndWithoutItsParentsScale) {
  EXPECT_FALSE(Read("joint", "").IsPlain());
  EXPECT_TRUE(Read("joint", "setAttr \".ssc\" no;\n").IsPlain());
  EXPECT_FALSE(Read("joint", "setAttr \".ssc\" no;\nsetAttr \".joy\" 5;\n").IsPlain());
}

TEST(PlainForm, InheritanceIsSetOrDriven) {
  const auto node = [](const Read& read) { return read.scene.Find("a"); };
  const Read silent("transform", "");
  const Read off("transform", "setAttr \".it\" no;\n");
  const Read driven("transform", "connectAttr \"b.x\" \"a.it\";\n");
  EXPECT_TRUE(bake::Inherits(silent.scene, node(silent)));
  EXPECT_FALSE(bake::Inherits(off.scene, node(off)));
  EXPECT_FALSE(bake::IsInheritanceDriven(off.scene, node(off)));
  EXPECT_TRUE(bake::IsInheritanceDriven(driven.scene, node(driven)));
}

}  // namespace
