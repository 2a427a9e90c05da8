// MA0501 to MA0599: cameras and locators.
#include "diag/TableInternal.h"

namespace diag {
namespace {

constexpr Entry kCameraCodes[] = {
    {.code = Code::CameraNotFound,
     .severity = Severity::Error,
     .symbol = "CameraNotFound",
     .sentence = "no camera is called \"{0}\"",
     .meaning = "The name is that of a camera or of its transform, or a path that begins with \"|\". Upper "
                "and lower case count. Orthographic cameras and the four cameras that every scene begins "
                "with are never meant.",
     .example = "mayascene bake --camera shotCam shot.ma -o baked.ma",
     .help = "Check the names of the cameras in the scene: mayascene bake without --camera lists those "
             "that it writes."},
    {.code = Code::FilmOffsetLost,
     .severity = Severity::Warning,
     .symbol = "FilmOffsetLost",
     .sentence = "the film offset of \"{0}\" is lost: the picture is shifted",
     .meaning = "The film back of the camera is moved off the centre of the lens, by an offset or a shake. A "
                "camera of a composition looks through the middle of the picture.",
     .example = "createNode camera -n \"shotCamShape\";\nsetAttr \".fio\" -type \"double2\" 0.1 0 ;",
     .help = "Shift the finished picture by the offset, as a part of the aperture."},
    {.code = Code::LensSqueezeInAperture,
     .severity = Severity::Warning,
     .symbol = "LensSqueezeInAperture",
     .sentence = "the lens squeeze of \"{0}\" is written into its aperture",
     .meaning = "The camera has an anamorphic lens. The bake multiplies the width of the aperture by the "
                "squeeze, which gives the same picture; programs that show the aperture show the wider one.",
     .example = "createNode camera -n \"shotCamShape\";\nsetAttr \".lsr\" 2;",
     .help = "Nothing has to be done for the picture."},
    {.code = Code::PictureEffectLost,
     .severity = Severity::Warning,
     .symbol = "PictureEffectLost",
     .sentence = "changes of the finished picture of \"{0}\" are lost",
     .meaning =
         "The camera scales, moves or rolls the film after the projection, moves it within the picture "
         "by a film fit offset, or pans and zooms the rendered picture. A composition has no such "
         "values.",
     .example = "createNode camera -n \"shotCamShape\";\nsetAttr \".ptsc\" 2;",
     .help = "Make the same change of the picture in the composition: scale, position or rotation of the "
             "footage."},
    {.code = Code::CameraMirrored,
     .severity = Severity::Warning,
     .symbol = "CameraMirrored",
     .sentence = "\"{0}\" is mirrored, which a composition cannot show",
     .meaning = "A negative scale above the camera turns its picture into its mirror image. The bake has the "
                "place and the direction of the camera, without the mirror.",
     .example = "createNode transform -n \"shotCam\";\nsetAttr \".s\" -type \"double3\" -1 1 1 ;",
     .help = "Flip the finished picture, or take the negative scale out of the scene."},
    {.code = Code::CameraSheared,
     .severity = Severity::Warning,
     .symbol = "CameraSheared",
     .sentence = "\"{0}\" is sheared, which a composition cannot show",
     .meaning = "An uneven scale above a rotation, or a shear, bends the axes of the camera. The bake has "
                "its place and its direction, with square axes.",
     .example = "createNode transform -n \"rig\";\nsetAttr \".sh\" -type \"double3\" 0.5 0 0 ;",
     .help = "Take the uneven scale out of what stands above the camera."},
    {.code = Code::CameraWithoutLens,
     .severity = Severity::Error,
     .symbol = "CameraWithoutLens",
     .sentence = "\"{0}\" has no usable lens: its focal length or aperture is 0, negative or not a number",
     .meaning = "Such a camera has no picture. It is not written.",
     .example = "createNode camera -n \"shotCamShape\";\nsetAttr \".fl\" 0;",
     .help = "Give the camera a focal length and an aperture above 0."},
    {.code = Code::CameraNotFinite,
     .severity = Severity::Error,
     .symbol = "CameraNotFinite",
     .sentence = "\"{0}\" has no place: a value of its transforms is not a number",
     .meaning = "A value of the camera, or of what stands above it, is too large to be held. The camera is "
                "not written.",
     .example = "createNode transform -n \"shotCam\";\nsetAttr \".tx\" 1e999;",
     .help = "Look for huge values in the transforms above the camera."},
    {.code = Code::NullSheared,
     .severity = Severity::Warning,
     .symbol = "NullSheared",
     .sentence = "the null of \"{0}\" is sheared: its place is exact, its axes are not",
     .meaning = "An uneven scale above a rotation, or a shear, bends the axes of the locator. A null of a "
                "composition has square axes.",
     .example = "createNode transform -n \"rig\";\nsetAttr \".sh\" -type \"double3\" 0.5 0 0 ;",
     .help = "Nothing has to be done where only the place of the null matters."},
    {.code = Code::NullNotFinite,
     .severity = Severity::Warning,
     .symbol = "NullNotFinite",
     .sentence = "the null of \"{0}\" has no place and is left out",
     .meaning = "A value of the locator's transforms is too large to be held.",
     .example = "createNode transform -n \"point\";\nsetAttr \".tx\" 1e999;",
     .help = "Look for huge values in the transforms above the locator."},
    {.code = Code::LocatorsLeftOut,
     .severity = Severity::Note,
     .symbol = "LocatorsLeftOut",
     .sentence = "locators without a mark are left out: {0}",
     .meaning = "The importer makes a null layer of a locator whose name contains \"null\", \"NULL\" or "
                "\"Null\". No other locator comes over.",
     .example = "createNode locator -n \"pointShape\" -p \"point\";",
     .help = "To have all of them: mayascene bake SCENE -o OUT --locators all."},
    {.code = Code::CameraUneven,
     .severity = Severity::Warning,
     .symbol = "CameraUneven",
     .sentence = "\"{0}\" is scaled more along one axis than along another, which a composition cannot show",
     .meaning = "Such a scale stretches the picture of the camera. The bake has its place and its direction, "
                "without the stretch.",
     .example = "createNode transform -n \"shotCam\";\nsetAttr \".s\" -type \"double3\" 2 1 1 ;",
     .help = "Give the camera, and what stands above it, the same scale along all axes."},
};

}  // namespace

std::span<const Entry> CameraCodes() { return kCameraCodes; }

}  // namespace diag
