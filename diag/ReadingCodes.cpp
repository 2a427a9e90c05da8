// MA0101 to MA0199: what the reader could not read, and passed over.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kReadingCodes[] = {
    {.code = Code::OpenString,
     .severity = Severity::Warning,
     .symbol = "OpenString",
     .sentence = "this string has no closing quote",
     .meaning =
         "A quote opens a string that the file never closes, or that a new command follows. The command "
         "with the string is skipped. Reading goes on with the next command.",
     .example =
         "createNode script -n \"notes\";\n  setAttr \".b\" -type \"string\" \"closing quote forgotten;\n"
         "createNode camera -n \"shotCamShape\";",
     .help = "Close the string, or export the scene again. A file that ends inside a string was cut off: "
             "copy it again."},
    {.code = Code::OpenComment,
     .severity = Severity::Warning,
     .symbol = "OpenComment",
     .sentence = "this comment has no end",
     .meaning =
         "\"/*\" opens a comment, and no \"*/\" follows. Everything up to the next line that begins with a "
         "command is skipped.",
     .example = "/* exported by hand\ncreateNode camera -n \"shotCamShape\";",
     .help = "End the comment with \"*/\", or take it out."},
    {.code = Code::CommandCutOff,
     .severity = Severity::Warning,
     .symbol = "CommandCutOff",
     .sentence = "the file ends inside the command \"{0}\"",
     .meaning =
         "The last command has no \";\". The file was probably cut off on its way. The last command is "
         "skipped, and what followed it is missing.",
     .example = "createNode camera -n \"shotCamShape\";\n  setAttr \".fl\" 3",
     .help = "Copy or export the file again, and compare its size with the original's."},
    {.code = Code::CommandWithoutEnd,
     .severity = Severity::Warning,
     .symbol = "CommandWithoutEnd",
     .sentence = "the command \"{0}\" has no \";\" before the next command",
     .meaning = "A new command begins on a line of its own before the last one has ended. The last one is "
                "skipped.",
     .example = "createNode camera -n \"shotCamShape\"\ncreateNode transform -n \"shotCam\";",
     .help = "Put a \";\" at the end of the command, or export the scene again."},
    {.code = Code::ConflictMark,
     .severity = Severity::Warning,
     .symbol = "ConflictMark",
     .sentence = "this line is the mark of a merge conflict",
     .meaning =
         "A version control system wrote both versions of some lines into the file, between marks. The "
         "marks are skipped, both versions are read, and the later value wins. A command with a "
         "mark inside is skipped whole.",
     .example = "<<<<<<< HEAD\ncurrentUnit -l centimeter -a degree -t film;\n=======\n"
                "currentUnit -l centimeter -a degree -t film;\n>>>>>>> theirs",
     .help = "Resolve the conflict: keep one version and take out the marks. Or take the scene from before "
             "the merge."},
    {.code = Code::TemplateField,
     .severity = Severity::Warning,
     .symbol = "TemplateField",
     .sentence = "\"{0}\" is a template field that nobody filled in",
     .meaning =
         "The file is a template: a program should have replaced the field by a value. The command with "
         "the field is skipped.",
     .example = "currentUnit -l centimeter -a degree -t {{FPS}};",
     .help =
         "Use the scene that the program made from this template, or write the value in place of the field."},
    {.code = Code::UnexpectedByte,
     .severity = Severity::Warning,
     .symbol = "UnexpectedByte",
     .sentence = "\"{0}\" cannot be read here",
     .meaning = "No command and no value begins with this byte. The command in which it stands is skipped.",
     .example = "currentUnit -l centimeter -a degree -t &film;",
     .help =
         "Look at this line in a text editor. A file with many such bytes is damaged, or is not a Maya ASCII "
         "scene: export it again as Maya ASCII."},
    {.code = Code::IncompleteCommand,
     .severity = Severity::Warning,
     .symbol = "IncompleteCommand",
     .sentence = "the command \"{0}\" lacks {1}",
     .meaning = "The command ends before it has all that it needs. It does nothing.",
     .example = "connectAttr \"shotCam_translateX.o\";",
     .help = "Complete the command, or export the scene again."},
    {.code = Code::UnreadableValue,
     .severity = Severity::Warning,
     .symbol = "UnreadableValue",
     .sentence = "\"{0}\" is not a value that {1} can have",
     .meaning = "The value is not a number where one is needed, or it is too large. The default is used in "
                "its place.",
     .example = "select -ne :time1;\n  setAttr \".o\" 1e999;",
     .help = "Write a value that can be read, or export the scene again."},
    {.code = Code::TextTooLong,
     .severity = Severity::Error,
     .symbol = "TextTooLong",
     .sentence = "the file has {0} bytes, which is more than can be read",
     .meaning = "Files of up to 4,294,967,294 bytes are read. Of a longer one nothing is read.",
     .example = "$ truncate -s 5G everything.ma",
     .help = "Export only the cameras, with what is above them."},
};

}  // namespace

std::span<const Entry> ReadingCodes() { return kReadingCodes; }

}  // namespace diag
