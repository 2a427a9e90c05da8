// Reads the commands of a scene and carries them out with the builder.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include "diag/Collector.h"
#include "scene/Cursor.h"
#include "scene/SceneBuilder.h"

namespace scene {

class Reader {
 public:
  // All must outlive the reader; the text must outlive the scene too. With null as `notes` the notes are
  // reported as diagnostics.
  Reader(std::string_view text, diag::Collector* diagnostics, std::vector<NodeNote>* notes);

  Scene Read();

 private:
  enum class TokenKind {
    Word,
    Option,  // "-" and a letter
    String,
    Punctuation,
    End,     // ";"
    Broken,  // it could not be read; it is reported, and the command is skipped
  };
  struct Token {
    TokenKind kind = TokenKind::Broken;
    std::string_view text = {};  // of a string, with its escapes read
    std::uint32_t offset = 0;    // of a string, after its quote
    std::uint32_t end = 0;
  };
  using Named = SceneBuilder::Named;

  // ---- Reader.cpp: commands and tokens ----

  void ReadCommand();
  Token NextToken();
  Token StringToken();
  Token Broken(diag::Code code, std::uint32_t offset, std::uint32_t end);
  Token StrangeByte();

  // Reads the tokens of the command up to its ";" into arguments_. False where the command could not be read.
  // Keeps the first 10000 tokens only.
  bool ReadArguments();

  // Moves to the end of the command; *end is the offset of its ";". False when the command is broken: that is
  // reported, and the command is skipped.
  bool FindEnd(bool strange, std::uint32_t* end);

  // Skips to the end of a command that cannot be read. Reports nothing.
  void SkipCommand();

  void Lacks(std::string_view what);
  static bool Is(const Token& token, std::string_view shortName, std::string_view longName);
  static bool IsValue(const Token& token);
  static Named NameOf(const Token& token);

  // ---- ReaderNodes.cpp ----

  void ReadCreateNode();
  void ReadRename();
  void ReadParent();
  void ReadSelect();
  void ReadNamespace();

  // ---- ReaderAttributes.cpp ----

  void ReadSetAttr();
  void ReadAddAttr();
  NodeId Current(Named attribute);
  bool SkipOptions(Token* token);

  // ---- ReaderConnections.cpp ----

  void ReadConnectAttr();
  void ReadDisconnectAttr();

  // ---- ReaderHead.cpp ----

  void ReadRequires();
  void ReadFileInfo();
  void ReadFile();
  void ReadCurrentUnit();

  struct CommandReader {
    std::string_view name;
    void (Reader::*read)();
  };
  static const CommandReader kReaders[];
  static const CommandReader* FindReader(std::string_view name);

  diag::Collector* diagnostics_;
  Cursor cursor_;
  SceneBuilder builder_;
  NodeId current_ = kNoNode;
  bool currentIsLost_ = false;  // the command that makes a node current could not be read
  std::string_view command_;    // the name of the command that is being read
  std::uint32_t commandOffset_ = 0;
  std::vector<Token> arguments_;
};

}  // namespace scene
