// MA0801 to MA0899: what does not come over.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kLossCodes[] = {
    {.code = Code::OrthographicCamera,
     .severity = Severity::Note,
     .symbol = "OrthographicCamera",
     .sentence = "the orthographic camera \"{0}\" does not come over",
     .meaning = "A camera of a composition has a perspective. The importer leaves orthographic cameras out.",
     .example = "createNode camera -n \"planShape\" -p \"plan\";\n  setAttr \".o\" yes;",
     .help = "Nothing has to be done, unless the shot is seen through it: then give the camera a very long "
             "lens and move it far away."},
    {.code = Code::StartupCameras,
     .severity = Severity::Note,
     .symbol = "StartupCameras",
     .sentence = "cameras that every scene begins with are left out: {0}",
     .meaning =
         "persp, top, front and side are the cameras of the viewports. The importer knows the first by its "
         "name, and the others because they are orthographic.",
     .example = "createNode camera -s -n \"perspShape\" -p \"persp\";",
     .help = "Nothing has to be done, unless one of them is the camera of the shot: then duplicate it in "
             "Maya under another name."},
    {.code = Code::CameraNotImported,
     .severity = Severity::Warning,
     .symbol = "CameraNotImported",
     .sentence = "the camera \"{0}\" does not come over",
     .meaning = "The scene creates the camera, and the import made no layer of it.",
     .example = "createNode camera -n \"perspShape\" -p \"shotCam\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT. A camera that is called perspShape needs "
             "another name."},
    {.code = Code::ParentIsPath,
     .severity = Severity::Warning,
     .symbol = "ParentIsPath",
     .sentence = "\"{0}\" loses its place: its parent is given as the path \"{1}\"",
     .meaning =
         "The importer looks for a node's parent by its name. It finds none under a path, so what stands "
         "there, and above it, has no effect.",
     .example = "createNode camera -n \"shotCamShape\" -p \"|rig|shotCam\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::ParentNotImported,
     .severity = Severity::Warning,
     .symbol = "ParentNotImported",
     .sentence =
         "\"{0}\" loses its place: the import does not take its parent \"{1}\", a node of the type {2}",
     .meaning = "A node above the camera or the marked locator is of a type that the importer does not know, "
                "such as a joint. The camera or locator comes over as if that node stood at the origin.",
     .example = "createNode joint -n \"arm\";\ncreateNode transform -n \"shotCam\" -p \"arm\";\n"
                "createNode camera -n \"shotCamShape\" -p \"shotCam\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::ChannelsOfOneKey,
     .severity = Severity::Warning,
     .symbol = "ChannelsOfOneKey",
     .sentence = "\"{0}\" does not get the values of its keys: one key alone in {1}",
     .meaning = "The importer takes a node for animated when one of its curves has two keys. This node has "
                "only curves of one key. It comes over with the values that the scene stores beside the "
                "curves, which differ; often it lands at the origin.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr \".ktv[0]\" 1 12.5;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::DrivenByNoCurve,
     .severity = Severity::Warning,
     .symbol = "DrivenByNoCurve",
     .sentence = "\"{0}\" stands still in {1}: \"{2}\" ({3}) drives it, which is not a curve",
     .meaning = "A constraint, an expression or another node computes the channels. The importer follows "
                "animation curves alone, and takes the values that the scene stores.",
     .example = "createNode pointConstraint -n \"hold\" -p \"shotCam\";\n"
                "connectAttr \"hold.ctx\" \"shotCam.tx\";",
     .help =
         "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene import "
         "--bake. What a bake cannot compute, bake in Maya (Edit, Keys, Bake Simulation)."},
    {.code = Code::CurveThroughNode,
     .severity = Severity::Warning,
     .symbol = "CurveThroughNode",
     .sentence = "\"{0}\" stands still in {1}: its curves go through \"{2}\" ({3})",
     .meaning = "Between the curve and the channel stands another node: a blend, a conversion of units, an "
                "animation layer. The importer follows curves that drive a channel directly.",
     .example = "createNode pairBlend -n \"blend\";\n"
                "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 24 5;\n"
                "connectAttr \"moveX.o\" \"blend.itx2\";\n"
                "connectAttr \"blend.otx\" \"shotCam.tx\";",
     .help =
         "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene import "
         "--bake."},
    {.code = Code::ConnectionToPath,
     .severity = Severity::Warning,
     .symbol = "ConnectionToPath",
     .sentence = "the curve of \"{0}\" is lost: the connection names the node by a path",
     .meaning = "The importer looks for the node of a connection by its name. It finds none under a path.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 24 5;\n"
                "connectAttr \"moveX.o\" \"|shotCam.tx\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake. Or give the "
             "node a name that no other node has, and export again."},
    {.code = Code::FocalLengthElsewhere,
     .severity = Severity::Warning,
     .symbol = "FocalLengthElsewhere",
     .sentence = "the focal length of \"{0}\" stands still: \"{1}\" ({2}) drives it",
     .meaning =
         "The focal length comes from another node, such as a control of a rig. The importer follows only a "
         "curve that drives the focal length directly; without one it takes the value that the scene stores.",
     .example = "createNode transform -n \"control\";\n"
                "  addAttr -ln \"zoom\" -at double;\n"
                "connectAttr \"control.zoom\" \"shotCamShape.fl\";",
     .help =
         "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene import "
         "--bake."},
    {.code = Code::LookAtShortNames,
     .severity = Severity::Warning,
     .symbol = "LookAtShortNames",
     .sentence = "the look-at \"{0}\" is not recognised: the scene has the short names of attributes",
     .meaning = "The importer knows the target of a look-at by the word \"target\" in the connection. A "
                "scene that is saved with short names says \"tg[0].tt\". The camera \"{1}\" is not aimed.",
     .example = "createNode transform -n \"point\";\n"
                "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n"
                "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n"
                "connectAttr \"point.t\" \"aim.tg[0].tt\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake. The camera then "
             "turns by keys. Or save the scene with full attribute names."},
    {.code = Code::LookAtWeightLast,
     .severity = Severity::Warning,
     .symbol = "LookAtWeightLast",
     .sentence = "the camera \"{1}\" is aimed at its own look-at \"{0}\", not at the target",
     .meaning =
         "The last connection with the word \"target\" counts. Here it is the one of the weight, which comes "
         "from the look-at itself.",
     .example = "createNode transform -n \"point\";\n"
                "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n"
                "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n"
                "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";\n"
                "connectAttr \"aim.pointW0\" \"aim.target[0].targetWeight\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::LookAtNotTaken,
     .severity = Severity::Warning,
     .symbol = "LookAtNotTaken",
     .sentence = "the look-at \"{0}\" is not recognised: the camera \"{1}\" is not aimed",
     .meaning = "The importer needs three connections of a look-at: the place of what is turned, the target, "
                "and the rotation, each between two nodes that it knows. One is missing, or names a path.",
     .example = "createNode transform -n \"point\";\n"
                "createNode aimConstraint -n \"aim\";\n"
                "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake. The camera then "
             "turns by keys."},
    {.code = Code::AttributesWithoutPlace,
     .severity = Severity::Note,
     .symbol = "AttributesWithoutPlace",
     .sentence = "a composition has no place for {1} of \"{0}\"",
     .meaning = "The camera has settings that the importer does not take: depth of field, an image plane, "
                "visibility.",
     .example = "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n  setAttr \".dof\" yes;",
     .help = "Set the same in the composition, where it is wanted."},
    {.code = Code::OrthographicAsPerspective,
     .severity = Severity::Warning,
     .symbol = "OrthographicAsPerspective",
     .sentence = "the orthographic camera \"{0}\" comes over with a perspective",
     .meaning =
         "The importer knows an orthographic camera by the word \"yes\" alone. This one is written with "
         "another word, so the import makes a layer of it, as of any other camera. A camera of a "
         "composition has a perspective.",
     .example = "createNode camera -n \"planShape\" -p \"plan\";\n  setAttr \".o\" on;",
     .help =
         "Delete the layer, unless the shot is seen through it: then give the camera a very long lens and "
         "move it far away."},
    {.code = Code::ParentElsewhere,
     .severity = Severity::Warning,
     .symbol = "ParentElsewhere",
     .sentence = "\"{0}\" loses its place: its parent \"{1}\" is not in this file{2}",
     .meaning =
         "A node above the camera or the marked locator stands in a referenced file, or in none that is "
         "known. The camera or locator comes over as if that node stood at the origin. A bake cannot read "
         "the other file either.",
     .example = "file -r -ns \"rig\" -rfn \"rigRN\" \"rig.ma\";\ncreateNode transform -n \"shotCam\" -p "
                "\"rig:root\";\ncreateNode camera -n \"shotCamShape\" -p \"shotCam\";",
     .help = "Import the reference into the scene before the export, or export the camera together with "
             "everything above it."},
    {.code = Code::StoredValueSkipped,
     .severity = Severity::Warning,
     .symbol = "StoredValueSkipped",
     .sentence = "\"{0}\" gets {1} for {2}, not {3}: the import does not read a setAttr that {4}",
     .meaning =
         "The importer reads the values of a node from the commands that follow its createNode, and of those "
         "only the ones that begin with a name it knows: .t, .r, .s, .rp and .sp of a transform; .cap, .fl "
         "and .ff of a camera, before which one option with its value may stand. It reads no part of them "
         "(.tx, .hfa), no command that begins with an option otherwise, and none that names its node or "
         "follows a select. The node then has the value that was read last, or the importer's default.",
     .example = "createNode transform -n \"shotCam\";\n  setAttr -l on \".t\" -type \"double3\" 1 2 3 ;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::LocatorsWithoutCamera,
     .severity = Severity::Warning,
     .symbol = "LocatorsWithoutCamera",
     .sentence = "the marked locators do not come over: {0}, and no camera with them",
     .meaning =
         "The importer makes null layers of marked locators beside a camera layer. Without a camera that it "
         "takes it makes no composition.",
     .example = "createNode transform -n \"mark\";\ncreateNode locator -n \"mark_nullShape\" -p \"mark\";",
     .help = "Export the locators together with the camera of the shot."},
    {.code = Code::NoCameraToImport,
     .severity = Severity::Warning,
     .symbol = "NoCameraToImport",
     .sentence = "nothing comes over: the scene has no camera that the import takes",
     .meaning =
         "A composition is made for a camera. The file creates none, or none of a kind that comes over.",
     .example = "createNode transform -n \"group\";",
     .help = "Choose the file that the camera of the shot is in. Cameras of references stand in files of "
             "their own."},
    {.code = Code::TargetLosesItsChain,
     .severity = Severity::Warning,
     .symbol = "TargetLosesItsChain",
     .sentence = "\"{0}\", which \"{1}\" looks at, loses the place of what it stands under: \"{2}\"",
     .meaning =
         "The importer aims a camera at the translation of the target alone. What stands above the target "
         "has no effect, so the camera looks at another point.",
     .example =
         "createNode transform -n \"rig\";\n  setAttr \".t\" -type \"double3\" 0 10 0 ;\n"
         "createNode transform -n \"aim\" -p \"rig\";\n"
         "createNode transform -n \"shotCam\";\ncreateNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
         "createNode lookAt -n \"look\";\n"
         "connectAttr \"look.constraintRotate\" \"shotCam.rotate\";\n"
         "connectAttr \"shotCam.translate\" \"look.constraintTranslate\";\n"
         "connectAttr \"aim.translate\" \"look.target[0].targetTranslate\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::ParentByCommand,
     .severity = Severity::Warning,
     .symbol = "ParentByCommand",
     .sentence =
         "\"{0}\" stands elsewhere: a parent command moves it {1} \"{2}\", and the import does not read it",
     .meaning =
         "The importer takes a node's parent from its createNode. A parent command that comes later changes "
         "it in the scene alone.",
     .example =
         "createNode transform -n \"rig\";\n  setAttr \".t\" -type \"double3\" 0 10 0 ;\n"
         "createNode transform -n \"shotCam\";\ncreateNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
         "parent \"shotCam\" \"rig\";",
     .help = "Open the scene in Maya and save it again, which writes the parent with the node. Or write the "
             "scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
};

}  // namespace

std::span<const Entry> LossCodes() { return kLossCodes; }

}  // namespace diag
