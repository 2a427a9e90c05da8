// MA0701 to MA0799: what stops an import.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kStopCodes[] = {
    {.code = Code::ImportStopped,
     .severity = Severity::Error,
     .symbol = "ImportStopped",
     .sentence = "the import stops with code {0}: {1}",
     .meaning =
         "The importer, or its host, cannot go on here. What was made before stays, and nothing of what "
         "follows comes over.",
     .example = "select -ne :defaultResolution;\n  setAttr \".w\" 0;",
     .help = "Correct the scene where the sentence says so, or write it anew: mayascene bake SCENE -o OUT."},
    {.code = Code::NotMayaAscii,
     .severity = Severity::Error,
     .symbol = "NotMayaAscii",
     .sentence = "this is not a Maya ASCII scene",
     .meaning =
         "A Maya ASCII scene is a text that begins with \"//Maya\". This file begins differently, so the "
         "importer does not read it.",
     .example = "#usda 1.0",
     .help = "Save the scene as Maya ASCII (.ma), and give that file. If a line that begins with \"//Maya\" "
             "stands "
             "further down, remove what is above it."},
    {.code = Code::MayaBinary,
     .severity = Severity::Error,
     .symbol = "MayaBinary",
     .sentence = "this is a Maya Binary scene under another name",
     .meaning = "The file has the form of a Maya Binary scene (.mb). The importer reads only Maya ASCII.",
     .example = "$ printf 'FOR8\\000\\000\\000\\000\\000\\000\\000\\100Maya' > shot.ma",
     .help = "Open the scene in Maya and save it as Maya ASCII (.ma). To rename the file is not enough."},
    {.code = Code::CompressedFile,
     .severity = Severity::Error,
     .symbol = "CompressedFile",
     .sentence = "this file is compressed ({0})",
     .meaning = "The file begins like a compressed file. There may be a scene in it.",
     .example = "$ printf '\\037\\213\\010' > shot.ma",
     .help = "Unpack the file, and use the scene in it."},
    {.code = Code::EmptyFile,
     .severity = Severity::Error,
     .symbol = "EmptyFile",
     .sentence = "the file has no text",
     .meaning =
         "The file has no bytes, or none but white space or zeros. It was probably never written to its end.",
     .example = "$ printf '' > shot.ma",
     .help = "Copy or export the file again."},
    {.code = Code::MarkBeforeHeader,
     .severity = Severity::Error,
     .symbol = "MarkBeforeHeader",
     .sentence = "the file begins with a byte order mark ({0})",
     .meaning = "A text editor wrote a mark before the first line, or wrote every letter in two bytes. The "
                "importer looks for \"//Maya\" at the very beginning of the file.",
     .example = "$ printf '\\357\\273\\277//Maya ASCII 2018 scene;\\n' > shot.ma",
     .help = "Save the file as UTF-8 without a byte order mark, or write the scene anew from the original."},
    {.code = Code::UnquotedPath,
     .severity = Severity::Error,
     .symbol = "UnquotedPath",
     .sentence = "the import stops here: \"{0}\" is a path without quotes",
     .meaning =
         "Edits of a referenced file name their nodes by paths without quotes. The importer takes no word "
         "that begins with \"|\", and reads nothing of what follows.",
     .example = "setAttr \".ed\" -type \"dataReferenceEdits\"\n  \"heroRN\" 1\n  2 |hero|root \"visibility\" "
                "\" 1\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake. Or import the "
             "reference into the scene before the export."},
    {.code = Code::AliasList,
     .severity = Severity::Error,
     .symbol = "AliasList",
     .sentence = "the import stops here: a list of attribute aliases stands in braces",
     .meaning = "A node has names of its own for its attributes, which are written as a list in braces. The "
                "importer takes no \"{\", and reads nothing of what follows.",
     .example = "setAttr \".aal\" -type \"attributeAlias\" {\"smile\",\"weight[0]\"} ;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::ConflictMarkStops,
     .severity = Severity::Error,
     .symbol = "ConflictMarkStops",
     .sentence = "the import stops here: this line is the mark of a merge conflict",
     .meaning =
         "A version control system wrote both versions of some lines into the file, between marks. The "
         "importer reads nothing of what follows.",
     .example = "<<<<<<< HEAD",
     .help =
         "Resolve the conflict: keep one version and take out the marks. A bake reads both versions, and the "
         "later value wins: mayascene bake SCENE -o OUT."},
    {.code = Code::TemplateFieldStops,
     .severity = Severity::Error,
     .symbol = "TemplateFieldStops",
     .sentence = "the import stops here: \"{0}\" is a template field that nobody filled in",
     .meaning =
         "The file is a template: a program should have replaced the field by a value. The importer reads "
         "nothing of what follows.",
     .example = "currentUnit -l centimeter -a degree -t {{FPS}};",
     .help =
         "Use the scene that the program made from this template, or write the value in place of the field."},
    {.code = Code::RefusedByte,
     .severity = Severity::Error,
     .symbol = "RefusedByte",
     .sentence = "the import stops here: no word begins with \"{0}\"",
     .meaning =
         "Outside of strings the importer takes words that begin with a letter, a digit, \"-\" or \".\", and "
         "\"(\", \")\", \"+\", \":\" and \";\". At any other byte it stops.",
     .example = "createNode transform -n _root;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT. Where the line is damaged, export the scene "
             "again."},
    {.code = Code::LastCommentOpen,
     .severity = Severity::Error,
     .symbol = "LastCommentOpen",
     .sentence = "the import stops here: the last comment has no line end",
     .meaning =
         "The file ends in a comment, and the comment's line does not end. The importer takes such a file "
         "for one that was cut off. Nothing comes over.",
     .example = "// End of shot.ma",
     .help =
         "Add an empty line to the end of the file, or write the scene anew: mayascene bake SCENE -o OUT."},
    {.code = Code::CutOffInString,
     .severity = Severity::Error,
     .symbol = "CutOffInString",
     .sentence = "the import stops here: this string is not closed before the file ends",
     .meaning =
         "The file was cut off inside a string, or there is a quote too few or too many. Nothing comes over.",
     .example = "setAttr \".b\" -type \"string\" \"closing quote forgotten;",
     .help = "Copy or export the file again, and compare its size with the original's."},
    {.code = Code::CutOffInComment,
     .severity = Severity::Error,
     .symbol = "CutOffInComment",
     .sentence = "the import stops here: this comment does not end before the file ends",
     .meaning =
         "\"/*\" opens a comment that nothing closes. The importer misses the end of a comment in \"/***/\" "
         "too: it skips a \"*\" after a \"*\". Nothing comes over.",
     .example = "/* exported by hand\ncreateNode camera -n \"shotCamShape\";",
     .help = "End the comment with \"*/\", with no other \"*\" before it, or take it out."},
    {.code = Code::CutOffInCommand,
     .severity = Severity::Error,
     .symbol = "CutOffInCommand",
     .sentence = "the import stops at the end of the file: the command \"{0}\" has no end",
     .meaning =
         "The last command has no \";\", or no line end follows its last word. The file was probably cut off "
         "on its way. Nothing comes over.",
     .example = "createNode camera -n \"shotCamShape\";\n  setAttr \".fl\" 3",
     .help =
         "Copy or export the file again, and compare its size with the original's. A bake reads all up to "
         "there: mayascene bake SCENE -o OUT."},
    {.code = Code::UnequalKeys,
     .severity = Severity::Error,
     .symbol = "UnequalKeys",
     .sentence = "the import stops at \"{0}\": {1} keys on {2} (\"{3}\"), but {4}",
     .meaning =
         "The importer takes the first keys of all channels of a node together, then the second ones, and so "
         "on. All curves of a node that have two keys or more need the same number of keys. What was made "
         "before stays; the node and what follows it do not come over.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 3 \".ktv[0:2]\" 1 0 2 5.5 3 10;\n"
                "createNode animCurveTA -n \"turnY\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 3 90;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";\n"
                "connectAttr \"turnY.o\" \"shotCam.ry\";",
     .help =
         "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene import "
         "--bake."},
    {.code = Code::NumberTooLarge,
     .severity = Severity::Error,
     .symbol = "NumberTooLarge",
     .sentence = "the import stops here: the number \"{0}\" is too large",
     .meaning = "No number may be larger than about 1.8e308. Nothing comes over.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".t\" -type \"double3\" 1e999 0 0 ;",
     .help = "Look in the scene for the node that has such a value, set it to a smaller one, and export the "
             "scene again."},
    {.code = Code::NumberUnreadable,
     .severity = Severity::Error,
     .symbol = "NumberUnreadable",
     .sentence = "the import stops here: \"{0}\" is not a number that it can read",
     .meaning =
         "Where the importer needs a number, it takes decimal digits, which can have a sign, a fraction "
         "and an exponent. Nothing comes over.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".t\" -type \"double3\" 1.#QNAN 0 0 ;",
     .help = "Look in the scene for what has no valid value, and export the scene again."},
};

}  // namespace

std::span<const Entry> StopCodes() { return kStopCodes; }

}  // namespace diag
