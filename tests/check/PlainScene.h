// A scene as its author wrote it, read by a reader of the tests that shares no code with the product. For
// scenes that are well formed.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace check_test {

inline constexpr int kNone = -1;

using Bytes = std::pair<std::size_t, std::size_t>;  // the first, and the one after the last

struct PlainNode {
  std::string type;
  std::string name;
  std::string parentWritten;                   // as "-p" has it; empty where nothing stands above
  int parent = kNone;                          // kNone too where the file does not create it
  bool startup = false;                        // created with "-s"
  std::map<std::string, double> numbers = {};  // by short name, "tx" and the like
  std::map<std::string, double> whole = {};    // those that a plain setAttr ".t" after its createNode sets
  std::vector<double> keys;                    // of a curve: time and value by turns
  std::vector<Bytes> text;                     // of its commands, and of the connections into it
};

struct PlainDriver {
  int node = kNone;        // kNone: the file does not create it
  std::string sourcePlug;  // as it is written
  Bytes text;              // of the connection
};

class PlainScene {
 public:
  explicit PlainScene(std::string_view text);

  const std::vector<PlainNode>& nodes() const { return nodes_; }
  const PlainNode& node(int id) const { return nodes_[static_cast<std::size_t>(id)]; }

  // Where the last command of the text begins.
  std::optional<std::size_t> openCommand() const { return openCommand_; }

  double Number(int id, const std::string& attribute, double otherwise) const;

  // The number that the file has in its usual form: without an option, a name or the axis alone.
  double UsualNumber(int id, const std::string& attribute, double otherwise) const;

  // "translateX" of "tx"; the same where it has none.
  static std::string LongName(const std::string& attribute);

  // What drives an attribute, by its short name: by itself, or with the three that it is one of.
  const PlainDriver* DriverOf(int id, const std::string& attribute) const;

  // What is connected into the node, by short names. "target[0].targetTranslate" keeps its form.
  const std::map<std::string, PlainDriver>& DriversOf(int id) const {
    return drivers_[static_cast<std::size_t>(id)];
  }

  bool countsCentimeters() const { return countsCentimeters_; }
  double degrees() const { return degrees_; }  // in one unit of angle
  double framesPerSecond() const { return framesPerSecond_; }
  // Whether a scene's first key is the beginning of its time.
  bool countsFrames() const { return countsFrames_; }
  bool saysRate() const { return saysRate_; }
  double resolution(const std::string& attribute, double otherwise) const;

 private:
  struct Word {
    std::string_view text;
    bool quoted = false;
    std::size_t end = 0;  // in the text
  };
  using Command = std::vector<Word>;

  void Take(const Command& command, Bytes place);
  void Create(const Command& command, Bytes place);
  void Set(const Command& command, Bytes place);
  void Connect(const Command& command, Bytes place);
  void Units(const Command& command);
  static void SetNumbers(std::string_view attribute, const std::vector<double>& numbers,
                         std::map<std::string, double>* known);
  int Find(std::string_view path) const;

  std::vector<PlainNode> nodes_;
  std::map<std::string, std::vector<int>> byName_;
  std::vector<std::map<std::string, PlainDriver>> drivers_;  // by node and short name
  std::map<std::string, double> resolution_;
  int current_ = kNone;
  bool resolutionIsCurrent_ = false;
  bool countsCentimeters_ = true;
  double degrees_ = 1.0;
  double framesPerSecond_ = 24.0;
  bool countsFrames_ = true;
  bool saysRate_ = false;
  std::optional<std::size_t> openCommand_;
};

}  // namespace check_test
