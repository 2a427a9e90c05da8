#include "plugin/Globals.h"

const WNBasicSuite* G_basic_suiteP = nullptr;
std::int32_t G_plugin_idL = 0;
HostStringTable* Maya_Import_G_zref = nullptr;
std::int32_t G_use_linear_unitsL = 0;
double G_time_offsetD = 0.0;
