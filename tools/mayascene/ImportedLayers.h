// The result of an import, in the plain form that the rules of a check take.
#pragma once

#include "check/CameOver.h"
#include "refhost/Host.h"
#include "tools/mayascene/SceneFile.h"

namespace mayascene {

// The result is that of an import of the file. `converted`: distances were converted to points.
check::CameOver whatCameOver(const SceneLook& look, const refhost::CallbackResult& result, bool converted);

}  // namespace mayascene
