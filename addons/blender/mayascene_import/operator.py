"""File > Import > Maya scene (.ma)."""

import os

import bpy
from bpy_extras.io_utils import ImportHelper

from . import preferences, render_settings
from .builder import Builder
from .plain import document, runner
from .plain.scene_settings import metres_per_unit

_SHOWN = 20
_KINDS = {"error": 'ERROR', "warning": 'WARNING', "note": 'INFO'}

_OUTCOMES = {
    "nothing": "the scene has no cameras to import",
    "refused": "this is not a Maya ASCII scene",
    "failed": "the import failed",
    "unreadable": "the file cannot be read",
}


_FILTER = bpy.props.StringProperty(default="*.ma", options={'HIDDEN'})
_BAKE = bpy.props.BoolProperty(
    name="Bake", default=True,
    description="Evaluate the scene at every frame first. Without it only "
                "what is keyed comes over, straight between keys")
_METRES = bpy.props.BoolProperty(
    name="Units to metres", default=True,
    description="Make lengths of the scene's linear unit metres. Without it "
                "their numbers stay")
_SET_UP = bpy.props.BoolProperty(
    name="Set up the scene", default=True,
    description="Take frame range, rate, resolution and pixel aspect from "
                "the Maya scene")


class CannotImport(Exception):
    """Why nothing is built, in words."""


class ImportMayaScene(bpy.types.Operator, ImportHelper):
    """Import cameras and nulls of a Maya ASCII scene"""

    bl_idname = "import_scene.mayascene"
    bl_label = "Import Maya Scene"
    bl_options = {'REGISTER', 'UNDO', 'PRESET'}

    filename_ext = ".ma"
    filter_glob: _FILTER
    bake: _BAKE
    metres: _METRES
    set_up: _SET_UP

    def execute(self, context):
        try:
            scene = self._scene(context)
        except (CannotImport, runner.ToolFailed,
                document.NotAComposition) as problem:
            self.report({'ERROR'}, str(problem))
            return {'CANCELLED'}
        for picture in scene.pictures:
            self._build(context, scene, picture)
        return {'FINISHED'}

    def _scene(self, context):
        tool = runner.find_tool(preferences.tool_of(context),
                                os.path.dirname(__file__))
        if tool is None:
            raise CannotImport("the tool mayascene is not found: set its "
                               "path in the add-on's preferences")
        run = runner.run(tool, self.filepath, self.bake)
        scenes = document.read(run.document)
        if len(scenes) != 1:
            raise CannotImport(f"{tool} gave {len(scenes)} scenes")
        scene = scenes[0]
        if scene.outcome != "imported":
            why = document.reasons(scene.complaints, run.remarks)
            more = [f"and {len(why) - _SHOWN} more"] * (len(why) > _SHOWN)
            raise CannotImport("\n".join(
                [_OUTCOMES.get(scene.outcome, scene.outcome)]
                + why[:_SHOWN] + more))
        self._say(run.remarks
                  + [("warning", text) for text in scene.complaints])
        return scene

    def _factor(self, scene):
        """Blender's units in one of the scene's, and in a metre."""
        metres = metres_per_unit(scene.linear_unit)
        if metres is None:
            if self.metres:
                self.report({'WARNING'}, "the scene's linear unit is not "
                                         "known: its lengths stay")
            return 1.0, 1.0
        return (metres, 1.0) if self.metres else (1.0, 1.0 / metres)

    def _build(self, context, scene, picture):
        factor, metre = self._factor(scene)
        builder = Builder(context.scene, os.path.realpath(self.filepath),
                          picture, factor, metre)
        builder.build()
        remarks = list(builder.remarks)
        if self.set_up:
            remarks += render_settings.apply(context.scene, picture)
        if builder.first_time and builder.cameras:
            context.scene.camera = builder.cameras[0]
        self._say(remarks)
        self.report({'INFO'}, f"{picture.name}: {builder.made} made, "
                              f"{builder.updated} updated")

    def _say(self, remarks):
        """An error would end the import, so the errors of a scene that came
        over are shown as warnings."""
        for kind, text in remarks[:_SHOWN]:
            level = 'WARNING' if kind == "error" else _KINDS.get(kind, 'INFO')
            self.report({level}, text)
        if len(remarks) > _SHOWN:
            self.report({'WARNING'}, f"and {len(remarks) - _SHOWN} more")


def menu_entry(menu, _context):
    menu.layout.operator(ImportMayaScene.bl_idname, text="Maya scene (.ma)")
