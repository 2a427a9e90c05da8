"""Tracks on their way to Blender's properties and curves."""

import bpy

from . import compat

_LINEAR = bpy.types.Keyframe.bl_rna.properties[
    "interpolation"].enum_items['LINEAR'].value


def _set_value(owner, track):
    if hasattr(getattr(owner, track.path), "__len__"):
        getattr(owner, track.path)[track.index] = track.values[0]
    else:
        setattr(owner, track.path, track.values[0])


def _add_curve(curves, track):
    curve = curves.new(track.path, index=track.index)
    points = curve.keyframe_points
    points.add(len(track.frames))
    pairs = zip(track.frames, track.values)
    points.foreach_set("co", [part for pair in pairs for part in pair])
    points.foreach_set("interpolation", [_LINEAR] * len(track.frames))
    curve.update()


def apply(owner, tracks):
    """Sets what stays and animates what moves. Other curves are left."""
    moving = any(track.frames is not None for track in tracks)
    data = owner.animation_data
    curves = None
    if moving or (data is not None and data.action is not None):
        curves = compat.curves_of(owner)
    for track in tracks:
        old = curves.find(track.path, index=track.index) if curves else None
        if old is not None:
            curves.remove(old)
        _set_value(owner, track)
        if track.frames is not None:
            _add_curve(curves, track)
