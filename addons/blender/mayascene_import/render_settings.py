"""The Blender scene's frame range, rate, resolution and pixel aspect."""

from .plain.scene_settings import settings_of


def apply(scene, picture):
    """Gives remarks on what Blender cannot hold."""
    wanted = settings_of(picture)
    remarks = []
    render = scene.render
    render.fps = wanted.fps
    render.fps_base = wanted.fps_base
    render.resolution_x = picture.width
    render.resolution_y = picture.height
    render.pixel_aspect_x = wanted.aspect_x
    render.pixel_aspect_y = wanted.aspect_y
    if (render.resolution_x, render.resolution_y) != (picture.width,
                                                      picture.height):
        remarks.append(
            ("warning", f"Blender has no picture of {picture.width} x "
                        f"{picture.height}: the camera shows another part"))
    if wanted.start < 0:
        remarks.append(("warning", "frames below 0 have their keys, but "
                                   "the frame range begins at 0"))
    scene.frame_start = max(wanted.start, 0)
    scene.frame_end = max(wanted.end, scene.frame_start)
    scene.frame_set(scene.frame_start)
    return remarks
