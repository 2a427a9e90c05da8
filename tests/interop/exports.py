"""What the tool exports, and frames as other programs count them."""

import os
import subprocess


class ExportFailed(Exception):
    pass


def export(tool, scene, suffix, folder):
    """The file that a scene is exported to, with a bake."""
    path = os.path.join(folder, scene.name + suffix)
    done = subprocess.run(
        [tool, "export", "--bake", "--quiet", scene.path, "-o", path],
        capture_output=True, text=True, errors="replace", check=False)
    if done.returncode != 0:
        raise ExportFailed(f"{scene.name}{suffix}: status "
                           f"{done.returncode}: {done.stderr[-500:]}")
    return path


def frames_of(composition, start, rate, step=10):
    """Every step-th frame. `start` is what the file calls the first one,
    `rate` how many of its times pass for one of the composition's frames."""
    return [{"label": frame,
             "time": start + (frame - composition.start) * rate,
             "number": composition.number_of(frame)}
            for frame in composition.frames(step)]
