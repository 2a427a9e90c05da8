// A scene that uses every command in many forms, a command a piece.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace testsupport {

// Each piece is a command, or a comment, with its line end. Each createNode names a node of its own.
inline const std::vector<std::string_view>& ScenePieces() {
  static const std::vector<std::string_view> kPieces = {
      "//Maya ASCII 2020 scene\n",
      "/* a block\n ; \" * ** / */\n",
      "file -rdi 1 -ns \"ref\" -rfn \"refRN\" -op \"v=0;\" -typ \"mayaAscii\"\n\t\t\"ref.ma\";\n",
      "file -r -ns \"ref\" -dr 1 -rfn \"refRN\" \"ref.ma\";\n",
      "requires maya \"2020\";\n",
      "requires -nodeType \"a\" -dataType \"b\" \"plug\" \"1.0\";\n",
      "currentUnit -l centimeter -a degree -t film;\n",
      "fileInfo \"osv\" \"a \\\"b\\\" \\\\ c\\n\";\n",
      "createNode transform -s -n \"persp\";\n",
      "\trename -uid \"5A-6B\";\n",
      "\tsetAttr \".v\" no;\n",
      "createNode transform -n \"rig\";\n",
      "\tsetAttr \".t\" -type \"double3\" 1 -2.5 3e2 ;\n",
      "\tsetAttr -l on -k off \".rx\" 45;\n",
      "\taddAttr -ci true -k true -sn \"foc\" -ln \"focal\" -dv 35 -min 1 -at \"double\";\n",
      "createNode transform -n \"move\" -p \"rig\";\n",
      "\tsetAttr \".r.ry\" 90;\n",
      "createNode camera -n \"lens\" -p \"|rig|move\";\n",
      "\tsetAttr -k off \".v\";\n",
      "\tsetAttr \".cap\" -type \"double2\" 1.417 0.945 ;\n",
      "\tsetAttr \".fl\" 50; // wide\n",
      "\tsetAttr \".imn\" -type \"string\" \"a;b\";\n",
      "createNode fosterParent -n \"refRNfosterParent1\";\n",
      "createNode transform -n \"foster\" -p \"refRNfosterParent1\";\n",
      "createNode locator -n \"ns:loc\" -p \"rig\";\n",
      "createNode mesh -n \"mesh\" -p \"foster\";\n",
      "\tsetAttr -s 4 \".vt[0:3]\"  -0.5 -0.5 0.5 0.5 -0.5 0.5\n\t\t-0.5 0.5 0.5 0.5 0.5 0.5;\n",
      "\tsetAttr -s 2 -ch 8 \".fc[0:1]\" -type \"polyFaces\"\n\t\tf 4 0 1 2 3\n\t\tmu 0 4 0 1 3 2;\n",
      "createNode lookAt -n \"look\";\n",
      "\tsetAttr \".tg[0].tw\" 0.5;\n",
      "createNode script -n \"sceneConfigurationScriptNode\";\n",
      "\tsetAttr \".b\" -type \"string\" (\n\t\t\"playbackOptions -min 1 \"\n\t\t+ \"-max 24\");\n",
      "createNode reference -n \"refRN\";\n",
      "\tsetAttr \".ed\" -type \"dataReferenceEdits\"\n\t\t\"refRN\" 1\n\t\t2 |ref:a|ref:b \"t\" \" 1\";\n",
      "createNode animCurveTL -n \"curve\";\n",
      "\tsetAttr \".tan\" 18;\n",
      "\tsetAttr -s 3 \".ktv[0:2]\"  1 0 2 5.5 3 10;\n",
      "\tsetAttr -s 3 \".ktl[1:2]\" no yes;\n",
      "createNode unknownRig -n \"other\";\n",
      "\tsetAttr \".aal\" -type \"attributeAlias\" {\"speed\",\"weight[0]\"} ;\n",
      "parent -s -nc -r -add \"|rig|ns:loc\" \"other\" ;\n",
      "select -ne :time1;\n",
      "\tsetAttr \".o\" 7;\n",
      "select -ne :defaultResolution;\n",
      "\tsetAttr \".w\" 1920;\n",
      "connectAttr \"curve.o\" \"rig.tx\";\n",
      "connectAttr \"rig.focal\" \"lens.fl\" -l on;\n",
      "connectAttr -f \"rig.t\"\n\t\t\"look.tg[0].tt\";\n",
      "connectAttr \"mesh.iog\" \":initialShadingGroup.dsm\" -na;\n",
      "connectAttr \"curve.o\" \"move.ty\";\n",
      "disconnectAttr \"curve.o\" \"move.ty\";\n",
      "rename \"other\" \"another\";\n",
      "namespace -set \"late\";\n",
      "createNode transform -n \"comer\";\n",
      "relationship \"link\" \":lightLinker1\" \":a.message\" \":b.message\";\n",
      "// End of rich.ma\n",
  };
  return kPieces;
}

inline std::string WholeScene() {
  std::string text;
  for (const std::string_view piece : ScenePieces()) text += piece;
  return text;
}

}  // namespace testsupport
