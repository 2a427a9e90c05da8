// Reads the commands of a scene text into records.
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>

#include "tests/secondreader/Lexer.h"
#include "tests/secondreader/PlayedHost.h"
#include "tests/secondreader/Records.h"

namespace secondreader {

class SceneReader {
 public:
  SceneReader(PlayedHost& host, std::string_view text, std::function<void(int)> show)
      : host_(host), lexer_(text, std::move(show)) {}

  // Reads the whole text. Throws the code of the first error.
  void read();

  const Scene& scene() const { return scene_; }

 private:
  enum class Current { None, Transform, Camera, Curve, Render, Locator };

  // The next token inside a command that is read up to its ";".
  Token inCommand();

  // Commands.cpp
  void createNode();
  void select();
  void currentUnit();
  void clearCurrent();
  bool takeOption(const Token& option, std::string* name, std::string* parent);
  template <typename Record>
  void createRecord(std::vector<Record>& list, Record& current, Current kind);

  // Attributes.cpp
  void setAttr();
  void setTransformAttr();
  void setCameraAttr();
  void setCurveAttr();
  void setRenderAttr();
  double number(const Token& token);
  void readTriple(Triple& triple, Triple standard);
  template <typename Record>
  void writeBack(std::vector<Record>& list, const Record& current);
  bool findKeys();
  void readKeys();

  // Connections.cpp
  void connectAttr();
  void connect(const std::string& source, const std::string& destination);
  void connectTransform(int source, bool isCurve, const std::string& attribute, std::size_t destination,
                        const std::string& destinationAttribute);

  PlayedHost& host_;
  Lexer lexer_;
  Scene scene_;
  Current kind_ = Current::None;
  Transform transform_;
  Camera camera_;
  Curve curve_;
  Locator locator_;
};

}  // namespace secondreader
