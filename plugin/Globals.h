// The importer's process-wide state. The entry sets it at load, every callback reads it; the host calls on
// one thread, one call at a time, so nothing here is locked.
#pragma once

#include <cstdint>

#include "hostapi/WNBasicSuite.h"
#include "hostutil/HostStrings.h"

// The host's root table, and the plug-in's name for itself in host calls. Null and 0 before load.
extern const WNBasicSuite* G_basic_suiteP;
extern std::int32_t G_plugin_idL;

// The registered table of localised strings. Null before load, after a failed registration and after the
// death hook.
extern HostStringTable* Maya_Import_G_zref;

// The preference "Use Linear Units": 0 takes distances as they stand in the scene, anything else converts
// them from the scene's linear unit to points.
extern std::int32_t G_use_linear_unitsL;

// The scene time that the composition's time 0 stands for, in the scene's time unit. An import starts it at
// 0; the first key of every animated node of a frame-based scene moves it.
extern double G_time_offsetD;
