"""Runs inside Blender: its job, and the add-on in an empty file."""

import json
import sys

import bpy


def read_job():
    """The JSON file that follows the folder of these modules."""
    place = sys.argv[sys.argv.index("--") + 2]
    with open(place, encoding="utf-8") as file:
        return json.load(file)


def begin(addons, tool):
    """Begins an empty file with the add-on, which calls the tool."""
    if addons not in sys.path:
        sys.path.insert(0, addons)
    bpy.ops.wm.read_factory_settings(use_empty=True)
    bpy.ops.preferences.addon_enable(module="mayascene_import")
    addon = bpy.context.preferences.addons["mayascene_import"]
    addon.preferences.tool = tool
