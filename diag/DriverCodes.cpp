// MA0401 to MA0499: what drives a channel.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kDriverCodes[] = {
    {.code = Code::UnsupportedDriver,
     .severity = Severity::Warning,
     .symbol = "UnsupportedDriver",
     .sentence = "\"{0}\" is driven by \"{1}\" ({2}), which cannot be computed here",
     .meaning = "The channel is computed by a node of a type that is not supported, or by a node in another "
                "file. The channel keeps the value that the scene stores for it, which is what was shown "
                "when the scene was saved.",
     .example = "createNode transform -n \"shotCam\";\ncreateNode expression -n \"shake\";\nconnectAttr "
                "\"shake.out[0]\" \"shotCam.tx\";",
     .help = "Bake \"{0}\" into keys where the scene was made, if it moves."},
    {.code = Code::DriverWithoutAnswer,
     .severity = Severity::Warning,
     .symbol = "DriverWithoutAnswer",
     .sentence = "\"{1}\" gives \"{0}\" no value, so its stored one is kept",
     .meaning = "What drives the channel depends on something that cannot be computed, or has no answer: a "
                "constraint whose weights are all 0, or a node that should look at its own place. At those "
                "frames the channel keeps the value that the scene stores for it.",
     .example = "createNode transform -n \"shotCam\";\ncreateNode pointConstraint -n \"hold\" -p "
                "\"shotCam\";\nconnectAttr \"hold.ctx\" \"shotCam.tx\";",
     .help = "Bake \"{0}\" into keys where the scene was made, if it moves."},
    {.code = Code::DriverCircle,
     .severity = Severity::Warning,
     .symbol = "DriverCircle",
     .sentence = "\"{0}\" drives itself",
     .meaning = "What the channel depends on leads back to it. Each channel of the circle keeps the value "
                "that the scene stores for it.",
     .example = "createNode transform -n \"a\";\ncreateNode transform -n \"b\";\nconnectAttr \"a.tx\" "
                "\"b.tx\";\nconnectAttr \"b.tx\" \"a.tx\";",
     .help = "Bake \"{0}\" into keys where the scene was made, if it moves."},
    {.code = Code::SeveralTargets,
     .severity = Severity::Note,
     .symbol = "SeveralTargets",
     .sentence = "\"{0}\" has several targets; how they are mixed is not certain",
     .meaning =
         "Several targets of a constraint are averaged by their weights, and their rotations are mixed "
         "along the shorter way. The program that made the scene may mix the rotations differently.",
     .example = "createNode transform -n \"shotCam\";\ncreateNode transform -n \"left\";\ncreateNode "
                "transform -n \"right\";\ncreateNode orientConstraint -n \"between\" -p "
                "\"shotCam\";\nconnectAttr \"left.r\" \"between.tg[0].tr\";\nconnectAttr \"right.r\" "
                "\"between.tg[1].tr\";\nconnectAttr \"between.crx\" \"shotCam.rx\";",
     .help = "Nothing has to be done while all weights but one are 0. Otherwise look at the result."},
    {.code = Code::TwistSign,
     .severity = Severity::Warning,
     .symbol = "TwistSign",
     .sentence = "\"{0}\" has a twist; which way it turns is not certain",
     .meaning = "A look-at has a twist, a turn about the direction of its aim. A positive one is taken as "
                "right-handed about that direction.",
     .example = "createNode lookAt -n \"aim\";\n  setAttr \".tws\" 10;\ncreateNode transform -n \"shotCam\" "
                "-p \"aim\";\nconnectAttr \"aim.crx\" \"shotCam.rx\";",
     .help = "Look at the roll of the camera in the result."},
    {.code = Code::StereoRig,
     .severity = Severity::Note,
     .symbol = "StereoRig",
     .sentence = "the two eyes of \"{0}\" are computed by a rule that is not certain",
     .meaning = "Each eye of a stereo rig stands half of the separation beside the centre. Converged eyes "
                "are turned to the point of zero parallax; those off the axis have their film moved. "
                "Adjustments of the rig are not read.",
     .example = "createNode stereoRigTransform -n \"rig\";\ncreateNode transform -n \"left\" -p \"rig\";\n"
                "connectAttr \"rig.slo\" \"left.tx\";",
     .help = "Look at the distance of the two eyes in the result."},
};

}  // namespace

std::span<const Entry> DriverCodes() { return kDriverCodes; }

}  // namespace diag
