"""What differs between versions of Blender.

Made for 3.4 and tested there. Since 4.4 an action holds its curves in
slots, layers and strips, and from 5.0 on only there.
"""

import bpy

_SLOTS_SINCE = (4, 4, 0)


def _slotted_curves(owner):
    data = owner.animation_data
    action = data.action
    if data.action_slot is None:
        data.action_slot = action.slots.new(owner.id_type, owner.name)
    layer = action.layers[0] if action.layers else action.layers.new("Layer")
    strip = (layer.strips[0] if layer.strips
             else layer.strips.new(type='KEYFRAME'))
    return strip.channelbag(data.action_slot, ensure=True).fcurves


def curves_of(owner):
    """The curves of an object or of camera data, which may be none yet."""
    data = owner.animation_data or owner.animation_data_create()
    if data.action is None:
        data.action = bpy.data.actions.new(owner.name)
    if bpy.app.version < _SLOTS_SINCE:
        return data.action.fcurves
    return _slotted_curves(owner)
