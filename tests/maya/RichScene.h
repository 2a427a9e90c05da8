// A scene that uses every command, in pieces. For each piece it is known what an end of the text inside it
// gives.
#pragma once

#include <string>
#include <vector>

namespace testsupport {

inline constexpr int kNeverOpen = 1000;

struct ScenePiece {
  const char* text;
  // The number of tokens after which the command is read up to its ";", so that the end of the text
  // is an error in it; kNeverOpen for what the main loop passes over.
  int openFrom;
};

inline const std::vector<ScenePiece>& RichScenePieces() {
  static const std::vector<ScenePiece> kPieces = {
      {"//Maya ASCII 2020 scene\n", kNeverOpen},
      {"//Name: rich.ma\r\n", kNeverOpen},
      {"file -rdi 1 -ns \"r\" \"r.ma\";\n", kNeverOpen},
      {"requires maya \"2020\";\n", kNeverOpen},
      {"currentUnit -l centimeter -a degree -t film;\n", 1},
      {"currentUnit -t 23.976fps;\n", 1},
      {"fileInfo \"application\" \"maya\";\n", kNeverOpen},
      {"createNode transform -s -n \"rig\" -p \"|top\";\n", 2},
      {"\trename -uid \"5A-6B\";\n", kNeverOpen},
      {"\tsetAttr \".v\" no;\n", kNeverOpen},
      {"\tsetAttr \".t\" -type \"double3\" 1 -2.5 3e2 ;\n", 2},
      {"\tsetAttr -k off \".rp\" 1 2 3;\n", kNeverOpen},
      {"\tsetAttr \".scalePivot\" -type \"double3\" 4 5 6 7 ;\n", 2},
      {"/* a block * comment ** of \"two\"\n lines */\n", kNeverOpen},
      {"createNode aimConstraint -n \"aim\" -p \"rig\";\n", 2},
      {"createNode camera -name \"shape\" -parent \"rig\";\n", 2},
      {"\tsetAttr -k off \".v\";\n", kNeverOpen},
      {"\tsetAttr -k off \".fl\" 50;\n", 4},
      {"\tsetAttr \".cap\" -type \"double2\" 1.417 0.945 ;\n", 2},
      {"\tsetAttr \".o\" yes;\n", 2},
      {"\tsetAttr \".ff\" 2;\n", 2},
      {"\tsetAttr \".wci\" 7 8 9;\n", 2},
      {"createNode locator -n \"loc\" -p \"rig\";\n", 2},
      {"\tsetAttr \".lp\" 1 2 3;\n", kNeverOpen},
      {"createNode mesh -n \"mesh\";\n", kNeverOpen},
      {"\tsetAttr \".t\" 1 2 3;\n", kNeverOpen},
      {"addAttr -ci true -sn \"x\" -ln \"xx\" -at \"double\";\n", kNeverOpen},
      {"createNode animCurveTL -n \"rig_tx\";\n", 2},
      {"\tsetAttr \".tan\" 18;\n", 1},
      {"\tsetAttr -s 3 -k on \".ktv[0:2]\"  1 0 2 5.5 3 10;\n", 1},
      {"\tsetAttr \".ktv[3:4]\" 4 yes 5 -6;\n", 1},
      {"createNode animCurveTU -n \"shape_fl\";\n", 2},
      {"createNode animCurveTA -n \"rig_TX\";\n", 2},
      {"\tsetAttr \".keyTimeValue\" 1 2;\n", 1},
      {"createNode \"transform\" -n \"none\";\n", kNeverOpen},
      {"parent -s -nc \"rig\" \"top\";\n", kNeverOpen},
      {"select -ne :time1;\n", 1},
      {"select -ne :defaultResolution;\n", 1},
      {"\tsetAttr \".w\" 1920 \".h\" 1080;\n", 1},
      {"\tsetAttr \".dar\" 1.777;\n", 1},
      {"connectAttr -f \"rig_tx.o\" \"rig.tx\";\n", 1},
      {"connectAttr \"shape_fl.output\" \"shape.focalLength\" -na;\n", 1},
      {"connectAttr \"rig.t\" \"aim.target[0].targetTranslate\";\n", 1},
      {"connectAttr \"aim.crx\" \"rig.rx\";\n", 1},
      {"disconnectAttr \"a\\\"b.o\" \"rig.tx\";\n", kNeverOpen},
      {"( ) + - : 5;\n", kNeverOpen},
      {"// End of rich.ma\n", kNeverOpen},
  };
  return kPieces;
}

inline std::string RichScene() {
  std::string text;
  for (const ScenePiece& piece : RichScenePieces()) text += piece.text;
  return text;
}

}  // namespace testsupport
