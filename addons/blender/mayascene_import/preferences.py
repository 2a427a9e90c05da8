"""The add-on's preferences: where the tool is."""

import bpy


_TOOL = bpy.props.StringProperty(
    name="mayascene",
    description="The command-line tool. Empty: the one on PATH, else the "
                "one that the project has built",
    subtype='FILE_PATH')


class MayaScenePreferences(bpy.types.AddonPreferences):
    bl_idname = __package__

    tool: _TOOL

    def draw(self, _context):
        self.layout.prop(self, "tool")


def tool_of(context):
    """The path that the user gave, or an empty text."""
    addon = context.preferences.addons.get(__package__)
    if addon is None or not addon.preferences.tool:
        return ""
    return bpy.path.abspath(addon.preferences.tool)
