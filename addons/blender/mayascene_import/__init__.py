"""File > Import > Maya scene (.ma): cameras and nulls of a Maya scene.

The command-line tool reads the scene; this add-on builds what it gives.
"""

import bpy

from . import operator, preferences

bl_info = {
    "name": "Maya scene cameras (.ma)",
    "author": "The mayascene project",
    "version": (1, 0, 0),
    "blender": (3, 4, 0),
    "location": "File > Import > Maya scene (.ma)",
    "description": "Cameras and nulls of Maya ASCII scenes, with their "
                   "animation",
    "category": "Import-Export",
}

_CLASSES = (preferences.MayaScenePreferences, operator.ImportMayaScene)


def register():
    for item in _CLASSES:
        bpy.utils.register_class(item)
    bpy.types.TOPBAR_MT_file_import.append(operator.menu_entry)


def unregister():
    bpy.types.TOPBAR_MT_file_import.remove(operator.menu_entry)
    for item in reversed(_CLASSES):
        bpy.utils.unregister_class(item)
