// Units, the render settings, connections, and commands that the importer does not know.
#include "tests/secondreader/SceneGenerator.h"

namespace secondreader {

void SceneGenerator::units() {
  static constexpr std::string_view kLinear[] = {"mm", "millimeter", "cm", "centimeter", "m",     "meter",
                                                 "km", "kilometer",  "in", "inch",       "ft",    "foot",
                                                 "yd", "yard",       "mi", "mile",       "cubit", "file"};
  static constexpr std::string_view kAngle[] = {"deg", "degree", "rad", "radian", "degree", "turn"};
  static constexpr std::string_view kTime[] = {"hour", "min",       "sec",   "millisec", "game",  "film",
                                               "pal",  "ntsc",      "show",  "palf",     "ntscf", "24",
                                               "25.5", "23.976fps", "jiffy", "0"};
  word(anyCase("currentUnit"));
  if (dice_.chance(70)) {
    word(anyCase(dice_.chance(70) ? "-l" : "-linear"));
    word(anyCase(dice_.oneOf(kLinear)));
  }
  if (dice_.chance(60)) {
    word(anyCase(dice_.chance(70) ? "-a" : "-angle"));
    word(anyCase(dice_.oneOf(kAngle)));
  }
  if (odd()) words("-s 2");
  if (dice_.chance(85)) {
    word(anyCase(dice_.chance(70) ? "-t" : "-time"));
    if (odd()) {
      word(dice_.chance(50) ? oddNumber() : "\"film\"");
    } else {
      word(anyCase(dice_.oneOf(kTime)));
    }
  }
  end();
}

void SceneGenerator::resolution() {
  static constexpr std::string_view kSelects[] = {
      ":time1", "defaultResolution", ":defaultResolution \"x\"", "\"x\" :defaultResolution", ":", ":;"};
  word(anyCase("select"));
  if (dice_.chance(90)) word("-ne");
  word(odd() ? dice_.oneOf(kSelects) : ':' + anyCase("defaultResolution"));
  end();
  static constexpr std::string_view kAspects[] = {"1", "1.005", "1.01", "0.9", "2", "0.9091", "1.009", "-1"};
  for (int count = dice_.between(1, 4); count > 0; --count) {
    word("setAttr");
    if (odd()) words("-k on");
    switch (dice_.between(0, 4)) {
      case 0:
        quoted(anyCase(dice_.chance(50) ? ".w" : ".width"));
        word(odd() ? oddNumber() : std::to_string(dice_.between(16, 4096)));
        break;
      case 1:
        quoted(anyCase(dice_.chance(50) ? ".h" : ".height"));
        word(odd() ? oddNumber() : std::to_string(dice_.between(16, 4096)));
        break;
      case 2:
        quoted(anyCase(dice_.chance(50) ? ".dar" : ".deviceAspectRatio"));
        word(number());
        break;
      case 3:
        quoted(anyCase(dice_.chance(50) ? ".pa" : ".pixelAspect"));
        word(odd() ? oddNumber() : std::string(dice_.oneOf(kAspects)));
        break;
      default:
        words("\".w\" 640 \".h\" 480.9 \".pa\" 1");
        break;
    }
    end();
  }
}

void SceneGenerator::otherCommand() {
  static constexpr std::string_view kCommands[] = {
      "requires maya \"2020\"",
      "fileInfo \"application\" \"maya\"",
      "createNode mesh -n \"m\" -p \"group1\"; setAttr \".t\" 1 2 3",
      "parent -s -nc \"a\" \"b\"",
      "addAttr -ci true -sn \"x\" -ln \"y\" -at \"double\"",
      "disconnectAttr \"a.o\" \"b.tx\"",
      "file -r -ns \"x\" \"y.ma\"",
      "// to the end of the line\n",
      "/* over\nlines ; \" */",
      "createNode \"transform\" -n \"quotedType\"",
      "createNode ; setAttr \".t\" 4 5 6",
      "select -all",
      "select :other",
      "rename -uid \"1\" select \"group1\"",
      "relationship \"link\" \":lightLinker1.message\"",
      "currentUnit -t",
      "select :",
      "select -ne :other",
      "connectAttr -f \"a.o\"",
  };
  static constexpr std::string_view kBad[] = {"{ }", "_name x", "#", "a / b", "\"open"};
  words(odd() && dice_.chance(10) ? dice_.oneOf(kBad) : dice_.oneOf(kCommands));
  end();
}

void SceneGenerator::connect(const std::string& source, const std::string& destination) {
  word(anyCase("connectAttr"));
  if (odd()) word("-f");
  quoted(source);
  if (!(odd() && dice_.chance(20))) quoted(destination);
  if (odd()) words("-na");
  if (odd() && dice_.chance(20)) quoted("later.o");
  end();
}

void SceneGenerator::strayConnection() {
  static constexpr std::string_view kAttributes[] = {
      ".t", ".o",  ".tx", ".rz",     ".cr", ".crx",         ".ct",     ".ctx",
      "",   ".fl", ".v",  ".target", ".cv", ".Target[0].x", ".output", ".constraintVectorX"};
  const auto plug = [&](const std::vector<std::string>& names) {
    return knownName(names) + std::string(dice_.oneOf(kAttributes));
  };
  const std::string source = plug(dice_.chance(50) ? transforms_ : curves_);
  connect(source, plug(dice_.chance(80) ? transforms_ : cameras_));
}

// One of the nodes again, made current with its own attributes.
void SceneGenerator::repeatedNode() {
  if (dice_.chance(50)) {
    createNode("transform", knownName(transforms_), knownName(transforms_));
    transformAttributes();
  } else if (dice_.chance(50)) {
    createNode("camera", knownName(cameras_), knownName(transforms_));
    cameraAttributes();
  } else {
    curve(knownName(curves_), dice_.between(0, 4), false);
  }
}

// Attributes of whatever is current by now, after a command or two that may have changed that.
void SceneGenerator::attributesAgain() {
  for (int count = dice_.between(0, 2); count > 0; --count) otherCommand();
  if (dice_.chance(50)) {
    transformAttributes();
  } else {
    cameraAttributes();
  }
}

}  // namespace secondreader
