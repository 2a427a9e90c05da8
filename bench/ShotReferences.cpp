// The referenced files of a shot: where they are, the edits of their contents, and the curves that drive
// their controls through place holders.
#include <array>

#include "bench/SceneParts.h"
#include "bench/ShotParts.h"

namespace bench {
namespace {

constexpr std::size_t kDriven = 6;  // channels of a control: place and rotation

std::string nameSpace(std::int64_t reference) { return numbered("crew", reference); }

std::string referenceNode(std::int64_t reference) { return nameSpace(reference) + "RN"; }

std::string placeHolder(std::int64_t reference, std::int64_t number) {
  return referenceNode(reference) + ".placeHolderList[" + std::to_string(number) + "]";
}

// From the root of the referenced file down to a control; some lie deeper than others.
std::string controlPath(std::int64_t reference, std::int64_t control) {
  constexpr std::int64_t kLevels = 5;
  const std::string inside = '|' + nameSpace(reference) + ':';
  std::string path = inside + "root_grp" + inside + "motion_ctrl";
  for (std::int64_t level = 0; level < control % kLevels; ++level) {
    path += inside + numbered("limb_", control / kLevels) + numbered("_offset_", level);
  }
  const std::string name = numbered("ctrl_", control);
  return path + inside + name + "_grp" + inside + name;
}

std::string curveOf(std::int64_t reference, std::int64_t control, std::size_t channel) {
  const std::string name = nameSpace(reference) + "_" + numbered("ctrl_", control);
  return name + "_" + std::string(kChannels[channel].suffix);
}

SceneText& change(SceneText& scene, const std::string& path, std::string_view attribute) {
  return scene.text("\n\t\t2 \"").text(path).text("\" \"").text(attribute).text("\" \n\t\t");
}

void changeTriple(SceneText& scene, const std::string& path, std::string_view attribute) {
  change(scene, path, attribute).text("\" -type \\\"double3\\\" ").real(scene.number(90), 14);
  scene.text(" ").real(scene.number(90), 14).text(" ").real(scene.number(90), 14).text("\"");
}

void addAttribute(SceneText& scene, const std::string& path, EditPaths paths) {
  // An unquoted path is followed by two more blanks, so that both forms have the same size.
  scene.text(paths == EditPaths::Quoted ? "\n\t\t1 \"" : "\n\t\t1 ").text(path);
  scene.text(paths == EditPaths::Quoted ? "\" " : "   ");
  scene.text("\n\t\t\"followRoot\" \"followRoot\" \" -ci 1 -min 0 -max 1 -at \\\"double\\\"\"");
}

void constrain(SceneText& scene, std::int64_t reference, const std::string& path) {
  const std::string constraint = path + "|" + nameSpace(reference) + ":follow_parentConstraint1";
  scene.text("\n\t\t0 \"|")
      .text(referenceNode(reference))
      .text("fosterParent1|follow_parentConstraint1\" \"");
  scene.text(path).text("\" \n\t\t\"-s -r \"");
  for (std::size_t c = 0; c < kDriven; ++c) {
    scene.text("\n\t\t3 \"").text(constraint).text(c < 3 ? ".constraintTranslate" : ".constraintRotate");
    scene.text(std::array{"X", "Y", "Z"}[c % 3]).text("\" \n\t\t\"").text(path).text(".");
    scene.text(kChannels[c].suffix).text("\" \n\t\t\"\"");
  }
}

bool hasAddedAttribute(std::int64_t control) { return control % 4 == 0; }

bool isConstrained(std::int64_t control) { return control % 20 == 7; }

// The number of edits that editControl writes.
std::int64_t editsOf(std::int64_t control) {
  constexpr std::int64_t kChannelEdits = kDriven;
  return 6 + kChannelEdits + (hasAddedAttribute(control) ? 1 : 0) +
         (isConstrained(control) ? 1 + kChannelEdits : 0);
}

void editControl(SceneText& scene, std::int64_t reference, std::int64_t control, EditPaths paths) {
  const std::string path = controlPath(reference, control);
  if (hasAddedAttribute(control)) addAttribute(scene, path, paths);
  if (isConstrained(control)) constrain(scene, reference, path);
  change(scene, path, "visibility").text("\" -k 1 1\"");
  changeTriple(scene, path, "translate");
  changeTriple(scene, path, "rotate");
  for (const std::string_view attribute : {"translateX", "translateY", "translateZ"}) {
    change(scene, path, attribute).text("\" -av\"");
  }
  for (std::size_t c = 0; c < kDriven; ++c) {
    scene.text("\n\t\t5 4 \"").text(referenceNode(reference)).text("\" \"").text(path).text(".");
    scene.text(kChannels[c].suffix).text("\" \n\t\t\"");
    const std::int64_t number =
        control * static_cast<std::int64_t>(kDriven) + static_cast<std::int64_t>(c) + 1;
    scene.text(placeHolder(reference, number)).text("\" \"\"");
  }
}

template <typename Each>
void eachControl(const ShotSize& size, Each each) {
  for (std::int64_t r = 0; r < size.references; ++r) {
    for (std::int64_t k = 0; k < size.controls; ++k) each(r, k);
  }
}

}  // namespace

void referenceFiles(SceneText& scene, const ShotSize& size) {
  for (const std::string_view how : {"file -rdi 1 -ns \"", "file -r -ns \""}) {
    for (std::int64_t r = 0; r < size.references; ++r) {
      scene.text(how).text(nameSpace(r)).text("\" -dr 1 -rfn \"").text(referenceNode(r));
      scene.text("\" -op \"v=0;\" -typ \"mayaAscii\"\n\t\t \"assets/").text(nameSpace(r));
      scene.text("/rig/").text(nameSpace(r)).text("_rig_v012.ma\";\n");
    }
  }
}

void referenceNodes(SceneText& scene, const ShotSize& size, EditPaths paths) {
  for (std::int64_t r = 0; r < size.references; ++r) {
    const std::string name = referenceNode(r);
    std::int64_t edits = 0;
    for (std::int64_t k = 0; k < size.controls; ++k) edits += editsOf(k);
    const std::int64_t holders = size.controls * static_cast<std::int64_t>(kDriven);
    scene.node("fosterParent", name + "fosterParent1");
    scene.node("reference", name).text("\tsetAttr -s ").integer(holders).text(" \".phl\";\n");
    for (std::int64_t h = 1; h <= holders; ++h) scene.text("\tsetAttr \".phl[").integer(h).text("]\" 0;\n");
    scene.text("\tsetAttr \".ed\" -type \"dataReferenceEdits\" \n\t\t\"").text(name).text("\"\n\t\t\"");
    scene.text(name).text("\" 0\n\t\t\"").text(name).text("\" ").integer(edits);
    for (std::int64_t k = 0; k < size.controls; ++k) editControl(scene, r, k, paths);
    scene.text(";\n\tsetAttr \".ptag\" -type \"string\" \"\";\nlockNode -l 1 ;\n");
  }
}

void referenceCurves(SceneText& scene, const ShotSize& size) {
  eachControl(size, [&](std::int64_t r, std::int64_t k) {
    for (std::size_t c = 0; c < kDriven; ++c) {
      const int keys = 1 + static_cast<int>(scene.below(20));
      sparseCurve(scene, kChannels[c].curveType, curveOf(r, k, c), keys, k % 5 == 0);
    }
  });
}

void referenceConnections(SceneText& scene, const ShotSize& size) {
  eachControl(size, [&](std::int64_t r, std::int64_t k) {
    for (std::size_t c = 0; c < kDriven; ++c) {
      const std::int64_t number = k * static_cast<std::int64_t>(kDriven) + static_cast<std::int64_t>(c) + 1;
      scene.connect(curveOf(r, k, c) + ".o", referenceNode(r) + ".phl[" + std::to_string(number) + "]");
    }
  });
}

}  // namespace bench
