// MA0201 to MA0299: nodes, their names and parents, connections, units, references.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kNodeCodes[] = {
    {.code = Code::NoCurrentNode,
     .severity = Severity::Warning,
     .symbol = "NoCurrentNode",
     .sentence = "no node is current, so \"{0}\" belongs to none",
     .meaning = "An attribute that begins with \".\" belongs to the node that the last createNode or select "
                "named. Here there is none. The command does nothing.",
     .example = "currentUnit -l centimeter;\nsetAttr \".fl\" 35;",
     .help = "Look at what is missing above this line, or export the scene again."},
    {.code = Code::NameTaken,
     .severity = Severity::Note,
     .symbol = "NameTaken",
     .sentence = "there is a second \"{0}\" in the same place, now called \"{1}\"",
     .meaning =
         "Two nodes of one name stand under the same parent. The second one is given a number. Commands "
         "that name the node mean the first one.",
     .example = "createNode transform -n \"shotCam\";\ncreateNode transform -n \"shotCam\";",
     .help = "Give the two nodes different names, if both matter."},
    {.code = Code::AmbiguousName,
     .severity = Severity::Warning,
     .symbol = "AmbiguousName",
     .sentence = "\"{0}\" is the name of several nodes; the first of them is meant",
     .meaning =
         "Several nodes have this name under different parents, and the command does not say which one "
         "it means. The first one in the file is taken.",
     .example =
         "createNode transform -n \"left\";\ncreateNode transform -n \"right\";\n"
         "createNode transform -n \"cam\" -p \"left\";\ncreateNode transform -n \"cam\" -p \"right\";\n"
         "createNode camera -n \"camShape\" -p \"cam\";",
     .help =
         "Give the nodes different names, or export the scene again: the program that writes scenes writes "
         "paths where a name is not enough."},
    {.code = Code::ParentMissing,
     .severity = Severity::Warning,
     .symbol = "ParentMissing",
     .sentence = "the parent \"{0}\" of \"{1}\" is not in the file",
     .meaning =
         "The node is named as the child of a node that the file does not create. Its place in the world "
         "is not known; it is taken as if it had no parent.",
     .example = "createNode camera -n \"shotCamShape\" -p \"shotCam\";",
     .help = "Export the camera together with everything above it."},
    {.code = Code::ParentInReference,
     .severity = Severity::Note,
     .symbol = "ParentInReference",
     .sentence = "\"{1}\" stands under \"{0}\", which belongs to the referenced file \"{2}\"",
     .meaning = "A node above this one is in another file, which is not read. Its place in the world is not "
                "known; it is taken as if the referenced node had the identity transform.",
     .example = "file -r -ns \"hero\" -rfn \"heroRN\" \"hero.ma\";\n"
                "createNode transform -n \"faceCam\" -p \"hero:head\";",
     .help =
         "Import the referenced file into the scene before the export, or bake the camera into world space "
         "where the scene was made."},
    {.code = Code::ParentCircle,
     .severity = Severity::Warning,
     .symbol = "ParentCircle",
     .sentence = "\"{0}\" would stand above itself",
     .meaning = "The parents of a node form a circle. The node is taken as if it had no parent.",
     .example = "createNode transform -n \"a\" -p \"b\";\ncreateNode transform -n \"b\" -p \"a\";",
     .help = "Give each node a parent that is not below it."},
    {.code = Code::UnknownNode,
     .severity = Severity::Note,
     .symbol = "UnknownNode",
     .sentence = "the command \"{0}\" names \"{1}\", which the file does not create",
     .meaning = "The command changes a node that is not in this file. It does nothing.",
     .example = "rename \"oldCam\" \"shotCam\";",
     .help = "Nothing has to be done, unless the node matters. It may stand in a referenced file."},
    {.code = Code::AlreadyConnected,
     .severity = Severity::Note,
     .symbol = "AlreadyConnected",
     .sentence = "\"{0}\" is already driven by \"{1}\"",
     .meaning = "A channel is driven by one other at most. The first connection stays, this one is ignored.",
     .example = "connectAttr \"a.o\" \"shotCam.tx\";\nconnectAttr \"b.o\" \"shotCam.tx\";",
     .help = "Take out one of the two connections."},
    {.code = Code::UnknownUnit,
     .severity = Severity::Warning,
     .symbol = "UnknownUnit",
     .sentence = "\"{0}\" is not a unit of {1}",
     .meaning = "The word of currentUnit is not known. The unit stays as it was: centimetres, degrees and 24 "
                "frames a second, unless the file set another one before.",
     .example = "currentUnit -l league -a degree -t film;",
     .help = "Write a unit that is known: for example centimeter, degree, film or 25fps."},
    {.code = Code::SecondUnit,
     .severity = Severity::Warning,
     .symbol = "SecondUnit",
     .sentence = "the unit of {0} changes here from \"{1}\" to \"{2}\"",
     .meaning = "The file sets the unit twice, to different values. The last one holds for the whole file.",
     .example = "currentUnit -l centimeter -a degree -t film;\ncurrentUnit -t pal;",
     .help = "Keep the command that is right, and take out the other."},
    {.code = Code::ReferenceNotRead,
     .severity = Severity::Note,
     .symbol = "ReferenceNotRead",
     .sentence = "referenced files are not read: {0}, the first \"{1}\"",
     .meaning = "The scene takes nodes from other files. Those nodes are not known.",
     .example = "file -r -ns \"hero\" -rfn \"heroRN\" \"hero.ma\";",
     .help = "Nothing has to be done, unless a camera or its parent stands in that file: then import the "
             "referenced file into the scene before the export."},
    {.code = Code::SameNames,
     .severity = Severity::Warning,
     .symbol = "SameNames",
     .sentence = "this is a second node called \"{0}\" for the importer",
     .meaning = "The importer knows nodes by their names alone, wherever they stand. Of several transforms, "
                "cameras, curves or locators of one name, the first gets the values, the curves and the "
                "parent of all of them.",
     .example =
         "createNode transform -n \"shotCam\" -p \"rigA\";\ncreateNode transform -n \"shotCam\" -p \"rigB\";",
     .help = "Give the nodes different names, or write the scene anew: mayascene bake SCENE -o OUT."},
    {.code = Code::NamesDifferInCase,
     .severity = Severity::Warning,
     .symbol = "NamesDifferInCase",
     .sentence = "\"{0}\" and \"{1}\" are one name for the importer",
     .meaning =
         "The importer does not distinguish upper and lower case. The first of the nodes gets the values, "
         "the curves and the parent of both.",
     .example = "createNode transform -n \"shotCam\";\ncreateNode transform -n \"ShotCam\";",
     .help = "Give the nodes different names, or write the scene anew: mayascene bake SCENE -o OUT."},
    {.code = Code::NameTooLong,
     .severity = Severity::Warning,
     .symbol = "NameTooLong",
     .sentence = "the importer does not take this name of {0} bytes",
     .meaning =
         "A name of more than 252 bytes is empty for the importer. The node gets no values and no curves.",
     .example = "$ printf '//Maya ASCII 2018 scene;\\ncreateNode camera -n \"%0300d\";\\n' 0 > shot.ma",
     .help = "Give the node a shorter name, or write the scene anew: mayascene bake SCENE -o OUT."},
    {.code = Code::NodeWithoutName,
     .severity = Severity::Warning,
     .symbol = "NodeWithoutName",
     .sentence = "this {0} has no name that the importer takes",
     .meaning = "The node has no name, or a name without quotes. Of several such nodes the first gets the "
                "values of all.",
     .example = "createNode transform -n shotCam;",
     .help = "Write the name in quotes, or write the scene anew: mayascene bake SCENE -o OUT."},
    {.code = Code::TextAfterNul,
     .severity = Severity::Warning,
     .symbol = "TextAfterNul",
     .sentence = "the importer reads nothing of the {0} bytes after this zero byte",
     .meaning =
         "A byte of value 0 ends the text for the importer, and text follows it. The file is damaged, or was "
         "put together from several.",
     .example =
         "$ printf '//Maya ASCII 2018 scene;\\n\\000createNode camera -n \"shotCamShape\";\\n' > shot.ma",
     .help = "Copy or export the file again. A bake reads on after the byte: mayascene bake SCENE -o OUT."},
};

}  // namespace

std::span<const Entry> NodeCodes() { return kNodeCodes; }

}  // namespace diag
