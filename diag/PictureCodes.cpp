// MA0901 to MA0999: where the picture of an import differs from the scene's.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kPictureCodes[] = {
    {.code = Code::PictureShifts,
     .severity = Severity::Warning,
     .symbol = "PictureShifts",
     .sentence = "the picture of \"{0}\" shifts by {1}, most at frame {2}",
     .meaning =
         "Nine points of the picture, in three rows of three at the distance of the centre of interest (100 "
         "units where the scene has none), are followed over the frames of the scene. The shift is the "
         "largest distance, in pixels of the scene's resolution, between where the scene shows a point and "
         "where the import does. Time 0 of the composition is the first key of the camera and of what "
         "stands above it, or time 0 of a scene that does not count time in frames; between keys the import "
         "is taken as linear. The other diagnostics of the camera name the reasons.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr \".tan\" 3;\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 48 100;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help =
         "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene import "
         "--bake."},
    {.code = Code::KeysAreNoBake,
     .severity = Severity::Warning,
     .symbol = "KeysAreNoBake",
     .sentence = "\"{0}\" loses its path between keys: {1} keys over {2} frames",
     .meaning = "The importer takes the keys and none of their tangents. Between keys the composition "
                "interpolates in its own way. A node has one list of times: curves with as many keys at "
                "other times are put at those of the first.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr \".tan\" 3;\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 48 100;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help =
         "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene import "
         "--bake."},
    {.code = Code::RotateOrderLost,
     .severity = Severity::Warning,
     .symbol = "RotateOrderLost",
     .sentence = "\"{0}\" is turned in another order: the import takes xyz, the scene has {1}",
     .meaning = "The same three angles give another direction when they are applied in another order.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".r\" -type \"double3\" 30 40 0 ;\n"
                "  setAttr \".ro\" 4;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::RotateAxisLost,
     .severity = Severity::Warning,
     .symbol = "RotateAxisLost",
     .sentence = "the rotate axis of \"{0}\" is lost",
     .meaning = "The node is turned once more, before its own rotation. The importer does not take that.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".ra\" -type \"double3\" 0 90 0 ;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::ShearLost,
     .severity = Severity::Warning,
     .symbol = "ShearLost",
     .sentence = "the shear of \"{0}\" is lost",
     .meaning = "The axes of the node are not square to each other. A layer has square axes.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".sh\" -type \"double3\" 0.5 0 0 ;",
     .help = "Take the shear out of what stands above the camera."},
    {.code = Code::PivotTranslationLost,
     .severity = Severity::Warning,
     .symbol = "PivotTranslationLost",
     .sentence = "the pivot translations of \"{0}\" are lost",
     .meaning = "When a pivot is moved and the node stays in its place, the scene keeps the difference in a "
                "value of its own. The importer takes the pivots alone.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".rpt\" -type \"double3\" 0 2 0 ;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::InheritanceOff,
     .severity = Severity::Warning,
     .symbol = "InheritanceOff",
     .sentence = "\"{0}\" does not inherit the transforms above it; in the import it inherits them",
     .meaning =
         "The importer makes the layer of the node a child of the layer of its parent, whatever the scene "
         "says.",
     .example = "createNode transform -n \"rig\";\n"
                "createNode transform -n \"shotCam\" -p \"rig\";\n"
                "  setAttr \".it\" no;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::FitDiffers,
     .severity = Severity::Warning,
     .symbol = "FitDiffers",
     .sentence = "\"{0}\" shows another part of its film: the fit is {1}, the import takes horizontal",
     .meaning =
         "With fill and overscan the shapes of the film and of the picture decide which side fits. Here it "
         "is the vertical one.",
     .example = "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
                "  setAttr \".ff\" 3;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::LensSqueezeLost,
     .severity = Severity::Warning,
     .symbol = "LensSqueezeLost",
     .sentence = "the lens squeeze of \"{0}\" is lost: {1}",
     .meaning =
         "The camera has an anamorphic lens, which takes in a wider picture. The importer does not read it.",
     .example = "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
                "  setAttr \".lsr\" 2;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::CameraScaleLost,
     .severity = Severity::Warning,
     .symbol = "CameraScaleLost",
     .sentence = "the camera scale of \"{0}\" is lost: {1}",
     .meaning = "The camera scale makes the lens longer or shorter. The importer does not read it.",
     .example = "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
                "  setAttr \".cs\" 2;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::ChainScaled,
     .severity = Severity::Warning,
     .symbol = "ChainScaled",
     .sentence = "\"{0}\" scales the camera \"{1}\" below it",
     .meaning =
         "A scale above a camera moves it. An uneven one also bends its axes, and a negative one mirrors the "
         "picture: no layer can show that, and the largest shift of MA0901 leaves it out.",
     .example = "createNode transform -n \"rig\";\n"
                "  setAttr \".s\" -type \"double3\" 2 2 2 ;\n"
                "createNode transform -n \"shotCam\" -p \"rig\";",
     .help = "Take the scale out of the rig. An even, positive one comes over where the camera is written in "
             "world space: mayascene bake SCENE -o OUT --world."},
    {.code = Code::PictureSizeAssumed,
     .severity = Severity::Warning,
     .symbol = "PictureSizeAssumed",
     .sentence = "the composition has {0}, where the scene means {1}",
     .meaning = "The file leaves a value of the render settings out, or derives it. The importer has "
                "defaults of its own: 720 by 486 pixels, pixel aspect 0.9091.",
     .example = "select -ne :defaultResolution;\n  setAttr \".w\" 1920;\n  setAttr \".h\" 1080;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT. Or set the composition by hand."},
    {.code = Code::KeysStartApart,
     .severity = Severity::Warning,
     .symbol = "KeysStartApart",
     .sentence = "\"{0}\" begins at frame {1}, \"{2}\" at frame {3}: the import lets both begin at once",
     .meaning = "The importer puts the first key of each node at time 0 of the composition. Nodes that are "
                "keyed from different frames move against each other.",
     .example = "createNode transform -n \"rig\";\n"
                "createNode transform -n \"shotCam\" -p \"rig\";\n"
                "createNode animCurveTL -n \"rigX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 24 10;\n"
                "connectAttr \"rigX.o\" \"rig.tx\";\n"
                "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 12 0 24 10;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::OtherLengthUnit,
     .severity = Severity::Warning,
     .symbol = "OtherLengthUnit",
     .sentence = "the scene's unit of length is \"{0}\": {1}",
     .meaning =
         "The importer takes distances as they stand in the file. A scene in another unit comes over in "
         "another size than the same scene in centimetres. With --linear-units 1 distances are converted: "
         "right "
         "for most units, but metres come over 100 times and kilometres 2.54 times too large.",
     .example = "currentUnit -l meter -a degree -t film;",
     .help =
         "Nothing has to be done, unless cameras from several scenes have to fit together: then set the "
         "same unit in all of them, or import with --linear-units 1. Set centimetres in a scene in metres or "
         "kilometres."},
    {.code = Code::BeyondCompositionTime,
     .severity = Severity::Warning,
     .symbol = "BeyondCompositionTime",
     .sentence = "\"{0}\" has a key at {1}, later than a composition's time can be",
     .meaning =
         "A time of the composition is a whole number of thousandths of a frame, and has 31 bits. Later keys "
         "land at the largest time.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 3000000 10;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help = "Take out the keys that are far away from the shot."},
    {.code = Code::NegativeFrames,
     .severity = Severity::Note,
     .symbol = "NegativeFrames",
     .sentence = "\"{0}\" has keys before frame 0, from frame {1} on",
     .meaning =
         "The first key lands at time 0 of the composition, so that all frames come over; their numbers "
         "change.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" -10 0 24 10;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help = "Shift the layers in the composition to where the footage needs them."},
    {.code = Code::FractionalFrames,
     .severity = Severity::Note,
     .symbol = "FractionalFrames",
     .sentence = "\"{0}\" has keys between frames, the first at {1}",
     .meaning = "Keys lie at fractions of a frame. They come over to a thousandth of a frame; a composition "
                "shows whole frames.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1.5 0 24.5 10;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help = "Nothing has to be done where the motion is smooth."},
    {.code = Code::RateDiffers,
     .severity = Severity::Warning,
     .symbol = "RateDiffers",
     .sentence = "the composition has {1} frames a second, the scene {0}",
     .meaning = "The scene sets no frame rate, or a unit of time that the importer takes for another one.",
     .example = "currentUnit -l centimeter -a degree -t sec;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT. Or set the frame rate in the scene."},
    {.code = Code::ShiftNotMeasured,
     .severity = Severity::Note,
     .symbol = "ShiftNotMeasured",
     .sentence = "how far the picture of \"{0}\" shifts is not measured: {1}",
     .meaning =
         "At most 100000 frames of a scene are measured, and at most 2000000 frames of layers: each frame "
         "counts once for the camera and once for each layer above it. What depends on a driver that cannot "
         "be "
         "computed here is not measured either.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 3000000 10;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help = "Where there are too many frames, write only those of the shot: mayascene bake SCENE -o OUT "
             "--frames "
             "A:B. Where a channel cannot be computed, bake it in Maya."},
    {.code = Code::ApertureMotionLost,
     .severity = Severity::Warning,
     .symbol = "ApertureMotionLost",
     .sentence = "the film aperture of \"{0}\" stands still: {1}",
     .meaning = "The angle of view changes with the aperture. The importer takes the aperture that the scene "
                "stores, and no keys of it. The diagnostic of the picture's shift says how far that goes.",
     .example = "createNode animCurveTU -n \"wide\";\n  setAttr -s 2 \".ktv[0:1]\" 1 1 24 2;\n"
                "connectAttr \"wide.o\" \"shotCamShape.hfa\";",
     .help = "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene "
             "import --bake."},
    {.code = Code::FitMotionLost,
     .severity = Severity::Warning,
     .symbol = "FitMotionLost",
     .sentence = "the film fit of \"{0}\" stands still: {1}",
     .meaning =
         "The fit decides which side of the film the picture shows whole. The importer takes the fit "
         "that the scene stores, and no keys of it. The diagnostic of the picture's shift says how far "
         "that goes.",
     .example = "createNode animCurveTU -n \"fit\";\n  setAttr -s 2 \".ktv[0:1]\" 1 1 24 2;\n"
                "connectAttr \"fit.o\" \"shotCamShape.ff\";",
     .help = "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene "
             "import --bake."},
    {.code = Code::InfinityLost,
     .severity = Severity::Warning,
     .symbol = "InfinityLost",
     .sentence = "\"{0}\" stands still in {1} {2} its keys, where the scene goes on: {3}",
     .meaning = "A curve can go on outside its keys: it repeats them, or goes on along a straight line. A "
                "composition holds the first and the last key. The shot has frames there.",
     .example = "createNode script -n \"sceneConfigurationScriptNode\";\n"
                "  setAttr \".b\" -type \"string\" \"playbackOptions -min 1 -max 48\";\n"
                "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 2 \".ktv[0:1]\" 1 0 24 10;\n"
                "  setAttr \".pst\" 3;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help = "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene "
             "import --bake."},
    {.code = Code::OffsetMatrixLost,
     .severity = Severity::Warning,
     .symbol = "OffsetMatrixLost",
     .sentence = "the offset parent matrix of \"{0}\" is lost",
     .meaning =
         "The matrix moves, turns or scales the node once more, after its own channels. The importer does "
         "not read it, nor what drives it.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 9 0 0 1 ;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::LimitLost,
     .severity = Severity::Warning,
     .symbol = "LimitLost",
     .sentence = "\"{0}\" goes past a limit: {1} comes over as {2}, where the scene holds it at {3}",
     .meaning =
         "A limit of a transform is switched on, and a value or a key lies outside it. The scene shows the "
         "limit there. The importer does not read limits.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".t\" -type \"double3\" 9 0 0 ;\n"
                "  setAttr \".mxtl\" -type \"double3\" 4 1 1 ;\n"
                "  setAttr \".xtxe\" yes;",
     .help = "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::RadiansLost,
     .severity = Severity::Warning,
     .symbol = "RadiansLost",
     .sentence = "\"{0}\" hardly turns: {1} is {2} in radians, and comes over as {3} degrees",
     .meaning = "The scene's unit of angle is the radian. The importer multiplies such an angle by 0.01745 "
                "instead of "
                "57.3, so almost nothing of a rotation is left. The diagnostic names the first angle of the "
                "node; it "
                "holds for all.",
     .example = "currentUnit -l centimeter -a radian -t film;\n"
                "createNode transform -n \"shotCam\";\n"
                "  setAttr \".r\" -type \"double3\" 0.5 0 0 ;",
     .help =
         "Write the scene anew: mayascene bake SCENE -o OUT, or mayascene import --bake. Or set the unit of "
         "angle to degrees, and export again."},
    {.code = Code::KeysAtOneTime,
     .severity = Severity::Warning,
     .symbol = "KeysAtOneTime",
     .sentence =
         "\"{0}\" loses a key: those of \"{1}\" at {2} (line {3}) and {4} (line {5}) land on one time",
     .meaning =
         "A time of a composition is a whole number of thousandths of a frame. Of two keys that land on "
         "the same time the later one in the file stays. All channels of the node lose that key.",
     .example = "createNode animCurveTL -n \"moveX\";\n"
                "  setAttr -s 3 \".ktv[0:2]\" 1 0 1.0002 5 24 10;\n"
                "connectAttr \"moveX.o\" \"shotCam.tx\";",
     .help =
         "Take one of the two keys out. Or write the scene anew, with a key at every frame: mayascene bake "
         "SCENE -o OUT, or mayascene import --bake."},
    {.code = Code::AimedPivotLost,
     .severity = Severity::Warning,
     .symbol = "AimedPivotLost",
     .sentence =
         "\"{0}\" is aimed and has a pivot: the scene moves it about the pivot as it turns, the import "
         "does not",
     .meaning =
         "A look-at turns the camera about its pivot, so that it moves as it turns. The importer finds "
         "the place of the camera from the pivot and the rotation that is stored, and aims the layer from "
         "there.",
     .example = "createNode transform -n \"shotCam\";\n"
                "  setAttr \".rp\" -type \"double3\" 0 0 5 ;\n"
                "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
                "createNode transform -n \"point\";\n"
                "  setAttr \".t\" -type \"double3\" 20 0 -20 ;\n"
                "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n"
                "  setAttr \".a\" -type \"double3\" 0 0 -1 ;\n"
                "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n"
                "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";",
     .help =
         "Write the scene anew, with a key at every frame: mayascene bake SCENE -o OUT, or mayascene import "
         "--bake."},
    {.code = Code::LookAtTurnLost,
     .severity = Severity::Warning,
     .symbol = "LookAtTurnLost",
     .sentence = "the look-at \"{0}\" turns the camera \"{1}\" further: its {2} is lost",
     .meaning =
         "An aimed layer looks straight at its target, and upright. An offset or a twist of the look-at, or "
         "an aim along another axis than the camera's own, turns the camera in the scene alone.",
     .example = "createNode transform -n \"shotCam\";\n"
                "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
                "createNode transform -n \"point\";\n"
                "  setAttr \".t\" -type \"double3\" 20 0 -20 ;\n"
                "createNode aimConstraint -n \"aim\" -p \"shotCam\";\n"
                "  setAttr \".a\" -type \"double3\" 0 0 -1 ;\n"
                "  setAttr \".o\" -type \"double3\" 0 15 0 ;\n"
                "connectAttr \"aim.constraintRotate\" \"shotCam.rotate\";\n"
                "connectAttr \"shotCam.translate\" \"aim.constraintTranslate\";\n"
                "connectAttr \"point.translate\" \"aim.target[0].targetTranslate\";",
     .help =
         "Write the scene anew, with the rotation at every frame: mayascene bake SCENE -o OUT, or mayascene "
         "import --bake."},
};

}  // namespace

std::span<const Entry> PictureCodes() { return kPictureCodes; }

}  // namespace diag
