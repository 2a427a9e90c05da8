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
     .help = "Give the nodes a parent each that does not lead back to them."},
    {.code = Code::UnknownNode,
     .severity = Severity::Note,
     .symbol = "UnknownNode",
     .sentence = "the command \"{0}\" names \"{1}\", which the file does not create",
     .meaning = "The command changes a node that is not in this file. It does nothing.",
     .example = "rename \"oldCam\" \"shotCam\";",
     .help = "Nothing, unless the node matters. It may stand in a referenced file."},
    {.code = Code::AlreadyConnected,
     .severity = Severity::Note,
     .symbol = "AlreadyConnected",
     .sentence = "\"{0}\" is already driven by \"{1}\"",
     .meaning =
         "A channel is driven by one other at most. The first connection stays, this one is passed over.",
     .example = "connectAttr \"a.o\" \"shotCam.tx\";\nconnectAttr \"b.o\" \"shotCam.tx\";",
     .help = "Take out one of the two connections."},
    {.code = Code::UnknownUnit,
     .severity = Severity::Warning,
     .symbol = "UnknownUnit",
     .sentence = "\"{0}\" is no unit of {1}",
     .meaning = "The word of currentUnit is not known. The unit stays as it was: centimetres, degrees and 24 "
                "frames a second, where nothing else was said.",
     .example = "currentUnit -l league -a degree -t film;",
     .help = "Write a unit that is known: for example centimeter, degree, film or 25fps."},
    {.code = Code::SecondUnit,
     .severity = Severity::Warning,
     .symbol = "SecondUnit",
     .sentence = "the unit of {0} changes here from \"{1}\" to \"{2}\"",
     .meaning = "The file says the unit twice, and differently. The last one holds for the whole file.",
     .example = "currentUnit -l centimeter -a degree -t film;\ncurrentUnit -t pal;",
     .help = "Keep the command that is right, and take out the other."},
    {.code = Code::ReferenceNotRead,
     .severity = Severity::Note,
     .symbol = "ReferenceNotRead",
     .sentence = "the referenced file \"{0}\" is not read",
     .meaning = "The scene takes nodes from another file. Those nodes are not known.",
     .example = "file -r -ns \"hero\" -rfn \"heroRN\" \"hero.ma\";",
     .help =
         "Nothing, unless a camera or its parent stands in that file: then import the referenced file into "
         "the scene before the export."},
};

}  // namespace

std::span<const Entry> NodeCodes() { return kNodeCodes; }

}  // namespace diag
